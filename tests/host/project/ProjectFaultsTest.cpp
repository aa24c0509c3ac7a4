// SPDX-License-Identifier: Apache-2.0
#include "tests/host/shared/Samples.h"

#include "host/analysis/TrackingStore.h"
#include "host/media/MediaDescriber.h"
#include "host/media/MediaOpener.h"
#include "host/media/ResourceKeeper.h"
#include "host/project/ProjectFaults.h"

#include <EditorModel/effects/Transition.h>
#include <EditorModel/library/Import.h>
#include <EditorModel/library/UserObject.h>
#include <EditorModel/media/File.h>
#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/timeline/Timeline.h>

#include <QRegularExpression>

#include <gmock/gmock.h>

#include <functional>
#include <limits>
#include <ostream>
#include <set>

namespace Host {

void PrintTo(const ProjectFault& fault, std::ostream* stream)
{
    *stream << ruleOf(fault.code).name << ": " << fault.about.toStdString() << ": "
            << fault.text.toStdString();
}

} // namespace Host

namespace {

using namespace HostTests;
using namespace Host;
using testing::ElementsAre;
using testing::Field;
using testing::IsEmpty;
using Timeline::Clip;
using Timeline::ClipTiming;
using Timeline::Track;

constexpr double nan = std::numeric_limits<double>::quiet_NaN();
constexpr double infinity = std::numeric_limits<double>::infinity();

/// A sound project with something of everything: two clips of one film that meet, a transition between them,
/// and a title that depends on the second one and follows what is tracked in it.
class SoundProject
{
public:
    SoundProject()
    {
        describe(sample("film.mp4"));
        content.timeline = &timeline;
        content.resourceTable = &table;
        content.userCollection = &collection;
        timeline.addTrack(&primary)->addTrack(&title);
        primary.setTimeline(&timeline);
        title.setTimeline(&timeline);
        for (Clip* const clip : {&a, &b}) {
            clip->setTimeline(&timeline)->setType(Clip::VideoClip)->setFile(&file);
            clip->setMediaTrack(file.videoTracks.front()->index)->setSourceDuration(5000);
        }
        a.setName("a")->setVolumeEnvelope(&gain);
        b.setName("b")->setMoveEnvelope(&pose)->addMotionTracking("face");
        s.setTimeline(&timeline)->setType(Clip::OverlayClip)->setName("s")->setSourceDuration(5000);
        timeline.addClip(&a, ClipTiming(&primary, 0, 0, 1000, 0, 5000));
        timeline.addClip(&b, ClipTiming(&primary, 0, 1000, 1000, 0, 5000));
        timeline.addClip(&s, ClipTiming(&title, 0, 1200, 500, 0, 5000));
        timeline.addLink(&b, &s, 200)->addTransition(&between, {&a, &b}, 600);
        timeline.addTrackingLink(&s, Timeline::TrackingLinkInfo({&b, "face"}, QPointF()));
        gain.addKeyValue(0.0, 1.0)->addKeyValue(1.0, 0.5);
        pose.addKeyValue(0.0, Transformation::Object());
        table.resource2fileInfo[{ResourceKeeper::identifier(file.path, 0), Resource::VideoType}].info.path =
            file.path;
        collection.addItem(&item);
        trackings.put(MotionTracking::Data("face"));
    }

    std::vector<ProjectFault> faults() const
    {
        return projectFaults({{&content}, &content, QString(), trackings});
    }

    /// The codes of all faults, each once.
    std::set<int> codes() const
    {
        std::set<int> codes;
        for (const ProjectFault& fault : faults()) {
            codes.insert(fault.code);
        }
        return codes;
    }

