// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/Messages.h>
#include <EditorModel/timeline/Clip.h>
#include <EditorModel/timeline/ClipBuildingStrategy.h>
#include <EditorModel/types/MTime.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <optional>

namespace ResourceTable {
class Object;
}
namespace Timeline {
struct Object;
struct Track;
} // namespace Timeline

/// Asks for files to be brought into a project, at one or several places at once, and tells how it went. A
/// module outside the model does the work, within the call.
namespace FileAdder {

/// The sender of the request and of its answer. It holds nothing: its identity is its use.
class EDITORMODEL_EXPORT Object : public virtual PubSub::Object
{
public:
    ~Object() override;
};

/// The one instance, made at the first call and destroyed when the process exits. Never null; from any
/// thread.
EDITORMODEL_EXPORT const FileAdder::Object* globalObject();

/// Where a request comes from. The values belong to those who ask and those who answer.
enum Asrc : int
{
};

/// The outcome. The values but the first one belong to those who answer.
enum AddedResult : int
{
    NotAnswered = 0, ///< what a client gets where no module answers
};

/// A place on a timeline. Nothing that the pointers name is owned.
class EDITORMODEL_EXPORT TimelineContext
{
public:
    const Timeline::Object* timeline;
    /// Null for none.
    const Timeline::Track* track = nullptr;
    /// In the time of the timeline; -1 for none.
    MTime position = -1;
    /// Of the clip that is to be built; 0 for none in particular.
    Timeline::Clip::ClipType clipType{};
    /// -1 for none.
    int trackLevel = -1;
    /// Of no meaning to the model.
    bool flag = false;
    Timeline::ClipBuildingStrategy clipBuildingStrategy = Timeline::DefaultStrategy;

    TimelineContext(const Timeline::Object* timeline_);
    TimelineContext(const Timeline::Object* timeline_, const Timeline::Track* track_, int trackLevel_,
                    MTime position_);
    TimelineContext(const Timeline::Object* timeline_, const Timeline::Track* track_, MTime position_,
                    Timeline::Clip::ClipType clipType_, int trackLevel_, bool flag_);
    TimelineContext(const Timeline::Object* timeline_, Timeline::ClipBuildingStrategy strategy);
};

/// That the files go to the user's collection.
class EDITORMODEL_EXPORT UserCollectionContext
{};

/// That the files go into a project's table of resources, which is not owned.
class EDITORMODEL_EXPORT ResourceTableContext
{
public:
    const ResourceTable::Object* table;

    ResourceTableContext(const ResourceTable::Object* table_);
};

/// Where files are to go: any of the three places, or none of them.
class EDITORMODEL_EXPORT Contexts
{
public:
    std::optional<FileAdder::TimelineContext> timeline;
    std::optional<FileAdder::UserCollectionContext> userCollection;
    std::optional<FileAdder::ResourceTableContext> resourceTable;

    /// These take the place of an earlier context of the same kind.
    Contexts& setContext(const FileAdder::TimelineContext& context);
    Contexts& setContext(const FileAdder::UserCollectionContext& context);
    Contexts& setContext(const FileAdder::ResourceTableContext& context);
};

/// Asks whoever can open media to add files. Answered, before the publication ends, by an
/// AddMediaFilesResult. The sender is globalObject().
class EDITORMODEL_EXPORT AddMediaFiles : public ::Message::Types::Request<FileAdder::Object>
{
public:
    AddMediaFiles(const QStringList& files_, FileAdder::Asrc source_, const FileAdder::Contexts& contexts_);
    AddMediaFiles(const AddMediaFiles&) = default;
    AddMediaFiles(AddMediaFiles&&) = default;
    AddMediaFiles& operator=(const AddMediaFiles&) = default;
    AddMediaFiles& operator=(AddMediaFiles&&) = default;
    ~AddMediaFiles() override;

    /// Paths; there may be none.
    QStringList files;
    FileAdder::Asrc source;
    FileAdder::Contexts contexts;
};

/// Tells how the adding of files went. The sender is globalObject().
class EDITORMODEL_EXPORT AddMediaFilesResult : public ::Message::Types::Notification<FileAdder::Object>
{
public:
    AddMediaFilesResult(FileAdder::AddedResult result_, const QStringList& files_);
    AddMediaFilesResult(const AddMediaFilesResult&) = default;
    AddMediaFilesResult(AddMediaFilesResult&&) = default;
    AddMediaFilesResult& operator=(const AddMediaFilesResult&) = default;
    AddMediaFilesResult& operator=(AddMediaFilesResult&&) = default;
    ~AddMediaFilesResult() override;

    FileAdder::AddedResult result;
    /// Paths, as whoever answers gives them.
    QStringList files;
};

/// Carries out requests, one after another: see the free function for a single one. It hears answers only
/// while it asks, and then all of them, also those to a request that is made meanwhile.
class EDITORMODEL_EXPORT Helper : public PubSub::Subscriber<FileAdder::AddMediaFilesResult>
{
public:
    /// The last answer to any request of this helper. The default constructor leaves it unset, and nobody
    /// sets it where there is no answer.
    FileAdder::AddedResult result;
    /// Not used by the model.
    QHash<QString, QString> reserved;

    Helper() = default;
    Helper(const Helper&) = default;
    Helper& operator=(const Helper&) = default;
    ~Helper() override;

    /// Asks, and gives `result`. At the end the helper isn't subscribed to globalObject(), also if it was
    /// before.
    FileAdder::AddedResult addMediaFiles(const QStringList& files, FileAdder::Asrc source,
                                         const FileAdder::Contexts& contexts);

protected:
    void notify(const FileAdder::AddMediaFilesResult& answer) override;
};

/// Asks for the files to be added, and returns when that is done. Where several modules answer, the last one
/// decides. No files are a request like any other.
EDITORMODEL_EXPORT FileAdder::AddedResult addMediaFiles(const QStringList& files, FileAdder::Asrc source,
                                                        const FileAdder::Contexts& contexts);

} // namespace FileAdder
