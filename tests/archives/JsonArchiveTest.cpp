// SPDX-License-Identifier: Apache-2.0
// The shape of the Json archive's tree, and what its reader refuses.
#include "tests/archives/SampleClasses.h"

#include <EditorModel/persistence/ConstructionLog.h>
#include <EditorModel/persistence/Json.h>

#include <boost/serialization/vector.hpp>

#include <gtest/gtest.h>

#include <limits>
#include <optional>
#include <string>
#include <vector>

namespace {

using boost::serialization::make_nvp;
using nlohmann::json;
using Serialize::Json::iarchive;
using Serialize::Json::oarchive;

/// With a body of its own.
struct Client
{
    short small = 0;
    unsigned long long large = 0;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& make_nvp("small", small);
        ar& make_nvp("large", large);
    }
};

template <class T>
json saved(const T& value)
{
    json root;
    oarchive(root) << make_nvp("content", value);
    return root;
}

template <class T>
void load(const json& root, T& value)
{
    iarchive archive(root);
    archive >> make_nvp("content", value);
}

template <class T>
std::string errorOf(const json& root, T& value)
{
    const Serialize::Details::ConstructionLog log;
    try {
        load(root, value);
    } catch (const std::exception& error) {
        return error.what();
    }
    return "nothing was thrown";
}

TEST(JsonArchive, AValueHasItsFieldsUnderTheirKeys)
{
    EXPECT_EQ(saved(Sample::Leaf(4, QStringLiteral("four"))),
              json::parse(R"({"content": {"number": 4, "text": "four"}})"));
}

TEST(JsonArchive, AClassWithoutFieldsIsAnObjectWithoutMembers)
{
    EXPECT_EQ(saved(Sample::Nothing()), json::parse(R"({"content": {}})"));
}

TEST(JsonArchive, AValueWithoutAKeyIsTheHeadItself)
{
    json root;
    {
        oarchive archive(root);
        archive << 5;
        EXPECT_EQ(archive.headRef(), 5);
    }
    EXPECT_EQ(root, 5);
    int loaded = 0;
    iarchive archive(root);
    archive >> loaded;
    EXPECT_EQ(loaded, 5);
    EXPECT_EQ(archive.headRef(), 5);
}

TEST(JsonArchive, ANullPointerIsANullUnderItsKeyWithNoClassName)
{
    const Sample::Leaf* const null = nullptr;
    EXPECT_EQ(saved(null), json::parse(R"({"content": null})"));
}

TEST(JsonArchive, APointerNamesItsClassAndEveryLaterMentionItsIdentity)
{
    const Sample::Leaf leaf(4, QStringLiteral("four"));
    const std::deque<const Sample::Leaf*> leaves = {&leaf, nullptr, &leaf};
    EXPECT_EQ(saved(leaves), json::parse(R"({"content": {"count": 3, "item_version": 0, "item": [
        {"$meta": {"class": "Sample::Leaf", "id": 1}, "number": 4, "text": "four"},
        null,
        {"$meta": {"class": "Sample::Leaf", "ref": 1}}]}})"));
}

TEST(JsonArchive, AnObjectHeldByValueGetsAnIdentityWhenAPointerNamesIt)
{
    Sample::Tree tree;
    tree.other = &tree;
    const json root = saved(tree);
    EXPECT_EQ(root["content"]["$meta"], json::parse(R"({"id": 1})"));
    EXPECT_EQ(root["content"]["other"], json::parse(R"({"$meta": {"class": "Sample::Tree", "ref": 1}})"));
    EXPECT_FALSE(root["content"]["inner"].contains("$meta"));
}

