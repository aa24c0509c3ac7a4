// SPDX-License-Identifier: Apache-2.0
// Damaged documents end in a clear error or in a sound object, and in nothing else.
#include "tests/archives/SampleClasses.h"
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldVisitors.h"

#include <EditorModel/media/ResourceTable.h>

#include <gtest/gtest.h>

#include <QCryptographicHash>
#include <QTemporaryDir>

#include <random>

namespace {

using Testing::Dump;

/// A document of a few objects with every kind of field.
class Damage : public ::testing::TestWithParam<Way>
{
protected:
    void SetUp() override
    {
        m_leaf.number = 3;
        m_leaf.text = QString::fromUtf8("Grüße");
        m_tree.other = &m_tree;
        m_tree.leaf = &m_leaf;
        m_tree.bytes = "bytes";
        m_tree.text = QStringLiteral("text");
        m_tree.time = MTime(5000000000);
        m_grove.row = {&m_tree, nullptr, &m_tree};
        m_grove.leaves = {&m_leaf};
        m_grove.numbers = {1, 2};
        m_grove.named[QStringLiteral("name")].number = 8;
        m_grove.falls[&m_leaf] = MTime(12);
        m_grove.couple.second = &m_leaf;
        m_grove.notes[QStringLiteral("key")] = QStringLiteral("value");
        m_grove.list = {&m_leaf};
        m_table.resource2fileInfo[{QStringLiteral("film"), Resource::VideoType}].info.track = 2;
        m_table.resource2fileInfo[{QStringLiteral("film"), Resource::AudioType}].info.track = 3;
        m_document = documentOf({&m_grove, &m_leaf, &m_table}, GetParam());
    }

    /// True if the document was refused. Whatever is loaded must be whole enough to be walked and stored
    /// again.
    bool refused(const QByteArray& document)
    {
        try {
            const auto graph = graphOf(document);
            for (const auto* const root : graph.roots()) {
                if (root) {
                    EXPECT_FALSE(Dump::of(*root).empty());
                }
            }
            EXPECT_FALSE(documentOf({graph.roots().begin(), graph.roots().end()}, GetParam()).isEmpty());
            return false;
        } catch (const Document::Error& error) {
            EXPECT_STRNE(error.what(), "");
            EXPECT_FALSE(error.reason().empty());
            return true;
        }
    }

    /// Boost's archives stand behind a checksum.
    bool isGuarded() const
    {
        return GetParam().route == Document::Archive && GetParam().form != Document::Json;
    }
    bool isFramed() const { return GetParam().form == Document::Binary || isGuarded(); }

