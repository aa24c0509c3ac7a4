// SPDX-License-Identifier: Apache-2.0
#include "host/media/FileImporter.h"

#include "host/commands/Refusal.h"
#include "host/media/AddFilesToCollection.h"
#include "host/media/AddingFailed.h"
#include "host/media/CollectingFailed.h"
#include "host/media/CollectionKeeper.h"
#include "host/media/FileFacts.h"
#include "host/media/FileNotAdded.h"

#include <EditorModel/bus/View.h>
#include <EditorModel/media/ResourceTable.h>

#include <map>
#include <set>
#include <vector>

namespace Host {
namespace {

using Table = ResourceTable::Object;

bool isShared(const Table* table)
{
    return Message::View<Table>().enumerateAll().count(table) > 0;
}

std::set<QString> filesOf(const Table& table)
{
    std::set<QString> files;
    for (const auto& entry : table.resource2fileInfo) {
        files.insert(entry.second.info.path);
    }
    return files;
}

std::set<QString> filesOfCollections()
{
    std::set<QString> files;
    for (const auto* const collection : Message::View<EditorCollection::UserObject>().enumerateAll()) {
        files.merge(listedFiles(*collection));
    }
    return files;
}

/// Why files are not added to a table, as whoever fills it tells.
class TableReasons : private PubSub::Subscriber<AddingFailed>
{
public:
    explicit TableReasons(const Table* table) { subscribe(table); }

    QString of(const QString& path) const
    {
        const auto reason = m_reasons.find(path);
        return reason == m_reasons.end() ? "is not entered: no module fills this table" : reason->second;
    }

private:
    void notify(const AddingFailed& message) override { m_reasons[message.path] = message.reason; }

    std::map<QString, QString> m_reasons;
};

/// Why files are not listed in the user's collection, as whoever was to list them tells.
class CollectionReasons : private PubSub::Subscriber<CollectingFailed>
{
public:
    CollectionReasons() { subscribe(EditorCollection::globalObject()); }

    QString of(const QString& path) const
    {
        const auto reason = m_reasons.find(path);
        return reason == m_reasons.end() ? "is not collected: no module keeps the user's collection"
                                         : reason->second;
    }

private:
    void notify(const CollectingFailed& message) override { m_reasons[message.path] = message.reason; }

    std::map<QString, QString> m_reasons;
};

/// The places for the clips of one request, one after another on each track.
class NextPlaces
{
public:
    explicit NextPlaces(const FileAdder::TimelineContext& context) : m_context(context) {}

    LayingPlace of(TrackType type) const
    {
        LayingPlace place = {m_context.track, m_context.trackLevel == -1 ? 0 : m_context.trackLevel, {}};
        if (m_context.position != MTime(-1)) {
            const auto end = m_ends.find(key(type));
            place.at = end == m_ends.end() ? m_context.position : end->second;
        }
        return place;
    }

    void noteLaid(TrackType type, MTime end) { m_ends[key(type)] = end; }

private:
    /// A given track takes clips of any type one after another.
    TrackType key(TrackType type) const { return m_context.track ? TrackType() : type; }

    const FileAdder::TimelineContext& m_context;
    std::map<TrackType, MTime> m_ends;
};

} // namespace

/// One request.
class FileImporter::Run
{
public:
    Run(FileImporter& importer, const FileAdder::AddMediaFiles& request);

    void carryOut();

private:
    struct Candidate
    {
        /// As it was asked for.
        QString asked;
        QString path;
        /// Null if it can't be opened.
        const Media::File* file;
        bool isAdded;
    };

    bool isOurTimeline() const;
    Candidate open(const QString& path);
    std::vector<Candidate*> opened();
    void refuse(const Candidate& candidate, FileNotAdded::Place place, const QString& reason);
    /// Marks those that are among the files of a place, and returns the others.
    std::vector<Candidate*> missing(const std::set<QString>& files);
    void fillTable(const Table* table);
    void fillCollection();
    void layClips(const FileAdder::TimelineContext& context);
    EditResult layClips(Candidate& candidate, const FileAdder::TimelineContext& context, NextPlaces& places);
    void answer() const;

