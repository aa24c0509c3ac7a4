// SPDX-License-Identifier: Apache-2.0
#include "Samples.h"
#include "Streaming.h"

#include <QGuiApplication>
#include <QImage>
#include <QPixmap>

using namespace StreamTest;

namespace {

/// Pictures need an application object for as long as they live.
class StreamsWithPictures : public Streams
{
protected:
    char m_name[6] = "tests";
    char* m_arguments[2] = {m_name, nullptr};
    int m_count = 1;
    const QGuiApplication m_application{m_count, m_arguments};

    static std::shared_ptr<const Types::Image> picture()
    {
        QImage image(2, 1, QImage::Format_ARGB32);
        image.setPixel(0, 0, 0xFF102030);
        image.setPixel(1, 0, 0x80FF0000);
        return std::make_shared<const Types::Image>(QPixmap::fromImage(image));
    }

    static QRgb pixel(const Types::Image& image, int x)
    {
        return image.toImage().convertToFormat(QImage::Format_ARGB32).pixel(x, 0);
    }
};

INSTANTIATE_TEST_SUITE_P(Forms, StreamsWithPictures,
                         testing::Values(Document::Binary, Document::Xml, Document::Json), nameOf);

} // namespace

TEST_P(StreamsWithPictures, GiveBackPictures)
{
    Album album;
    album.cover = picture();
    const Album copy = copied(album);
    ASSERT_NE(copy.cover, nullptr);
    EXPECT_EQ(copy.cover->size(), QSize(2, 1));
    EXPECT_EQ(pixel(*copy.cover, 0), 0xFF102030u);
    EXPECT_EQ(pixel(*copy.cover, 1), 0x80FF0000u);
    EXPECT_EQ(copy.back, nullptr);
}

TEST_P(StreamsWithPictures, KeepPicturesShared)
{
    Album album;
    album.cover = picture();
    album.back = album.cover;
    const Album copy = copied(album);
    EXPECT_EQ(copy.cover, copy.back);
    ASSERT_NE(copy.cover, nullptr);
    EXPECT_EQ(copy.cover.use_count(), 2);
}

TEST_P(StreamsWithPictures, KeepEqualPicturesApart)
{
    Album album;
    album.cover = picture();
    album.back = picture();
    const Album copy = copied(album);
    EXPECT_NE(copy.cover, copy.back);
}

TEST_P(StreamsWithPictures, GiveBackAPictureWithoutPixels)
{
    Album album;
    album.cover = std::make_shared<const Types::Image>();
    const Album copy = copied(album);
    ASSERT_NE(copy.cover, nullptr);
    EXPECT_TRUE(copy.cover->isNull());
}

TEST_P(StreamsWithPictures, RefuseDataThatIsNoPicture)
{
    Album album;
    album.cover = picture();
    QByteArray document = saved(GetParam(), album);
    // The signature of PNG, and what base64 makes of it.
    document.replace("\x89PNG", "\x89PGN").replace("iVBORw0KGgo", "iVBRRw0KGgo");
    EXPECT_EQ(failureOf(GetParam(), document).text, "the data of a picture is no picture");
}

TEST_P(StreamsWithPictures, WithstandRandomDamage)
{
    Album album;
    album.cover = picture();
    album.back = album.cover;
    const QByteArray document = saved(GetParam(), album);
    std::mt19937 random(11);
    for (int round = 0; round < 3000; ++round)
        expectSoundOrRefused(GetParam(), damaged(document, random));
}

TEST_P(Streams, RefusePicturesWithoutAnApplication)
{
    QByteArray document;
    {
        char name[] = "tests";
        char* arguments[] = {name, nullptr};
        int count = 1;
        const QGuiApplication application(count, arguments);
        Album album;
        album.cover = std::make_shared<const Types::Image>(QPixmap(1, 1));
        document = saved(GetParam(), album);
    }
    EXPECT_EQ(failureOf(GetParam(), document).text, "a picture needs a QGuiApplication");
}
