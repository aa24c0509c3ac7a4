// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Type.h>

#include <QByteArray>
#include <QPixmap>

#include <memory>

namespace Types {
class Image;
}

namespace Serialize::Details {

/// The archive form of `std::shared_ptr<const Types::Image>`: a pointer "px" to an "image" of a "png".
const Type& sharedPictureType();
const Type& pictureType();

/// PNG data of a picture; throws where it cannot be made.
QByteArray pngOf(const QPixmap& pixmap);
/// Throws `std::runtime_error` for data that is no picture, and where no QGuiApplication exists, without
/// which Qt would abort the process.
QPixmap pixmapOfPng(const QByteArray& png);
void requirePictures();

} // namespace Serialize::Details
