// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/Overlay.h>

#include <EditorModel/persistence/Fields.h>
#include <EditorModel/types/FuzzyCompare.h>

#include <QTransform>

#include <algorithm>
#include <iterator>
#include <utility>

namespace Overlay {
namespace {

bool isSamePen(const Types::Pen& a, const Types::Pen& b)
{
    return a.color == b.color && a.width == b.width && a.enabled == b.enabled;
}

} // namespace

DropShadow::DropShadow() = default;

DropShadow::DropShadow(unsigned color_) : enabled(true), color(color_) {}

DropShadow::DropShadow(unsigned color_, int offsetX_, int offsetY_) : DropShadow(color_)
{
    offsetX = offsetX_;
    offsetY = offsetY_;
}

DropShadow::DropShadow(unsigned color_, int offsetX_, int offsetY_, int blurRadius_)
    : DropShadow(color_, offsetX_, offsetY_)
{
    blurRadius = blurRadius_;
}

Item& Item::setType(Type newType)
{
    type = newType;
    return *this;
}

Item& Item::setText(const QString& newText)
{
    text = newText;
    return *this;
}

Item& Item::setTransform(const Types::Transform& newTransform)
{
    transform = newTransform;
    return *this;
}

Item& Item::setEnvelope(const TransformationEnvelope& newEnvelope)
{
    envelope = newEnvelope;
    return *this;
}

Item& Item::setScriptRole(const QString& role)
{
    scriptRole = role;
    return *this;
}

Item& Item::setEditTime(double time)
{
    editTime = time;
    return *this;
}

Item& Item::setOutline(const Types::Pen& pen)
{
    outline = pen;
    return *this;
}

Item& Item::setEditable(bool on)
{
    editable = on;
    return *this;
}

Item& Item::setFrom(double newFrom)
{
    from = newFrom;
    return *this;
}

Item& Item::setTo(double newTo)
{
    to = newTo;
    return *this;
}

Item& Item::setIntro(double newIntro)
{
    intro = newIntro;
    return *this;
}

Item& Item::setOutro(double newOutro)
{
    outro = newOutro;
    return *this;
}

Item& Item::setTextWidth(double width)
{
    textWidth = width;
    return *this;
}

Item& Item::setArcRadius(double radius)
{
    arcRadius = radius;
    return *this;
}

Item& Item::setDropShadow(const DropShadow& shadow)
{
    dropShadow = shadow;
    return *this;
}

bool operator==(const Item& a, const Item& b)
{
    return &a == &b ||
           (a.type == b.type && a.text == b.text &&
            qFuzzyCompare(a.transform.toQTransform(), b.transform.toQTransform()) &&
            a.scriptRole == b.scriptRole && a.editTime == b.editTime && isSamePen(a.outline, b.outline) &&
            Types::fuzzyEqual(a.textWidth, b.textWidth) && Types::fuzzyEqual(a.arcRadius, b.arcRadius));
}

Preset* Preset::setType(Type newType)
{
    type = newType;
    return this;
}

Preset* Preset::setScriptId(const QString& id)
{
    scriptId = id;
    return this;
}

Preset* Preset::setScriptSpeed(double speed)
{
    scriptSpeed = speed;
    return this;
}

Preset* Preset::setTag(const QString& newTag)
{
    tag = newTag;
    return this;
}

Preset* Preset::setDescription(const QString& newDescription)
{
    description = newDescription;
    return this;
}

Preset* Preset::setSourceDuration(MTime duration)
{
    sourceDuration = duration;
    return this;
}

Preset* Preset::appendItem(const Item& item)
{
    items.push_back(item);
    return this;
}

Preset* Preset::prependItem(const Item& item)
{
    items.push_front(item);
    return this;
}

Preset* Preset::removeItem(const Item& item)
{
    // The given item may stand in the list: it must stay whole until the last one was compared with it.
    std::deque<Item> rest;
    std::copy_if(items.begin(), items.end(), std::back_inserter(rest),
                 [&item](const Item& candidate) { return !(candidate == item); });
    items = std::move(rest);
    return this;
}

Preset* Preset::clearItems()
{
    items.clear();
    return this;
}

bool Preset::hasItemType(Item::Type itemType) const
{
    return std::any_of(items.begin(), items.end(),
                       [itemType](const Item& item) { return item.type == itemType; });
}

bool Preset::isEmpty() const
{
    return items.empty();
}

bool operator==(const Preset& a, const Preset& b)
{
    return &a == &b || (a.items == b.items && a.scriptId == b.scriptId &&
                        Types::fuzzyEqual(a.scriptSpeed, b.scriptSpeed));
}

QString encodeText(const QString& text)
{
    return QString::fromLatin1(text.toUtf8().toBase64());
}

QString decodeText(const QString& encoded)
{
    const QByteArray utf8 = QByteArray::fromBase64(encoded.toUtf8());
    // With its length: the text may hold null characters.
    QString text = QString::fromUtf8(utf8.constData(), utf8.size());
    // Qt takes the mark for a sign of the encoding and drops it.
    if (utf8.startsWith("\xEF\xBB\xBF"))
        text.prepend(QChar(QChar::ByteOrderMark));
    return text;
}

void fields(Serialize::Fields& f, DropShadow& shadow)
{
    f("enabled", shadow.enabled)("color", shadow.color);
    f("offsetX", shadow.offsetX)("offsetY", shadow.offsetY)("blurRadius", shadow.blurRadius);
}

void fields(Serialize::Fields& f, Item& item)
{
    f("type", item.type).coded("encodedText", item.text, encodeText, decodeText);
    f("transform", item.transform)("envelope", item.envelope)("scriptRole", item.scriptRole);
    f("editTime", item.editTime)("outline", item.outline)("editable", item.editable);
    f("features", item.features)("textWidth", item.textWidth)("arcRadius", item.arcRadius);
    f("from", item.from)("to", item.to)("intro", item.intro)("outro", item.outro);
    f("dropShadow", item.dropShadow);
}

void fields(Serialize::Fields& f, Preset& preset)
{
    f("type", preset.type)("scriptId", preset.scriptId)("scriptSpeed", preset.scriptSpeed);
    f("items", preset.items)("tag", preset.tag)("description", preset.description);
    f("sourceDuration", preset.sourceDuration);
}

} // namespace Overlay

EDITORMODEL_PERSISTENT_CLASS(Overlay::DropShadow)
EDITORMODEL_PERSISTENT_CLASS(Overlay::Item)
EDITORMODEL_PERSISTENT_CLASS(Overlay::Preset)
