// SPDX-License-Identifier: Apache-2.0
#include "PictureCommand.h"

#include "Refusal.h"
#include "TimelineDocument.h"
#include "TimelinePicture.h"

#include <QFileInfo>

namespace Host {

ExitCode drawTimeline(const QString& document, const QString& picturePath)
{
    return unlessRefused([&] {
        const PictureForm form = requirePictureForm(picturePath);
        const TimelineDocument loaded = TimelineDocument::load(document);
        const TimelinePicture picture(loaded.timeline(), QFileInfo(document).completeBaseName());
        savePicture(picture, picturePath, form);
        return Success;
    });
}

} // namespace Host
