// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"
#include "tests/types/Printing.h"

#include <EditorModel/analysis/Thumbnail.h>
#include <EditorModel/bus/View.h>
#include <EditorModel/types/Image.h>

#include <gtest/gtest.h>

#include <functional>
#include <type_traits>
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
