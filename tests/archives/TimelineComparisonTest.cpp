// SPDX-License-Identifier: Apache-2.0
// The comparison of timelines would be worth nothing if there were a difference that it did not see.
#include "tests/shared/TimelineComparison.h"
#include "tests/shared/FullProject.h"
#include "tests/shared/FullTimeline.h"

#include <EditorModel/persistence/Fields.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <functional>
#include <ostream>
#include <set>
#include <string>
#include <utility>
#include <vector>

namespace {

using ::testing::Contains;
using ::testing::EndsWith;
using Testing::FullProject;
using Testing::FullTimeline;
using ::testing::IsEmpty;
using Testing::projectDifferences;
using Testing::timelineDifferences;

TEST(TimelineComparison, TwoOfOneMakeAreEqual)
{
    const FullTimeline first;
    const FullTimeline second;
    EXPECT_THAT(timelineDifferences(first.timeline, second.timeline), IsEmpty());
    EXPECT_THAT(timelineDifferences(first.nested, second.nested), IsEmpty());
}

TEST(TimelineComparison, TimesAreComparedByTheBitsThatAreStored)
{
    const FullTimeline stored;
    FullTimeline loaded;
    const std::vector<std::string> durations = {"clips[still]/key/sourceDuration",
                                                "clips[still]/value/sourceDuration"};
    EXPECT_EQ(timelineDifferences(stored.timeline, loaded.timeline, true), durations);
    loaded.clip("still").setSourceDuration(5);
    loaded.timeline.clips.at(&loaded.clip("still")).setSourceDuration(5);
    EXPECT_THAT(timelineDifferences(stored.timeline, loaded.timeline, true), IsEmpty());
    EXPECT_EQ(timelineDifferences(stored.timeline, loaded.timeline), durations);
}

struct Change
{
    const char* name;
    /// How the place ends: an object is compared where the walk comes first.
    const char* place;
    std::function<void(FullTimeline& full)> make;
};

void PrintTo(const Change& change, std::ostream* stream)
{
    *stream << change.name;
}

class TimelineChange : public ::testing::TestWithParam<Change>
{};

TEST_P(TimelineChange, IsNoticedWhereItWasMade)
{
    const FullTimeline stored;
    FullTimeline loaded;
    GetParam().make(loaded);
    EXPECT_THAT(timelineDifferences(stored.timeline, loaded.timeline), Contains(EndsWith(GetParam().place)));
}

const std::vector<Change> changes = {
    {"AnotherWidth", "width", [](FullTimeline& f) { f.timeline.width += 1; }},
    {"AnotherSampleRate", "sampleRate", [](FullTimeline& f) { f.timeline.sampleRate += 1; }},
    {"AnotherFormatWithin", "labels[splash]/timeline/height", [](FullTimeline& f) { f.nested.height += 1; }},
    {"AScope", "scope", [](FullTimeline& f) { f.timeline.setScope(Timeline::Object::Scope(1)); }},
    {"AReservedText", "reservedText", [](FullTimeline& f) { f.timeline.reservedText = QStringLiteral("x"); }},
    {"AnExportRange", "exportRanges", [](FullTimeline& f) { f.timeline.addExportRange(nullptr); }},
    {"NoMarkerUpdates", "markerUpdateEnabled",
     [](FullTimeline& f) { f.timeline.setMarkerUpdateEnabled(false); }},
    {"ALostClip", "clips[song]", [](FullTimeline& f) { f.timeline.removeClip(&f.clip("song")); }},
    {"AnotherClip", "clips",
     [](FullTimeline& f) { f.timeline.addClip(&f.clips.emplace_back(), Timeline::ClipTiming()); }},
    {"TwoClipsOfOneName", "clips", [](FullTimeline& f) { f.clip("song").setName(QStringLiteral("beach")); }},
    {"ASlightlyOtherStep", "volumeEnvelope/keyValues[1]/step",
     [](FullTimeline& f) { f.volumeEnvelopes[0].keyValues[1].step += 1e-15; }},
    {"AnotherTiming", "clips[song]/value/fadeOutDuration",
     [](FullTimeline& f) { f.timeline.setClipFadeOutDuration(&f.clip("song"), 901); }},
    {"AnotherOrderOfEffects", "clips[Möwe]/key/effects[0]/uniqueId",
     [](FullTimeline& f) { std::swap(f.clip("Möwe").effects[0], f.clip("Möwe").effects[1]); }},
    {"OneEffectLess", "clips[Möwe]/key/effects", [](FullTimeline& f) { f.clip("Möwe").effects.pop_back(); }},
    {"AnotherText", "clips[caption]/key/overlay/items[0]/text",
     [](FullTimeline& f) { f.overlays[0].items[0].text += QLatin1Char(' '); }},
    {"AnotherSetOfAnswers", "clips[question]/key/quiz/questions[0]/correctAnswers",
     [](FullTimeline& f) { f.quizzes[0].questions[0].correctAnswers.erase(QStringLiteral("this")); }},
    {"AnotherBeat", "rhythm/beats",
     [](FullTimeline& f) {
         auto beat = f.rhythms[0].beats.extract(500);
         beat.key() = 501;
         f.rhythms[0].beats.insert(std::move(beat));
     }},
    {"ALostTracking", "clips[beach]/key/motionTrackings",
     [](FullTimeline& f) { f.clip("beach").removeMotionTracking(QStringLiteral("{a}")); }},
    {"ARange", "clips[beach]/key/range",
     [](FullTimeline& f) {
         static const Composition::Range range;
         f.clip("beach").setRange(&range);
     }},
    {"ATimeOfChange", "file/lastModified", [](FullTimeline& f) { f.files[0].setLastModified(1); }},
    {"AnotherOrderOfTracks", "tracks[0]",
     [](FullTimeline& f) { std::swap(f.timeline.tracks[0], f.timeline.tracks[1]); }},
    {"ALinkTurnedRound", "links[beach sound]",
     [](FullTimeline& f) {
         f.timeline.removeLink(&f.clip("beach sound"));
         f.timeline.addLink(&f.clip("beach sound"), &f.clip("beach"), 0);
     }},
    {"AnotherOffsetOfALink", "links[caption]/value/offset",
     [](FullTimeline& f) { f.timeline.links.at(&f.clip("caption")).offset = 2001; }},
    {"ASlightlyOtherPoint", "trackingLinks[caption]/value/objectRelativeOffset",
     [](FullTimeline& f) {
         f.timeline.trackingLinks.at(&f.clip("caption")).objectRelativeOffset.rx() += 1e-13;
     }},
    {"APairTurnedRound", "transitions[in]/value/first",
     [](FullTimeline& f) {
         Timeline::ClipPair& pair = f.timeline.transitions.at(&f.transitions[1]);
         std::swap(pair.first, pair.second);
     }},
    {"AnotherResource", "transitions[dissolve]/key/resources[1]",
     [](FullTimeline& f) { std::get<0>(f.transitions[0].resources[1]) = QStringLiteral("other"); }},
    // Objects that were one are two; the later one, as the walk goes, is not the partner.
    {"AnEffectNoLongerShared", "clips[beach]/key/effects[2]",
     [](FullTimeline& f) {
         f.effects.push_back(f.effects[0]);
         f.clip("beach").effects[2] = &f.effects.back();
     }},
    {"AFileNoLongerShared", "clips[intro]/key/file",
     [](FullTimeline& f) {
         f.files.push_back(f.files[0]);
         f.clip("intro").setFile(&f.files.back());
     }},
    {"ALabelNoLongerShared", "clips[beach sound]/key/labels[wave]",
     [](FullTimeline& f) {
         f.labels.push_back(f.labels[0]);
         f.clip("beach sound").removeLabel(&f.labels[0])->addLabel(&f.labels.back());
     }},
    {"ATransitionNoLongerShared", "transitions[dissolve]/key",
     [](FullTimeline& f) {
         f.transitions.push_back(f.transitions[0]);
         f.innermost.transitions = {{&f.transitions.back(), {nullptr, nullptr}}};
     }},
    {"AMirrorOfACopy", "clips[mirror]/key/nestedTimeline",
     [](FullTimeline& f) {
         static Timeline::Object copy;
         copy = f.timeline;
         f.clip("mirror").setNestedTimeline(&copy);
     }},
    // Objects that were two are one.
    {"EqualEffectsMadeOne", "clips[chapter]/key/effects[0]",
     [](FullTimeline& f) { f.clip("chapter").effects[0] = &f.effects[4]; }},
    {"EqualEnvelopesMadeOne", "clips[song again]/key/volumeEnvelope",
     [](FullTimeline& f) { f.clip("song again").setVolumeEnvelope(&f.volumeEnvelopes[1]); }},
    {"EqualLabelsMadeOne", "clips[beach sound]/key/labels[equal]",
     [](FullTimeline& f) { f.clip("beach sound").removeLabel(&f.labels[3])->addLabel(&f.labels[2]); }},
    {"EqualTracksMadeOne", "tracks[4]",
     [](FullTimeline& f) {
         f.timeline.tracks[4] = f.timeline.tracks[3];
         f.timeline.setClipTrack(&f.clip("song again"), f.timeline.tracks[3]);
     }},
};

INSTANTIATE_TEST_SUITE_P(Changes, TimelineChange, ::testing::ValuesIn(changes),
                         [](const auto& instance) { return std::string(instance.param.name); });

/// A field that can be changed where it stands, and changed back.
struct Site
{
    std::string place;
    std::function<void()> change;
    std::function<void()> undo;
};

/// Finds every stored field in a graph. Keys of maps and items of sets stay as they are, on which their order
/// rests, and so do the values that are stored in another form.
class Sites final : public Serialize::Fields
{
public:
    template <class T>
    explicit Sites(const T& root) : Fields(false)
    {
        const T* pointer = &root;
        (*this)("root", pointer);
        // The pointer to the root is not in the graph.
        m_sites.erase(m_sites.begin());
    }