TEST(JsonArchive, ContainersHaveTheirCountsAndItems)
{
    Sample::Grove grove;
    grove.numbers = {7, 8};
    grove.words = {{QStringLiteral("a")}, {}};
    grove.grid = {{1, {{2, 0.5}}}};
    grove.triple = {QStringLiteral("t"), 3, Sample::Dark};
    grove.notes = {{QStringLiteral("k"), QStringLiteral("v")}};
    const json content = saved(grove)["content"];
    EXPECT_EQ(content["numbers"], json::parse(R"({"count": 2, "item_version": 0, "item": [7, 8]})"));
    EXPECT_EQ(content["words"], json::parse(R"({"count": 2, "item_version": 0, "item": [
        {"count": 1, "item_version": 0, "item": ["a"]}, {"count": 0, "item_version": 0}]})"));
    EXPECT_EQ(content["grid"], json::parse(R"({"count": 1, "item_version": 0, "item": [
        {"first": 1, "second": {"count": 1, "item_version": 0, "item": [{"first": 2, "second": 0.5}]}}]})"));
    EXPECT_EQ(content["couple"], json::parse(R"({"first": null, "second": null})"));
    EXPECT_EQ(content["triple"], json::parse(R"({"element": ["t", 3, 7]})"));
    EXPECT_EQ(content["notes"], json::parse(R"({"count": 1, "item": [{"first": "k", "second": "v"}]})"));
    EXPECT_EQ(content["list"], json::parse(R"({"count": 0})"));
}

TEST(JsonArchive, AMapOfTextsWithoutEntriesIsACountOfZero)
{
    EXPECT_EQ(saved(QMap<QString, QString>()), json::parse(R"({"content": {"count": 0}})"));
}

TEST(JsonArchive, ABaseStandsUnderItsOwnName)
{
    Sample::Tree tree;
    tree.girth = 1.5;
    tree.rough = true;
    const json content = saved(tree)["content"];
    EXPECT_EQ(content["Sample::Trunk"], json::parse(R"({"girth": 1.5})"));
    EXPECT_EQ(content["Sample::Bark"], json::parse(R"({"rough": true, "next": null})"));
}

TEST(JsonArchive, NumbersThatJsonHasNotAreTexts)
{
    json root;
    Serialize::Json::detail::save(root, std::numeric_limits<double>::infinity());
    EXPECT_EQ(root, "inf");
    Serialize::Json::detail::save(root, -std::numeric_limits<double>::infinity());
    EXPECT_EQ(root, "-inf");
    Serialize::Json::detail::save(root, std::numeric_limits<double>::quiet_NaN());
    EXPECT_EQ(root, "nan");
}

template <class T>
void expectNode(const T& value, const json& expected)
{
    json node;
    Serialize::Json::detail::save(node, value);
    EXPECT_EQ(node, expected);
    EXPECT_EQ(node.type(), expected.type());
    T loaded{};
    Serialize::Json::detail::load(node, loaded);
    EXPECT_EQ(loaded, value);
}

TEST(JsonArchive, SingleValuesAreSavedAndLoadedByTheirTypes)
{
    expectNode(std::string("four"), "four");
    expectNode(true, true);
    expectNode(0.5, 0.5);
    expectNode(-4, -4);
    expectNode(4294967295u, 4294967295u);
    expectNode(qint64(-5000000000), -5000000000);
}

TEST(JsonArchive, NumbersBeyondEitherEndOfTheirTypeAreRefused)
{
    using Serialize::Json::detail::load;
    int whole = 0;
    load(json(-2147483648), whole);
    EXPECT_EQ(whole, std::numeric_limits<int>::min());
    EXPECT_THROW(load(json(-2147483649), whole), std::runtime_error);
    EXPECT_THROW(load(json(2147483648), whole), std::runtime_error);
    unsigned int colour = 0;
    EXPECT_THROW(load(json(-1), colour), std::runtime_error);
    EXPECT_THROW(load(json(4294967296), colour), std::runtime_error);
    qint64 large = 0;
    EXPECT_THROW(load(json(9223372036854775808u), large), std::runtime_error);
}