    FileImporter& m_importer;
    const QStringList m_paths;
    const FileAdder::Contexts m_contexts;
    /// Has the files that no clip will need.
    MediaDescriber m_describer;
    std::map<QString, const MediaDescriber::Entry*> m_entries;
    std::vector<Candidate> m_candidates;
    bool m_isComplete = true;
};

/// The request may be a client's object that changes while other modules work.
FileImporter::Run::Run(FileImporter& importer, const FileAdder::AddMediaFiles& request)
    : m_importer(importer), m_paths(request.files), m_contexts(request.contexts)
{}

void FileImporter::Run::carryOut()
{
    for (const QString& path : m_paths) {
        m_candidates.push_back(open(path));
    }
    if (m_contexts.resourceTable) {
        fillTable(m_contexts.resourceTable->table);
    }
    if (m_contexts.userCollection) {
        fillCollection();
    }
    if (m_contexts.timeline) {
        layClips(*m_contexts.timeline);
    }
    answer();
}

bool FileImporter::Run::isOurTimeline() const
{
    return m_contexts.timeline && m_contexts.timeline->timeline == m_importer.m_session.timeline();
}

FileImporter::Run::Candidate FileImporter::Run::open(const QString& path)
{
    const MediaDescriber::Entry*& entry = m_entries[path];
    if (!entry) {
        entry = isOurTimeline() ? &m_importer.m_clips.open(path) : m_importer.m_clips.find(path);
    }
    if (!entry) {
        entry = &m_describer.describe(path.isEmpty() ? path : absolutePath(path));
    }
    const bool isOpened = entry->file.isOpened;
    const Candidate candidate = {path, entry->file.path, isOpened ? &entry->file : nullptr, false};
    if (!isOpened) {
        refuse(candidate, FileNotAdded::AnyPlace, entry->reason);
    }
    return candidate;
}

std::vector<FileImporter::Run::Candidate*> FileImporter::Run::opened()
{
    std::vector<Candidate*> found;
    for (Candidate& candidate : m_candidates) {
        if (candidate.file) {
            found.push_back(&candidate);
        }
    }
    return found;
}

void FileImporter::Run::refuse(const Candidate& candidate, FileNotAdded::Place place, const QString& reason)
{
    m_isComplete = false;
    PubSub::publish(FileNotAdded(candidate.asked, place, reason));
}

std::vector<FileImporter::Run::Candidate*> FileImporter::Run::missing(const std::set<QString>& files)
{
    std::vector<Candidate*> others;
    for (Candidate* const candidate : opened()) {
        if (files.count(candidate->path) > 0) {
            candidate->isAdded = true;
        } else {
            others.push_back(candidate);
        }
    }
    return others;
}

void FileImporter::Run::fillTable(const Table* table)
{
    QStringList paths;
    for (const Candidate* const candidate : opened()) {
        paths << candidate->path;
    }
    const TableReasons reasons(table);
    if (!paths.isEmpty() && isShared(table)) {
        PubSub::publish(ResourceTable::AddFilesToTableRequest(table, paths));
    }
    // Whoever heard of the request may have destroyed the table.
    const bool isThere = isShared(table);
    for (const Candidate* const candidate : missing(isThere ? filesOf(*table) : std::set<QString>())) {
        refuse(*candidate, FileNotAdded::TablePlace,
               isThere ? reasons.of(candidate->path) : "is not entered: no module owns this table");
    }
}

void FileImporter::Run::fillCollection()
{
    std::deque<const Media::File*> files;
    for (const Candidate* const candidate : opened()) {
        files.push_back(candidate->file);
    }
    const CollectionReasons reasons;
    if (!files.empty()) {
        PubSub::publish(AddFilesToCollection(files));
    }
    for (const Candidate* const candidate : missing(filesOfCollections())) {
        refuse(*candidate, FileNotAdded::CollectionPlace, reasons.of(candidate->path));
    }
}

void FileImporter::Run::layClips(const FileAdder::TimelineContext& context)
{
    NextPlaces places(context);
    for (Candidate* const candidate : opened()) {
        const EditResult laid = isOurTimeline() ? layClips(*candidate, context, places)
                                                : EditResult{"is not laid: the timeline isn't edited here"};
        if (laid) {
            candidate->isAdded = true;
        } else {
            refuse(*candidate, FileNotAdded::TimelinePlace, laid.refusal);
        }
    }
}

EditResult FileImporter::Run::layClips(Candidate& candidate, const FileAdder::TimelineContext& context,
                                       NextPlaces& places)
{
    EditSession& session = m_importer.m_session;
    MediaClips::Clips clips = {};
    try {
        clips = m_importer.m_clips.make(*candidate.file, context.clipBuildingStrategy, context.clipType);
    } catch (const Refusal& refusal) {
        return {refusal.reason};
    }
    EditResult laid = lay(session, clips, places.of(clips.track));
    if (!laid) {
        laid.refusal.prepend("can't be laid: ");
        return laid;
    }
    // Whoever heard of the clip may have removed it.
    if (session.timeline()->contains(clips.clip)) {
        places.noteLaid(clips.track, session.timeline()->clipTiming(clips.clip).end());
    }
    return laid;
}

void FileImporter::Run::answer() const
{
    QStringList added;
    for (const Candidate& candidate : m_candidates) {
        if (candidate.isAdded) {
            added << candidate.asked;
        }
    }
    PubSub::publish(FileAdder::AddMediaFilesResult(m_isComplete      ? AllAdded
                                                   : added.isEmpty() ? NoneAdded
                                                                     : SomeAdded,
                                                   added));
}

FileImporter::FileImporter(EditSession& session) : m_session(session), m_clips(session)
{
    subscribe(FileAdder::globalObject());
}

void FileImporter::notify(const FileAdder::AddMediaFiles& request)
{
    const FileAdder::Contexts& contexts = request.contexts;
    if (request.files.isEmpty() ||
        (!contexts.timeline && !contexts.userCollection && !contexts.resourceTable)) {
        PubSub::publish(FileAdder::AddMediaFilesResult(NothingAsked, {}));
        return;
    }
    Run(*this, request).carryOut();
}

} // namespace Host