    const std::vector<Site>& sites() const { return m_sites; }

private:
    struct Changer
    {
        Sites& sites;
        const Serialize::Key& key;
        void* address;

        void operator()(bool*) const
        {
            add<bool>([](bool& v) { v = !v; });
        }
        void operator()(int*) const
        {
            add<int>([](int& v) { v ^= 1; });
        }
        void operator()(quint32*) const
        {
            add<quint32>([](quint32& v) { v ^= 1; });
        }
        void operator()(qint64*) const
        {
            add<qint64>([](qint64& v) { v ^= 1; });
        }
        void operator()(double*) const
        {
            add<double>([](double& v) { v += 0.5; });
        }
        void operator()(std::string*) const
        {
            add<std::string>([](std::string& v) { v += 'x'; });
        }
        void operator()(QString*) const
        {
            add<QString>([](QString& v) { v += QLatin1Char('x'); });
        }
        void operator()(MTime*) const
        {
            add<MTime>([](MTime& v) { v += MTime(1); });
        }
        void operator()(QPointF*) const
        {
            add<QPointF>([](QPointF& v) { v.ry() += 0.5; });
        }
        void operator()(std::shared_ptr<const Types::Image>*) const { FAIL() << "no clip holds a picture"; }

        template <class T, class Change>
        void add(Change change) const
        {
            T* const field = static_cast<T*>(address);
            sites.m_sites.push_back(
                {key.archive, [=] { change(*field); }, [=, old = *field] { *field = old; }});
        }
    };