TEST(JsonArchive, ANodeGivesTheIdentityOfItsObjectOrOfTheOneThatItMentions)
{
    using Serialize::Json::getObjectId;
    EXPECT_EQ(getObjectId(json::parse(R"({"$meta": {"class": "Sample::Leaf", "id": 4}, "number": 4})")), 4u);
    EXPECT_EQ(getObjectId(json::parse(R"({"$meta": {"ref": 5}})")), 5u);
    EXPECT_EQ(getObjectId(json::parse(R"({"$meta": {"id": 0}})")), 0u);
    for (const char* const without :
         {R"({"$meta": {"class": "Sample::Leaf"}})", R"({"id": 4})", "[4]", "4", "null"})
        EXPECT_EQ(getObjectId(json::parse(without)), std::nullopt) << without;
}

TEST(JsonArchive, BytesAreBase64)
{
    json root;
    {
        oarchive archive(root);
        archive.save_binary("\x00\xFF\x10", 3);
    }
    EXPECT_EQ(root, "AP8Q");
    char bytes[3] = {};
    iarchive archive(root);
    archive.load_binary(bytes, 3);
    EXPECT_EQ(std::string(bytes, 3), std::string("\x00\xFF\x10", 3));
    EXPECT_THROW(archive.load_binary(bytes, 2), std::runtime_error);
}

TEST(JsonArchive, AnIdentifierThatIsNotInTheTableThrows)
{
    const json root = json::parse(R"({"content": {"$meta": {"class": "Sample::Leaf", "ref": 5}}})");
    const Sample::Leaf* pointer = nullptr;
    EXPECT_EQ(errorOf(root, pointer), "invalid map<K, T> key");
    Sample::Leaf leaf;
    EXPECT_THROW(load(root, leaf), std::out_of_range);
}

TEST(JsonArchive, AnObjectHeldByValueTwiceStandsTwice)
{
    const Sample::Leaf leaf(4, QStringLiteral("four"));
    const Sample::Leaf* const pointer = &leaf;
    json root;
    oarchive(root) << make_nvp("first", leaf) << make_nvp("second", leaf) << make_nvp("pointer", pointer);
    EXPECT_EQ(root["first"], json::parse(R"({"$meta": {"id": 1}, "number": 4, "text": "four"})"));
    EXPECT_EQ(root["second"], json::parse(R"({"number": 4, "text": "four"})"));
    EXPECT_EQ(root["pointer"], json::parse(R"({"$meta": {"class": "Sample::Leaf", "ref": 1}})"));
}

TEST(JsonArchive, AKeyThatStandsTwiceIsRefusedAndEndsTheArchive)
{
    const Sample::Leaf first;
    const Sample::Leaf second;
    const Sample::Leaf* const pointer = &first;
    json root;
    oarchive archive(root);
    archive << make_nvp("content", first);
    EXPECT_THROW(archive << make_nvp("content", second), std::runtime_error);
    EXPECT_THROW(archive << make_nvp("pointer", pointer), std::logic_error);
}

TEST(JsonArchive, AReaderGoesOnAfterAnException)
{
    const json root = json::parse(R"({"a": {"number": "x", "text": ""}, "b": {"number": 3, "text": ""}})");
    Sample::Leaf leaf;
    iarchive archive(root);
    EXPECT_THROW(archive >> make_nvp("a", leaf), std::runtime_error);
    archive >> make_nvp("b", leaf);
    EXPECT_EQ(leaf.number, 3);
}

TEST(JsonArchive, AMentionHeldByValueIsACopyOfWhatItNames)
{
    const json root = json::parse(R"({"first": {"$meta": {"id": 1}, "number": 4, "text": "four"},
                                      "second": {"$meta": {"ref": 1}}})");
    Sample::Leaf first;
    Sample::Leaf second;
    iarchive archive(root);
    archive >> make_nvp("first", first) >> make_nvp("second", second);
    EXPECT_EQ(first.number, 4);
    EXPECT_EQ(second.number, 4);
}

