// SPDX-License-Identifier: Apache-2.0
#include "host/commands/NewCommand.h"

#include "host/commands/Refusal.h"
#include "host/media/MediaAdding.h"
#include "host/project/ProjectModules.h"
#include "host/project/ProjectStore.h"

#include <EditorModel/library/UserObject.h>

#include <QFileInfo>

namespace Host {
namespace {

/// A project that is being made.
struct NewProject
{
    Timeline::Object timeline;
    EditorCollection::UserObject collection;
    ResourceTable::Object table;

    Project::Content content()
    {
        Project::Content content;
        content.timeline = &timeline;
        content.userCollection = &collection;
        content.resourceTable = &table;
        return content;
    }
};

} // namespace

ExitCode newProject(const QString& path, const QStringList& media)
{
    return unlessRefused([&] {
        if (QFileInfo::exists(path)) {
            throw Refusal(path, "exists already");
        }
        NewProject project;
        const ProjectModules modules(project.content());
        FileAdder::Contexts places = modules.places();
        const MediaAdding adding =
            addMedia(media, places.setContext(FileAdder::TimelineContext(&project.timeline)));
        for (const MediaAdding::Failure& failure : adding.failures) {
            writeError(failure.path, failure.reason);
        }
        if (!adding.isDone) {
            return Failure;
        }
        ProjectStore::save(project.content(), path);
        return Success;
    });
}

} // namespace Host
