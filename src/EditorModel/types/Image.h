// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>

#include <QPixmap>

namespace Types {

/// A picture that can be watched on the bus, shared as `std::shared_ptr<const Types::Image>`. Like every
/// pixmap it needs a QGuiApplication to exist first.
class EDITORMODEL_EXPORT Image : public QPixmap, public virtual PubSub::Object
{
public:
    Image();
    Image(const QPixmap& pixmap);
    Image(const Image&) = default;
    ~Image() override;

    Image& operator=(const Image&) = default;
};

} // namespace Types