    void onScalar(const Serialize::Key& key, const Serialize::Scalar& value, const void* address) override
    {
        if (!std::exchange(m_isKey, false) && address && !m_isInSet)
            std::visit(Changer{*this, key, const_cast<void*>(address)}, value);
    }

    void onObject(const Serialize::Key&, const Serialize::Type& type, void* object) override
    {
        type.visit(*this, object);
    }

    void onBase(const Serialize::Key&, const Serialize::Type& type, void* object) override
    {
        type.visit(*this, object);
    }

    void onPointer(const Serialize::Key& key, const Serialize::PointerField& field) override
    {
        const Serialize::Pointee pointee = field.access.get(field);
        const bool isInOrder = std::exchange(m_isKey, false) || m_isInSet;
        if (!pointee.object)
            return;
        if (!isInOrder) {
            m_sites.push_back({key.archive,
                               [=] {
                                   field.access.set(field, {nullptr, nullptr});
                               },
                               [=] { field.access.set(field, pointee); }});
        }
        if (!m_met.insert(pointee.object).second)
            return;
        const bool outer = std::exchange(m_isInSet, false);
        pointee.type->visit(*this, pointee.object);
        m_isInSet = outer;
    }

    void onContainer(const Serialize::Key&, const Serialize::Type& type, void* container) override
    {
        // The key of an entry.
        if (std::exchange(m_isKey, false))
            return;
        const bool isSet = std::string(type.info.name()).rfind("St3set", 0) == 0;
        const bool outer = std::exchange(m_isInSet, isSet);
        type.visit(*this, container);
        m_isInSet = outer;
    }

