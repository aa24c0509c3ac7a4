// SPDX-License-Identifier: Apache-2.0
#include "host/commands/NewCommand.h"

#include "host/commands/Refusal.h"
#include "host/media/MediaClips.h"
#include "host/project/ProjectStore.h"

#include <EditorModel/library/UserObject.h>
#include <EditorModel/media/ResourceTable.h>

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

/// With a collection and a table for what is to come.
void saveProject(Timeline::Object& timeline, const QString& path)
{
    EditorCollection::UserObject collection;
    ResourceTable::Object table;
    Project::Content content;
    content.timeline = &timeline;
    content.userCollection = &collection;
    content.resourceTable = &table;
    ProjectStore::save(content, path);
}

} // namespace

ExitCode newProject(const QString& path, const QStringList& media)
{
    return unlessRefused([&] {
        if (QFileInfo::exists(path)) {
            throw Refusal(path, "exists already");
        }
        Timeline::Object timeline;
        EditSession session(&timeline);
        MediaClips clips(session);
        if (!layAll(session, clips, media)) {
            return Failure;
        }
        saveProject(timeline, path);
        return Success;
    });
}

} // namespace Host
