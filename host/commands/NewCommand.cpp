// SPDX-License-Identifier: Apache-2.0
#include "host/commands/NewCommand.h"

#include "host/commands/Refusal.h"
#include "host/media/MediaClips.h"
#include "host/project/TimelineDocument.h"

#include <QFileInfo>

namespace Host {
namespace {

bool layAll(EditSession& session, MediaClips& clips, const QStringList& media)
{
    bool isDone = true;
    for (const QString& path : media) {
        try {
            if (const EditResult result = lay(session, clips.make(path)); !result) {
                throw Refusal(path, result.refusal);
            }
        } catch (const Refusal& refusal) {
            writeError(refusal.name, refusal.reason);
            isDone = false;
        }
    }
    return isDone;
}

} // namespace

ExitCode newProject(const QString& path, const QStringList& media)
{
    return unlessRefused([&] {
        if (QFileInfo::exists(path)) {
            throw Refusal(path, "exists already");
        }
        EditSession session;
        MediaClips clips(session);
        if (!layAll(session, clips, media)) {
            return Failure;
        }
        TimelineDocument::save(*session.timeline(), path);
        return Success;
    });
}

} // namespace Host
