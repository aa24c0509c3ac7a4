// SPDX-License-Identifier: Apache-2.0
// Archives as a client uses them, with no document around: persistent classes need no further include, by
// value or by pointer, and the client's own classes keep bodies of their own.
#include <boost/archive/binary_iarchive.hpp>
#include <boost/archive/binary_oarchive.hpp>
#include <boost/archive/xml_iarchive.hpp>
#include <boost/archive/xml_oarchive.hpp>

#include "tests/archives/SampleClasses.h"
#include "tests/shared/FieldVisitors.h"

#include <EditorModel/persistence/ConstructionLog.h>
#include <EditorModel/persistence/Fields.h>
#include <EditorModel/persistence/Json.h>

#include <boost/serialization/nvp.hpp>
#include <boost/serialization/string.hpp>
#include <boost/serialization/vector.hpp>

#include <QByteArray>

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <sstream>
#include <vector>

namespace Client {

/// Has a body of its own, and holds what the library made persistent.
struct Notebook
{
    int pages = 0;
    std::string owner;
    short edition = 0;
    std::vector<int> marks;
    Sample::Leaf pressed;
    const Sample::Tree* drawing = nullptr;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& boost::serialization::make_nvp("pages", pages);
        ar& boost::serialization::make_nvp("owner", owner);
        ar& boost::serialization::make_nvp("edition", edition);
        ar& boost::serialization::make_nvp("marks", marks);
        ar& boost::serialization::make_nvp("pressed", pressed);
        ar& boost::serialization::make_nvp("drawing", drawing);
    }
};

/// Derived from a persistent class, without the macro: its own body counts.
struct Herbarium : Sample::Leaf
{
    int shelf = 0;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& boost::serialization::make_nvp("shelf", shelf);
    }
};

/// Stores one of its texts in a form of its own, and does what the test wants while that is read.
class Letter : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Letter)

    const Sample::Leaf* first = nullptr;
    QString text;
    const Sample::Leaf* second = nullptr;
    const Sample::Tree* drawing = nullptr;
    const Letter* reply = nullptr;

    static std::function<void()> s_onReading;
};

std::function<void()> Letter::s_onReading;

static void fields(Serialize::Fields& f, Letter& letter)
{
    const auto asItIs = [](const QString& text) { return text; };
    const auto read = [](const QString& text) {
        if (Letter::s_onReading)
            Letter::s_onReading();
        return text;
    };
    f("first", letter.first).coded("text", letter.text, asItIs, read)("second", letter.second);
    f("drawing", letter.drawing)("reply", letter.reply);
}

} // namespace Client

EDITORMODEL_ARCHIVE_NAME(Client::Letter, "Client::Letter")
EDITORMODEL_PERSISTENT_CLASS(Client::Letter)

namespace {

using boost::serialization::make_nvp;
using Testing::Dump;

struct BinaryForm
{
    /// A document that fails in the middle of an object.
    static std::string cut(const std::string& text) { return text.substr(0, text.size() - 40); }

    template <class T>
    static std::string save(const T& value)
    {
        std::ostringstream stream;
        boost::archive::binary_oarchive(stream) << make_nvp("content", value);
        return stream.str();
    }

    template <class T>
    static void load(const std::string& text, T& value)
    {
        std::istringstream stream(text);
        boost::archive::binary_iarchive archive(stream);
        archive >> make_nvp("content", value);
    }
};

struct XmlForm
{
    /// The last field has no number in it.
    static std::string cut(std::string text)
    {
        const std::size_t at = text.rfind("<number>") + 8;
        return text.replace(at, 1, "x");
    }

    template <class T>
    static std::string save(const T& value)
    {
        std::ostringstream stream;
        boost::archive::xml_oarchive(stream) << make_nvp("content", value);
        return stream.str();
    }

    template <class T>
    static void load(const std::string& text, T& value)
    {
        std::istringstream stream(text);
        boost::archive::xml_iarchive archive(stream);
        archive >> make_nvp("content", value);
    }
};

struct JsonForm
{
    static std::string cut(const std::string& text)
    {
        auto root = nlohmann::json::parse(text);
        root["content"].erase("inner");
        return root.dump();
    }

    template <class T>
    static std::string save(const T& value)
    {
        nlohmann::json root;
        Serialize::Json::oarchive(root) << make_nvp("content", value);
        return root.dump();
    }

