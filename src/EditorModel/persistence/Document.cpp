// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/Document.h>

#include <EditorModel/persistence/ConstructionLog.h>
#include <EditorModel/persistence/FailurePlace.h>
#include <EditorModel/persistence/Frame.h>
#include <EditorModel/persistence/Json.h>
#include <EditorModel/persistence/JsonText.h>
#include <EditorModel/persistence/Roots.h>
#include <EditorModel/persistence/streams/Streams.h>

#include <QBuffer>
#include <QFile>
#include <QSaveFile>

#include <cstring>
#include <istream>
#include <ostream>
#include <streambuf>
#include <utility>

namespace Document {
namespace {

using Serialize::Details::Roots;

constexpr const char* routeKey = "EditorModel";
constexpr const char* versionKey = "version";
constexpr const char* archiveRoute = "archive";
constexpr int jsonVersion = 1;

/// Standard streams over bytes in memory, without a copy of them.
class BytesOut final : public std::streambuf
{
public:
    explicit BytesOut(QByteArray& bytes) : m_bytes(bytes) {}

private:
    std::streamsize xsputn(const char* data, std::streamsize count) override
    {
        m_bytes.append(data, static_cast<int>(count));
        return count;
    }
    int_type overflow(int_type c) override
    {
        m_bytes.append(traits_type::to_char_type(c));
        return c;
    }