    Sample::Leaf m_leaf;
    Sample::Tree m_tree;
    Sample::Grove m_grove;
    ResourceTable::Object m_table;
    QByteArray m_document;
};

INSTANTIATE_TEST_SUITE_P(Ways, Damage, ::testing::ValuesIn(allWays),
                         [](const auto& instance) { return std::string(instance.param.name); });

TEST_P(Damage, ADocumentCutAtAnyByteIsRefused)
{
    // Blanks behind the end of a text are no part of it.
    const int end = isFramed() ? m_document.size() : m_document.trimmed().size();
    for (int length = 0; length < end; ++length)
        ASSERT_TRUE(refused(m_document.left(length)))
            << "cut to " << length << " of " << m_document.size() << " bytes";
    EXPECT_FALSE(refused(m_document));
}

TEST_P(Damage, ADocumentThatGoesOnBehindItsEndIsRefused)
{
    EXPECT_TRUE(refused(m_document + "x"));
    EXPECT_TRUE(refused(m_document + m_document));
}

TEST_P(Damage, ChangedBytesAreRefusedOrGiveASoundObject)
{
    std::mt19937 random(20);
    const auto below = [&](int bound) { return std::uniform_int_distribution<int>(0, bound - 1)(random); };
    for (int round = 0; round < 4000; ++round) {
        QByteArray document = m_document;
        for (int changes = below(4); changes >= 0; --changes) {
            const int at = below(document.size());
            switch (below(5)) {
            case 0:
                document[at] = static_cast<char>(below(256));
                break;
            case 1:
                document[at] = static_cast<char>(document[at] ^ (1 << below(8)));
                break;
            case 2:
                document.remove(at, 1 + below(8));
                break;
            case 3:
                document.insert(at, static_cast<char>(below(256)));
                break;
            default:
                document.insert(at, m_document.mid(below(m_document.size()), 1 + below(40)));
                break;
            }
        }
        const bool wasRefused = refused(document);
        if (isFramed() && document != m_document) {
            ASSERT_TRUE(wasRefused) << "round " << round;
        }
    }
}

TEST_P(Damage, EveryBitFlippedAloneIsRefusedOrGivesASoundObject)
{
    for (int at = 0; at < m_document.size(); ++at) {
        QByteArray document = m_document;
        document[at] = static_cast<char>(document[at] ^ (1 << (at % 8)));
        const bool wasRefused = refused(document);
        if (isFramed()) {
            ASSERT_TRUE(wasRefused) << "byte " << at;
        }
    }
}

TEST(DocumentError, TellsFormPlaceAndReason)
{
    const Document::Error error("XML document", "objects[1]/path", "the text is not UTF-8");
    EXPECT_STREQ(error.what(), "XML document, at objects[1]/path: the text is not UTF-8");
    EXPECT_STREQ(Document::Error("", "", "the document is empty").what(), "the document is empty");
    EXPECT_STREQ(Document::Error("a.json", "", "it is empty").what(), "a.json: it is empty");
}

TEST(DocumentError, WhatIsNoDocumentIsNamed)
{
    const std::string none = "this is neither a binary nor an XML nor a Json document";
    EXPECT_EQ(loadError(""), "the document is empty");
    EXPECT_EQ(loadError("hello"), none);
    EXPECT_EQ(loadError("  \n "), none);
    EXPECT_EQ(loadError("\x89PNG\r\n\x1A\n"), none);
    EXPECT_EQ(loadError("{\"a\": tru}"),
              "Json document: this is no Json: it cannot be read on from line 1, column 10");
    EXPECT_EQ(loadError("{\"EditorModel\": \"archive\", \"version\": 7}"),
              "Json document: its version is not 1");
    EXPECT_EQ(loadError("{\"EditorModel\": \"archive\", \"version\": [1]}"),
              "Json document: its version is not 1");
    EXPECT_EQ(loadError("{\"EditorModel\": \"archive\", \"version\": 1}"),
              "Json document, at objects: \"objects\" is missing");
}

TEST(DocumentError, ABinaryDocumentTellsWhatHappenedToIt)
{
    const Sample::Leaf leaf;
    const QByteArray document = documentOf({&leaf}, allWays[0]);
    const auto size = [](int bytes) { return std::to_string(bytes); };
    // Signature, version and route, length and digest take 50 bytes.
    EXPECT_EQ(loadError(document.left(20)),
              "binary document: it is cut off: 50 bytes are expected, 20 are there");
    EXPECT_EQ(loadError(document.left(60)), "binary document: it is cut off: " + size(document.size() - 50) +
                                                " bytes are expected, 10 are there");
    EXPECT_EQ(loadError(document + 'x'),
              "binary document: it goes on behind its end: " + size(document.size() - 50) +
                  " bytes are expected, " + size(document.size() - 49) + " are there");
    QByteArray changed = document;
    changed[document.size() - 1] = static_cast<char>(changed[document.size() - 1] ^ 1);
    EXPECT_EQ(loadError(changed), "binary document: it is damaged: its content does not fit its checksum");
    changed = document;
    changed[8] = 9;
    EXPECT_EQ(loadError(changed), "binary document: it is of version 9, which is not known");
    changed = document;
    changed.replace("\r\n", "\n");
    EXPECT_EQ(loadError(changed), "binary document: it does not begin as a binary document does");
}

TEST(DocumentError, ThePlaceOfADamagedFieldIsItsWayOfKeys)
{
    Sample::Tree tree;
    Sample::Leaf leaf;
    tree.leaf = &leaf;
    Sample::Grove grove;
    grove.row = {nullptr, &tree};
    QByteArray document = documentOf({&grove}, allWays[2]);
    document.replace("\"number\": 0", "\"number\": true");
    EXPECT_EQ(loadError(document),
              "Json document, at objects[1]/row[2]/leaf/number: there is boolean where a whole "
              "number is expected");
}

TEST(DocumentError, AWrongCountIsNamedWithItsContainer)
{
    Sample::Grove grove;
    grove.litter.resize(1);
    QByteArray document = documentOf({&grove}, allWays[2]);
    const int count = document.indexOf("\"count\": 1", document.indexOf("\"litter\""));
    document.replace(count, 10, "\"count\": 5");
    EXPECT_EQ(loadError(document),
              "Json document, at objects[1]/litter: there are 1 items where 5 are counted");
}

TEST(DocumentError, ObjectsThatNestTooDeepAreRefusedOnLoadingToo)
{
    std::string deep;
    std::string end;
    for (int level = 0; level < 20000; ++level) {
        deep += "{\"$meta\": {\"class\": \"Sample::Bark\"}, \"rough\": false, \"next\": ";
        end += '}';
    }
    const std::string text = "{\"EditorModel\": \"archive\", \"version\": 1, \"objects\": {\"count\": 1, "
                             "\"item_version\": 0, \"item\": [" +
                             deep + "null" + end + "]}}";
    const std::string error = loadError(QByteArray::fromStdString(text));
    EXPECT_NE(error.find("objects nest deeper than 1000 levels"), std::string::npos) << error;
    EXPECT_EQ(error.find("Json document, at .../next/next/"), 0u) << error;
    EXPECT_LT(error.size(), 500u);
}

TEST(DocumentError, AMarkOrBlanksMayStandInFront)
{
    const Sample::Leaf leaf(4, QStringLiteral("four"));
    const QByteArray document = documentOf({&leaf}, allWays[2]);
    EXPECT_EQ(graphOf(QByteArray(100, ' ') + document).rootAs<Sample::Leaf>()->number, 4);
    EXPECT_EQ(graphOf("\xEF\xBB\xBF" + document).rootAs<Sample::Leaf>()->number, 4);
}

TEST(DocumentError, ADeviceThatIsNotOpenIsNamed)
{
    QBuffer closed;
    try {
        Document::load(closed);
        FAIL() << "a closed device was read";
    } catch (const Document::Error& error) {
        EXPECT_STREQ(error.what(), "the device is not open for reading");
    }
}

TEST(DocumentOrigin, ForeignDocumentsAreNeverGivenToBoost)
{
    const Sample::Leaf leaf(4, QStringLiteral("four"));
    for (const Way& way : allWays) {
        QByteArray document = documentOf({&leaf}, way);
        QBuffer buffer(&document);
        buffer.open(QIODevice::ReadOnly);
        const bool isBoosts = way.route == Document::Archive && way.form != Document::Json;
        try {
            const auto graph = Document::load(buffer, Document::ForeignDocuments);
            EXPECT_FALSE(isBoosts) << way.name;
            EXPECT_EQ(graph.rootAs<Sample::Leaf>()->number, 4);
        } catch (const Document::Error& error) {
            EXPECT_TRUE(isBoosts) << way.name;
            EXPECT_EQ(error.reason(), "an archive of this form is taken from oneself alone");
        }
    }
}

/// With a checksum that is right.
TEST(DocumentError, AnXmlArchiveWithoutItsEndTagIsRefused)
{
    const auto sealed = [](const QByteArray& content) {
        return content + "<!-- EditorModel archive: " + QByteArray::number(content.size()) +
               " bytes, SHA-256 " + QCryptographicHash::hash(content, QCryptographicHash::Sha256).toHex() +
               " -->\n";
    };
    const Sample::Leaf leaf;
    const QByteArray document = documentOf({&leaf}, allWays[1]);
    const QByteArray content = document.left(document.lastIndexOf("<!--"));
    EXPECT_EQ(sealed(content), document);
    EXPECT_EQ(loadError(sealed(content.left(content.lastIndexOf("</boost_serialization>")))),
              "XML document: it is cut off: its end tag is missing");
}

TEST(DocumentError, ACommentLikeASealMakesNoArchive)
{
    const Sample::Leaf leaf(4, QStringLiteral("four"));
    QByteArray document = documentOf({&leaf}, allWays[4]);
    document.insert(document.lastIndexOf("</EditorModel>"),
                    "<!-- EditorModel archive: 3 bytes, SHA-256 00 -->\n");
    EXPECT_EQ(graphOf(document).rootAs<Sample::Leaf>()->number, 4);
}

TEST(DocumentFile, IsReplacedAsAWholeOrNotAtAll)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QString::fromUtf8("Grüße 日本.json"));
    const Sample::Leaf leaf(4, QStringLiteral("four"));
    Document::saveFile(path, {&leaf}, Document::Json);
    EXPECT_EQ(Document::loadFile(path).rootAs<Sample::Leaf>()->number, 4);

    Sample::Tree broken;
    broken.bytes = "\xFF";
    EXPECT_THROW(Document::saveFile(path, {&broken}, Document::Json), Document::Error);
    EXPECT_EQ(Document::loadFile(path).rootAs<Sample::Leaf>()->number, 4);
}