    template <class T>
    static void load(const std::string& text, T& value)
    {
        const auto root = nlohmann::json::parse(text);
        Serialize::Json::iarchive archive(root);
        archive >> make_nvp("content", value);
    }
};

template <class Form>
class ClientArchives : public ::testing::Test
{};

using Forms = ::testing::Types<BinaryForm, XmlForm, JsonForm>;
struct FormNames
{
    template <class Form>
    static std::string GetName(int)
    {
        return std::is_same_v<Form, BinaryForm> ? "Binary" : std::is_same_v<Form, XmlForm> ? "Xml" : "Json";
    }
};

TYPED_TEST_SUITE(ClientArchives, Forms, FormNames);

std::string withMossForLeaves(std::string text)
{
    const std::string leaf = "Sample::Leaf";
    for (std::size_t at = text.find(leaf); at != std::string::npos; at = text.find(leaf, at))
        text.replace(at, leaf.size(), "Sample::Moss");
    return text;
}

TYPED_TEST(ClientArchives, AnObjectHeldByValueKeepsItsCycles)
{
    Sample::Tree tree;
    tree.whole = 7;
    tree.other = &tree;
    tree.next = &tree;
    Sample::Tree loaded;
    TypeParam::load(TypeParam::save(tree), loaded);
    EXPECT_EQ(loaded.whole, 7);
    EXPECT_EQ(loaded.other, &loaded);
    EXPECT_EQ(loaded.next, &loaded);
}

TYPED_TEST(ClientArchives, APointerToABaseBringsBackTheDerivedObject)
{
    Sample::Tree tree;
    tree.whole = 7;
    tree.rough = true;
    const Sample::Bark* const base = &tree;
    Sample::Bark* loadedBase = nullptr;
    TypeParam::load(TypeParam::save(base), loadedBase);
    const std::unique_ptr<Sample::Bark> owned(loadedBase);
    ASSERT_TRUE(dynamic_cast<Sample::Tree*>(loadedBase));
    EXPECT_EQ(dynamic_cast<Sample::Tree*>(loadedBase)->whole, 7);
    EXPECT_TRUE(loadedBase->rough);

    const Serialize::ISerializable* const root = &tree;
    Serialize::ISerializable* loadedRoot = nullptr;
    TypeParam::load(TypeParam::save(root), loadedRoot);
    const std::unique_ptr<Serialize::ISerializable> ownedRoot(loadedRoot);
    ASSERT_TRUE(dynamic_cast<Sample::Tree*>(loadedRoot));
    EXPECT_EQ(dynamic_cast<Sample::Tree*>(loadedRoot)->whole, 7);
}

TYPED_TEST(ClientArchives, ANullPointerComesBackNull)
{
    const Sample::Tree* const null = nullptr;
    Sample::Tree other;
    Sample::Tree* loaded = &other;
    TypeParam::load(TypeParam::save(null), loaded);
    EXPECT_EQ(loaded, nullptr);
}

TYPED_TEST(ClientArchives, AClassOfTheClientKeepsItsOwnBody)
{
    Sample::Tree tree;
    tree.whole = 5;
    Client::Notebook notebook;
    notebook.pages = 12;
    notebook.owner = "Ada & <co>";
    notebook.edition = -3;
    notebook.marks = {4, 5, 6};
    notebook.pressed.text = QStringLiteral("fern");
    notebook.drawing = &tree;
    Client::Notebook loaded;
    TypeParam::load(TypeParam::save(notebook), loaded);
    const std::unique_ptr<const Sample::Tree> owned(loaded.drawing);
    EXPECT_EQ(loaded.pages, 12);
    EXPECT_EQ(loaded.owner, "Ada & <co>");
    EXPECT_EQ(loaded.edition, -3);
    EXPECT_EQ(loaded.marks, (std::vector<int>{4, 5, 6}));
    EXPECT_EQ(loaded.pressed.text, QStringLiteral("fern"));
    ASSERT_TRUE(loaded.drawing);
    EXPECT_EQ(loaded.drawing->whole, 5);
}

TYPED_TEST(ClientArchives, AClassDerivedFromAPersistentOneKeepsItsOwnBody)
{
    Client::Herbarium herbarium;
    herbarium.shelf = 3;
    herbarium.number = 9;
    Client::Herbarium loaded;
    TypeParam::load(TypeParam::save(herbarium), loaded);
    EXPECT_EQ(loaded.shelf, 3);
    EXPECT_EQ(loaded.number, 0);
}

TYPED_TEST(ClientArchives, AnArchiveMayBeReadWhileAnotherOneIs)
{
    const Sample::Leaf fern(4, QStringLiteral("fern"));
    const Sample::Leaf moss(5, QStringLiteral("moss"));
    Sample::Tree tree;
    tree.whole = 7;
    tree.leaf = &fern;
    Client::Letter reply;
    reply.text = QStringLiteral("Thanks");
    reply.second = &moss;
    Client::Letter letter;
    letter.first = &fern;
    letter.text = QStringLiteral("Dear reader");
    letter.second = &moss;
    letter.drawing = &tree;
    letter.reply = &reply;
    const std::string text = TypeParam::save(letter);
    const std::string inner = TypeParam::save(tree);

    // Takes what the readers make; a root that a pointer named would be made by the client's own templates.
    const Serialize::Details::ConstructionLog log;
    // An inner archive that is read whole, one that ends too soon, and one more where that stood.
    int readings = 0;
    Client::Letter::s_onReading = [&] {
        ++readings;
        Sample::Tree first, broken, last;
        TypeParam::load(inner, first);
        EXPECT_EQ(Dump::of(first), Dump::of(tree));
        EXPECT_ANY_THROW(TypeParam::load(TypeParam::cut(inner), broken));
        TypeParam::load(inner, last);
        EXPECT_EQ(Dump::of(last), Dump::of(tree));
    };
    Client::Letter loaded;
    TypeParam::load(text, loaded);
    Client::Letter::s_onReading = nullptr;
    EXPECT_EQ(readings, 2);
    EXPECT_EQ(Dump::of(loaded), Dump::of(letter));
}

TYPED_TEST(ClientArchives, AnArchiveIsReadAsAnyWhenOneBeforeItFailed)
{
    Sample::Tree tree;
    tree.whole = 7;
    tree.other = &tree;
    const std::string text = TypeParam::save(tree);
    for (int round = 0; round != 3; ++round) {
        Sample::Tree broken;
        EXPECT_ANY_THROW(TypeParam::load(TypeParam::cut(text), broken));
        Sample::Tree loaded;
        TypeParam::load(text, loaded);
        EXPECT_EQ(Dump::of(loaded), Dump::of(tree));
    }
}

TYPED_TEST(ClientArchives, AClassThatWasNeverRegisteredIsRefused)
{
    const Sample::Stray stray;
    Sample::Tree tree;
    tree.leaf = &stray;
    try {
        TypeParam::save(tree);
        FAIL() << "a stray object was stored";
    } catch (const boost::archive::archive_exception& error) {
        EXPECT_EQ(error.code, boost::archive::archive_exception::unregistered_class);
        EXPECT_STREQ(error.what(), "unregistered class - derived class not registered or exported");
    }
}

TEST(JsonArchive, ASoftPointerReadsAnotherClassAsNull)
{
    const Sample::Leaf leaf(4, QStringLiteral("four"));
    Sample::Tree tree;
    tree.soft = &leaf;
    tree.anything = &leaf;
    Sample::Tree loaded;
    JsonForm::load(withMossForLeaves(JsonForm::save(tree)), loaded);
    EXPECT_EQ(loaded.soft, nullptr);
    const auto* const moss = dynamic_cast<const Sample::Moss*>(loaded.anything);
    const std::unique_ptr<const Sample::Moss> owned(moss);
    ASSERT_TRUE(moss);
    EXPECT_EQ(moss->number, 4);
}

TEST(XmlArchive, ASoftPointerReadsAnotherClassAsNull)
{
    const Sample::Moss moss;
    const Sample::Leaf leaf(4, QStringLiteral("four"));
    Sample::Tree inner;
    inner.anything = &moss;
    Sample::Tree tree;
    tree.other = &inner;
    tree.soft = &leaf;
    std::string text = XmlForm::save(tree);
    // The moss is where its class got its number, and the leaf takes that number.
    const std::string named = "\" class_name=\"Sample::Moss\"";
    const std::size_t nameAt = text.find(named);
    ASSERT_NE(nameAt, std::string::npos);
    const std::size_t numberAt = text.rfind('"', nameAt - 1) + 1;
    const std::string number = text.substr(numberAt, nameAt - numberAt);
    const std::string reference = "<soft class_id_reference=\"";
    const std::size_t softAt = text.rfind(reference) + reference.size();
    text.replace(softAt, text.find('"', softAt) - softAt, number);

    const Serialize::Details::ConstructionLog log;
    Sample::Tree loaded;
    XmlForm::load(text, loaded);
    EXPECT_EQ(loaded.soft, nullptr);
    ASSERT_TRUE(loaded.other);
    EXPECT_TRUE(dynamic_cast<const Sample::Moss*>(loaded.other->anything));
}

/// The archive as a library of another version wrote it.
QByteArray ofLibrary(const char* version, QByteArray archive)
{
    const int from = archive.indexOf("version=\"", archive.indexOf("<boost_serialization")) + 9;
    return archive.replace(from, archive.indexOf('"', from) - from, version);
}

TEST(XmlArchive, HasVersionsOfItemsFromTheFourthLibraryOn)
{
    Sample::Grove grove;
    grove.numbers = {7, 8};
    grove.words = {{QStringLiteral("a")}, {}};
    grove.grid = {{1, {{2, 0.5}}}};
    const QByteArray archive = QByteArray::fromStdString(XmlForm::save(grove));
    QByteArray without = archive;
    without.replace("<item_version>0</item_version>", "");
    ASSERT_FALSE(without.contains("item_version"));
    for (const QByteArray& text : {ofLibrary("3", without), ofLibrary("4", archive)}) {
        Sample::Grove loaded;
        XmlForm::load(text.toStdString(), loaded);
        EXPECT_EQ(Dump::of(loaded), Dump::of(grove));
    }
    Sample::Grove loaded;
    EXPECT_ANY_THROW(XmlForm::load(ofLibrary("3", archive).toStdString(), loaded));
    EXPECT_ANY_THROW(XmlForm::load(ofLibrary("4", without).toStdString(), loaded));
}

TEST(JsonArchive, AStrictPointerToAnotherClassThrows)
{
    const Sample::Leaf leaf;
    Sample::Tree tree;
    tree.leaf = &leaf;
    auto text = JsonForm::save(tree);
    const Serialize::Details::ConstructionLog log;
    Sample::Tree loaded;
    EXPECT_THROW(JsonForm::load(withMossForLeaves(text), loaded), std::bad_cast);
}

} // namespace