    QByteArray& m_bytes;
};

class BytesIn final : public std::streambuf
{
public:
    explicit BytesIn(const QByteArray& bytes)
    {
        char* const begin = const_cast<char*>(bytes.constData());
        setg(begin, begin, begin + bytes.size());
    }
};

const char* nameOf(Form form)
{
    switch (form) {
    case Binary:
        return "binary document";
    case Xml:
        return "XML document";
    case Json:
        return "Json document";
    }
    return "document";
}

std::string composed(const std::string& form, const std::string& place, const std::string& reason)
{
    const std::string at = place.empty() ? form : form + ", at " + place;
    return at.empty() ? reason : at + ": " + reason;
}

/// Runs `body`; whatever it throws becomes an `Error` with the place that the fields noted.
template <class Body, class Position>
auto reported(const char* form, Body body, Position position) -> decltype(body())
{
    Serialize::Details::FailurePlace::clear();
    const auto place = [&] {
        const std::string keys = Serialize::Details::FailurePlace::text();
        const std::string at = position();
        return keys.empty() || at.empty() ? keys + at : keys + " (" + at + ")";
    };
    try {
        return body();
    } catch (const Error&) {
        throw;
    } catch (const std::bad_alloc&) {
        throw;
    } catch (const std::bad_cast&) {
        throw Error(form, place(), "an object of another class stands there");
    } catch (const std::exception& error) {
        throw Error(form, place(), error.what());
    }
}

template <class Body>
auto reported(const char* form, Body body) -> decltype(body())
{
    return reported(form, body, [] { return std::string(); });
}

// Saving

QByteArray streamed(const Roots& roots, Form form)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    const auto writer = Serialize::makeStreamWriter(form, buffer);
    Roots objects = roots;
    Serialize::Details::writeStream(*writer, objects);
    writer->finish();
    return buffer.data();
}

QByteArray archived(const Roots& roots, void (*write)(std::ostream&, Roots&))
{
    QByteArray bytes;
    BytesOut buffer(bytes);
    std::ostream stream(&buffer);
    Roots objects = roots;
    write(stream, objects);
    return bytes;
}

QByteArray jsonArchived(const Roots& roots)
{
    nlohmann::json root;
    {
        Serialize::Json::oarchive archive(root);
        Serialize::Details::atRoots(
            [&] { archive << boost::serialization::make_nvp(Serialize::Details::rootsKey, roots); });
    }
    root[routeKey] = archiveRoute;
    root[versionKey] = jsonVersion;
    return QByteArray::fromStdString(root.dump(1, '\t') + '\n');
}

QByteArray documentOf(const Roots& roots, Form form, Route route)
{
    switch (form) {
    case Binary:
        return Details::framed(route == Archive ? archived(roots, &Serialize::Details::writeBinaryArchive)
                                                : streamed(roots, form),
                               route);
    case Xml:
        return route == Archive ? Details::sealed(archived(roots, &Serialize::Details::writeXmlArchive))
                                : streamed(roots, form);
    case Json:
        return route == Archive ? jsonArchived(roots) : streamed(roots, form);
    }
    throw std::invalid_argument("there is no form " + std::to_string(form));
}

// Loading

/// Loads with `read`, and gives the graph everything that was made on the way.
template <class Read>
Graph graphOf(Read read)
{
    Serialize::Details::ConstructionLog log;
    Roots stored;
    read(stored);
    std::deque<Serialize::ISerializable*> roots;
    // The objects were made here: nobody else has claimed them constant.
    for (const Serialize::ISerializable* const root : stored)
        roots.push_back(const_cast<Serialize::ISerializable*>(root));
    std::vector<Graph::Owned> objects;
    objects.reserve(log.size());
    for (const auto& entry : log.take())
        objects.push_back({entry.object, entry.destroy});
    return Graph(std::move(roots), std::move(objects));
}

Graph fromStream(const QByteArray& document, Form form)
{
    std::unique_ptr<Serialize::StreamReader> reader;
    return reported(
        nameOf(form),
        [&] {
            return graphOf([&](Roots& roots) {
                reader = Serialize::makeStreamReader(form, document);
                Serialize::Details::readStream(*reader, roots);
                reader->finish();
            });
        },
        [&] { return reader ? reader->position() : std::string(); });
}

Graph fromArchive(const QByteArray& content, void (*read)(std::istream&, Roots&))
{
    return graphOf([&](Roots& roots) {
        BytesIn buffer(content);
        std::istream stream(&buffer);
        read(stream, roots);
    });
}

/// Boost's readers trust what they are given.
void requireOwn(Origin origin)
{
    if (origin != OwnDocuments)
        throw std::runtime_error("an archive of this form is taken from oneself alone");
}

Graph fromBinary(const QByteArray& document, Origin origin)
{
    const auto content = reported(nameOf(Binary), [&] { return Details::unframed(document); });
    if (content.route == Stream)
        return fromStream(content.content, Binary);
    return reported(nameOf(Binary), [&] {
        requireOwn(origin);
        return fromArchive(content.content, &Serialize::Details::readBinaryArchive);
    });
}

Graph fromXml(const QByteArray& document, Origin origin)
{
    if (!Details::isXmlArchive(document))
        return fromStream(document, Xml);
    return reported(nameOf(Xml), [&] {
        requireOwn(origin);
        return fromArchive(Details::unsealed(document), &Serialize::Details::readXmlArchive);
    });
}

Graph fromJsonArchive(const QByteArray& document)
{
    const auto root = Details::parsedJson(document);
    const auto version = root.find(versionKey);
    if (version == root.end() || *version != jsonVersion)
        throw std::runtime_error("its version is not " + std::to_string(jsonVersion));
    return graphOf([&](Roots& roots) {
        Serialize::Json::iarchive archive(root);
        Serialize::Details::atRoots(
            [&] { archive >> boost::serialization::make_nvp(Serialize::Details::rootsKey, roots); });
    });
}

Graph fromJson(const QByteArray& document)
{
    if (Details::jsonRoute(document, routeKey) != archiveRoute)
        return fromStream(document, Json);
    return reported(nameOf(Json), [&] { return fromJsonArchive(document); });
}

/// The first byte of what is said, behind blanks and a byte order mark.
char firstOf(const QByteArray& document)
{
    int at = document.startsWith("\xEF\xBB\xBF") ? 3 : 0;
    while (at < document.size() && std::strchr(" \t\r\n", document[at]))
        ++at;
    return at < document.size() ? document[at] : '\0';
}

Graph graphOfDocument(const QByteArray& document, Origin origin)
{
    if (document.isEmpty())
        throw Error("", "", "the document is empty");
    if (Details::hasFrame(document))
        return fromBinary(document, origin);
    switch (firstOf(document)) {
    case '<':
        return fromXml(document, origin);
    case '{':
        return fromJson(document);
    default:
        throw Error("", "", "this is neither a binary nor an XML nor a Json document");
    }
}

/// Runs `body`; an error gets the file's name in front.
template <class Body>
auto named(const QString& path, Body body) -> decltype(body())
{
    try {
        return body();
    } catch (const Error& error) {
        const std::string file = path.toStdString();
        throw Error(error.form().empty() ? file : file + ": " + error.form(), error.place(), error.reason());
    }
}

} // namespace

