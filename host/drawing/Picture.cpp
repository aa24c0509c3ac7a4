// SPDX-License-Identifier: Apache-2.0
#include "host/drawing/Picture.h"

#include "host/commands/Refusal.h"

#include <QBuffer>
#include <QImage>
#include <QPainter>
#include <QSaveFile>
#include <QSvgGenerator>

namespace Host {
namespace {

void paint(const Picture& picture, QPaintDevice& device, double scale)
{
    QPainter painter(&device);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::TextAntialiasing);
    painter.scale(scale, scale);
    picture.draw(painter);
}

QByteArray pngOf(const Picture& picture, const QString& path)
{
    const QSize pixels = picture.size() * pngScale;
    // Painters of pixels go no further.
    constexpr int mostPixels = 32767;
    if (pixels.width() > mostPixels || pixels.height() > mostPixels) {
        throw Refusal(path, "cannot be written: a picture of this size must be an .svg");
    }
    QImage image(pixels, QImage::Format_RGB32);
    if (image.isNull()) {
        throw Refusal(path, "cannot be written: there is not enough memory");
    }
    image.fill(Qt::white);
    paint(picture, image, pngScale);
    QBuffer buffer;
    buffer.open(QBuffer::WriteOnly);
    if (!image.save(&buffer, "PNG")) {
        throw Refusal(path, "cannot be written: the picture cannot be encoded");
    }
    return buffer.data();
}

QByteArray svgOf(const Picture& picture)
{
    QBuffer buffer;
    QSvgGenerator generator;
    generator.setOutputDevice(&buffer);
    // That of a CSS pixel, so that the drawing has its own size in a browser.
    generator.setResolution(96);
    generator.setTitle(picture.title());
    generator.setDescription(QString());
    generator.setSize(picture.size());
    generator.setViewBox(QRect(QPoint(), picture.size()));
    paint(picture, generator, 1.0);
    return buffer.data();
}

} // namespace

std::optional<PictureForm> pictureFormOfPath(const QString& path)
{
    if (path.endsWith(".png", Qt::CaseInsensitive)) {
        return Png;
    }
    if (path.endsWith(".svg", Qt::CaseInsensitive)) {
        return Svg;
    }
    return std::nullopt;
}

PictureForm requirePictureForm(const QString& path)
{
    const std::optional<PictureForm> form = pictureFormOfPath(path);
    if (!form) {
        throw Refusal(path, "is no name of a picture: such a name ends in .png or .svg");
    }
    return *form;
}

void savePicture(const Picture& picture, const QString& path, PictureForm form)
{
    const QByteArray content = form == Png ? pngOf(picture, path) : svgOf(picture);
    QSaveFile file(path);
    if (!file.open(QSaveFile::WriteOnly) || file.write(content) != content.size() || !file.commit()) {
        throw Refusal(path, "cannot be written: " + file.errorString());
    }
}

} // namespace Host