TEST(DocumentFile, ErrorsNameTheFile)
{
    const QTemporaryDir folder;
    const QString missing = folder.filePath(QStringLiteral("missing.bin"));
    try {
        Document::loadFile(missing);
        FAIL() << "a missing file was loaded";
    } catch (const Document::Error& error) {
        EXPECT_EQ(error.what(), missing.toStdString() + ": it cannot be read: No such file or directory");
    }
    const Sample::Leaf leaf;
    EXPECT_THROW(
        Document::saveFile(folder.filePath(QStringLiteral("no/such/folder.xml")), {&leaf}, Document::Xml),
        Document::Error);
}

TEST(DocumentFile, TheFormFollowsFromTheEnding)
{
    EXPECT_EQ(Document::formOfPath(QStringLiteral("a.bin")), Document::Binary);
    EXPECT_EQ(Document::formOfPath(QStringLiteral("a.b.XML")), Document::Xml);
    EXPECT_EQ(Document::formOfPath(QStringLiteral("x/y.Json")), Document::Json);
    EXPECT_EQ(Document::formOfPath(QStringLiteral("json")), std::nullopt);
    EXPECT_EQ(Document::formOfPath(QStringLiteral("a.txt")), std::nullopt);
}

TEST(DocumentGraph, FreesEveryObjectOnce)
{
    Sample::Counted first;
    Sample::Counted second;
    first.next = &second;
    first.also = &second;
    second.next = &first;
    for (const Way& way : allWays) {
        const QByteArray document = documentOf({&first, &second}, way);
        Sample::Counted::s_deleted = 0;
        {
            auto graph = graphOf(document);
            EXPECT_EQ(graph.size(), 2u);
            Document::Graph moved(std::move(graph));
            EXPECT_EQ(graph.size(), 0u);
            EXPECT_EQ(moved.roots().size(), 2u);
            graph = std::move(moved);
            EXPECT_EQ(Sample::Counted::s_deleted, 0);
        }
        EXPECT_EQ(Sample::Counted::s_deleted, 2) << way.name;
    }
}

} // namespace
