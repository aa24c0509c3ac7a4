// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/media/FileAdder.h>
#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/timeline/Timeline.h>

#include <gmock/gmock.h>

/// Requests that add files, and what is to be found in them.
namespace FileAdderTests {

inline const Timeline::Object someTimeline;
inline const Timeline::Track someTrack;
inline const ResourceTable::Object someTable;

inline const QStringList twoFiles = {QStringLiteral("/films/b.mp4"), QStringLiteral("/films/a.mp4")};

inline FileAdder::AddedResult result(int value)
{
    return static_cast<FileAdder::AddedResult>(value);
}

inline FileAdder::Asrc source(int value)
{
    return static_cast<FileAdder::Asrc>(value);
}

inline void expectContext(const FileAdder::TimelineContext& context, const Timeline::Object* timeline,
                          const Timeline::Track* track, MTime position, int clipType, int trackLevel,
                          bool flag, int strategy)
{
    EXPECT_EQ(context.timeline, timeline);
    EXPECT_EQ(context.track, track);
    EXPECT_EQ(context.position, position);
    EXPECT_EQ(context.clipType, clipType);
    EXPECT_EQ(context.trackLevel, trackLevel);
    EXPECT_EQ(context.flag, flag);
    EXPECT_EQ(context.clipBuildingStrategy, strategy);
}

/// Every field differs from what the other constructors give.
inline FileAdder::TimelineContext fullContext()
{
    FileAdder::TimelineContext context(&someTimeline, &someTrack, MTime(250), Timeline::Clip::AudioClip, 3,
                                       true);
    context.clipBuildingStrategy = Timeline::ClipBuildingStrategy(4);
    return context;
}

inline void expectFullContext(const FileAdder::TimelineContext& context)
{
    expectContext(context, &someTimeline, &someTrack, 250, 2, 3, true, 4);
}

inline FileAdder::Contexts allContexts()
{
    return FileAdder::Contexts()
        .setContext(fullContext())
        .setContext(FileAdder::UserCollectionContext())
        .setContext(FileAdder::ResourceTableContext(&someTable));
}

inline void expectAllContexts(const FileAdder::Contexts& contexts)
{
    ASSERT_TRUE(contexts.timeline);
    expectFullContext(*contexts.timeline);
    EXPECT_TRUE(contexts.userCollection);
    ASSERT_TRUE(contexts.resourceTable);
    EXPECT_EQ(contexts.resourceTable->table, &someTable);
}

inline void expectRequest(const FileAdder::AddMediaFiles& request)
{
    EXPECT_EQ(request.sender, FileAdder::globalObject());
    EXPECT_EQ(request.files, twoFiles);
    EXPECT_EQ(request.source, 5);
    expectAllContexts(request.contexts);
}

} // namespace FileAdderTests
