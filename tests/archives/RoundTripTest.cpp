// SPDX-License-Identifier: Apache-2.0
// Every registered class, in every form and both routes, by one body.
#include "tests/archives/SampleClasses.h"
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldVisitors.h"

#include <EditorModel/persistence/Type.h>

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <tuple>

namespace {

using Testing::Dump;
using Testing::Filler;

class EveryClass : public ::testing::TestWithParam<std::tuple<std::string, Way>>
{
protected:
    const Serialize::Type& type() const { return *Serialize::findType(std::get<0>(GetParam())); }
    const Way& way() const { return std::get<1>(GetParam()); }

    void expectRoundTrip(const Serialize::ISerializable& object)
    {
        const auto graph = graphOf(documentOf({&object}, way()));
        ASSERT_EQ(graph.roots().size(), 1u);
        ASSERT_TRUE(graph.roots().front());
        EXPECT_EQ(Dump::of(*graph.roots().front()), Dump::of(object, way().wrapsTimes()));
        // What was loaded is stored as what it was loaded from.
        EXPECT_EQ(Dump::of(*graphOf(documentOf({graph.roots().front()}, way())).roots().front()),
                  Dump::of(*graph.roots().front()));
    }
};

TEST_P(EveryClass, ComesBackWithEveryFieldSet)
{
    Filler filler;
    expectRoundTrip(*filler.make(type()));
}

TEST_P(EveryClass, ComesBackWithDefaults)
{
    const std::unique_ptr<Serialize::ISerializable> object(type().serializable(type().create()));
    expectRoundTrip(*object);
}

TEST_P(EveryClass, ComesBackWithTimesThatNeedMoreThan32Bits)
{
    // From the first that wraps on, so that times that are keys of a map keep their order.
    Filler filler(MTime(qint64(1) << 31));
    expectRoundTrip(*filler.make(type()));
}

TEST_P(EveryClass, ThreeOfThemComeBackFromOneDocument)
{
    Filler filler;
    const auto* const first = filler.make(type());
    const auto* const second = filler.make(type());
    const auto graph = graphOf(documentOf({first, second, nullptr, first}, way()));
    ASSERT_EQ(graph.roots().size(), 4u);
    EXPECT_EQ(graph.roots()[0], graph.roots()[3]);
    EXPECT_NE(graph.roots()[0], graph.roots()[1]);
    EXPECT_EQ(graph.roots()[2], nullptr);
    EXPECT_EQ(Dump::of(*graph.roots()[1]), Dump::of(*second, way().wrapsTimes()));
}

INSTANTIATE_TEST_SUITE_P(Registered, EveryClass,
                         ::testing::Combine(::testing::ValuesIn(Serialize::registeredNames()),
                                            ::testing::ValuesIn(allWays)),
                         [](const auto& instance) {
                             std::string name =
                                 std::get<0>(instance.param) + "_" + std::get<1>(instance.param).name;
                             for (char& c : name) {
                                 if (!std::isalnum(static_cast<unsigned char>(c)))
                                     c = '_';
                             }
                             return name;
                         });

class EveryWay : public ::testing::TestWithParam<Way>
{
protected:
    template <class T>
    Document::Graph stored(const T& object)
    {
        return graphOf(documentOf({&object}, GetParam()));
    }
};

INSTANTIATE_TEST_SUITE_P(Ways, EveryWay, ::testing::ValuesIn(allWays),
                         [](const auto& instance) { return std::string(instance.param.name); });

TEST_P(EveryWay, AnEmptyDocumentHasNoRoots)
{
    EXPECT_TRUE(graphOf(documentOf({}, GetParam())).roots().empty());
}

TEST_P(EveryWay, EveryKindOfTextComesBack)
{
    for (const QString& text : Testing::awkwardTexts()) {
        Sample::Tree tree;
        tree.text = text;
        tree.bytes = text.toStdString();
        const auto graph = stored(tree);
        EXPECT_EQ(graph.rootAs<Sample::Tree>()->text, text)
            << text.toUtf8().toPercentEncoding().toStdString();
        EXPECT_EQ(graph.rootAs<Sample::Tree>()->bytes, tree.bytes);
    }
}

TEST_P(EveryWay, EveryCharacterComesBack)
{
    Sample::Tree tree;
    for (uint code = 0; code < 0x11000; ++code) {
        if (code >= 0xD800 && code <= 0xDFFF)
            continue;
        tree.text += QString::fromUcs4(&code, 1);
    }
    EXPECT_EQ(stored(tree).rootAs<Sample::Tree>()->text, tree.text);
}

TEST_P(EveryWay, ExtremeNumbersComeBack)
{
    using Doubles = std::numeric_limits<double>;
    for (const double real :
         {0.0, -0.0, Doubles::min(), Doubles::denorm_min(), Doubles::max(), Doubles::lowest(),
          Doubles::epsilon(), 0.1, 1e23, Doubles::infinity(), -Doubles::infinity()}) {
        Sample::Tree tree;
        tree.real = real;
        tree.girth = -real;
        tree.point = QPointF(real, -real);
        const auto graph = stored(tree);
        const auto* const loaded = graph.rootAs<Sample::Tree>();
        EXPECT_EQ(loaded->real, real);
        EXPECT_EQ(std::signbit(loaded->real), std::signbit(real));
        EXPECT_EQ(loaded->girth, -real);
        EXPECT_EQ(loaded->point.x(), real);
        EXPECT_EQ(loaded->point.y(), -real);
    }
    Sample::Tree tree;
    tree.real = Doubles::quiet_NaN();
    tree.whole = std::numeric_limits<int>::min();
    tree.colour = std::numeric_limits<quint32>::max();
    tree.large = std::numeric_limits<qint64>::min();
    const auto graph = stored(tree);
    const auto* const loaded = graph.rootAs<Sample::Tree>();
    EXPECT_TRUE(std::isnan(loaded->real));
    EXPECT_EQ(loaded->whole, std::numeric_limits<int>::min());
    EXPECT_EQ(loaded->colour, std::numeric_limits<quint32>::max());
    EXPECT_EQ(loaded->large, std::numeric_limits<qint64>::min());
}

TEST_P(EveryWay, TimesWrapInTheArchivesAndAreWholeInTheStream)
{
    const bool wraps = GetParam().wrapsTimes();
    const auto timeBack = [&](qint64 ms) {
        Sample::Tree tree;
        tree.time = MTime(ms);
        return stored(tree).rootAs<Sample::Tree>()->time.ms();
    };
    EXPECT_EQ(timeBack(2147483647), 2147483647);
    EXPECT_EQ(timeBack(2147483648), wraps ? -2147483648 : 2147483648);
    EXPECT_EQ(timeBack(4294967296), wraps ? 0 : 4294967296);
    EXPECT_EQ(timeBack(4294967301), wraps ? 5 : 4294967301);
    EXPECT_EQ(timeBack(-2147483648), -2147483648);
    EXPECT_EQ(timeBack(-2147483649), wraps ? 2147483647 : -2147483649);
    EXPECT_EQ(timeBack(-1), -1);
}

TEST_P(EveryWay, SharedObjectsStaySharedAndCyclesClose)
{
    Sample::Leaf leaf(3, QStringLiteral("shared"));
    Sample::Tree first;
    Sample::Tree second;
    first.other = &second;
    second.other = &first;
    first.next = &first;
    first.leaf = &leaf;
    first.sameLeaf = &leaf;
    second.leaf = &leaf;
    second.anything = &first;

    const auto graph = stored(first);
    const auto* const loaded = graph.rootAs<Sample::Tree>();
    ASSERT_TRUE(loaded && loaded->other);
    EXPECT_EQ(loaded->other->other, loaded);
    EXPECT_EQ(loaded->next, loaded);
    EXPECT_EQ(loaded->sameLeaf, loaded->leaf);
    EXPECT_EQ(loaded->other->leaf, loaded->leaf);
    EXPECT_EQ(loaded->other->anything, loaded);
    EXPECT_EQ(loaded->leaf->text, QStringLiteral("shared"));
    EXPECT_EQ(graph.size(), 3u);
}

TEST_P(EveryWay, APointerToAnObjectHeldByValueLeadsThere)
{
    Sample::Grove grove;
    grove.litter.push_back({1, QStringLiteral("one")});
    grove.litter.push_back({2, QStringLiteral("two")});
    grove.named[QStringLiteral("k")].number = 3;
    grove.couple = {&grove.litter[1], &grove.named[QStringLiteral("k")]};
    const auto graph = stored(grove);
    const auto* const loaded = graph.rootAs<Sample::Grove>();
    EXPECT_EQ(loaded->couple.first, &loaded->litter[1]);
    EXPECT_EQ(loaded->couple.second, &loaded->named.at(QStringLiteral("k")));
    EXPECT_EQ(graph.size(), 1u);
}

TEST_P(EveryWay, ADequeOfThreeNestedObjectsComesBackInOrder)
{
    std::deque<Sample::Tree> trees(3);
    Sample::Grove grove;
    for (int i = 0; i < 3; ++i) {
        trees[i].whole = 10 + i;
        trees[i].inner.number = 20 + i;
        trees[i].other = i < 2 ? &trees[i + 1] : nullptr;
        grove.row.push_back(&trees[i]);
    }
    const auto graph = stored(grove);
    const auto& row = graph.rootAs<Sample::Grove>()->row;
    ASSERT_EQ(row.size(), 3u);
    for (int i = 0; i < 3; ++i) {
        EXPECT_EQ(row[i]->whole, 10 + i);
        EXPECT_EQ(row[i]->inner.number, 20 + i);
        EXPECT_EQ(row[i]->other, i < 2 ? row[i + 1] : nullptr);
    }
}

TEST_P(EveryWay, AListThatIsSharedStaysSharedWhileItIsSaved)
{
    const Sample::Leaf leaf;
    Sample::Grove grove;
    grove.list = {&leaf, &leaf};
    const QList<const Sample::Leaf*> shared = grove.list;
    const auto* const before = &std::as_const(grove.list).first();
    documentOf({&grove}, GetParam());
    EXPECT_EQ(&std::as_const(grove.list).first(), before);
}

TEST_P(EveryWay, PicturesComeBackSharedAndNull)
{
    QImage image(2, 2, QImage::Format_ARGB32);
    image.fill(0x80FF0000u);
    image.setPixel(1, 0, 0xFF00FF00u);
    Sample::Album album;
    album.cover = std::make_shared<const Types::Image>(QPixmap::fromImage(image));
    album.back = album.cover;
    const auto graph = stored(album);
    const auto* const loaded = graph.rootAs<Sample::Album>();
    ASSERT_TRUE(loaded->cover);
    EXPECT_EQ(loaded->cover, loaded->back);
    EXPECT_EQ(loaded->cover.use_count(), 2);
    EXPECT_EQ(loaded->cover->toImage().convertToFormat(QImage::Format_ARGB32), image);
    EXPECT_EQ(graph.size(), 1u);

    Sample::Album bare;
    bare.back = std::make_shared<const Types::Image>();
    const auto second = stored(bare);
    EXPECT_EQ(second.rootAs<Sample::Album>()->cover, nullptr);
    ASSERT_TRUE(second.rootAs<Sample::Album>()->back);
    EXPECT_TRUE(second.rootAs<Sample::Album>()->back->isNull());
}

TEST_P(EveryWay, AClassThatWasNeverRegisteredIsRefusedByName)
{
    const Sample::Stray stray;
    Sample::Tree tree;
    tree.anything = &stray;
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    try {
        Document::save(buffer, tree, GetParam().form, GetParam().route);
        FAIL() << "a stray object was stored";
    } catch (const Document::Error& error) {
        EXPECT_EQ(error.place().substr(0, 19), "objects[1]/anything");
        EXPECT_EQ(error.reason(), "unregistered class - derived class not registered or exported");
    }
}

TEST_P(EveryWay, ObjectsThatNestTooDeepAreRefusedOnSaving)
{
    std::deque<Sample::Tree> chain(3000);
    for (std::size_t i = 0; i + 1 < chain.size(); ++i)
        chain[i].other = &chain[i + 1];
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    try {
        Document::save(buffer, chain.front(), GetParam().form, GetParam().route);
        FAIL() << "three thousand nested objects were stored";
    } catch (const Document::Error& error) {
        EXPECT_EQ(error.reason(), "objects nest deeper than 1000 levels");
    }
}

TEST_P(EveryWay, ATextThatIsNotUtf8IsRefusedByNameWhereTheFormIsText)
{
    Sample::Tree tree;
    tree.bytes = "caf\xE9";
    if (GetParam().form == Document::Binary) {
        if (GetParam().route == Document::Archive) {
            EXPECT_EQ(stored(tree).rootAs<Sample::Tree>()->bytes, tree.bytes);
        }
        return;
    }
    try {
        documentOf({&tree}, GetParam());
        FAIL() << "Latin-1 was stored as text";
    } catch (const Document::Error& error) {
        EXPECT_EQ(error.place().substr(0, 16), "objects[1]/bytes");
        EXPECT_NE(error.reason().find("UTF-8"), std::string::npos);
    }
}

} // namespace
