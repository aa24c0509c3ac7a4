// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tests/host/editing/Edits.h"
#include "tests/host/shared/Samples.h"

#include "host/media/AddFilesToCollection.h"
#include "host/media/CollectionKeeper.h"
#include "host/media/FileImporter.h"
#include "host/media/FileNotAdded.h"
#include "host/media/MediaOpener.h"
#include "host/media/ResourceKeeper.h"

#include <QFileInfo>

#include <gmock/gmock.h>

#include <functional>
#include <memory>

/// What the tests of FileImporter have in common.
namespace ImportTests {

using namespace HostTests;
using EditorCollection::UserObject;
using FileAdder::Contexts;
using FileAdder::ResourceTableContext;
using FileAdder::TimelineContext;
using FileAdder::UserCollectionContext;
using Importer = Host::FileImporter;
using Host::EditSession;
using Host::MediaClips;
using Lines = std::vector<std::string>;
using Table = ResourceTable::Object;
using Timeline::Clip;
using Timeline::Track;

constexpr FileAdder::Asrc anywhere{};

inline std::string nameOf(const QString& path)
{
    return QFileInfo(path).fileName().toStdString();
}

inline std::string namesOf(const QStringList& paths)
{
    std::string names;
    for (const QString& path : paths) {
        names += ' ' + nameOf(path);
    }
    return names;
}

inline const char* trackText(TrackType type)
{
    switch (type) {
    case PrimaryTrack:
        return "primary";
    case ExtraVideoTrack:
        return "extra";
    case NativeAudioTrack:
        return "native";
    case AudioTrack:
        return "audio";
    default:
        return "track";
    }
}

/// "primary: film.mp4 0-2000 @0; native: ..." in the order of the tracks.
inline std::string textOf(const Timeline::Object& timeline)
{
    std::string text;
    for (const Track* const track : timeline.tracks) {
        const std::string row = EditTests::row(timeline, track);
        text += (text.empty() ? "" : "; ") + std::string(trackText(track->type)) + ":" +
                (row.empty() ? "" : " " + row);
    }
    return text;
}

class Files : public Message::View<Media::File>
{
public:
    explicit Files(Lines& lines) : m_lines(lines) { observeNew(); }

private:
    using View::changed;
    void changed(const Media::File* file, const Media::File* old) override
    {
        if (file->isOpened != old->isOpened || file->isFailed != old->isFailed) {
            m_lines.push_back((file->isOpened ? "opened " : "failed ") + nameOf(file->path));
        }
    }
    void removed(const Media::File* file) override { m_lines.push_back("closed " + nameOf(file->path)); }

    Lines& m_lines;
};

class Tables : public Message::View<Table>
{
public:
    Tables(Lines& lines, Table* table) : m_lines(lines) { add(table); }

private:
    using View::changed;
    void changed(const Table* table) override
    {
        m_lines.push_back("table " + std::to_string(table->resource2fileInfo.size()));
    }

    Lines& m_lines;
};

class Collections : public Message::View<UserObject>
{
public:
    Collections(Lines& lines, const UserObject* collection) : m_lines(lines) { observe(collection); }

private:
    using View::changed;
    void changed(const UserObject* collection) override
    {
        std::string line = "collection";
        for (const Import::Object* const item : collection->items) {
            line += ' ' + item->tag.toStdString();
        }
        m_lines.push_back(line);
    }

    Lines& m_lines;
};

class Timelines : public Message::View<Timeline::Object>
{
public:
    Timelines(Lines& lines, const Timeline::Object* timeline) : m_lines(lines) { observe(timeline); }

    std::function<void()> onChanged;

private:
    using View::changed;
    void changed(const Timeline::Object* timeline) override
    {
        m_lines.push_back(textOf(*timeline));
        if (onChanged) {
            onChanged();
        }
    }

    Lines& m_lines;
};

/// Hears all messages that belong to requests.
class Requests
    : private PubSub::Subscriber<FileAdder::AddMediaFiles, FileAdder::AddMediaFilesResult, Host::FileNotAdded,
                                 ResourceTable::AddFilesToTableRequest, Host::AddFilesToCollection>
{
public:
    explicit Requests(Lines& lines) : m_lines(lines)
    {
        subscribe(FileAdder::globalObject());
        subscribe(EditorCollection::globalObject());
        subscribeAll<Table>();
    }

private:
    void notify(const FileAdder::AddMediaFiles& message) override
    {
        m_lines.push_back("asked:" + namesOf(message.files));
    }
    void notify(const FileAdder::AddMediaFilesResult& message) override
    {
        m_lines.push_back("answer " + std::to_string(message.result) + ":" + namesOf(message.files));
    }
    void notify(const Host::FileNotAdded& message) override
    {
        const char* const places[] = {"anywhere", "table", "collection", "timeline"};
        m_lines.push_back(nameOf(message.path) + " not in " + places[message.place] + ": " +
                          message.reason.toStdString());
    }
    void notify(const ResourceTable::AddFilesToTableRequest& message) override
    {
        m_lines.push_back("for table:" + namesOf(message.files));
    }
    void notify(const Host::AddFilesToCollection& message) override
    {
        std::string names;
        for (const Media::File* const file : message.files) {
            names += ' ' + nameOf(file->path);
        }
        m_lines.push_back("for collection:" + names);
    }

    Lines& m_lines;
};

/// All modules, and others that write down everything they hear, in one list.
class ImportFixture : public testing::Test
{
protected:
    ImportFixture() { lines.clear(); }
    void SetUp() override { Host::showMediaLibraryLog(false); }

    FileAdder::AddedResult add(const QStringList& paths, const Contexts& contexts)
    {
        return FileAdder::addMediaFiles(paths, anywhere, contexts);
    }
    FileAdder::AddedResult lay(const QStringList& paths, const TimelineContext& context)
    {
        return add(paths, Contexts().setContext(context));
    }

    Contexts everywhere() const
    {
        return Contexts()
            .setContext(TimelineContext(now()))
            .setContext(UserCollectionContext())
            .setContext(ResourceTableContext(&table));
    }
    const Timeline::Object* now() const { return session.timeline(); }
    /// What was heard since the last time.
    Lines heard() { return std::exchange(lines, {}); }
    const Track* addTrack(TrackType type)
    {
        const Track* const track = session.makeTrack(type);
        EXPECT_TRUE(session.addTrack(track));
        lines.clear();
        return track;
    }

    const QString film = sample("film.mp4");
    const QString wav = sample("speech.wav");
    const QString png = sample("picture.png");
    const QString song = sample("song.mp3");

    Lines lines;
    Table table;
    Requests requests{lines};
    Files files{lines};
    Host::MediaOpener opener;
    Host::ResourceKeeper resources;
    Host::CollectionKeeper collection;
    EditSession session;
    Importer importer{session};
    Tables tables{lines, &table};
    Collections collections{lines, collection.collection()};
    Timelines timelines{lines, session.timeline()};
};

} // namespace ImportTests
