// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/types/Image.h>

#include <QColor>
#include <QGuiApplication>
#include <QImage>

#include <gtest/gtest.h>

#include <memory>

namespace {

class Image : public testing::Test
{
protected:
    static QPixmap redDot()
    {
        QPixmap pixmap(3, 2);
        pixmap.fill(Qt::red);
        return pixmap;
    }

private:
    int m_argc = 1;
    char m_name[6] = "tests";
    char* m_argv[2] = {m_name, nullptr};
    QGuiApplication m_application{m_argc, m_argv};
};

TEST_F(Image, IsNullByDefault)
{
    EXPECT_TRUE(Types::Image().isNull());
}

TEST_F(Image, IsThePictureItWasMadeOf)
{
    const std::shared_ptr<const Types::Image> image = std::make_shared<Types::Image>(redDot());
    EXPECT_EQ(QSize(3, 2), image->size());
    EXPECT_EQ(QColor(Qt::red), image->toImage().pixelColor(2, 1));
}

TEST_F(Image, HasAnIdentityOfItsOwnAfterACopy)
{
    const Types::Image image = redDot();
    const Types::Image copy = image;
    const PubSub::Object* first = &image;
    const PubSub::Object* second = &copy;
    EXPECT_NE(first, second);
    EXPECT_EQ(image.cacheKey(), copy.cacheKey());
}

TEST_F(Image, TakesThePictureAssignedToIt)
{
    Types::Image image;
    image = Types::Image(redDot());
    EXPECT_EQ(QSize(3, 2), image.size());
    Types::Image& self = image;
    image = self;
    EXPECT_EQ(QSize(3, 2), image.size());
}

} // namespace
