// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/persistence/Persistent.h>

#include <QtGlobal>

class QPen;

namespace Types {

/// What the model keeps of a pen.
class EDITORMODEL_EXPORT Pen : public Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Pen)

public:
    /// ARGB, opaque black by default.
    quint32 color = 0xFF000000;
    /// In whole units.
    int width = 0;
    /// Whether the pen draws.
    bool enabled = false;

    Pen();
    Pen(quint32 color_, int width_, bool enabled_);
    /// Cuts off the fraction of the width. The pen is enabled where its brush has a style other than
    /// Qt::NoBrush; the style of its line doesn't count.
    Pen(const QPen& pen);
    Pen(const Pen&) = default;

    Pen& operator=(const Pen&) = default;
    Pen& operator=(const QPen& pen);

    static Pen fromQPen(const QPen& pen);

    /// A solid line with square caps and bevel joins, its brush solid or, where the pen isn't enabled,
    /// without a pattern.
    QPen toQPen() const;
};

} // namespace Types

EDITORMODEL_ARCHIVE_NAME(Types::Pen, "Types::Pen")
