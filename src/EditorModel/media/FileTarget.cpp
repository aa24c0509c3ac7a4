// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/FileTarget.h>

namespace Media {

FileTarget::~FileTarget() = default;

FileTarget* FileTarget::setPath(const QString& newPath)
{
    path = newPath;
    return this;
}

FileTarget* FileTarget::setVideoTrack(int track)
{
    videoTrack = track;
    return this;
}

FileTarget* FileTarget::setAudioTrack(int track)
{
    audioTrack = track;
    return this;
}

} // namespace Media
