// SPDX-License-Identifier: Apache-2.0
// Which of its structures an edit of a timeline changes, and which it leaves as they are.
#include "tests/timeline/Timelines.h"

#include <EditorModel/effects/Transition.h>
#include <EditorModel/timeline/Composition.h>

#include <gtest/gtest.h>

#include <array>
#include <functional>
#include <string>
#include <vector>

namespace {

using namespace TimelineTests;
using Timeline::ClipTiming;
using Timeline::TrackedObject;
using Timeline::TrackingLinkInfo;

using Names = std::set<std::string>;

/// Two tracks, each with two clips; in every structure something names the clips.
struct Stage
{
    std::array<Timeline::Clip, 5> clips;
    std::array<Timeline::Track, 3> tracks{Timeline::Track(TitleTrack), Timeline::Track(TitleTrack),
                                          Timeline::Track(TitleTrack)};
    std::array<Transition::Object, 2> transitions;
    std::array<Composition::Range, 2> ranges;
    Composition::Object composition;
    Timeline::Object timeline;

    Stage()
    {
        for (Timeline::Clip& clip : clips)
            clip.setSourceDuration(MTime(4000));
        timeline.addTrack(&tracks[0])->addTrack(&tracks[1]);
        for (int i = 0; i != 4; ++i)
            timeline.addClip(&clips[i], lying(&tracks[i / 2], i * 1000, 1000));
        timeline.addLink(&clips[0], &clips[2], MTime(5))->addLink(&clips[0], &clips[3], MTime(6));
        timeline.addTrackingLink(&clips[2], link(0))->addTrackingLink(&clips[3], link(0));
        timeline.addTransition(&transitions[0], {&clips[0], &clips[1]}, MTime(200));
        timeline.addExportRange(&ranges[0]);
    }

