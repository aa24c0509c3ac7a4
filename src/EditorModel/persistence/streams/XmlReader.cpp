// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/Utf8.h>
#include <EditorModel/persistence/streams/Forms.h>
#include <EditorModel/persistence/streams/XmlGuard.h>
#include <EditorModel/persistence/streams/XmlNames.h>

#include <QXmlStreamReader>

#include <algorithm>
#include <charconv>
#include <initializer_list>
#include <limits>
#include <stdexcept>
#include <string>
#include <vector>

namespace Serialize::Details {
namespace {

/// A whole number that fills the text.
template <class T>
T wholeOf(const std::string& text)
{
    T value = 0;
    const char* const end = text.data() + text.size();
    const auto result = std::from_chars(text.data(), end, value);
    if (text.empty() || result.ec == std::errc::invalid_argument || result.ptr != end)
        throwUnexpected("a whole number", inQuotes(text));
    if (result.ec != std::errc())
        throw std::runtime_error("the number " + inQuotes(text) + " is out of range");
    return value;
}

QByteArray bytesOfBase64(const QString& text)
{
    const auto decoded =
        QByteArray::fromBase64Encoding(text.toLatin1(), QByteArray::AbortOnBase64DecodingErrors);
    if (!decoded)
        throwUnexpected("base64", inQuotes(text.toStdString()));
    return *decoded;
}

class XmlReader final : public FormReader
{
public:
    explicit XmlReader(const QString& document) : m_length(document.size()), m_xml(document)
    {
        m_xml.setNamespaceProcessing(false);
        try {
            openRoot();
        } catch (const std::runtime_error& error) {
            throw std::runtime_error(position() + ": " + error.what());
        }
    }

    Mark mark(const std::string& key) override
    {
        enter(key);
        if (m_attributes.hasAttribute(Xml::null)) {
            requireAttributes({Xml::null});
            if (m_attributes.value(Xml::null) != Xml::yes)
                throwUnexpected(inQuotes(Xml::yes.data()), inQuotes(attribute(Xml::null)));
            leave();
            return {Mark::Null, 0, {}};
        }
        if (m_attributes.hasAttribute(Xml::reference)) {
            requireAttributes({Xml::reference});
            const auto id = wholeOf<quint64>(attribute(Xml::reference));
            leave();
            return {Mark::Reference, id, {}};
        }
        if (!m_attributes.hasAttribute(Xml::className))
            throwUnexpected("an object for " + inQuotes(key), "an element without \"class\"");
        if (!m_attributes.hasAttribute(Xml::id)) {
            requireAttributes({Xml::className});
            return {Mark::Part, 0, attribute(Xml::className)};
        }
        requireAttributes({Xml::className, Xml::id});
        return {Mark::Object, wholeOf<quint64>(attribute(Xml::id)), attribute(Xml::className)};
    }

    void endObject() override { leave(); }

    QByteArray png() override { return bytesOfBase64(text()); }

    int beginSequence(const std::string& key) override
    {
        enter(key);
        requireAttributes({Xml::count});
        const auto count = wholeOf<int>(attribute(Xml::count));
        constexpr qint64 shortestItem = 7; // <Item/>
        if (count < 0 || count > (m_length - m_xml.characterOffset()) / shortestItem)
            throw std::runtime_error("a sequence of " + std::to_string(count) + " items is not what follows");
        return count;
    }

    void endSequence() override { leave(); }

    void beginItem() override
    {
        enter(QString(Xml::item).toStdString());
        requireAttributes({});
    }

    void endItem() override { leave(); }

    void read(const std::string& key, bool& value) override
    {
        const std::string text = plain(key);
        if (text != Xml::yes.data() && text != Xml::no.data())
            throwUnexpected("\"true\" or \"false\"", inQuotes(text));
        value = text == Xml::yes.data();
    }

    void read(const std::string& key, qint32& value) override { value = wholeOf<qint32>(plain(key)); }
    void read(const std::string& key, quint32& value) override { value = wholeOf<quint32>(plain(key)); }
    void read(const std::string& key, qint64& value) override { value = wholeOf<qint64>(plain(key)); }
    void read(const std::string& key, double& value) override { value = realOf(plain(key)); }
    void read(const std::string& key, MTime& value) override { value = MTime(wholeOf<qint64>(plain(key))); }

    void read(const std::string& key, std::string& value) override
    {
        enter(key);
        if (!m_attributes.hasAttribute(Xml::encoding)) {
            requireAttributes({});
            value = text().toStdString();
            return;
        }
        requireAttributes({Xml::encoding});
        if (m_attributes.value(Xml::encoding) != Xml::base64)
            throwUnexpected("the encoding " + inQuotes(Xml::base64.data()),
                            inQuotes(attribute(Xml::encoding)));
        value = bytesOfBase64(text()).toStdString();
        requireUtf8(value);
    }

