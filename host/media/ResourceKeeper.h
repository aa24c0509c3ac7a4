// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/PubSub.h>
#include <EditorModel/bus/View.h>
#include <EditorModel/media/File.h>
#include <EditorModel/media/ResourceHooks.h>
#include <EditorModel/media/ResourceTable.h>

#include <QString>

#include <deque>
#include <map>
#include <mutex>

namespace Host {

/// The module that fills the tables of resources with media files, and answers for all resources that stand
/// in a table.
///
/// It owns every table that is added on the bus; a table outlives the keeper or is removed. It answers the
/// requests for its own tables and for those that another module owns; for a table that nobody owns there is
/// nothing to be done. All that a request adds comes in one change of the table. A file that some module has
/// opened already is taken as it is; others are opened by whichever module does that, and closed again. For a
/// file that cannot be opened AddingFailed goes out, and the others are added all the same.
///
/// Every track of a file is a resource of the track's kind, a picture being of the kind image:
/// - The identifier depends on the absolute path alone, so that it is the same on every run; from the second
///   track of a kind on, "-1", "-2" and so on follow. It holds nothing that the text form of a resource could
///   not carry. Links stay in the path, but where ".." leads out of one.
/// - `FileInfo` has the absolute path, the number of the track within the file, and the length of the file,
///   which is zero for a picture.
/// - `Timing` has PlayedOnce for what has a length, and Resource::Timing::Described, for which a position
///   means nothing, for a picture.
///
/// A file that is added again brings its `FileInfo` up to date; a timing that stands in the table is kept.
///
/// The describer's questions may come from any thread, as long as the keeper is neither being built nor
/// ending. Where two tables differ about a resource, the first in the order of addresses counts. What the
/// answers point at stays as it is until the keeper ends, also when the tables change.
class ResourceKeeper : public Resource::Details::Describer,
                       private Message::View<ResourceTable::Object>,
                       private PubSub::Subscriber<ResourceTable::AddFilesToTableRequest>
{
public:
    /// Positions in the resource are those in the clip.
    static constexpr auto PlayedOnce = static_cast<Resource::Timing::Mode>(2);

    ResourceKeeper();
    ResourceKeeper(const ResourceKeeper&) = delete;
    ResourceKeeper& operator=(const ResourceKeeper&) = delete;
    ~ResourceKeeper() override;

    /// The identifier of a track: `index` counts the tracks of its kind from zero.
    static QString identifier(const QString& path, int index);

    const Resource::FileInfo* fileInfo(const Resource::Describer& resource) const override;
    /// The composition of the file when it was added: whoever gave it to the file keeps it alive while a
    /// table has the resource. Null for a resource that came with its table.
    const Composition::Object* composition(const Resource::Describer& resource) const override;
    Resource::Timing timing(const Resource::Describer& resource) const override;

private:
    using Table = ResourceTable::Object;
    using TableView = Message::View<Table>;
    using Compositions = std::map<ResourceRef, const Composition::Object*>;
    struct Found;

    void notify(const ResourceTable::AddFilesToTableRequest& request) override;
    using TableView::changed;
    void changed(const Table* table) override;
    void removed(const Table* table) override;

    bool watches(const Table* table);
    Found describe(const Table* table, const QStringList& paths);
    static void addTracks(const Media::File& file, Found& found);
    void remember(const Compositions& compositions);
    void learn(const Table* departing);
    void forgetCompositions();
    const ResourceTable::FileResourceInfo* keep(const ResourceRef& resource,
                                                const ResourceTable::FileResourceInfo& info);
    const ResourceTable::FileResourceInfo* find(const Resource::Describer& resource) const;

    /// Guards what the answers are made of. The hook's own lock is held outside of it, never inside.
    mutable std::mutex m_mutex;
    std::map<ResourceRef, const ResourceTable::FileResourceInfo*> m_known;
    Compositions m_compositions;
    /// All that was ever known of a resource: askers may still look at it.
    std::map<ResourceRef, std::deque<ResourceTable::FileResourceInfo>> m_kept;
};

} // namespace Host
