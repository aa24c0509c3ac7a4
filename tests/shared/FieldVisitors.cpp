// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldVisitors.h"

#include <EditorModel/types/Image.h>
#include <EditorModel/types/Rect.h>

#include <QBuffer>
#include <QImage>

#include <algorithm>
#include <charconv>

namespace Testing {
namespace {

/// How many pointers deep the filler makes new objects.
constexpr int deepest = 2;

std::string exact(double value)
{
    char buffer[64];
    const auto end = std::to_chars(buffer, buffer + sizeof buffer, value).ptr;
    return std::string(buffer, end);
}

std::string escapedText(const std::string& text)
{
    return '"' + QByteArray::fromStdString(text).toPercentEncoding(" <>&'/:;.,").toStdString() + '"';
}

/// A set or a map of pointers, by its mangled name.
bool isOrderedByAddress(const Serialize::Type& type)
{
    const std::string name = type.info.name();
    return name.rfind("St3setIP", 0) == 0 || name.rfind("St3mapIP", 0) == 0;
}

std::string pixels(const Types::Image& image)
{
    const QImage plain = image.toImage().convertToFormat(QImage::Format_ARGB32);
    std::string text = std::to_string(plain.width()) + "x" + std::to_string(plain.height());
    for (int y = 0; y < plain.height(); ++y) {
        for (int x = 0; x < plain.width(); ++x)
            text += " " + std::to_string(plain.pixel(x, y));
    }
    return text;
}

} // namespace

const std::vector<QString>& awkwardTexts()
{
    static const std::vector<QString> texts = {
        QStringLiteral("plain"),
        QStringLiteral("<a href=\"x\">&amp;'</a>"),
        QStringLiteral("]]> <!-- --> <?xml ?>"),
        QStringLiteral("  blanks at both ends  "),
        QStringLiteral("line\nnext\r\nlast\rtab\t"),
        QString(QChar(0)) + QStringLiteral("nul\x01\x02\x1f\x7f"),
        QString::fromUtf8("Grüße, 日本語, עברית"),
        QString::fromUtf8("🎬🎞 outside the first plane"),
        QString(QChar(0xFEFF)) + QStringLiteral("mark"),
        QString(QChar(0xFFFE)) + QChar(0xFFFF) + QChar(0x0085) + QChar(0x2028),
        QStringLiteral("\\ / \" \\u0041 %1 %25"),
        QStringLiteral("\n"),
        QStringLiteral(" "),
    };
    return texts;
}

std::string Dump::of(const Serialize::ISerializable& object, bool wrapTimes)
{
    Dump dump(wrapTimes);
    const auto* root = &object;
    dump("root", root);
    return dump.text();
}

void Dump::line(const std::string& text)
{
    m_text += std::string(static_cast<std::size_t>(m_indent) * 2, ' ') + text + '\n';
}

void Dump::nested(const Serialize::Type& type, void* object)
{
    ++m_indent;
    type.visit(*this, object);
    --m_indent;
}

void Dump::onScalar(const Serialize::Key& key, const Serialize::Scalar& value, const void*)
{
    if (m_muted)
        return;
    struct Text
    {
        bool wrapTimes;

        std::string operator()(bool* v) const { return *v ? "true" : "false"; }
        std::string operator()(int* v) const { return std::to_string(*v); }
        std::string operator()(quint32* v) const { return std::to_string(*v) + "u"; }
        std::string operator()(qint64* v) const { return std::to_string(*v) + "l"; }
        std::string operator()(double* v) const { return exact(*v); }
        std::string operator()(std::string* v) const { return escapedText(*v); }
        std::string operator()(QString* v) const { return "Q" + escapedText(v->toStdString()); }
        std::string operator()(MTime* v) const
        {
            return std::to_string(wrapTimes ? static_cast<qint32>(static_cast<quint32>(v->ms())) : v->ms()) +
                   "ms";
        }
        std::string operator()(QPointF* v) const { return exact(v->x()) + "," + exact(v->y()); }
        std::string operator()(std::shared_ptr<const Types::Image>* v) const
        {
            return *v ? pixels(**v) : "null";
        }
    };
    line(std::string(key.archive) + ": " + std::visit(Text{m_wrapTimes}, value));
}

void Dump::onObject(const Serialize::Key& key, const Serialize::Type& type, void* object)
{
    if (m_muted)
        return;
    m_numbers.emplace(std::make_pair(object, &type), static_cast<int>(m_numbers.size()) + 1);
    line(std::string(key.archive) + ": " + type.name);
    nested(type, object);
}

void Dump::onBase(const Serialize::Key& key, const Serialize::Type& type, void* object)
{
    if (m_muted)
        return;
    line("base " + std::string(key.archive) + ": " + type.name);
    nested(type, object);
}

void Dump::onPointer(const Serialize::Key& key, const Serialize::PointerField& field)
{
    if (m_muted)
        return;
    const Serialize::Pointee pointee = field.access.get(field);
    if (!pointee.object) {
        line(std::string(key.archive) + ": null");
        return;
    }
    if (m_isOutline && m_pointersFollowed > 0) {
        line(std::string(key.archive) + ": " + pointee.type->name);
        return;
    }
    const auto entered = m_numbers.emplace(std::make_pair(pointee.object, pointee.type),
                                           static_cast<int>(m_numbers.size()) + 1);
    line(std::string(key.archive) + ": " + pointee.type->name + " #" + std::to_string(entered.first->second));
    if (!entered.second)
        return;
    ++m_pointersFollowed;
    nested(*pointee.type, pointee.object);
    --m_pointersFollowed;
}

void Dump::onContainer(const Serialize::Key& key, const Serialize::Type& type, void* container)
{
    if (m_muted)
        return;
    line(std::string(key.archive) + ":");
    ++m_level;
    if (isOrderedByAddress(type)) {
        const int count = countOf(type, container);
        ++m_indent;
        line(std::to_string(count) + " items");
        --m_indent;
        std::vector<std::pair<std::string, int>> items;
        for (int item = 1; item <= count && !m_isOutline; ++item)
            items.emplace_back(outline(item, type, container), item);
        std::sort(items.begin(), items.end());
        for (const auto& item : items)
            onlyItem(item.second, type, container);
    } else {
        const int outer = std::exchange(m_item, 0);
        nested(type, container);
        m_item = outer;
    }
    --m_level;
}

std::string Dump::outline(int item, const Serialize::Type& type, void* container) const
{
    Dump alone(m_wrapTimes);
    alone.m_isOutline = true;
    alone.onlyItem(item, type, container);
    return alone.text();
}

void Dump::onlyItem(int item, const Serialize::Type& type, void* container)
{
    const int outerLevel = std::exchange(m_itemLevel, m_level);
    const int outerItem = std::exchange(m_item, item);
    m_muted = true;
    nested(type, container);
    m_muted = false;
    m_itemLevel = outerLevel;
    m_item = outerItem;
}

int Dump::countOf(const Serialize::Type& type, void* container) const
{
    Dump counter(m_wrapTimes);
    counter.m_muted = true;
    type.visit(counter, container);
    return counter.m_count;
}

int Dump::onBeginSequence(Serialize::SequenceKind, int count)
{
    m_count = count;
    if (!m_muted)
        line(std::to_string(count) + " items");
    return count;
}

void Dump::onBeginItem(int index)
{
    if (m_item > 0 && m_level == m_itemLevel)
        m_muted = index != m_item;
    else if (!m_muted)
        line("item " + std::to_string(index));
}

void Dump::onEntry(const Serialize::Type& pair, void* entry)
{
    if (!m_muted)
        nested(pair, entry);
}

void Dump::onBinary(QByteArray& bytes, int)
{
    line(bytes.toHex().toStdString());
}

Filler::~Filler()
{
    for (const Made& made : m_made)
        delete made.object;
}

Serialize::ISerializable* Filler::make(const Serialize::Type& type)
{
    void* const object = type.create();
    m_made.push_back({&type, type.serializable(object)});
    ++m_depth;
    type.visit(*this, object);
    --m_depth;
    return type.serializable(object);
}

void Filler::onScalar(const Serialize::Key&, const Serialize::Scalar& value, const void*)
{
    const int count = ++m_count;
    struct Set
    {
        int count;
        MTime& time;

        void operator()(bool* v) const { *v = !*v; }
        void operator()(int* v) const { *v = count % 2 ? count : -count; }
        void operator()(quint32* v) const { *v = 0xF0000000u + static_cast<quint32>(count); }
        void operator()(qint64* v) const { *v = (qint64(1) << 40) + count; }
        void operator()(double* v) const { *v = count + 0.1; }
        void operator()(std::string* v) const { *v = text().toStdString(); }
        void operator()(QString* v) const { *v = text(); }
        void operator()(MTime* v) const
        {
            *v = time;
            time += MTime(1);
        }
        void operator()(QPointF* v) const { *v = QPointF(count, -count - 0.5); }
        void operator()(std::shared_ptr<const Types::Image>* v) const
        {
            QImage image(3, 2, QImage::Format_ARGB32);
            image.fill(0xFF000000u + static_cast<quint32>(count));
            *v = std::make_shared<const Types::Image>(QPixmap::fromImage(image));
        }
        QString text() const
        {
            const auto& texts = awkwardTexts();
            return texts[static_cast<std::size_t>(count) % texts.size()] + QString::number(count);
        }
    };
    std::visit(Set{count, m_time}, value);
}

void Filler::onObject(const Serialize::Key&, const Serialize::Type& type, void* object)
{
    type.visit(*this, object);
}

void Filler::onBase(const Serialize::Key&, const Serialize::Type& type, void* object)
{
    type.visit(*this, object);
}

void Filler::onPointer(const Serialize::Key&, const Serialize::PointerField& field)
{
    const Serialize::Type& type = field.declared ? *field.declared : Types::Rect::persistentType();
    Serialize::ISerializable* object = nullptr;
    if (m_depth <= deepest) {
        object = make(type);
    } else {
        // Deep down, pointers go back to what there is: shared objects, and cycles.
        for (const Made& made : m_made) {
            if (made.type == &type)
                object = made.object;
        }
    }
    field.access.setRoot(field, object);
}

void Filler::onContainer(const Serialize::Key&, const Serialize::Type& type, void* container)
{
    type.visit(*this, container);
}

int Filler::onBeginSequence(Serialize::SequenceKind kind, int count)
{
    // Deep down the keys of a map would all be one object.
    return kind == Serialize::Group ? count : m_depth <= deepest ? 3 : 1;
}

void Filler::onEntry(const Serialize::Type& pair, void* entry)
{
    pair.visit(*this, entry);
}

void Filler::onBinary(QByteArray& bytes, int)
{
    bytes = "bytes";
}

} // namespace Testing
