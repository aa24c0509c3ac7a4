// SPDX-License-Identifier: Apache-2.0
#include "host/commands/ThumbsCommand.h"

#include "host/analysis/FilmstripMaker.h"
#include "host/commands/ProgressBar.h"
#include "host/commands/Refusal.h"
#include "host/project/ProjectDocument.h"
#include "host/text/DisplayText.h"
#include "host/timeline/ClipFilmstrips.h"
#include "host/timeline/TimelinePicture.h"

#include <EditorModel/media/File.h>

#include <QDir>
#include <QFileInfo>

#include <cstdio>

namespace Host {
namespace {

/// Paths that are not absolute are taken from the folder of the project.
std::map<ResourceRef, MediaPlace> pictureMedia(const TimelineOutline& outline, const QDir& folder)
{
    std::map<ResourceRef, MediaPlace> places;
    for (const Timeline::Clip* clip : outline.clips()) {
        if (videoOf(*clip)) {
            places[pictureResourceOf(*clip)] = {folder.absoluteFilePath(clip->file->path), clip->mediaTrack};
        }
    }
    return places;
}

void fill(ClipFilmstrips& filmstrips)
{
    const ProgressBar bar(filmstrips.progress(), stderr);
    filmstrips.request();
}

QString besideDocument(const QString& document)
{
    const QString ending = QFileInfo(document).suffix();
    return document.chopped(ending.isEmpty() ? 0 : ending.size() + 1) + "-thumbs.png";
}

} // namespace

ExitCode drawThumbs(const QString& document, const QString& picturePath)
{
    return unlessRefused([&] {
        const QFileInfo info(document);
        const QString path = picturePath.isEmpty() ? besideDocument(document) : picturePath;
        const PictureForm form = requirePictureForm(path);
        const ProjectDocument loaded = ProjectDocument::load(document);
        TimelinePicture picture(loaded.timeline(), info.completeBaseName());
        const FilmstripMaker maker(pictureMedia(picture.outline(), info.absoluteDir()));
        ClipFilmstrips filmstrips(picture.layout(), picture.outline());
        fill(filmstrips);
        picture.showFilmstrips(&filmstrips);
        savePicture(picture, path, form);
        for (const auto& [file, reason] : maker.failures()) {
            writeError(file, reason);
        }
        const bool isTold = !picturePath.isEmpty() || writeOutput(printable(path) + '\n');
        return isTold && maker.failures().empty() ? Success : Failure;
    });
}

} // namespace Host
