// SPDX-License-Identifier: Apache-2.0
#include "host/project/MediaFaults.h"

#include "host/media/MediaDescriber.h"
#include "host/media/MediaOpener.h"
#include "host/media/ResourceKeeper.h"

#include <QDir>
#include <QFileInfo>

#include <algorithm>
#include <map>
#include <set>

namespace Host {
namespace {

using Media::File;
using Timeline::Clip;

bool isSame(const File::Track::Video& a, const File::Track::Video& b)
{
    return a.index == b.index && a.codecId == b.codecId && a.isImage == b.isImage && a.width == b.width &&
           a.height == b.height && a.frameRateN == b.frameRateN && a.frameRateD == b.frameRateD;
}

bool isSame(const File::Track::Audio& a, const File::Track::Audio& b)
{
    return a.index == b.index && a.codecId == b.codecId && a.sampleRate == b.sampleRate &&
           a.channelLayout == b.channelLayout;
}

template <class Track>
bool areSame(const std::deque<const Track*>& a, const std::deque<const Track*>& b)
{
    return std::equal(a.begin(), a.end(), b.begin(), b.end(),
                      [](const Track* x, const Track* y) { return x && y && isSame(*x, *y); });
}

template <class Track>
bool hasTrack(const std::deque<const Track*>& tracks, int index)
{
    return std::any_of(tracks.begin(), tracks.end(),
                       [index](const Track* track) { return track && track->index == index; });
}

QString fileText(const QString& path)
{
    return "file \"" + path + "\"";
}

class MediaFaults
{
public:
    MediaFaults(const QString& folder, FaultList& faults) : m_folder(folder), m_faults(faults) {}

    void findInTracks(const CheckedTimeline& timeline, const Clip& clip)
    {
        const File& file = *clip.file;
        const bool isThere =
            hasTrack(file.videoTracks, clip.mediaTrack) || hasTrack(file.audioTracks, clip.mediaTrack);
        if (file.isOpened && !isThere) {
            const QString about = timeline.nameOf(&clip);
            m_faults.add(NoMediaTrack, about,
                         QString("C%1 plays the track %2 of the %3, which has none of this number.")
                             .arg(about.mid(1), QString::number(clip.mediaTrack), fileText(file.path)));
        }
    }

    /// `user` tells who plays it.
    void findInFile(const File& file, const QString& user)
    {
        const QString about = fileText(file.path);
        const QString subject = "The " + about + user;
        const QString path = absolute(file.path);
        if (file.path.isEmpty() || !QFileInfo::exists(path)) {
            m_faults.add(MissingMedia, about, subject + " does not exist.");
            return;
        }
        const MediaDescriber::Entry& found = describe(path);
        if (!found.file.isOpened) {
            m_faults.add(UnreadableMedia, about, subject + " cannot be opened: it " + found.reason + ".");
        } else if (file.isOpened) {
            findChange(file, found.file, about, subject);
        }
    }

    void findInTable(const ResourceTable::Object& table, const std::set<QString>& played)
    {
        for (const auto& entry : table.resource2fileInfo) {
            const QString path = entry.second.info.path;
            if (played.count(identifier(path)) == 0 && !QFileInfo::exists(absolute(path))) {
                m_faults.add(MissingResource, QString("resource \"%1\"").arg(std::get<QString>(entry.first)),
                             QString("The %1 of a resource does not exist.").arg(fileText(path)));
            }
        }
    }

    void findUnlisted(const File& file, const std::set<QString>& listed)
    {
        if (listed.count(identifier(file.path)) == 0) {
            m_faults.add(UnlistedMedia, fileText(file.path),
                         "The " + fileText(file.path) + " is not in the table of resources.");
        }
    }

    /// The identifiers of the files that the table, which may be null, has.
    std::set<QString> listedIn(const ResourceTable::Object* table) const
    {
        std::set<QString> listed;
        if (table) {
            for (const auto& entry : table->resource2fileInfo) {
                listed.insert(identifier(entry.second.info.path));
            }
        }
        return listed;
    }

    QString identifier(const QString& path) const { return ResourceKeeper::identifier(absolute(path), 0); }

private:
    QString absolute(const QString& path) const { return QDir(m_folder).absoluteFilePath(path); }

    const MediaDescriber::Entry& describe(const QString& path)
    {
        auto known = m_described.find(path);
        if (known == m_described.end()) {
            known = m_described.emplace(path, &m_describer.describe(path)).first;
        }
        return *known->second;
    }

    void findChange(const File& then, const File& now, const QString& about, const QString& subject)
    {
        if (then.length != now.length) {
            m_faults.add(ChangedMedia, about,
                         subject + QString(" lasts %1 ms, but was described as %2 ms long.")
                                       .arg(now.length.ms())
                                       .arg(then.length.ms()));
        }
        if (!areSame(then.videoTracks, now.videoTracks) || !areSame(then.audioTracks, now.audioTracks)) {
            m_faults.add(ChangedMedia, about, subject + " has other tracks than were described.");
        }
    }

    const QString m_folder;
    FaultList& m_faults;
    // The opener ends last: it has the tracks of the files.
    MediaOpener m_opener;
    MediaDescriber m_describer;
    std::map<QString, const MediaDescriber::Entry*> m_described;
};

} // namespace

void findMediaFaults(const std::deque<CheckedTimeline>& timelines, const std::deque<const File*>& files,
                     const ResourceTable::Object* table, bool needsTable, const QString& folder,
                     FaultList& faults)
{
    MediaFaults media(folder, faults);
    std::set<const File*> done;
    std::set<QString> played;
    const std::set<QString> listed = media.listedIn(table);
    for (const CheckedTimeline& timeline : timelines) {
        for (const Clip* const clip : timeline.outline.clips()) {
            if (!clip->file) {
                continue;
            }
            media.findInTracks(timeline, *clip);
            if (!done.insert(clip->file).second) {
                continue;
            }
            media.findInFile(*clip->file, " of " + timeline.nameOf(clip));
            const bool isNew = played.insert(media.identifier(clip->file->path)).second;
            if (isNew && needsTable) {
                media.findUnlisted(*clip->file, listed);
            }
        }
    }
    for (const File* const file : files) {
        if (done.insert(file).second) {
            media.findInFile(*file, "");
        }
    }
    if (table) {
        media.findInTable(*table, played);
    }
}

} // namespace Host
