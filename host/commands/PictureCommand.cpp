// SPDX-License-Identifier: Apache-2.0
#include "host/commands/PictureCommand.h"

#include "host/commands/Refusal.h"
#include "host/project/ProjectDocument.h"
#include "host/timeline/TimelinePicture.h"

#include <QFileInfo>

namespace Host {

ExitCode drawTimeline(const QString& document, const QString& picturePath)
{
    return unlessRefused([&] {
        const PictureForm form = requirePictureForm(picturePath);
        const ProjectDocument loaded = ProjectDocument::load(document);
        const TimelinePicture picture(loaded.timeline(), QFileInfo(document).completeBaseName());
        savePicture(picture, picturePath, form);
        return Success;
    });
}

} // namespace Host
