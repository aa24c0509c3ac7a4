// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QSize>
#include <QString>

#include <optional>
#include <stdexcept>

class QPainter;

namespace Host {

/// A drawing that can be made on any paint device. It needs a QGuiApplication for its fonts.
class Picture
{
public:
    Picture() = default;
    Picture(const Picture&) = delete;
    Picture& operator=(const Picture&) = delete;
    virtual ~Picture() = default;

    virtual QString title() const = 0;
    /// In units of the painter, which are pixels of a screen at its usual size.
    virtual QSize size() const = 0;
    /// Covers all of its size, from (0, 0) on.
    virtual void draw(QPainter& painter) const = 0;
};

enum PictureForm : int
{
    Png,
    Svg,
};

/// By the ending of the name, in any case: .png, .svg; none for any other.
std::optional<PictureForm> pictureFormOfPath(const QString& path);
/// The same; throws Refusal for any other.
PictureForm requirePictureForm(const QString& path);

/// How many pixels of a PNG file stand for one unit of the picture, in each direction.
constexpr int pngScale = 2;

/// Replaces the file as a whole or not at all; throws Refusal.
void savePicture(const Picture& picture, const QString& path, PictureForm form);

} // namespace Host
