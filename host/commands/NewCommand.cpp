// SPDX-License-Identifier: Apache-2.0
#include "host/commands/NewCommand.h"

#include "host/commands/Refusal.h"
#include "host/media/CollectionKeeper.h"
#include "host/media/FileImporter.h"
#include "host/media/FileNotAdded.h"
#include "host/media/MediaOpener.h"
#include "host/media/ResourceKeeper.h"
#include "host/project/ProjectStore.h"

#include <EditorModel/library/UserObject.h>
#include <EditorModel/media/FileAdder.h>
#include <EditorModel/media/ResourceTable.h>

#include <QFileInfo>

namespace Host {
namespace {

/// Nobody tells sources apart so far.
constexpr auto FromCommand = static_cast<FileAdder::Asrc>(0);

class FailureWriter : private PubSub::Subscriber<FileNotAdded>
{
public:
    FailureWriter() { subscribe(FileAdder::globalObject()); }

private:
    void notify(const FileNotAdded& message) override { writeError(message.path, message.reason); }
};

/// A project that is being made, and the modules that fill it with media.
class NewProject : private Message::View<ResourceTable::Object>
{
public:
    NewProject() { add(&m_table); }

    /// False where something of it is missing then.
    bool addMedia(const QStringList& media)
    {
        const FailureWriter writer;
        FileAdder::Contexts contexts;
        contexts.setContext(FileAdder::TimelineContext(&m_timeline))
            .setContext(FileAdder::UserCollectionContext())
            .setContext(FileAdder::ResourceTableContext(&m_table));
        return FileAdder::addMediaFiles(media, FromCommand, contexts) == FileImporter::AllAdded;
    }

    void save(const QString& path)
    {
        Project::Content content;
        content.timeline = &m_timeline;
        content.userCollection = &m_collection;
        content.resourceTable = &m_table;
        ProjectStore::save(content, path);
    }

private:
    Timeline::Object m_timeline;
    EditorCollection::UserObject m_collection;
    ResourceTable::Object m_table;
    MediaOpener m_opener;
    ResourceKeeper m_resources;
    CollectionKeeper m_keeper{&m_collection};
    EditSession m_session{&m_timeline};
    FileImporter m_importer{m_session};
};

} // namespace

ExitCode newProject(const QString& path, const QStringList& media)
{
    return unlessRefused([&] {
        if (QFileInfo::exists(path)) {
            throw Refusal(path, "exists already");
        }
        NewProject project;
        if (!project.addMedia(media)) {
            return Failure;
        }
        project.save(path);
        return Success;
    });
}

} // namespace Host
