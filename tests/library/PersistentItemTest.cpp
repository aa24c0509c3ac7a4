// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldTexts.h"

#include <EditorModel/library/PersistentItem.h>

#include <gmock/gmock.h>

#include <QImage>

#include <string>

namespace {

using EditorCollection::PersistentItem;
using ::testing::ElementsAre;
using ::testing::Pair;

/// The archive names, by hand.
std::string itemName(const Effect::Object&)
{
    return "Collection::PersistentItem::Effect::Object";
}
std::string itemName(const Import::Object&)
{
    return "Collection::PersistentItem::Import::Object";
}
std::string itemName(const Theme::Object&)
{
    return "Collection::PersistentItem::Theme::Object";
}
std::string itemName(const Transition::Object&)
{
    return "Collection::PersistentItem::Transition::Object";
}
std::string itemName(const Overlay::Preset&)
{
    return "Collection::PersistentItem::Overlay::Preset";
}
std::string itemName(const Quiz::Preset&)
{
    return "Collection::PersistentItem::Quiz::Preset";
}
std::string itemName(const Envelope::TransformationPreset&)
{
    return "Collection::PersistentItem::Envelope::TransformationPreset";
}

template <class T>
class ItemOf : public ::testing::Test
{
protected:
    using Item = PersistentItem<T>;

    ItemOf() : image(2, 1, QImage::Format_ARGB32)
    {
        image.setPixel(0, 0, 0xFFFF0000u);
        image.setPixel(1, 0, 0xFF0000FFu);
        element.tag = "Element";
        item.uniqueId = "{1}";
        item.item = &element;
        item.preview = std::make_shared<const Types::Image>(QPixmap::fromImage(image));
        item.categories = {"blurs", "all"};
        item.collectionId = "Effects";
        item.customStrings = {{"author", "me"}, {"empty", ""}};
    }

    static_assert(!Testing::isVirtualBase<Serialize::ISerializable, Item>);
    static_assert(Testing::isVirtualBase<PubSub::Object, Item>);

    QImage image;
    T element;
    Item item;
};

using Elements = ::testing::Types<Effect::Object, Import::Object, Theme::Object, Transition::Object,
                                  Overlay::Preset, Quiz::Preset, Envelope::TransformationPreset>;

struct ElementName
{
    template <class T>
    static std::string GetName(int)
    {
        return T::NameInArchive();
    }
};

TYPED_TEST_SUITE(ItemOf, Elements, ElementName);

TYPED_TEST(ItemOf, IsMadeByItsName)
{
    Testing::expectMadeByName<PersistentItem<TypeParam>>(itemName(this->element));
}

TYPED_TEST(ItemOf, WritesItsFieldsInOrder)
{
    EXPECT_THAT(Testing::fieldKeys(this->item),
                ElementsAre("uniqueId", "item", "preview", "categories", "collectionId", "customStrings"));
}

TYPED_TEST(ItemOf, ComesBackWithItsElement)
{
    for (const Way& way : allWays) {
        SCOPED_TRACE(way.name);
        const auto graph = graphOf(documentOf({&this->item}, way));
        const auto* const loaded = graph.template rootAs<PersistentItem<TypeParam>>();
        ASSERT_NE(loaded, nullptr);
        EXPECT_EQ(graph.size(), 2u);
        EXPECT_EQ(loaded->uniqueId, "{1}");
        ASSERT_NE(loaded->item, nullptr);
        EXPECT_NE(loaded->item, &this->element);
        EXPECT_EQ(loaded->item->tag, "Element");
        ASSERT_NE(loaded->preview, nullptr);
        EXPECT_EQ(loaded->preview->toImage().convertToFormat(QImage::Format_ARGB32), this->image);
        EXPECT_THAT(loaded->categories, ElementsAre("all", "blurs"));
        EXPECT_EQ(loaded->collectionId, "Effects");
        EXPECT_THAT(loaded->customStrings,
                    ElementsAre(Pair(QString("author"), QString("me")), Pair(QString("empty"), QString(""))));
    }
}

TYPED_TEST(ItemOf, WithoutElementAndPictureComesBackWithoutThem)
{
    this->item.item = nullptr;
    this->item.preview = nullptr;
    for (const Way& way : allWays) {
        SCOPED_TRACE(way.name);
        const auto graph = graphOf(documentOf({&this->item}, way));
        const auto* const loaded = graph.template rootAs<PersistentItem<TypeParam>>();
        ASSERT_NE(loaded, nullptr);
        EXPECT_EQ(graph.size(), 1u);
        EXPECT_EQ(loaded->item, nullptr);
        EXPECT_EQ(loaded->preview, nullptr);
        EXPECT_EQ(loaded->uniqueId, "{1}");
        EXPECT_EQ(loaded->customStrings.size(), 2u);
    }
}

TYPED_TEST(ItemOf, TwoItemsCanShareAnElement)
{
    PersistentItem<TypeParam> other(this->item);
    other.uniqueId = "{2}";
    for (const Way& way : allWays) {
        SCOPED_TRACE(way.name);
        const auto graph = graphOf(documentOf({&this->item, &other}, way));
        EXPECT_EQ(graph.size(), 3u);
        const auto* const second = dynamic_cast<PersistentItem<TypeParam>*>(graph.roots().at(1));
        ASSERT_NE(second, nullptr);
        EXPECT_EQ(second->uniqueId, "{2}");
        EXPECT_EQ(second->item, graph.template rootAs<PersistentItem<TypeParam>>()->item);
    }
}

} // namespace