    void read(const std::string& key, QPointF& value) override
    {
        enter(key);
        requireAttributes({Xml::x, Xml::y});
        value = QPointF(realOf(attribute(Xml::x)), realOf(attribute(Xml::y)));
        leave();
    }

    void finish() override
    {
        leave();
        // Comments may follow; what else may not is the parser's to refuse.
        while (!m_xml.atEnd())
            next();
    }

    std::string position() const override
    {
        return "line " + std::to_string(m_xml.lineNumber()) + ", column " +
               std::to_string(m_xml.columnNumber() + 1);
    }

private:
    void openRoot()
    {
        if (nextTag() != QXmlStreamReader::StartElement || m_xml.name() != Xml::root)
            throwUnexpected("the element " + inQuotes(Xml::root.data()), inQuotes(name()));
        m_open.push_back(name());
        m_attributes = m_xml.attributes();
        requireAttributes({Xml::route, Xml::version});
        if (m_attributes.value(Xml::route) != Xml::stream)
            throwUnexpected("the route \"stream\"", inQuotes(attribute(Xml::route)));
        if (wholeOf<int>(attribute(Xml::version)) != Xml::currentVersion)
            throwUnexpected("version " + std::to_string(Xml::currentVersion) + " of the field stream",
                            "version " + attribute(Xml::version));
    }

    QXmlStreamReader::TokenType next()
    {
        const auto token = m_xml.readNext();
        if (m_xml.hasError())
            throw std::runtime_error(m_xml.errorString().toStdString());
        return token;
    }

    /// The next start or end of an element, past comments and the space between elements.
    QXmlStreamReader::TokenType nextTag()
    {
        for (;;) {
            const auto token = next();
            if (token == QXmlStreamReader::StartElement || token == QXmlStreamReader::EndElement)
                return token;
            if (token == QXmlStreamReader::Characters && !m_xml.isWhitespace())
                throwUnexpected("an element", "the text " + inQuotes(m_xml.text().toString().toStdString()));
            if (token == QXmlStreamReader::EndDocument)
                throwUnexpected("an element", "the end of the document");
        }
    }

    std::string name() const { return m_xml.name().toString().toStdString(); }

    void enter(const std::string& key)
    {
        if (nextTag() == QXmlStreamReader::EndElement)
            throwUnexpected("the field " + inQuotes(key), "the end of " + inQuotes(name()));
        if (name() != key)
            throwUnexpected("the field " + inQuotes(key), "the field " + inQuotes(name()));
        m_open.push_back(key);
        m_attributes = m_xml.attributes();
    }

    void leave()
    {
        if (nextTag() == QXmlStreamReader::StartElement)
            throwUnexpected("the end of " + inQuotes(m_open.back()), "the field " + inQuotes(name()));
        m_open.pop_back();
    }

    /// The text of the element that was entered; leaves it.
    QString text()
    {
        const QString text = m_xml.readElementText();
        if (m_xml.hasError())
            throw std::runtime_error(m_xml.errorString().toStdString());
        m_open.pop_back();
        return text;
    }

    /// The text of an element that has nothing but text.
    std::string plain(const std::string& key)
    {
        enter(key);
        requireAttributes({});
        return text().toStdString();
    }

    std::string attribute(QLatin1String name) const
    {
        return m_attributes.value(name).toString().toStdString();
    }

    void requireAttributes(std::initializer_list<QLatin1String> names) const
    {
        for (const QLatin1String name : names) {
            if (!m_attributes.hasAttribute(name))
                throwUnexpected("the attribute " + inQuotes(name.data()), "none");
        }
        for (const QXmlStreamAttribute& found : m_attributes) {
            if (std::find(names.begin(), names.end(), found.name()) == names.end())
                throw std::runtime_error("the attribute " + inQuotes(found.name().toString().toStdString()) +
                                         " has no place here");
        }
    }

    const qint64 m_length;
    QXmlStreamReader m_xml;
    /// The tags that are open.
    std::vector<std::string> m_open;
    /// Of the element that was entered last.
    QXmlStreamAttributes m_attributes;
};

} // namespace

std::unique_ptr<FormReader> makeXmlReader(const QByteArray& document)
{
    requireUtf8(document.toStdString());
    guardXml(document);
    // As text, it is taken for what it is, whatever encoding it claims.
    return std::make_unique<XmlReader>(QString::fromUtf8(document));
}

} // namespace Serialize::Details
