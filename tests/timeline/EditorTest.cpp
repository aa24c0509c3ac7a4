// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldTexts.h"
#include "tests/types/Printing.h"

#include <EditorModel/media/File.h>
#include <EditorModel/timeline/Editor.h>
#include <EditorModel/timeline/Timeline.h>

#include <gmock/gmock.h>

#include <type_traits>
#include <utility>

namespace FastTrack {

class Suppressor
{};
class Freezer
{};

} // namespace FastTrack

namespace {

using testing::ElementsAre;
using Timeline::Clip;

static_assert(Testing::isVirtualBase<Serialize::ISerializable, Editor::Object>);
static_assert(Testing::isVirtualBase<PubSub::Object, Editor::Object>);
static_assert(Testing::isVirtualBase<PubSub::Object, Ruler::Object>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, Ruler::Object>);
static_assert(Testing::isVirtualBase<PubSub::Object, FastTrack::Object>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, FastTrack::Object>);

const Timeline::Object someTimeline;
const PubSub::Object others[2] = {};
const Clip clips[2] = {};
const Media::File files[3] = {};
const FastTrack::Suppressor suppressors[2] = {};
const FastTrack::Freezer freezers[2] = {};

using Clips = std::set<const Clip*>;
using Files = std::set<const Media::File*>;

Editor::Object fullEditor()
{
    Editor::Object editor;
    editor.setTimeline(&someTimeline)->setClips({&clips[1], &clips[0]})->disable();
    editor.reservedFirst = &others[0];
    editor.reservedSecond = &others[1];
    return editor;
}

TEST(Editor, HasNothingToEditAtFirst)
{
    const Editor::Object editor;
    EXPECT_FALSE(editor.canEdit());
    EXPECT_FALSE(editor.isValid());
}

TEST(Editor, IsDisabledAndEnabledInAChain)
{
    Editor::Object editor;
    EXPECT_EQ(editor.disable(), &editor);
    EXPECT_FALSE(editor.enabled);
    EXPECT_EQ(editor.enable(), &editor);
    EXPECT_TRUE(editor.enabled);
}

TEST(Editor, KeepsItsClipsWhenItIsGivenThem)
{
    Editor::Object editor = fullEditor();
    const auto first = editor.clips.begin();
    EXPECT_EQ(editor.setClips(editor.clips), &editor);
    EXPECT_EQ(editor.clips, (Clips{&clips[0], &clips[1]}));
    EXPECT_EQ(editor.clips.begin(), first);
}

TEST(Editor, CanEditClipsWhileItIsEnabled)
{
    Editor::Object editor;
    EXPECT_TRUE(editor.setClips({&clips[0]})->canEdit());
    EXPECT_FALSE(editor.disable()->canEdit());
    EXPECT_TRUE(editor.enable()->canEdit());
    EXPECT_FALSE(editor.setClips({})->canEdit());
}

TEST(Editor, IsValidWithAllThreeOfItsObjects)
{
    EXPECT_TRUE(fullEditor().isValid());
    Editor::Object editor = fullEditor();
    editor.setTimeline(nullptr);
    EXPECT_FALSE(editor.isValid());
    editor = fullEditor();
    editor.reservedFirst = nullptr;
    EXPECT_FALSE(editor.isValid());
    editor = fullEditor();
    editor.reservedSecond = nullptr;
    EXPECT_FALSE(editor.isValid());
}

TEST(Editor, IsMadeByName)
{
    Testing::expectMadeByName<Editor::Object>("Editor::Object");
}

TEST(Editor, StoresItsSwitchAndItsClips)
{
    EXPECT_THAT(Testing::fieldKeys(fullEditor()), ElementsAre("enabled", "clips"));
    const Editor::Object editor = fullEditor();
    for (const Way& way : allWays) {
        SCOPED_TRACE(way.name);
        const Document::Graph graph = graphOf(documentOf({&editor}, way));
        const auto* const loaded = graph.rootAs<Editor::Object>();
        ASSERT_NE(loaded, nullptr);
        EXPECT_FALSE(loaded->enabled);
        EXPECT_EQ(loaded->clips.size(), 2u);
        EXPECT_EQ(loaded->timeline, nullptr);
        EXPECT_EQ(loaded->reservedFirst, nullptr);
        EXPECT_EQ(loaded->reservedSecond, nullptr);
    }
}

using Beats = std::map<MTime, bool>;

TEST(Ruler, KeepsItsBeatsWhenItIsGivenThem)
{
    Ruler::Object ruler;
    ruler.setBeats({{250, false}, {1000, true}});
    const auto first = ruler.beats.begin();
    EXPECT_EQ(ruler.setBeats(ruler.beats), &ruler);
    EXPECT_EQ(ruler.beats, (Beats{{250, false}, {1000, true}}));
    EXPECT_EQ(ruler.beats.begin(), first);
}

TEST(FastTrack, IsOffAtFirst)
{
    const FastTrack::Object track;
    EXPECT_FALSE(track.active());
    EXPECT_FALSE(track.freezed());
}

TEST(FastTrack, OperationsReturnTheTrack)
{
    FastTrack::Object track;
    EXPECT_EQ(track.addFile(&files[0]), &track);
    EXPECT_EQ(track.removeFile(&files[0]), &track);
    EXPECT_EQ(track.setFiles({}), &track);
    EXPECT_EQ(track.setContentPath(QString()), &track);
    EXPECT_EQ(track.setEnabled(true), &track);
    EXPECT_EQ(track.suppress(&suppressors[0]), &track);
    EXPECT_EQ(track.unsuppress(&suppressors[0]), &track);
    EXPECT_EQ(track.freeze(&freezers[0]), &track);
    EXPECT_EQ(track.unfreeze(&freezers[0]), &track);
}

TEST(FastTrack, HoldsASetOfFiles)
{
    FastTrack::Object track;
    track.addFile(&files[1])->addFile(&files[0])->addFile(&files[1]);
    EXPECT_EQ(track.files, (Files{&files[0], &files[1]}));
    track.removeFile(&files[1])->removeFile(&files[2]);
    EXPECT_EQ(track.files, (Files{&files[0]}));
    track.setFiles({&files[2]});
    EXPECT_EQ(track.files, (Files{&files[2]}));
}

TEST(FastTrack, TakesASetOfFilesOver)
{
    Files taken = {&files[0]};
    const auto first = taken.begin();
    FastTrack::Object track;
    track.setFiles(std::move(taken));
    EXPECT_EQ(track.files.begin(), first);
}

TEST(FastTrack, StoresItsPath)
{
    FastTrack::Object track;
    track.setContentPath(QStringLiteral("/content"));
    EXPECT_EQ(track.contentPath, QStringLiteral("/content"));
}

TEST(FastTrack, IsActiveWhenItIsEnabled)
{
    FastTrack::Object track;
    EXPECT_TRUE(track.setEnabled(true)->active());
    EXPECT_FALSE(track.setEnabled(false)->active());
}

TEST(FastTrack, IsSuppressedUntilTheLastSuppressorWithdraws)
{
    FastTrack::Object track;
    track.setEnabled(true)->suppress(&suppressors[0])->suppress(&suppressors[1]);
    EXPECT_FALSE(track.unsuppress(&suppressors[0])->active());
    EXPECT_TRUE(track.unsuppress(&suppressors[1])->active());
    EXPECT_FALSE(track.freezed());
}

TEST(FastTrack, CountsASuppressorOnce)
{
    FastTrack::Object track;
    track.setEnabled(true)->suppress(&suppressors[0])->suppress(&suppressors[0]);
    EXPECT_FALSE(track.active());
    EXPECT_TRUE(track.unsuppress(&suppressors[0])->active());
    EXPECT_TRUE(track.unsuppress(&suppressors[1])->active());
}

TEST(FastTrack, IsFrozenUntilTheLastFreezerWithdraws)
{
    FastTrack::Object track;
    track.freeze(&freezers[0])->freeze(&freezers[1])->freeze(&freezers[0]);
    EXPECT_TRUE(track.freezed());
    EXPECT_TRUE(track.unfreeze(&freezers[0])->freezed());
    EXPECT_FALSE(track.unfreeze(&freezers[1])->freezed());
}

TEST(FastTrack, IsActiveOrNotWhetherFrozenOrNot)
{
    FastTrack::Object track;
    EXPECT_FALSE(track.freeze(&freezers[0])->active());
    EXPECT_TRUE(track.setEnabled(true)->active());
    EXPECT_TRUE(track.unfreeze(&freezers[0])->active());
}

} // namespace