    int onBeginSequence(Serialize::SequenceKind, int count) override { return count; }
    void onBeginItem(int) override {}
    void onEndItem(int) override {}
    void onEndSequence(int) override {}

    void onEntry(const Serialize::Type& pair, void* entry) override
    {
        m_isKey = true;
        pair.visit(*this, entry);
    }

    void onBinary(QByteArray&, int) override { FAIL() << "no clip holds bytes"; }
    std::shared_ptr<const Types::Image> onShare(const Types::Image*) override { return nullptr; }

    /// The next field is the key of an entry.
    bool m_isKey = false;
    bool m_isInSet = false;
    std::set<const void*> m_met;
    std::vector<Site> m_sites;
};

TEST(TimelineComparison, EveryFieldThatIsStoredIsCompared)
{
    const FullTimeline stored;
    FullTimeline loaded;
    const Sites found(loaded.timeline);
    // Each of the 15 clips has 8 values of its own and 12 in its timing.
    EXPECT_GT(found.sites().size(), 300u);
    for (const Site& site : found.sites()) {
        site.change();
        EXPECT_FALSE(timelineDifferences(stored.timeline, loaded.timeline).empty()) << site.place;
        site.undo();
    }
    EXPECT_THAT(timelineDifferences(stored.timeline, loaded.timeline), IsEmpty());
}

TEST(ProjectComparison, TwoOfOneMakeAreEqual)
{
    const FullProject first;
    const FullProject second;
    EXPECT_THAT(projectDifferences(first.content, second.content), IsEmpty());
}

TEST(ProjectComparison, EveryFieldThatIsStoredIsCompared)
{
    const FullProject stored;
    FullProject loaded;
    const std::size_t inTimeline = Sites(loaded.full.timeline).sites().size();
    const Sites found(loaded.content);
    // Three pointers and a flag, 5 items, 8 values in each of 4 imports, 7 in each of 6 resources.
    EXPECT_EQ(found.sites().size() - inTimeline, 4u + 5u + 32u + 42u);
    for (const Site& site : found.sites()) {
        site.change();
        EXPECT_FALSE(projectDifferences(stored.content, loaded.content).empty()) << site.place;
        site.undo();
    }
    EXPECT_THAT(projectDifferences(stored.content, loaded.content), IsEmpty());
}

TEST(ProjectComparison, WhatIsSharedAndWhatIsOnlyEqualIsToldApart)
{
    const FullProject stored;
    FullProject loaded;
    loaded.imports.push_back(loaded.imports[0]);
    loaded.collection.items[3] = &loaded.imports.back();
    EXPECT_THAT(projectDifferences(stored.content, loaded.content),
                Contains(EndsWith("userCollection/items[3]")));
    loaded.collection.items[3] = loaded.collection.items[1];
    loaded.collection.items[2] = loaded.collection.items[0];
    EXPECT_THAT(projectDifferences(stored.content, loaded.content),
                Contains(EndsWith("userCollection/items[2]")));
}

TEST(ProjectComparison, AnotherSetOfResourcesIsNoticed)
{
    const FullProject stored;
    FullProject loaded;
    auto node = loaded.table.resource2fileInfo.extract(ResourceRef("clip", Resource::AudioType));
    EXPECT_THAT(projectDifferences(stored.content, loaded.content),
                Contains(EndsWith("resource2fileInfo[clip 2]")));
    std::get<1>(node.key()) = Resource::ImageType;
    loaded.table.resource2fileInfo.insert(std::move(node));
    EXPECT_THAT(projectDifferences(stored.content, loaded.content),
                Contains(EndsWith("resource2fileInfo[clip 2]")));
}

TEST(ProjectComparison, APackIsNotExpectedBack)
{
    FullProject stored;
    FullProject loaded;
    stored.setFieldsThatAreNotStored();
    EXPECT_THAT(projectDifferences(stored.content, loaded.content), IsEmpty());
    loaded.setFieldsThatAreNotStored();
    EXPECT_THAT(projectDifferences(stored.content, loaded.content),
                Contains(EndsWith("userCollection/items[0]/pack")));
}

} // namespace
