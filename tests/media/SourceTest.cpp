// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"
#include "tests/types/Printing.h"

#include <EditorModel/bus/View.h>
#include <EditorModel/effects/Effect.h>
#include <EditorModel/effects/Overlay.h>
#include <EditorModel/media/Source.h>
#include <EditorModel/persistence/Serializable.h>

#include <gmock/gmock.h>

#include <type_traits>
#include <utility>

namespace {

using Media::OverlaySource;
using Media::Source;
using testing::ElementsAre;

static_assert(Testing::isVirtualBase<PubSub::Object, Source>);
static_assert(Testing::isVirtualBase<PubSub::Object, OverlaySource>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, Source>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, OverlaySource>);
static_assert(sizeof(Media::TimingMode) == 4);
static_assert(sizeof(Media::ResizeMode) == 4);
static_assert(sizeof(Source::RepeatMode) == 4);

const ResourceRef film = {QStringLiteral("film"), Resource::VideoType};
const VolumeEnvelope volume;
const TransformationEnvelope crop, move;
const Effect::Object blur, echo;
const Overlay::Preset title;

Source sourceWithEveryFieldSet()
{
    Source source;
    source.setResource(film)->setRange(100, 900)->setTimingMode(Media::TimingMode(1));
    source.setRepeatMode(Source::RepeatMode(2))->setSourceDuration(5000)->setSpeedCompensated(true);
    source.setVolume(80)->setVolumeEnvelope(&volume)->setCropEnvelope(&crop)->setMoveEnvelope(&move);
    source.setFades(30, 40)->setReversed(true)->setEffects({&echo, &blur});
    source.setDefaultImpl("a name that is longer than what a string holds in place");
    source.setResizeMode(Media::ResizeMode(3));
    return source;
}

/// The callback counts its calls in `calls`.
OverlaySource overlaySourceWithEveryFieldSet(int& calls)
{
    OverlaySource source;
    source.setOverlay(&title).setMoveEnvelope(&move);
    source.setTrackingLinkInfo({"tracking", QPointF(0.25, -0.5), [&calls] { ++calls; }});
    source.setSourcePosition(250).setSourceDuration(4000);
    return source;
}

void expectEveryFieldSet(const OverlaySource& source, int& calls)
{
    EXPECT_EQ(source.overlay, &title);
    EXPECT_EQ(source.moveEnvelope, &move);
    EXPECT_EQ(source.trackingLinkInfo.trackingId, "tracking");
    EXPECT_EQ(source.trackingLinkInfo.offset, QPointF(0.25, -0.5));
    EXPECT_EQ(source.sourcePosition, MTime(250));
    EXPECT_EQ(source.sourceDuration, MTime(4000));
    ASSERT_TRUE(source.trackingLinkInfo.callback);
    const int before = calls;
    source.trackingLinkInfo.callback();
    EXPECT_EQ(calls, before + 1);
}

/// Every way of copying a whole record.
template <class T, class Expectation>
void expectCopiesAreWhole(const T& original, const Expectation& expectWhole)
{
    const T copy(original);
    expectWhole(copy);

    T assigned;
    EXPECT_EQ(&(assigned = original), &assigned);
    expectWhole(assigned);
    const T& itself = assigned;
    assigned = itself;
    expectWhole(assigned);

    T moved(std::move(assigned));
    expectWhole(moved);
    T target;
    EXPECT_EQ(&(target = std::move(moved)), &target);
    expectWhole(target);
    expectWhole(original);
}

TEST(MediaSource, HasNoDurationAtFirst)
{
    EXPECT_EQ(Source().duration(), MTime(0));
}

TEST(MediaSource, LastsFromTheBeginningOfItsRangeToTheEnd)
{
    EXPECT_EQ(Source().setRange(100, 900)->duration(), MTime(800));
    EXPECT_EQ(sourceWithEveryFieldSet().duration(), MTime(800)) << "whatever else is set";
}

TEST(MediaSource, KeepsARangeThatEndsBeforeItBegins)
{
    Source source;
    source.setRange(900, 100);
    EXPECT_EQ(source.from, MTime(900));
    EXPECT_EQ(source.to, MTime(100));
    EXPECT_EQ(source.duration(), MTime(-800));
}

TEST(MediaSource, FadesAreSetTogether)
{
    Source source;
    source.setFades(30, 40)->setFades(MTime(), 50);
    EXPECT_EQ(source.fadeIn, MTime(0));
    EXPECT_EQ(source.fadeOut, MTime(50));
}

TEST(MediaSource, EffectsAreReplacedByACopyOfTheListAndShared)
{
    Source source;
    source.setEffects({&blur});
    std::deque<const Effect::Object*> list = {&echo, nullptr, &echo};
    source.setEffects(list);
    list.clear();
    EXPECT_THAT(source.effects, ElementsAre(&echo, nullptr, &echo));
    source.setEffects(source.effects);
    EXPECT_THAT(source.effects, ElementsAre(&echo, nullptr, &echo));
}

TEST(MediaSource, ChangesInPlaceOnTheBus)
{
    Source source;
    Message::View<Source> owner, observer;
    owner.own(&source);
    observer.observe(&source);
    observer.change(&source)->setVolume(50)->setRange(10, 20);
    EXPECT_EQ(source.volume, 50);
    EXPECT_EQ(source.duration(), MTime(10));
    EXPECT_TRUE(observer.isObserved(&source));
}

TEST(OverlaySource, CopiesWholeWithItsCallback)
{
    int calls = 0;
    expectCopiesAreWhole(overlaySourceWithEveryFieldSet(calls),
                         [&](const OverlaySource& copy) { expectEveryFieldSet(copy, calls); });
    EXPECT_EQ(calls, 6);
}

TEST(OverlaySource, ChangesInPlaceOnTheBus)
{
    OverlaySource source;
    int calls = 0;
    Message::View<OverlaySource> owner, observer;
    owner.own(&source);
    observer.observe(&source);
    *observer.change(&source).operator->() = overlaySourceWithEveryFieldSet(calls);
    expectEveryFieldSet(source, calls);
    EXPECT_TRUE(observer.isObserved(&source));
}

} // namespace