TEST(JsonArchive, AnIdentifierOfAnyShapeIsNamedWithoutBeingWrittenOut)
{
    for (const char* const key : {"id", "ref"}) {
        json deep = 1;
        for (int level = 0; level < 300000; ++level)
            deep = json::array({std::move(deep)});
        json root;
        root["content"]["$meta"][key] = std::move(deep);
        Sample::Leaf leaf;
        EXPECT_EQ(errorOf(root, leaf), "an identifier is array, not a whole number from 0 on");
    }
}

/// A thousand mentions of one long text, held by value.
TEST(JsonArchive, ALongTextIsNotMultipliedByMentions)
{
    json root;
    root["text"] = json::parse(R"({"$meta": {"id": 1}, "number": 1})");
    root["text"]["text"] = std::string(100000, 'x');
    json items = json::array();
    for (int i = 0; i < 1000; ++i)
        items.push_back(json::parse(R"({"$meta": {"ref": 1}})"));
    root["content"] = {{"count", 1000}, {"item_version", 0}, {"item", items}};
    std::deque<Sample::Leaf> leaves;
    EXPECT_EQ(errorOf(root, leaves), "the document repeats its own parts without end");
    EXPECT_LT(leaves.size(), 10u);
}

TEST(JsonArchive, CountsAndNumbersOfBodiesAreChecked)
{
    std::vector<Client> clients;
    EXPECT_EQ(
        errorOf(json::parse(R"({"content": {"count": 500000000, "item_version": 0, "item": [1]}})"), clients),
        "there are 1 items where 500000000 are counted");
    EXPECT_EQ(errorOf(json::parse(R"({"content": {"count": -1, "item_version": 0}})"), clients),
              "a count of -1 items");
    Client client;
    EXPECT_EQ(errorOf(json::parse(R"({"content": {"small": 70000, "large": 1}})"), client),
              "the number 70000 is out of range");
    EXPECT_EQ(errorOf(json::parse(R"({"content": {"small": 1, "large": -1}})"), client),
              "the number -1 is out of range");
    client.large = std::numeric_limits<unsigned long long>::max();
    EXPECT_THROW(saved(client), std::runtime_error);
}

TEST(JsonArchive, AMentionMayStandBeforeWhatItNames)
{
    const json root = json::parse(R"({"content": {"count": 2, "item_version": 0, "item": [
        {"$meta": {"class": "Sample::Leaf", "ref": 9}},
        {"$meta": {"class": "Sample::Leaf", "id": 9}, "number": 4, "text": "four"}]}})");
    std::deque<const Sample::Leaf*> leaves;
    load(root, leaves);
    const std::unique_ptr<const Sample::Leaf> owned(leaves.at(0));
    EXPECT_EQ(leaves.at(0), leaves.at(1));
    EXPECT_EQ(leaves.at(0)->number, 4);
}

TEST(JsonArchive, AKeyItemOutsideACollectionIsAKeyLikeAnyOther)
{
    json root;
    {
        const int three = 3;
        oarchive archive(root);
        archive << make_nvp("item", three);
    }
    EXPECT_EQ(root, json::parse(R"({"item": 3})"));
    int loaded = 0;
    iarchive archive(root);
    archive >> make_nvp("item", loaded);
    EXPECT_EQ(loaded, 3);
}

