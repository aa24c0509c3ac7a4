// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "Samples.h"

#include "host/drawing/Picture.h"

#include <QImage>
#include <QStringList>
#include <QXmlStreamReader>

#include <cmath>
#include <string>

namespace HostTests {

/// A picture as the PNG file that is written of it.
class Drawing
{
public:
    explicit Drawing(const Host::Picture& picture)
    {
        const QString path = m_folder.path("picture.png");
        Host::savePicture(picture, path, Host::Png);
        image = QImage(path);
    }

    QColor at(QPointF place) const { return image.pixelColor((place * Host::pngScale).toPoint()); }

    QImage image;

private:
    const Folder m_folder;
};

inline bool isNear(const QColor& a, const QColor& b)
{
    return std::abs(a.red() - b.red()) < 12 && std::abs(a.green() - b.green()) < 12 &&
           std::abs(a.blue() - b.blue()) < 12;
}

inline std::string nameOf(const QColor& colour)
{
    return colour.name().toStdString();
}

/// What is in an SVG file.
struct Svg
{
    QString error;
    QString width;
    QString viewBox;
    QStringList texts;
    int lines = 0;
};

inline Svg readSvg(const QString& path)
{
    Svg svg;
    QXmlStreamReader reader(contentOf(path));
    while (!reader.atEnd()) {
        if (reader.readNext() != QXmlStreamReader::StartElement) {
            continue;
        }
        if (reader.name() == QLatin1String("svg")) {
            svg.width = reader.attributes().value("width").toString();
            svg.viewBox = reader.attributes().value("viewBox").toString();
        } else if (reader.name() == QLatin1String("polyline")) {
            ++svg.lines;
        } else if (reader.name() == QLatin1String("text")) {
            svg.texts << reader.readElementText().trimmed();
        }
    }
    svg.error = reader.errorString();
    return svg;
}

} // namespace HostTests
