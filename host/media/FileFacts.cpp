// SPDX-License-Identifier: Apache-2.0
#include "host/media/FileFacts.h"

#include <QDir>
#include <QFileInfo>

#include <algorithm>

namespace Host {
namespace {

using VideoTrack = Media::File::Track::Video;

const VideoTrack* firstPicture(const Media::File& file, bool isImage)
{
    const auto found = std::find_if(file.videoTracks.begin(), file.videoTracks.end(),
                                    [isImage](const auto* track) { return track->isImage == isImage; });
    return found == file.videoTracks.end() ? nullptr : *found;
}

} // namespace

QString absolutePath(const QString& path)
{
    const QString whole = path.startsWith('/') ? path : QDir::currentPath() + '/' + path;
    QString walked;
    for (const QString& step : whole.split('/')) {
        if (step == "..") {
            const QFileInfo last(walked);
            const QString target = last.isSymLink() ? last.canonicalFilePath() : QString();
            walked = target.isEmpty() ? walked : target;
            walked.truncate(std::max(0, walked.lastIndexOf('/')));
        } else if (!step.isEmpty() && step != ".") {
            walked += '/' + step;
        }
    }
    return walked.isEmpty() ? QString("/") : walked;
}

const VideoTrack* movingPicture(const Media::File& file)
{
    return firstPicture(file, false);
}

const VideoTrack* stillPicture(const Media::File& file)
{
    return firstPicture(file, true);
}

} // namespace Host