Error::Error(const std::string& form, const std::string& place, const std::string& reason)
    : std::runtime_error(composed(form, place, reason)), m_form(form), m_place(place), m_reason(reason)
{}

Error::~Error() = default;

Graph::Graph() = default;

Graph::Graph(std::deque<Serialize::ISerializable*> roots, std::vector<Owned> objects)
    : m_roots(std::move(roots)), m_objects(std::move(objects))
{}

Graph::Graph(Graph&& other) noexcept
    : m_roots(std::exchange(other.m_roots, {})), m_objects(std::exchange(other.m_objects, {}))
{}

Graph& Graph::operator=(Graph&& other) noexcept
{
    Graph taken(std::move(other));
    m_roots.swap(taken.m_roots);
    m_objects.swap(taken.m_objects);
    return *this;
}

Graph::~Graph()
{
    for (auto entry = m_objects.rbegin(); entry != m_objects.rend(); ++entry)
        entry->destroy(entry->object);
}

void save(QIODevice& device, const std::deque<const Serialize::ISerializable*>& roots, Form form, Route route)
{
    const QByteArray document = reported(nameOf(form), [&] { return documentOf(roots, form, route); });
    qint64 written = 0;
    while (written < document.size()) {
        const qint64 count = device.write(document.constData() + written, document.size() - written);
        if (count <= 0)
            throw Error(nameOf(form), "byte " + std::to_string(written),
                        "it cannot be written: " + device.errorString().toStdString());
        written += count;
    }
}

void save(QIODevice& device, const Serialize::ISerializable& root, Form form, Route route)
{
    save(device, {&root}, form, route);
}

Graph load(QIODevice& device, Origin origin)
{
    if (!device.isReadable())
        throw Error("", "", "the device is not open for reading");
    return graphOfDocument(device.readAll(), origin);
}

void saveFile(const QString& path, const std::deque<const Serialize::ISerializable*>& roots, Form form,
              Route route)
{
    named(path, [&] {
        QSaveFile file(path);
        if (!file.open(QIODevice::WriteOnly))
            throw Error(nameOf(form), "", "it cannot be written: " + file.errorString().toStdString());
        save(file, roots, form, route);
        if (!file.commit())
            throw Error(nameOf(form), "", "it cannot be written: " + file.errorString().toStdString());
    });
}

Graph loadFile(const QString& path, Origin origin)
{
    return named(path, [&] {
        QFile file(path);
        if (!file.open(QIODevice::ReadOnly))
            throw Error("", "", "it cannot be read: " + file.errorString().toStdString());
        return load(file, origin);
    });
}

std::optional<Form> formOfPath(const QString& path)
{
    if (path.endsWith(QLatin1String(".bin"), Qt::CaseInsensitive))
        return Binary;
    if (path.endsWith(QLatin1String(".xml"), Qt::CaseInsensitive))
        return Xml;
    if (path.endsWith(QLatin1String(".json"), Qt::CaseInsensitive))
        return Json;
    return std::nullopt;
}

} // namespace Document
