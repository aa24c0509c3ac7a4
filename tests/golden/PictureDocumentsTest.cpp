// SPDX-License-Identifier: Apache-2.0
// What documents with a picture look like, written down by hand. Stored data is for life: these texts are
// never written anew from what the code gives.
#include "TextArchives.h"

#include <EditorModel/library/PersistentItem.h>
#include <EditorModel/persistence/Document.h>
#include <EditorModel/types/Image.h>

#include <gtest/gtest.h>

#include <QBuffer>
#include <QImage>

#include <memory>
#include <string>

namespace {

using namespace GoldenTests;

using Item = EditorCollection::PersistentItem<Transition::Object>;
using Pointer = nlohmann::json::json_pointer;

// The picture is two pixels, a red and a blue one, as a PNG of 70 bytes.

constexpr const char* jsonArchive = R"({"content": {
    "uniqueId": "{1}", "item": null,
    "preview": {"px": {"$meta": {"class": "Types::Image", "id": 1},
        "image": {"png": {"size": 70, "bytes":
            "iVBORw0KGgoAAAANSUhEUgAAAAIAAAABCAIAAAB7QOjdAAAADUlEQVR42mP4zwAE/wEHAAH/PX2MSQAAAABJRU5ErkJggg=="}}}},
    "categories": {"count": 0, "item_version": 0}, "collectionId": "Transitions",
    "customStrings": {"count": 0, "item_version": 0}}})";

constexpr const char* jsonStream = R"({"EditorModel": "stream", "version": 1,
    "objects": [{"Data": {"$meta": {"class": "Collection::PersistentItem::Transition::Object", "id": 1},
        "uniqueId": "{1}", "item": null,
        "preview": {"$meta": {"class": "Types::Image", "id": 2}, "png":
            "iVBORw0KGgoAAAANSUhEUgAAAAIAAAABCAIAAAB7QOjdAAAADUlEQVR42mP4zwAE/wEHAAH/PX2MSQAAAABJRU5ErkJggg=="},
        "categories": [], "collectionId": "Transitions", "customStrings": []}}]})";

void expectRedAndBlue(const QImage& image)
{
    ASSERT_EQ(image.size(), QSize(2, 1));
    EXPECT_EQ(image.pixelColor(0, 0), QColor(255, 0, 0));
    EXPECT_EQ(image.pixelColor(1, 0), QColor(0, 0, 255));
}

void expectPreview(const Item& item)
{
    EXPECT_EQ(item.uniqueId, "{1}");
    EXPECT_EQ(item.collectionId, "Transitions");
    ASSERT_TRUE(item.preview);
    expectRedAndBlue(item.preview->toImage());
}

Item itemWithPreview()
{
    QImage image(2, 1, QImage::Format_RGB32);
    image.setPixelColor(0, 0, QColor(255, 0, 0));
    image.setPixelColor(1, 0, QColor(0, 0, 255));
    Item item;
    item.uniqueId = "{1}";
    item.collectionId = "Transitions";
    item.preview = std::make_shared<const Types::Image>(QPixmap::fromImage(image));
    return item;
}

/// The bytes of a PNG differ with the library that packs them: the picture is looked at, and then the members
/// that depend on it are taken from `expected`.
void expectSameButForPacking(nlohmann::json written, const nlohmann::json& expected, const Pointer& bytes,
                             const Pointer& size)
{
    const auto base64 = QByteArray::fromStdString(written.at(bytes).get<std::string>());
    const QByteArray png = QByteArray::fromBase64(base64);
    expectRedAndBlue(QImage::fromData(png, "PNG"));
    written.at(bytes) = expected.at(bytes);
    if (!size.empty()) {
        EXPECT_EQ(written.at(size), png.size());
        written.at(size) = expected.at(size);
    }
    EXPECT_EQ(written, expected);
}

TEST(PictureDocuments, TheJsonArchiveIsAsWrittenDown)
{
    expectSameButForPacking(savedAsJson(itemWithPreview()), nlohmann::json::parse(jsonArchive),
                            Pointer("/content/preview/px/image/png/bytes"),
                            Pointer("/content/preview/px/image/png/size"));

    Item content;
    loadJson(jsonArchive, content);
    expectPreview(content);
}

TEST(PictureDocuments, TheJsonStreamIsAsWrittenDown)
{
    QBuffer output;
    output.open(QIODevice::WriteOnly);
    Document::save(output, itemWithPreview(), Document::Json, Document::Stream);
    expectSameButForPacking(nlohmann::json::parse(output.data().toStdString()),
                            nlohmann::json::parse(jsonStream), Pointer("/objects/0/Data/preview/png"),
                            Pointer());

    QByteArray stored = jsonStream;
    QBuffer input(&stored);
    input.open(QIODevice::ReadOnly);
    const auto graph = Document::load(input);
    ASSERT_TRUE(graph.rootAs<Item>());
    expectPreview(*graph.rootAs<Item>());
}

} // namespace
