// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/Utf8.h>
#include <EditorModel/persistence/streams/Forms.h>
#include <EditorModel/persistence/streams/XmlNames.h>

#include <QIODevice>
#include <QXmlStreamWriter>

#include <algorithm>
#include <stdexcept>

namespace Serialize::Details {
namespace {

/// Keys become tags. The letters that other tools agree on suffice.
void requireTag(const std::string& key)
{
    const auto isLetter = [](char c) { return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z') || c == '_'; };
    const auto isInner = [&](char c) {
        return isLetter(c) || (c >= '0' && c <= '9') || c == '-' || c == '.';
    };
    if (key.empty() || !isLetter(key.front()) || !std::all_of(key.begin(), key.end(), isInner))
        throw std::runtime_error("the key " + inQuotes(key) + " cannot be a tag");
}

/// What XML cannot hold, and the carriage return, which readers take for a line feed.
bool isUnsafe(QChar c)
{
    return (c < QChar(' ') && c != QChar('\n') && c != QChar('\t')) || c >= QChar(0xFFFE);
}

class XmlWriter final : public FormWriter
{
public:
    explicit XmlWriter(QIODevice& device) : m_device(device), m_xml(&device)
    {
        m_xml.setAutoFormatting(true);
        m_xml.setAutoFormattingIndent(4);
        m_xml.writeStartDocument();
        m_xml.writeStartElement(Xml::root);
        m_xml.writeAttribute(Xml::route, Xml::stream);
        m_xml.writeAttribute(Xml::version, QString::number(Xml::currentVersion));
    }

    void null(const std::string& key) override
    {
        begin(key);
        m_xml.writeAttribute(Xml::null, Xml::yes);
        end();
    }

    void reference(const std::string& key, quint64 id) override
    {
        begin(key);
        m_xml.writeAttribute(Xml::reference, QString::number(id));
        end();
    }

    void beginObject(const std::string& key, const std::string& className, quint64 id) override
    {
        beginPart(key, className);
        m_xml.writeAttribute(Xml::id, QString::number(id));
    }

    void beginPart(const std::string& key, const std::string& className) override
    {
        begin(key);
        m_xml.writeAttribute(Xml::className, textOfUtf8(className));
    }

    void endObject() override { end(); }

    void picture(const std::string& key, quint64 id, const QByteArray& png) override
    {
        beginObject(key, pictureClass, id);
        m_xml.writeCharacters(QString::fromLatin1(png.toBase64()));
        end();
    }

    void beginSequence(const std::string& key, int count) override
    {
        begin(key);
        m_xml.writeAttribute(Xml::count, QString::number(count));
    }

    void endSequence() override { end(); }
    void beginItem() override { m_xml.writeStartElement(Xml::item); }
    void endItem() override { end(); }

    void write(const std::string& key, bool value) override { element(key, value ? Xml::yes : Xml::no); }
    void write(const std::string& key, qint32 value) override { element(key, QString::number(value)); }
    void write(const std::string& key, quint32 value) override { element(key, QString::number(value)); }
    void write(const std::string& key, qint64 value) override { element(key, QString::number(value)); }
    void write(const std::string& key, double value) override { element(key, number(value)); }
    void write(const std::string& key, MTime value) override { write(key, value.ms()); }

    void write(const std::string& key, const std::string& value) override
    {
        const QString text = textOfUtf8(value);
        if (std::none_of(text.begin(), text.end(), isUnsafe)) {
            element(key, text);
            return;
        }
        begin(key);
        m_xml.writeAttribute(Xml::encoding, Xml::base64);
        m_xml.writeCharacters(QString::fromLatin1(QByteArray::fromStdString(value).toBase64()));
        end();
    }

    void write(const std::string& key, const QPointF& value) override
    {
        begin(key);
        m_xml.writeAttribute(Xml::x, number(value.x()));
        m_xml.writeAttribute(Xml::y, number(value.y()));
        end();
    }

    void finish() override
    {
        m_xml.writeEndDocument();
        requireWritten();
        flush(m_device);
    }

private:
    static QString number(double value) { return QString::fromStdString(textOf(value)); }

    void begin(const std::string& key)
    {
        requireTag(key);
        m_xml.writeStartElement(QString::fromStdString(key));
    }

    void end()
    {
        m_xml.writeEndElement();
        requireWritten();
    }

    void element(const std::string& key, const QString& text)
    {
        begin(key);
        m_xml.writeCharacters(text);
        end();
    }

    void requireWritten()
    {
        if (m_xml.hasError())
            throw std::runtime_error("the device does not take the document: " +
                                     m_device.errorString().toStdString());
    }

    QIODevice& m_device;
    QXmlStreamWriter m_xml;
};

} // namespace

std::unique_ptr<FormWriter> makeXmlWriter(QIODevice& device)
{
    return std::make_unique<XmlWriter>(device);
}

} // namespace Serialize::Details
