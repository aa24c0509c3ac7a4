// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/types/Image.h>

namespace Types {

Image::Image() = default;

Image::Image(const QPixmap& pixmap) : QPixmap(pixmap) {}

Image::~Image() = default;

} // namespace Types
