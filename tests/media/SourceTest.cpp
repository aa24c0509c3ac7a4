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
using testing::IsEmpty;

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

void expectEveryFieldSet(const Source& source)
{
    EXPECT_EQ(source.resource, film);
    EXPECT_EQ(source.from, MTime(100));
    EXPECT_EQ(source.to, MTime(900));
    EXPECT_EQ(source.timingMode, 1);
    EXPECT_EQ(source.repeatMode, 2);
    EXPECT_EQ(source.sourceDuration, MTime(5000));
    EXPECT_TRUE(source.speedCompensated);
    EXPECT_EQ(source.volume, 80);
    EXPECT_EQ(source.volumeEnvelope, &volume);
    EXPECT_EQ(source.cropEnvelope, &crop);
    EXPECT_EQ(source.moveEnvelope, &move);
    EXPECT_EQ(source.fadeIn, MTime(30));
    EXPECT_EQ(source.fadeOut, MTime(40));
    EXPECT_TRUE(source.reversed);
    EXPECT_THAT(source.effects, ElementsAre(&echo, &blur));
    EXPECT_EQ(source.defaultImpl, "a name that is longer than what a string holds in place");
    EXPECT_EQ(source.resizeMode, 3);
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

TEST(MediaSource, PlaysNothingByDefault)
{
    const Source source;
    EXPECT_EQ(source.resource, ResourceRef(QString(), Resource::NoType));
    EXPECT_EQ(source.from, MTime());
    EXPECT_EQ(source.to, MTime());
    EXPECT_EQ(source.timingMode, 0);
    EXPECT_EQ(source.repeatMode, 0);
    EXPECT_EQ(source.sourceDuration, MTime());
    EXPECT_FALSE(source.speedCompensated);
    EXPECT_EQ(source.volume, 100);
    EXPECT_EQ(source.volumeEnvelope, nullptr);
    EXPECT_EQ(source.cropEnvelope, nullptr);
    EXPECT_EQ(source.moveEnvelope, nullptr);
    EXPECT_EQ(source.fadeIn, MTime());
    EXPECT_EQ(source.fadeOut, MTime());
    EXPECT_FALSE(source.reversed);
    EXPECT_THAT(source.effects, IsEmpty());
    EXPECT_EQ(source.defaultImpl, "");
    EXPECT_EQ(source.resizeMode, 0);
    EXPECT_EQ(source.duration(), MTime(0));
}

TEST(MediaSource, SettersStoreAndReturnTheSourcesAddress)
{
    Source source;
    EXPECT_EQ(source.setResource(film), &source);
    EXPECT_EQ(source.setRange(1, 2), &source);
    EXPECT_EQ(source.setTimingMode(Media::TimingMode(-1)), &source);
    EXPECT_EQ(source.setRepeatMode(Source::RepeatMode(-2)), &source);
    EXPECT_EQ(source.setSourceDuration(-3), &source);
    EXPECT_EQ(source.setSpeedCompensated(true), &source);
    EXPECT_EQ(source.setVolume(-4), &source);
    EXPECT_EQ(source.setVolumeEnvelope(nullptr), &source);
    EXPECT_EQ(source.setCropEnvelope(nullptr), &source);
    EXPECT_EQ(source.setMoveEnvelope(nullptr), &source);
    EXPECT_EQ(source.setFades(-5, -6), &source);
    EXPECT_EQ(source.setReversed(true), &source);
    EXPECT_EQ(source.setEffects({}), &source);
    EXPECT_EQ(source.setDefaultImpl(""), &source);
    EXPECT_EQ(source.setResizeMode(Media::ResizeMode(-7)), &source);

    EXPECT_EQ(source.timingMode, -1);
    EXPECT_EQ(source.repeatMode, -2);
    EXPECT_EQ(source.sourceDuration, MTime(-3));
    EXPECT_EQ(source.volume, -4);
    EXPECT_EQ(source.fadeIn, MTime(-5));
    EXPECT_EQ(source.resizeMode, -7);
    expectEveryFieldSet(sourceWithEveryFieldSet());
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

TEST(MediaSource, CopiesWhole)
{
    expectCopiesAreWhole(sourceWithEveryFieldSet(), [](const Source& copy) { expectEveryFieldSet(copy); });
}

TEST(MediaSource, AssigningItToItselfLeavesTheNameOfTheImplementation)
{
    Source source;
    source.setDefaultImpl("player");
    const Source& itself = source;
    source = itself;
    EXPECT_EQ(source.defaultImpl, "player");
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

TEST(OverlaySource, PlaysNothingByDefault)
{
    const OverlaySource source;
    EXPECT_EQ(source.overlay, nullptr);
    EXPECT_EQ(source.moveEnvelope, nullptr);
    EXPECT_EQ(source.trackingLinkInfo.trackingId, QString());
    EXPECT_EQ(source.trackingLinkInfo.offset, QPointF(0, 0));
    EXPECT_FALSE(source.trackingLinkInfo.callback);
    EXPECT_EQ(source.sourcePosition, MTime());
    EXPECT_EQ(source.sourceDuration, MTime());
}

TEST(OverlaySource, SettersStoreAndReturnTheSourceItself)
{
    OverlaySource source;
    EXPECT_EQ(&source.setOverlay(&title), &source);
    EXPECT_EQ(&source.setMoveEnvelope(&move), &source);
    EXPECT_EQ(&source.setTrackingLinkInfo({}), &source);
    EXPECT_EQ(&source.setSourcePosition(-1), &source);
    EXPECT_EQ(&source.setSourceDuration(-2), &source);
    EXPECT_EQ(source.sourcePosition, MTime(-1));
    EXPECT_EQ(source.sourceDuration, MTime(-2));
    int calls = 0;
    expectEveryFieldSet(overlaySourceWithEveryFieldSet(calls), calls);
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
