// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"

#include <EditorModel/effects/Envelope.h>
#include <EditorModel/persistence/Document.h>

#include <QBuffer>

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <memory>
#include <type_traits>
#include <utility>
#include <vector>

namespace {

using Animation::KeyValue;
using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::Pair;

template <class T>
constexpr bool hasPlainRoot =
    std::is_base_of_v<Serialize::ISerializable, T> && !Testing::isVirtualBase<Serialize::ISerializable, T>;

static_assert(hasPlainRoot<KeyValue<double>>);
static_assert(hasPlainRoot<KeyValue<Transformation::Object>>);
static_assert(!std::is_base_of_v<PubSub::Object, KeyValue<double>>);
static_assert(hasPlainRoot<VolumeEnvelope>);
static_assert(hasPlainRoot<TransformationEnvelope>);
static_assert(Testing::isVirtualBase<PubSub::Object, VolumeEnvelope>);
static_assert(Testing::isVirtualBase<PubSub::Object, TransformationEnvelope>);

constexpr double infinity = std::numeric_limits<double>::infinity();
constexpr double notANumber = std::numeric_limits<double>::quiet_NaN();

// Built before main(), from the constant of another module.
const TransformationEnvelope earlyEnvelope;
const Transformation::Object earlyDefault = Animation::ValueTypeTrait<Transformation::Object>::s_defaultValue;

using Pairs = std::vector<std::pair<double, double>>;

VolumeEnvelope envelopeOf(const Pairs& keys)
{
    VolumeEnvelope envelope;
    for (const auto& key : keys) {
        envelope.keyValues.emplace_back(key.first, key.second);
    }
    return envelope;
}

Pairs keysOf(const VolumeEnvelope& envelope)
{
    Pairs keys;
    for (const auto& key : envelope.keyValues) {
        keys.emplace_back(key.step, key.value);
    }
    return keys;
}

/// The values of both neighbours, not-a-number for one that isn't there.
std::pair<double, double> neighbourValues(const VolumeEnvelope& envelope, double step)
{
    const auto [lower, upper] = envelope.neighbours(step);
    return {lower ? lower->value : notANumber, upper ? upper->value : notANumber};
}

MATCHER(None, "is no neighbour")
{
    return std::isnan(arg);
}

TEST(ValueTypeTrait, TellsWhatAnEnvelopeIsWithoutKeys)
{
    EXPECT_EQ(Animation::ValueTypeTrait<double>::s_defaultValue, 1.0);
    EXPECT_EQ(Animation::ValueTypeTrait<Transformation::Object>::s_defaultValue, Transformation::Object());
}

TEST(ValueTypeTrait, IsThereBeforeTheConstantsOfOthers)
{
    EXPECT_EQ(earlyEnvelope.defaultValue.opacity, 100);
    EXPECT_EQ(earlyEnvelope.defaultValue.matrix.m33, 1.0);
    EXPECT_EQ(earlyDefault.opacity, 100);
    EXPECT_EQ(earlyDefault.matrix.m11, 1.0);
}

TEST(AnimationItem, MovesTheListAndCopiesTheDefault)
{
    VolumeEnvelope original = envelopeOf({{0, 1}, {1, 2}});
    original.defaultValue = 7;
    const VolumeEnvelope moved(std::move(original));
    EXPECT_THAT(keysOf(moved), ElementsAre(Pair(0, 1), Pair(1, 2)));
    EXPECT_EQ(moved.defaultValue, 7);
    EXPECT_THAT(original.keyValues, IsEmpty());
    EXPECT_EQ(original.defaultValue, 7);

    TransformationEnvelope envelope;
    envelope.defaultValue.setOpacity(9);
    envelope.addKeyValue(0.5, Transformation::Object(Types::Transform(), 3));
    const TransformationEnvelope other(std::move(envelope));
    ASSERT_EQ(other.keyValues.size(), 1u);
    EXPECT_EQ(other.keyValues.front().value.opacity, 3);
    EXPECT_EQ(other.defaultValue.opacity, 9);
    EXPECT_THAT(envelope.keyValues, IsEmpty());
    EXPECT_EQ(envelope.defaultValue.opacity, 9);
}

TEST(AddingAKey, KeepsTheListInAscendingOrder)
{
    VolumeEnvelope envelope;
    EXPECT_EQ(envelope.addKeyValue(0.5, 1), &envelope);
    EXPECT_EQ(envelope.addKeyValue(KeyValue<double>(0.75, 2)), &envelope);
    envelope.addKeyValue(-1, 3)->addKeyValue(0.6, 4)->addKeyValue(2, 5);
    EXPECT_THAT(keysOf(envelope),
                ElementsAre(Pair(-1, 3), Pair(0.5, 1), Pair(0.6, 4), Pair(0.75, 2), Pair(2, 5)));
}

TEST(AddingAKey, PutsItInFrontOfThoseAtTheSameStepAndReplacesNothing)
{
    VolumeEnvelope envelope = envelopeOf({{0, 1}, {1, 2}, {2, 3}});
    envelope.addKeyValue(1, 10)->addKeyValue(KeyValue<double>(1, 20));
    envelope.addKeyValue(0, 30);
    EXPECT_THAT(keysOf(envelope),
                ElementsAre(Pair(0, 30), Pair(0, 1), Pair(1, 20), Pair(1, 10), Pair(1, 2), Pair(2, 3)));
}

TEST(AddingAKey, MayCopyOneOfTheList)
{
    VolumeEnvelope envelope = envelopeOf({{0, 1}, {1, 2}, {2, 3}});
    envelope.addKeyValue(envelope.keyValues[1]);
    EXPECT_THAT(keysOf(envelope), ElementsAre(Pair(0, 1), Pair(1, 2), Pair(1, 2), Pair(2, 3)));
}

TEST(Neighbours, AreNoneInAnEmptyList)
{
    EXPECT_THAT(neighbourValues(VolumeEnvelope(), 0.5), Pair(None(), None()));
}

TEST(Neighbours, AreTheKeysAroundThePosition)
{
    const VolumeEnvelope envelope = envelopeOf({{0, 10}, {1, 11}, {2, 12}});
    EXPECT_THAT(neighbourValues(envelope, -0.5), Pair(None(), 10));
    EXPECT_THAT(neighbourValues(envelope, 0), Pair(10, 11));
    EXPECT_THAT(neighbourValues(envelope, 0.5), Pair(10, 11));
    EXPECT_THAT(neighbourValues(envelope, 1), Pair(11, 12));
    EXPECT_THAT(neighbourValues(envelope, 1.5), Pair(11, 12));
    EXPECT_THAT(neighbourValues(envelope, 2), Pair(12, None()));
    EXPECT_THAT(neighbourValues(envelope, 2.5), Pair(12, None()));
}

TEST(Neighbours, OfASingleKeyAreThatKey)
{
    const VolumeEnvelope envelope = envelopeOf({{1, 5}});
    EXPECT_THAT(neighbourValues(envelope, 0), Pair(None(), 5));
    EXPECT_THAT(neighbourValues(envelope, 1), Pair(5, None()));
    EXPECT_THAT(neighbourValues(envelope, 2), Pair(5, None()));
}

TEST(Neighbours, TellTheStepsToo)
{
    const VolumeEnvelope envelope = envelopeOf({{0.25, 10}, {0.75, 11}});
    const auto [lower, upper] = envelope.neighbours(0.5);
    ASSERT_TRUE(lower && upper);
    EXPECT_EQ(lower->step, 0.25);
    EXPECT_EQ(upper->step, 0.75);
}

TEST(Neighbours, CountAKeyAsReachedFromWithinTheThreshold)
{
    constexpr double threshold = 2.220446049250313e-15;
    const VolumeEnvelope envelope = envelopeOf({{-1, 9}, {0, 10}, {1, 11}});
    EXPECT_THAT(neighbourValues(envelope, -std::nextafter(threshold, 0)), Pair(10, 11));
    EXPECT_THAT(neighbourValues(envelope, -threshold), Pair(9, 10));
    EXPECT_THAT(neighbourValues(envelope, 1 - 2.1e-15), Pair(11, None()));
    EXPECT_THAT(neighbourValues(envelope, 1 - 2.4e-15), Pair(10, 11));
    EXPECT_THAT(neighbourValues(envelope, -1 - 2.1e-15), Pair(9, 10));
    EXPECT_THAT(neighbourValues(envelope, -1 - 2.4e-15), Pair(None(), 9));
}

TEST(Neighbours, DoNotScaleTheThreshold)
{
    const VolumeEnvelope large = envelopeOf({{0, 1}, {1e9, 2}});
    EXPECT_THAT(neighbourValues(large, std::nextafter(1e9, 0)), Pair(1, 2));
    const VolumeEnvelope small = envelopeOf({{0, 1}, {1e-15, 2}, {2e-15, 3}});
    EXPECT_THAT(neighbourValues(small, 0.5e-15), Pair(2, 3));
}

TEST(Neighbours, OfEqualStepsAreTheFirstTwo)
{
    const VolumeEnvelope envelope = envelopeOf({{0, 1}, {1, 2}, {1, 3}, {1, 4}, {2, 5}});
    EXPECT_THAT(neighbourValues(envelope, 1), Pair(2, 3));
    EXPECT_THAT(neighbourValues(envelope, 0.5), Pair(1, 2));
    EXPECT_THAT(neighbourValues(envelope, 1.5), Pair(4, 5));
}

TEST(Neighbours, OfNotANumberAreTheFirstKeyAndTheNext)
{
    EXPECT_THAT(neighbourValues(envelopeOf({{0, 1}, {1, 2}, {2, 3}}), notANumber), Pair(1, 2));
    EXPECT_THAT(neighbourValues(envelopeOf({{0, 1}}), notANumber), Pair(1, None()));
}

TEST(Value, IsInterpolatedBetweenTwoKeys)
{
    const VolumeEnvelope envelope = envelopeOf({{0, 0}, {1, 10}, {3, 20}});
    EXPECT_DOUBLE_EQ(envelope.valueAt(0), 0);
    EXPECT_DOUBLE_EQ(envelope.valueAt(0.25), 2.5);
    EXPECT_DOUBLE_EQ(envelope.valueAt(0.5), 5);
    EXPECT_DOUBLE_EQ(envelope.valueAt(1), 10);
    EXPECT_DOUBLE_EQ(envelope.valueAt(1.5), 12.5);
    EXPECT_DOUBLE_EQ(envelope.valueAt(2), 15);
    EXPECT_DOUBLE_EQ(envelope.valueAt(3), 20);
}

TEST(Value, BeyondTheEndsIsThatOfTheEnd)
{
    VolumeEnvelope envelope = envelopeOf({{0, 0.5}, {1, 0.25}});
    envelope.defaultValue = 9;
    EXPECT_EQ(envelope.valueAt(-1), 0.5);
    EXPECT_EQ(envelope.valueAt(2), 0.25);
    EXPECT_EQ(envelope.valueAt(-infinity), 0.5);
    EXPECT_EQ(envelope.valueAt(infinity), 0.25);
}

TEST(Value, WithoutKeysIsTheDefault)
{
    VolumeEnvelope envelope;
    EXPECT_EQ(envelope.valueAt(0.5), 1.0);
    envelope.defaultValue = 0.125;
    EXPECT_EQ(envelope.valueAt(0.5), 0.125);
    EXPECT_EQ(envelope.valueAt(notANumber), 0.125);
    TransformationEnvelope transformation;
    transformation.defaultValue.setOpacity(42);
    EXPECT_EQ(transformation.valueAt(0).opacity, 42);
}

TEST(Value, OfASingleKeyHoldsEverywhere)
{
    const VolumeEnvelope envelope = envelopeOf({{0.5, 3}});
    for (const double step : {-1.0, 0.5, 2.0, infinity, -infinity, notANumber}) {
        EXPECT_EQ(envelope.valueAt(step), 3);
    }
}

TEST(Value, AtTwoKeysOfOneStepIsNotANumber)
{
    VolumeEnvelope envelope;
    envelope.addKeyValue(0, 0)->addKeyValue(1, 20)->addKeyValue(1, 10)->addKeyValue(2, 30);
    EXPECT_TRUE(std::isnan(envelope.valueAt(1)));
    EXPECT_DOUBLE_EQ(envelope.valueAt(0.5), 5);
    EXPECT_DOUBLE_EQ(envelope.valueAt(1.5), 25);
}

TEST(Value, OfNotANumberIsNotANumberBetweenKeys)
{
    EXPECT_TRUE(std::isnan(envelopeOf({{0, 0}, {1, 10}}).valueAt(notANumber)));
}

TEST(LinearInterpolation, IsNotHeldBetweenItsKeys)
{
    using Linear = Animation::ValueTypeInterpolator<double>;
    EXPECT_DOUBLE_EQ(Linear::interpolate(0, 1, 0.25, 4, 8), 5);
    EXPECT_DOUBLE_EQ(Linear::interpolate(2, 4, 3, -1, 1), 0);
    EXPECT_DOUBLE_EQ(Linear::interpolate(0, 1, 2, 4, 8), 12);
    EXPECT_DOUBLE_EQ(Linear::interpolate(0, 1, -1, 4, 8), 0);
    EXPECT_DOUBLE_EQ(Linear::interpolate(1, 0, 0.75, 4, 8), 5);
    EXPECT_TRUE(std::isnan(Linear::interpolate(1, 1, 1, 4, 8)));
}

RC_GTEST_PROP(AddingAKey, SortsWhateverTheOrder, (const std::vector<int>& steps))
{
    VolumeEnvelope envelope;
    for (std::size_t i = 0; i < steps.size(); ++i) {
        envelope.addKeyValue(steps[i], static_cast<double>(i));
    }
    // A later key stands in front of an earlier one.
    RC_ASSERT(envelope.keyValues.size() == steps.size());
    RC_ASSERT(std::is_sorted(
        envelope.keyValues.begin(), envelope.keyValues.end(),
        [](const auto& a, const auto& b) { return a.step != b.step ? a.step < b.step : a.value > b.value; }));
}

RC_GTEST_PROP(Value, LiesBetweenThoseOfTheNeighbours, (const std::vector<std::pair<int, int>>& keys))
{
    VolumeEnvelope envelope;
    for (const auto& key : keys) {
        envelope.addKeyValue(key.first, key.second);
    }
    // Never at a key: two of them may be there.
    const double step = *rc::gen::inRange(-200, 200) + *rc::gen::inRange(1, 100) / 100.0;
    const auto [lower, upper] = envelope.neighbours(step);
    std::vector<double> around;
    for (const auto& key : {lower, upper}) {
        if (key) {
            around.push_back(key->value);
        }
    }
    if (around.empty()) {
        around.push_back(envelope.defaultValue);
    }
    const auto [lowest, highest] = std::minmax_element(around.begin(), around.end());
    const double rounding = 1e-9 * std::max(std::abs(*lowest), std::abs(*highest));
    const double value = envelope.valueAt(step);
    RC_ASSERT(value >= *lowest - rounding);
    RC_ASSERT(value <= *highest + rounding);
}

template <class T>
void expectMadeByName(const std::string& name)
{
    EXPECT_EQ(T::NameInArchive(), name);
    EXPECT_EQ(T().GetNameInArchive(), name);
    const Serialize::BaseCreator* const creator = Serialize::findCreator(name);
    ASSERT_NE(creator, nullptr);
    const std::unique_ptr<Serialize::ISerializable> made(creator->Create());
    EXPECT_NE(dynamic_cast<T*>(made.get()), nullptr);
}

TEST(AnimationArchive, KnowsTheFourClassesByTheirShortNames)
{
    expectMadeByName<KeyValue<double>>("AnimationDoubleKeyValue");
    expectMadeByName<KeyValue<Transformation::Object>>("AnimationTransformationKeyValue");
    expectMadeByName<VolumeEnvelope>("VolumeEnvelope");
    expectMadeByName<TransformationEnvelope>("TransformationEnvelope");
}

TEST(AnimationArchive, HoldsTheDefaultAndThenTheKeys)
{
    VolumeEnvelope envelope = envelopeOf({{0.25, 3}, {0.5, 4}});
    envelope.defaultValue = 2;
    EXPECT_EQ(Testing::Dump::of(envelope), "root: VolumeEnvelope #1\n"
                                           "  defaultValue: 2\n"
                                           "  keyValues:\n"
                                           "    2 items\n"
                                           "    item 1\n"
                                           "    item: AnimationDoubleKeyValue\n"
                                           "      step: 0.25\n"
                                           "      value: 3\n"
                                           "    item 2\n"
                                           "    item: AnimationDoubleKeyValue\n"
                                           "      step: 0.5\n"
                                           "      value: 4\n");
}

TEST(AnimationArchive, NestsTheTransformationsOfAnEnvelope)
{
    TransformationEnvelope envelope;
    envelope.addKeyValue(0.5, Transformation::Object(Types::Transform(1, 2, 3, 4, 5, 6, 7, 8, 9), 60));
    const std::string matrix = "m11: 1 m12: 2 m13: 3 m21: 4 m22: 5 m23: 6 m31: 7 m32: 8 m33: 9";
    const std::string identity = "m11: 1 m12: 0 m13: 0 m21: 0 m22: 1 m23: 0 m31: 0 m32: 0 m33: 1";
    std::string dump;
    std::string pending;
    // One blank in place of line ends and indentation.
    for (const char c : Testing::Dump::of(envelope)) {
        if (c == '\n' || c == ' ') {
            pending = " ";
        } else {
            dump += pending + c;
            pending.clear();
        }
    }
    EXPECT_EQ(dump, "root: TransformationEnvelope #1 "
                    "defaultValue: Transformation::Object matrix: Types::Transform " +
                        identity +
                        " opacity: 100 keyValues: 1 items item 1 "
                        "item: AnimationTransformationKeyValue step: 0.5 "
                        "value: Transformation::Object matrix: Types::Transform " +
                        matrix + " opacity: 60");
}

TEST(AnimationArchive, IsReadInTheOrderOfTheFile)
{
    const VolumeEnvelope unsorted = envelopeOf({{1, 1}, {0, 2}, {0.5, 3}});
    for (const auto route : {Document::Archive, Document::Stream}) {
        QBuffer buffer;
        ASSERT_TRUE(buffer.open(QIODevice::ReadWrite));
        Document::save(buffer, unsorted, Document::Json, route);
        buffer.seek(0);
        const Document::Graph graph = Document::load(buffer);
        const auto* const loaded = graph.rootAs<VolumeEnvelope>();
        ASSERT_NE(loaded, nullptr);
        EXPECT_THAT(keysOf(*loaded), ElementsAre(Pair(1, 1), Pair(0, 2), Pair(0.5, 3)));
    }
}

TEST(Animation, NamesTheMimeTypeOfAnItem)
{
    EXPECT_EQ(*Animation::itemMimeType, "x-application/AnimationItem-serialized");
}

} // namespace