TEST(JsonArchive, DamageIsNamed)
{
    Sample::Leaf leaf;
    EXPECT_EQ(errorOf(json::parse(R"({})"), leaf), "\"content\" is missing");
    EXPECT_EQ(errorOf(json::parse(R"({"content": 3})"), leaf), "there is number where an object is expected");
    EXPECT_EQ(errorOf(json::parse(R"({"content": {"text": ""}})"), leaf), "\"number\" is missing");
    EXPECT_EQ(errorOf(json::parse(R"({"content": {"number": "1", "text": ""}})"), leaf),
              "there is string where a whole number is expected");
    EXPECT_EQ(errorOf(json::parse(R"({"content": {"number": 2147483648, "text": ""}})"), leaf),
              "the number 2147483648 is out of range");
    EXPECT_EQ(errorOf(json::parse(R"({"content": {"number": 1.5, "text": ""}})"), leaf),
              "there is number where a whole number is expected");

    const Sample::Leaf* pointer = nullptr;
    EXPECT_EQ(errorOf(json::parse(R"({"content": {"number": 1, "text": ""}})"), pointer),
              "an object has no class name");
    EXPECT_EQ(errorOf(json::parse(R"({"content": {"$meta": {"class": "No::Such"}}})"), pointer),
              "unregistered class - derived class not registered or exported");
    EXPECT_EQ(errorOf(json::parse(R"({"content": {"$meta": {"class": "QPixmap"}}})"), pointer),
              "unregistered class - derived class not registered or exported");
    EXPECT_EQ(errorOf(json::parse(R"({"content": {"$meta": {"class": "Sample::Leaf", "id": -1}}})"), pointer),
              "an identifier is number, not a whole number from 0 on");

    std::deque<int> numbers;
    EXPECT_EQ(errorOf(json::parse(R"({"content": {"count": 3, "item_version": 0, "item": [1]}})"), numbers),
              "there are 1 items where 3 are counted");
    EXPECT_EQ(errorOf(json::parse(R"({"content": {"count": -1, "item_version": 0}})"), numbers),
              "a count of -1 items");

    std::map<int, double> map;
    EXPECT_EQ(errorOf(json::parse(R"({"content": {"count": 2, "item_version": 0, "item": [
                  {"first": 1, "second": 0}, {"first": 1, "second": 0}]}})"),
                      map),
              "the key of a map stands twice");
}

TEST(JsonArchive, OneIdentifierForTwoObjectsIsRefused)
{
    const json root = json::parse(R"({"content": {"count": 2, "item_version": 0, "item": [
        {"$meta": {"class": "Sample::Leaf", "id": 9}, "number": 5, "text": "five"},
        {"$meta": {"class": "Sample::Leaf", "id": 9}, "number": 4, "text": "four"}]}})");
    std::deque<const Sample::Leaf*> leaves;
    EXPECT_EQ(errorOf(root, leaves), "the identifier 9 stands for two objects");
}

/// Each level of nested lists names the level below it ten times: eight levels would be a hundred million
/// items.
TEST(JsonArchive, ADocumentThatRepeatsItsOwnPartsIsRefused)
{
    using Level1 = std::deque<Sample::Leaf>;
    using Level2 = std::deque<Level1>;
    using Level3 = std::deque<Level2>;
    using Level4 = std::deque<Level3>;
    json parts = json::array();
    const auto list = [](json item, int times) {
        json items = json::array();
        for (int i = 0; i < times; ++i)
            items.push_back(item);
        return json{{"count", times}, {"item_version", 0}, {"item", items}};
    };
    const auto mention = [](int id) { return json{{"$meta", {{"ref", id}}}}; };
    json leaf = {{"number", 1}, {"text", "x"}, {"$meta", {{"id", 1}}}};
    json root;
    for (int level = 1; level <= 4; ++level) {
        parts.push_back(leaf);
        leaf = list(mention(level), 100);
        leaf["$meta"]["id"] = level + 1;
    }
    root["parts"] = parts;
    root["content"] = leaf;
    Level4 lists;
    EXPECT_EQ(errorOf(root, lists), "the document repeats its own parts without end");
}

TEST(JsonArchive, AnObjectThatHoldsItselfByValueIsRefused)
{
    const json root = json::parse(R"({"content": {"$meta": {"id": 1}, "count": 1, "item_version": 0,
        "item": [{"$meta": {"ref": 1}}]}})");
    std::deque<std::deque<Sample::Leaf>> lists;
    EXPECT_EQ(errorOf(root, lists), "\"number\" is missing");
}

} // namespace
