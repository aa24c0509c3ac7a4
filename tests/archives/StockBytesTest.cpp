// SPDX-License-Identifier: Apache-2.0
// The binary and XML archives hold, byte for byte, what Boost's own templates write for the same classes.
#include "tests/archives/SampleClasses.h"
#include "tests/archives/StockClasses.h"

#include <gtest/gtest.h>

#include <array>
#include <sstream>

namespace {

/// One graph, built alike from either family of classes; what points where is fixed by places in arrays, so
/// that containers ordered by address have the same order in both.
template <class Family>
struct Graph
{
    std::array<typename Family::Leaf, 4> leaves;
    std::array<typename Family::Tree, 3> trees;
    typename Family::Grove grove;

    Graph()
    {
        for (int i = 0; i < 4; ++i) {
            leaves[i].number = 10 + i;
            leaves[i].text = QStringLiteral("leaf & <%1> \"q\" 'a'").arg(i);
        }
        for (int i = 0; i < 3; ++i)
            fill(trees[i], i);
        trees[0].other = &trees[1];
        trees[1].other = &trees[0];
        trees[2].other = nullptr;
        trees[0].next = &trees[2];
        trees[2].next = &trees[2];

        grove.row = {&trees[0], nullptr, &trees[2], &trees[0]};
        grove.numbers = {1, -2, 3};
        grove.litter.push_back({5, QStringLiteral("five")});
        grove.litter.push_back({6, QString::fromUtf8("Grüße 日本 🎬")});
        grove.words = {{QStringLiteral("a"), QStringLiteral("b")}, {}, {QStringLiteral("c")}};
        grove.leaves = {&leaves[2], &leaves[0]};
        grove.falls = {{&leaves[0], MTime(40)}, {&leaves[3], MTime(-1)}};
        grove.named.emplace(QStringLiteral("x"), typename Family::Leaf(7, QStringLiteral("seven")));
        grove.grid = {{1, {{2, 0.5}}}, {3, {}}};
        grove.couple = {&leaves[1], nullptr};
        grove.triple = {QStringLiteral("three"), 3, Family::dark};
        grove.notes = {{QStringLiteral("k"), QStringLiteral("v")}, {QStringLiteral("l"), QString()}};
        grove.list = {&leaves[3], &leaves[1]};
    }

    void fill(typename Family::Tree& tree, int i)
    {
        tree.girth = 1.5 + i;
        tree.rough = i == 1;
        tree.flag = true;
        tree.whole = -100 * i;
        tree.colour = 0xFF102030u + i;
        tree.large = (qint64(1) << 40) + i;
        tree.real = 0.1 * i;
        tree.bytes = "bytes";
        tree.text = QStringLiteral("text");
        tree.time = MTime((qint64(1) << 31) + i);
        tree.point = QPointF(i, -2.25);
        tree.shade = Family::dark;
        tree.reversed = QStringLiteral("abc");
        tree.leaf = &leaves[i];
        tree.sameLeaf = &leaves[0];
        tree.soft = &leaves[1];
        tree.anything = i == 2 ? nullptr : static_cast<const typename Family::Root*>(&leaves[2]);
        tree.inner.number = 77;
    }
};

struct SampleFamily
{
    using Root = Serialize::ISerializable;
    using Leaf = Sample::Leaf;
    using Tree = Sample::Tree;
    using Grove = Sample::Grove;
    static constexpr Sample::Shade dark = Sample::Dark;
};

struct StockFamily
{
    using Root = Stock::Root;
    using Leaf = Stock::Leaf;
    using Tree = Stock::Tree;
    using Grove = Stock::Grove;
    static constexpr Stock::Shade dark = Stock::Dark;
};

template <class Archive, class T>
std::string saved(const T& root)
{
    std::ostringstream stream;
    {
        Archive archive(stream);
        archive << boost::serialization::make_nvp("root", root);
    }
    std::string bytes = stream.str();
    for (const auto* const key : {"Stock_::", "Stock_.."}) {
        for (std::size_t at = bytes.find(key); at != std::string::npos; at = bytes.find(key, at))
            bytes.replace(at, 6, "Sample");
    }
    return bytes;
}

template <class Archive>
class StockBytes : public ::testing::Test
{};

using Archives = ::testing::Types<boost::archive::binary_oarchive, boost::archive::xml_oarchive>;
struct ArchiveNames
{
    template <class Archive>
    static std::string GetName(int)
    {
        return std::is_same_v<Archive, boost::archive::binary_oarchive> ? "Binary" : "Xml";
    }
};

TYPED_TEST_SUITE(StockBytes, Archives, ArchiveNames);

TYPED_TEST(StockBytes, ARootHeldByValueIsStoredAlike)
{
    const Graph<SampleFamily> ours;
    const Graph<StockFamily> stock;
    EXPECT_EQ(saved<TypeParam>(ours.grove), saved<TypeParam>(stock.grove));
    EXPECT_EQ(saved<TypeParam>(ours.trees[0]), saved<TypeParam>(stock.trees[0]));
    EXPECT_EQ(saved<TypeParam>(ours.leaves[0]), saved<TypeParam>(stock.leaves[0]));
}

TYPED_TEST(StockBytes, ARootHeldByPointerIsStoredAlike)
{
    const Graph<SampleFamily> ours;
    const Graph<StockFamily> stock;
    const Sample::Grove* const ourGrove = &ours.grove;
    const Stock::Grove* const stockGrove = &stock.grove;
    EXPECT_EQ(saved<TypeParam>(ourGrove), saved<TypeParam>(stockGrove));
    const Sample::Bark* const ourBark = &ours.trees[1];
    const Stock::Bark* const stockBark = &stock.trees[1];
    EXPECT_EQ(saved<TypeParam>(ourBark), saved<TypeParam>(stockBark));
    const Serialize::ISerializable* const ourRoot = &ours.trees[2];
    const Stock::Root* const stockRoot = &stock.trees[2];
    EXPECT_EQ(saved<TypeParam>(ourRoot), saved<TypeParam>(stockRoot));
}

TYPED_TEST(StockBytes, EmptyAndNullFieldsAreStoredAlike)
{
    const Sample::Grove ours;
    const Stock::Grove stock;
    EXPECT_EQ(saved<TypeParam>(ours), saved<TypeParam>(stock));
    const Sample::Tree ourTree;
    const Stock::Tree stockTree;
    EXPECT_EQ(saved<TypeParam>(ourTree), saved<TypeParam>(stockTree));
}

} // namespace
