// SPDX-License-Identifier: Apache-2.0
#include "PictureCommand.h"

#include "TimelineDocument.h"
#include "TimelinePicture.h"

#include <QFileInfo>

#include <optional>

namespace Host {

ExitCode drawTimeline(const QString& document, const QString& picturePath)
{
    try {
        const std::optional<PictureForm> form = pictureFormOfPath(picturePath);
        if (!form) {
            throw Refusal(picturePath, "is no name of a picture: such a name ends in .png or .svg");
        }
        const TimelineDocument loaded = TimelineDocument::load(document);
        const TimelinePicture picture(loaded.timeline(), QFileInfo(document).completeBaseName());
        savePicture(picture, picturePath, *form);
        return Success;
    } catch (const Refusal& refusal) {
        writeError(refusal.name, refusal.reason);
    } catch (const PictureError& error) {
        writeError(picturePath, error.reason);
    } catch (const Document::Error& error) {
        writeError(error.what());
    }
    return Failure;
}

} // namespace Host
