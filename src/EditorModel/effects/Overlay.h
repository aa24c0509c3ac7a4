// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/effects/Envelope.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/MTime.h>
#include <EditorModel/types/Pen.h>
#include <EditorModel/types/Transform.h>

#include <QString>
#include <QtGlobal>

#include <deque>

namespace Overlay {

/// The shadow of an overlay's item: off by default, on where a colour is given. The units of the offsets and
/// the radius are the rendering module's.
class EDITORMODEL_EXPORT DropShadow : public Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(DropShadow)

public:
    bool enabled = false;
    /// ARGB.
    quint32 color = 0xb43f3f3f;
    int offsetX = 4;
    int offsetY = 4;
    int blurRadius = 1;

    DropShadow();
    DropShadow(unsigned color_);
    DropShadow(unsigned color_, int offsetX_, int offsetY_);
    DropShadow(unsigned color_, int offsetX_, int offsetY_, int blurRadius_);
};

/// One text or shape of an overlay. The units of its times and lengths are the rendering module's.
class EDITORMODEL_EXPORT Item : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Item)

public:
    /// The types belong to the rendering module; other values are reached by a cast.
    enum Type : int
    {
        DefaultType = 0,
    };

    Type type = DefaultType;
    /// May hold markup. Stored as encodeText() gives it.
    QString text;
    Types::Transform transform;
    TransformationEnvelope envelope;
    /// The part that the item plays in the preset's script.
    QString scriptRole;
    double editTime = 0.0;
    Types::Pen outline;
    bool editable = true;
    /// Flags, whose meaning is the rendering module's.
    int features = 0;
    double from = 0.0;
    double to = 1.0;
    double intro = 0.0;
    double outro = 0.0;
    double textWidth = 0.0;
    double arcRadius = 0.0;
    DropShadow dropShadow;

    Item& setType(Type newType);
    Item& setText(const QString& newText);
    Item& setTransform(const Types::Transform& newTransform);
    Item& setEnvelope(const TransformationEnvelope& newEnvelope);
    Item& setScriptRole(const QString& role);
    Item& setEditTime(double time);
    Item& setOutline(const Types::Pen& pen);
    Item& setEditable(bool on);
    Item& setFrom(double newFrom);
    Item& setTo(double newTo);
    Item& setIntro(double newIntro);
    Item& setOutro(double newOutro);
    Item& setTextWidth(double width);
    Item& setArcRadius(double radius);
    Item& setDropShadow(const DropShadow& shadow);
};

/// Compares type, text, transform, script role, edit time, outline, text width and arc radius, and nothing
/// else. The transform's coefficients are compared by qFuzzyCompare, the last two as Types::fuzzyEqual()
/// does. An item always equals itself.
EDITORMODEL_EXPORT bool operator==(const Item& a, const Item& b);

/// A title, callout or sticker.
class EDITORMODEL_EXPORT Preset : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Preset)

public:
    /// The types belong to the modules that show presets; other values are reached by a cast.
    enum Type : int
    {
        DefaultType = 0,
    };

    /// "x-application/OverlayPreset-serialized", for the clipboard and for drag and drop.
    static const QString* const mimeType;

    Type type = DefaultType;
    /// The script that drives the preset; the rendering module runs it.
    QString scriptId;
    double scriptSpeed = 1.0;
    std::deque<Item> items;
    /// The name in the library.
    QString tag;
    QString description;
    /// Not read by the model.
    MTime sourceDuration;

    Preset* setType(Type newType);
    Preset* setScriptId(const QString& id);
    Preset* setScriptSpeed(double speed);
    Preset* setTag(const QString& newTag);
    Preset* setDescription(const QString& newDescription);
    Preset* setSourceDuration(MTime duration);

    Preset* appendItem(const Item& item);
    Preset* prependItem(const Item& item);
    /// Removes every item that equals the given one, which may be one of the preset's own; that one's address
    /// is void afterwards, as are those of all items.
    Preset* removeItem(const Item& item);
    Preset* clearItems();

    bool hasItemType(Item::Type itemType) const;
    /// There are no items.
    bool isEmpty() const;
};

/// Compares the items in order, the script's identifier, and its speed as Types::fuzzyEqual() does, and
/// nothing else. A preset always equals itself.
EDITORMODEL_EXPORT bool operator==(const Preset& a, const Preset& b);

/// Base64 of the text's UTF-8. A surrogate without its partner has no UTF-8: '?' is encoded in its place.
EDITORMODEL_EXPORT QString encodeText(const QString& text);

/// Gives back what encodeText() was given. What isn't base64 is read as far as QByteArray::fromBase64() reads
/// it, and what isn't UTF-8 then becomes replacement characters.
EDITORMODEL_EXPORT QString decodeText(const QString& encoded);

} // namespace Overlay

EDITORMODEL_ARCHIVE_NAME(Overlay::DropShadow, "Overlay::DropShadow")
EDITORMODEL_ARCHIVE_NAME(Overlay::Item, "Overlay::Item")
EDITORMODEL_ARCHIVE_NAME(Overlay::Preset, "Overlay::Preset")