    Media::File file;
    Media::File::Track::Video video;
    Media::File::Track::Audio sound;
    Track primary{PrimaryTrack};
    Track title{TitleTrack};
    Clip a, b, s;
    /// On no timeline.
    Clip away;
    VolumeEnvelope gain;
    TransformationEnvelope pose;
    Transition::Object between, other;
    Import::Object item;
    EditorCollection::UserObject collection;
    ResourceTable::Object table;
    Timeline::Object timeline;
    Project::Content content;
    TrackingStore trackings;

private:
    /// As a document would have it, without the module that opened it.
    void describe(const QString& path)
    {
        const MediaOpener opener;
        MediaDescriber describer;
        file = describer.describe(path).file;
        video = *file.videoTracks.front();
        sound = *file.audioTracks.front();
        video.file = sound.file = &file;
        file.clearTracks()->addTrack(&video)->addTrack(&sound);
    }
};

struct Damage
{
    FaultCode code;
    const char* name;
    std::function<void(SoundProject& p)> damage;
};

/// For every code what brings about just this fault.
const std::vector<Damage>& damages()
{
    static const Folder folder;
    static const std::vector<Damage> damages = {
        {NoTimeline, "ATimelineIsMissing", [](SoundProject& p) { p.content.timeline = nullptr; }},
        {NullClip, "NullIsListedAsAClip",
         [](SoundProject& p) { p.timeline.addClip(nullptr, ClipTiming(&p.primary, 0, 9000, 1, 0, 1)); }},
        {NoTrack, "AClipLiesOnNoTrack", [](SoundProject& p) { p.timeline.setClipTrack(&p.s, nullptr); }},
        {TimeOutOfRange, "AClipStartsTooLate",
         [](SoundProject& p) { p.timeline.moveClip(&p.s, MTime(qint64(1) << 31)); }},
        {NoDuration, "AClipHasNoDuration", [](SoundProject& p) { p.timeline.setClipDuration(&p.s, 0); }},
        {OutsideSource, "AClipShowsMoreThanItsSource",
         [](SoundProject& p) { p.timeline.setClipSourcePosition(&p.s, 4800); }},
        {EndsTooLong, "FadesAreLongerThanTheClip",
         [](SoundProject& p) { p.timeline.setClipFadeInDuration(&p.s, 501); }},
        {Overlap, "AClipLiesOnAnother", [](SoundProject& p) { p.timeline.setClipTrack(&p.s, &p.primary); }},
        {TrackTwice, "ATrackIsListedTwice", [](SoundProject& p) { p.timeline.addTrack(&p.title); }},
        {ForeignTrack, "ATrackIsAnotherTimelines", [](SoundProject& p) { p.title.setTimeline(nullptr); }},
        {ShowsItself, "AClipShowsItsTimeline", [](SoundProject& p) { p.s.setNestedTimeline(&p.timeline); }},
        {DanglingLink, "AMasterIsGone", [](SoundProject& p) { p.timeline.addLink(&p.away, &p.s, 0); }},
        {LinkCycle, "AMasterIsItsOwnSlave", [](SoundProject& p) { p.timeline.addLink(&p.s, &p.b, 0); }},
        {DanglingTracking, "WhatIsFollowedIsGone",
         [](SoundProject& p) {
             p.timeline.addTrackingLink(&p.s, Timeline::TrackingLinkInfo({&p.away, "face"}, QPointF()));
         }},
        {DanglingTransition, "ATransitionLeavesAClipThatIsGone",
         [](SoundProject& p) {
             p.timeline.transitions[&p.other] = {&p.away, nullptr};
         }},
        {TransitionOnNothing, "ATransitionHasNoClips",
         [](SoundProject& p) {
             p.timeline.transitions[&p.other] = {nullptr, nullptr};
         }},
        {TransitionApart, "AGapIsInATransition", [](SoundProject& p) { p.timeline.moveClip(&p.b, 1001); }},
        {CrowdedTransition, "TwoTransitionsLeaveAClip",
         [](SoundProject& p) {
             p.timeline.transitions[&p.other] = {&p.a, nullptr};
         }},
        {WrongShare, "AShareIsThatOfNoTransition",
         [](SoundProject& p) { p.timeline.clips.at(&p.s).setTransitionIn(10); }},
        {ValueOutOfRange, "AVolumeIsNegative", [](SoundProject& p) { p.a.setVolume(-1); }},
        {ValueOutOfRange, "APoseIsMoreThanOpaque",
         [](SoundProject& p) { p.pose.keyValues.front().value.setOpacity(101); }},
        {ValueOutOfRange, "AGainIsNegative", [](SoundProject& p) { p.gain.keyValues.front().value = -0.5; }},
        {ValueOutOfRange, "AGainIsInfinite",
         [](SoundProject& p) { p.gain.keyValues.front().value = infinity; }},
        {ValueOutOfRange, "AKeyIsInfinitelyFar",
         [](SoundProject& p) { p.gain.keyValues.back().step = infinity; }},
        {ValueOutOfRange, "APictureHasNoWidth", [](SoundProject& p) { p.timeline.width = 0; }},
        {ValueOutOfRange, "ARateIsDividedByZero", [](SoundProject& p) { p.timeline.frameRateD = 0; }},
        {ValueOutOfRange, "SoundHasNoRate", [](SoundProject& p) { p.timeline.sampleRate = 0; }},
        {ValueOutOfRange, "ASourceIsNegative", [](SoundProject& p) { p.s.setSourceDuration(-1); }},
        {EmptyEnvelope, "AnEnvelopeHasNoKeys", [](SoundProject& p) { p.gain.keyValues.clear(); }},
        {UnsortedKeys, "KeysAreOutOfOrder",
         [](SoundProject& p) { std::swap(p.gain.keyValues.front(), p.gain.keyValues.back()); }},
        {DoubleKey, "TwoKeysAreAtOnePlace",
         [](SoundProject& p) { p.pose.keyValues.push_back(p.pose.keyValues.front()); }},
        {NotANumber, "AGainIsNotANumber", [](SoundProject& p) { p.gain.defaultValue = nan; }},
        {NotANumber, "AnOffsetIsNotANumber",
         [](SoundProject& p) { p.timeline.trackingLinks.at(&p.s).setObjectRelativeOffset(QPointF(0, nan)); }},
        {UnknownTracking, "WhatIsFollowedIsNotTracked",
         [](SoundProject& p) {
             p.timeline.addTrackingLink(&p.s, Timeline::TrackingLinkInfo({&p.b, "hand"}, QPointF()));
         }},
        {LostTracking, "ATrackingIsLost", [](SoundProject& p) { p.trackings.remove("face"); }},
        {MissingMedia, "AFileIsMissing",
         [](SoundProject& p) {
             p.file.setPath("/no/such/film.mp4");
             p.table.resource2fileInfo.begin()->second.info.path = p.file.path;
         }},
        {UnreadableMedia, "AFileIsNoMedia",
         [](SoundProject& p) {
             p.file.setPath(folder.write("letter.mp4", "Dear Sir or Madam,\n"));
             p.table.resource2fileInfo.begin()->second.info.path = p.file.path;
         }},
        {ChangedMedia, "AFileHasAnotherLength",
         [](SoundProject& p) { p.file.setLength(p.file.length + 40); }},
        {ChangedMedia, "AFileHasLostItsSound", [](SoundProject& p) { p.file.audioTracks.clear(); }},
        {NoMediaTrack, "AFileHasNoSuchTrack", [](SoundProject& p) { p.a.setMediaTrack(7); }},
        {MissingResource, "TheFileOfAResourceIsMissing",
         [](SoundProject& p) {
             p.table.resource2fileInfo[{"r", Resource::AudioType}].info.path = "/no/such/song.mp3";
         }},
        {UnlistedMedia, "AFileIsNotInTheTable", [](SoundProject& p) { p.table.clear(); }},
        {UnlistedMedia, "ThereIsNoTable", [](SoundProject& p) { p.content.resourceTable = nullptr; }},
        {NullItem, "NullIsListedAsAnItem", [](SoundProject& p) { p.collection.addItem(nullptr); }},
        {DoubleItem, "AnItemIsListedTwice", [](SoundProject& p) { p.collection.addItem(&p.item); }},
    };
    return damages;
}

class Faults : public testing::TestWithParam<Damage>
{};
INSTANTIATE_TEST_SUITE_P(Of, Faults, testing::ValuesIn(damages()),
                         [](const auto& damage) { return std::string(damage.param.name); });

TEST_P(Faults, AreToldByTheirCodeAlone)
{
    SoundProject project;
    EXPECT_THAT(project.faults(), IsEmpty());
    GetParam().damage(project);
    EXPECT_THAT(project.codes(), ElementsAre(GetParam().code));
    for (const ProjectFault& fault : project.faults()) {
        EXPECT_FALSE(fault.about.isEmpty());
        EXPECT_TRUE(fault.text.endsWith('.')) << fault.text.toStdString();
        EXPECT_TRUE(fault.text.at(0).isUpper()) << fault.text.toStdString();
    }
}

TEST(ProjectFaults, AnObjectIsHeldInOneWay)
{
    SoundProject project;
    const auto& key = project.gain.keyValues.front();
    const auto faults =
        projectFaults({{&key, &project.content}, &project.content, QString(), project.trackings});
    EXPECT_THAT(faults, ElementsAre(Field(&ProjectFault::code, HeldTwice)));
}

TEST(ProjectFaults, EveryCodeHasADocumentThatShowsIt)
{
    std::set<int> shown = {HeldTwice};
    for (const Damage& damage : damages()) {
        shown.insert(damage.code);
    }
    for (int code = 0; code != FaultCodeCount; ++code) {
        EXPECT_EQ(shown.count(code), 1u) << ruleOf(FaultCode(code)).name;
    }
}

TEST(ProjectFaults, EveryCodeHasANameOfItsOwn)
{
    ASSERT_EQ(faultRules().size(), std::size_t(FaultCodeCount));
    std::set<QString> names;
    for (int code = 0; code != FaultCodeCount; ++code) {
        const FaultRule& rule = faultRules().at(std::size_t(code));
        EXPECT_EQ(rule.code, code) << rule.name;
        EXPECT_TRUE(QRegularExpression("^[a-z]+(-[a-z]+)*$").match(rule.name).hasMatch()) << rule.name;
        EXPECT_TRUE(names.insert(rule.name).second) << rule.name;
        EXPECT_TRUE(QString(rule.advice).endsWith('.')) << rule.name;
        EXPECT_THAT(faultCodesText(), testing::HasSubstr(std::string("  ") + rule.name + " "));
    }
}

TEST(ProjectFaults, NameClipsAsTheyAreShown)
{
    SoundProject project;
    project.b.setVolume(-5);
    const std::vector<ProjectFault> faults = project.faults();
    ASSERT_EQ(faults.size(), 1u);
    EXPECT_EQ(faults[0].about, "clip 2 \"b\"");
    EXPECT_EQ(faults[0].text, "Clip 2 \"b\" has a volume of -5 percent.");
}

TEST(ProjectFaults, AreFoundInNestedTimelines)
{
    SoundProject project;
    Timeline::Object nested;
    Track track(PrimaryTrack);
    Clip inner;
    nested.addTrack(&track);
    track.setTimeline(&nested);
    inner.setName("inner")->setVolume(-1)->setTimeline(&nested)->setSourceDuration(10);
    nested.addClip(&inner, ClipTiming(&track, 0, 0, 10, 0, 10));
    project.s.setNestedTimeline(&nested);
    const std::vector<ProjectFault> faults = project.faults();
    ASSERT_EQ(faults.size(), 1u);
    EXPECT_EQ(faults[0].about, "clip 1 \"inner\" in the timeline of clip 3 \"s\"");
}

TEST(ProjectFaults, TellWhyATrackingIsLost)
{
    const Folder folder;
    folder.write(TrackingStore::fileNameOf("face"), "{");
    SoundProject project;
    project.trackings.load(folder.path());
    const std::vector<ProjectFault> faults = project.faults();
    ASSERT_EQ(faults.size(), 1u);
    EXPECT_THAT(faults[0].text.toStdString(),
                testing::StartsWith(
                    "Clip 2 \"b\" has lost the tracking \"face\": its file t-face.json is damaged: "));
}

TEST(ProjectFaults, RelativeNamesOfMediaCountFromTheFolderOfTheProject)
{
    SoundProject project;
    project.file.setPath("film.mp4");
    const auto faults =
        projectFaults({{&project.content}, &project.content, HOST_SAMPLES, project.trackings});
    EXPECT_THAT(faults, IsEmpty());
}

TEST(ProjectFaults, APlainDocumentNeedsNoTable)
{
    SoundProject project;
    EXPECT_THAT(projectFaults({{&project.timeline}, nullptr, QString(), project.trackings}), IsEmpty());
    EXPECT_THAT(projectFaults({{}, nullptr, QString(), project.trackings}), IsEmpty());
}

} // namespace
