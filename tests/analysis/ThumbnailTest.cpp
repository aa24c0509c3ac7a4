// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"
#include "tests/types/Printing.h"

#include <EditorModel/analysis/Thumbnail.h>
#include <EditorModel/bus/View.h>
#include <EditorModel/types/Image.h>

#include <gtest/gtest.h>

#include <functional>
#include <type_traits>
#include <utility>
#include <vector>

namespace {

using Thumbnail::Object;

static_assert(Testing::isVirtualBase<PubSub::Object, Object>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, Object>);

const ResourceRef film = {QStringLiteral("film"), Resource::VideoType};

using Image = std::shared_ptr<const Types::Image>;

Object withEveryFieldSet(const Image& image)
{
    Object thumbnail;
    thumbnail.setResource(film)->setResourceDuration(9000)->setPosition(4500)->setSize(160, 90);
    thumbnail.setImage(image);
    return thumbnail;
}

void expectEveryFieldSet(const Object& thumbnail, const Image& image)
{
    EXPECT_EQ(thumbnail.resource, film);
    EXPECT_EQ(thumbnail.resourceDuration, MTime(9000));
    EXPECT_EQ(thumbnail.position, MTime(4500));
    EXPECT_EQ(thumbnail.width, 160);
    EXPECT_EQ(thumbnail.height, 90);
    EXPECT_EQ(thumbnail.image, image);
}

TEST(Thumbnail, IsOfNothingByDefault)
{
    const Object thumbnail;
    EXPECT_EQ(thumbnail.resource, ResourceRef(QString(), Resource::NoType));
    EXPECT_EQ(thumbnail.resourceDuration, MTime());
    EXPECT_EQ(thumbnail.position, MTime());
    EXPECT_EQ(thumbnail.width, 0);
    EXPECT_EQ(thumbnail.height, 0);
    EXPECT_EQ(thumbnail.image, nullptr);
}

TEST(Thumbnail, SettersStoreAndReturnTheObject)
{
    const auto image = std::make_shared<const Types::Image>();
    Object thumbnail;
    EXPECT_EQ(thumbnail.setResource(film), &thumbnail);
    EXPECT_EQ(thumbnail.setResourceDuration(-1), &thumbnail);
    EXPECT_EQ(thumbnail.setPosition(-2), &thumbnail);
    EXPECT_EQ(thumbnail.setWidth(-3), &thumbnail);
    EXPECT_EQ(thumbnail.setHeight(-4), &thumbnail);
    EXPECT_EQ(thumbnail.width, -3);
    EXPECT_EQ(thumbnail.height, -4);
    EXPECT_EQ(thumbnail.setSize(5, 6), &thumbnail);
    EXPECT_EQ(thumbnail.setImage(image), &thumbnail);
    EXPECT_EQ(thumbnail.resourceDuration, MTime(-1));
    EXPECT_EQ(thumbnail.position, MTime(-2));
    EXPECT_EQ(thumbnail.width, 5);
    EXPECT_EQ(thumbnail.height, 6);
    EXPECT_EQ(thumbnail.image, image);
    expectEveryFieldSet(withEveryFieldSet(image), image);
}

TEST(Thumbnail, CopiesWholeAndSharesTheImage)
{
    const auto image = std::make_shared<const Types::Image>();
    const Object original = withEveryFieldSet(image);
    Object copy(original);
    expectEveryFieldSet(copy, image);
    Object assigned;
    EXPECT_EQ(&(assigned = original), &assigned);
    const Object& itself = assigned;
    assigned = itself;
    expectEveryFieldSet(assigned, image);
    const Object moved(std::move(copy));
    expectEveryFieldSet(moved, image);
    Object target;
    EXPECT_EQ(&(target = std::move(assigned)), &target);
    expectEveryFieldSet(target, image);
    expectEveryFieldSet(original, image);
}

TEST(Thumbnail, EqualsTheOneThatHasItsPictureAlready)
{
    const Object waiting = withEveryFieldSet(nullptr);
    const Object ready = withEveryFieldSet(std::make_shared<const Types::Image>());
    EXPECT_TRUE(waiting == ready);
    EXPECT_FALSE(waiting != ready);
    EXPECT_TRUE(Object() == Object());
}

TEST(Thumbnail, IsComparedByEveryFieldButTheImage)
{
    struct Change
    {
        const char* what;
        std::function<void(Object&)> apply;
    };
    const std::vector<Change> changes = {
        {"identifier", [](Object& o) { std::get<0>(o.resource) = "Film"; }},
        {"kind", [](Object& o) { std::get<1>(o.resource) = Resource::ImageType; }},
        {"duration of the resource", [](Object& o) { o.setResourceDuration(9001); }},
        {"position", [](Object& o) { o.setPosition(4501); }},
        {"width", [](Object& o) { o.setWidth(161); }},
        {"height", [](Object& o) { o.setHeight(91); }},
    };
    const Object original = withEveryFieldSet(nullptr);
    for (const Change& change : changes) {
        SCOPED_TRACE(change.what);
        Object changed = original;
        change.apply(changed);
        EXPECT_FALSE(changed == original);
        EXPECT_FALSE(original == changed);
        EXPECT_TRUE(changed != original);
    }
}

TEST(Thumbnail, GetsItsPictureOnTheBus)
{
    Object thumbnail;
    const auto image = std::make_shared<const Types::Image>();
    Message::View<Object> owner, observer;
    owner.own(&thumbnail);
    observer.observe(&thumbnail);
    owner.change(&thumbnail)->setImage(image);
    EXPECT_EQ(observer.object()->image, image);
}

} // namespace