    TrackingLinkInfo link(int clip) const
    {
        return TrackingLinkInfo(TrackedObject(&clips[clip], QStringLiteral("id")), QPointF(1, 2));
    }
};

Names changedStructures(const Timeline::Object& before, const Timeline::Object& after)
{
    Names changed;
    const auto compare = [&](const char* name, bool isSame) {
        if (!isSame)
            changed.insert(name);
    };
    compare("clips", before.clips == after.clips);
    compare("links", before.links == after.links);
    compare("trackingLinks", before.trackingLinks == after.trackingLinks);
    compare("transitions", before.transitions == after.transitions);
    compare("tracks", before.tracks == after.tracks);
    compare("exportRanges", before.exportRanges == after.exportRanges);
    compare("scope", before.scope == after.scope);
    compare("composition", before.composition == after.composition);
    compare("markerUpdateEnabled", before.markerUpdateEnabled == after.markerUpdateEnabled);
    compare("width", before.width == after.width);
    compare("sampleRate", before.sampleRate == after.sampleRate);
    return changed;
}

struct Edit
{
    std::string name;
    std::function<Timeline::Object*(Timeline::Object&, Stage&)> carryOut;
    Names changes;
};

void PrintTo(const Edit& edit, std::ostream* out)
{
    *out << edit.name;
}

using Object = Timeline::Object;

const std::vector<Edit> edits = {
    {"AddingAClip", [](Object& o, Stage& s) { return o.addClip(&s.clips[4], ClipTiming()); }, {"clips"}},
    {"MovingAClip", [](Object& o, Stage& s) { return o.moveClip(&s.clips[0], MTime(9000)); }, {"clips"}},
    {"MovingAClipElsewhere",
     [](Object& o, Stage& s) { return o.moveClip(&s.clips[0], ClipTiming()); },
     {"clips"}},
    {"RemovingAClip", [](Object& o, Stage& s) { return o.removeClip(&s.clips[0]); }, {"clips"}},
    {"ClearingClips", [](Object& o, Stage&) { return o.clearClips(); }, {"clips"}},
    {"TrimmingTheLeft",
     [](Object& o, Stage& s) { return o.resizeClipLeft(&s.clips[0], MTime(9)); },
     {"clips"}},
    {"TrimmingTheRight",
     [](Object& o, Stage& s) { return o.resizeClipRight(&s.clips[0], MTime(9)); },
     {"clips"}},
    {"Reversing", [](Object& o, Stage& s) { return o.reverseClip(&s.clips[0]); }, {"clips"}},
    {"SettingADuration",
     [](Object& o, Stage& s) { return o.setClipDuration(&s.clips[0], MTime(1)); },
     {"clips"}},
    {"Slipping",
     [](Object& o, Stage& s) { return o.setClipSourcePosition(&s.clips[0], MTime(1)); },
     {"clips"}},
    {"FadingIn",
     [](Object& o, Stage& s) { return o.setClipFadeInDuration(&s.clips[0], MTime(1)); },
     {"clips"}},
    {"FadingOut",
     [](Object& o, Stage& s) { return o.setClipFadeOutDuration(&s.clips[0], MTime(1)); },
     {"clips"}},
    {"ChangingTheTrack",
     [](Object& o, Stage& s) { return o.setClipTrack(&s.clips[0], &s.tracks[2]); },
     {"clips"}},
    {"ChangingTheLevel", [](Object& o, Stage& s) { return o.setClipTrackLevel(&s.clips[0], 4); }, {"clips"}},
    {"CompensatingSpeed",
     [](Object& o, Stage& s) { return o.setClipSpeedCompensated(&s.clips[0], true); },
     {"clips"}},
    {"ChangingSpeed", [](Object& o, Stage& s) { return o.setClipSpeed(&s.clips[0], 2.0); }, {"clips"}},
    {"AddingATrack", [](Object& o, Stage& s) { return o.addTrack(&s.tracks[2]); }, {"tracks"}},
    {"RemovingATrack", [](Object& o, Stage& s) { return o.removeTrack(&s.tracks[0]); }, {"tracks"}},
    {"ClearingATrack", [](Object& o, Stage& s) { return o.clearTrack(&s.tracks[0]); }, {"clips"}},
    {"ClearingAnEmptyTrack", [](Object& o, Stage& s) { return o.clearTrack(&s.tracks[2]); }, {}},
    {"ClearingTracks", [](Object& o, Stage&) { return o.clearTracks(); }, {"tracks"}},
    {"MovingATrack", [](Object& o, Stage& s) { return o.moveTrack(&s.tracks[0], &s.tracks[1]); }, {"tracks"}},
    {"AddingALink",
     [](Object& o, Stage& s) { return o.addLink(&s.clips[1], &s.clips[2], MTime()); },
     {"links"}},
    {"RemovingALink", [](Object& o, Stage& s) { return o.removeLink(&s.clips[2]); }, {"links"}},
    {"RemovingALinkOfAMaster", [](Object& o, Stage& s) { return o.removeLink(&s.clips[0]); }, {}},
    {"ClearingLinks", [](Object& o, Stage&) { return o.clearLinks(); }, {"links"}},
    {"AddingATrackingLink",
     [](Object& o, Stage& s) { return o.addTrackingLink(&s.clips[1], s.link(0)); },
     {"trackingLinks"}},
    {"RemovingATrackingLink",
     [](Object& o, Stage& s) { return o.removeTrackingLink(&s.clips[2]); },
     {"trackingLinks"}},
    {"RemovingATrackedObject",
     [](Object& o, Stage&) { return o.removeTrackingLink(QStringLiteral("id")); },
     {"trackingLinks"}},
    {"ClearingWhatFollowsAClip",
     [](Object& o, Stage& s) { return o.clearTrackingLinks(&s.clips[0]); },
     {"trackingLinks"}},
    {"ClearingTrackingLinks", [](Object& o, Stage&) { return o.clearTrackingLinks(); }, {"trackingLinks"}},
    {"AddingATransition",
     [](Object& o, Stage& s) {
         return o.addTransition(&s.transitions[1], {&s.clips[2], &s.clips[3]}, MTime(100));
     },
     {"clips", "transitions"}},
    {"RemovingATransition",
     [](Object& o, Stage& s) { return o.removeTransition(&s.transitions[0]); },
     {"clips", "transitions"}},
    {"LengtheningATransition",
     [](Object& o, Stage& s) { return o.setTransitionDuration(&s.transitions[0], MTime(300)); },
     {"clips"}},
    {"ClearingTransitions", [](Object& o, Stage&) { return o.clearTransitions(); }, {"clips", "transitions"}},
    {"AddingAnExportRange",
     [](Object& o, Stage& s) { return o.addExportRange(&s.ranges[1]); },
     {"exportRanges"}},
    {"RemovingAnExportRange",
     [](Object& o, Stage& s) { return o.removeExportRange(&s.ranges[0]); },
     {"exportRanges"}},
    {"SettingTheScope", [](Object& o, Stage&) { return o.setScope(Object::Scope(3)); }, {"scope"}},
    {"SettingTheComposition",
     [](Object& o, Stage& s) { return o.setComposition(&s.composition); },
     {"composition"}},
    {"StoppingMarkers",
     [](Object& o, Stage&) { return o.setMarkerUpdateEnabled(false); },
     {"markerUpdateEnabled"}},
};

class Staleness : public ::testing::TestWithParam<Edit>
{
protected:
    Stage stage;
};

INSTANTIATE_TEST_SUITE_P(Edits, Staleness, ::testing::ValuesIn(edits),
                         [](const auto& instance) { return instance.param.name; });

TEST_P(Staleness, AnEditChangesWhatItsNameSaysAndNothingElse)
{
    const Timeline::Object before(stage.timeline);
    EXPECT_EQ(GetParam().carryOut(stage.timeline, stage), &stage.timeline);
    EXPECT_EQ(changedStructures(before, stage.timeline), GetParam().changes);
}

/// Through what they name, for structures can be equal and yet name what is gone.
TEST(StalenessOfNames, ARemovedClipStaysInAllThatNamesIt)
{
    Stage stage;
    stage.timeline.removeClip(&stage.clips[0])->removeClip(&stage.clips[2]);
    EXPECT_EQ(stage.timeline.masterOf(&stage.clips[2]), &stage.clips[0]);
    EXPECT_EQ(stage.timeline.getTrackingLink(&stage.clips[2])->trackedObject.clip, &stage.clips[0]);
    EXPECT_EQ(stage.timeline.outboundTransitionOf(&stage.clips[0]), &stage.transitions[0]);
    EXPECT_EQ(stage.timeline.clipTiming(&stage.clips[1]).transitionIn, MTime(100));
}

TEST(StalenessOfNames, ARemovedTrackIsStillTheTrackOfItsClips)
{
    Stage stage;
    stage.timeline.removeTrack(&stage.tracks[0]);
    EXPECT_EQ(stage.timeline.clipsAt(&stage.tracks[0]), (Clips{&stage.clips[0], &stage.clips[1]}));
    EXPECT_FALSE(stage.timeline.isTrackEmpty(&stage.tracks[0]));
    stage.timeline.clearTracks();
    EXPECT_EQ(stage.timeline.clips.size(), 4u);
}

} // namespace
