// SPDX-License-Identifier: Apache-2.0
// Usage: fuzz-seeds FOLDER
// Writes what the fuzzers begin with: a folder for each, with documents of every persistent class, once as it
// is made and once with every field set, and a dictionary with the names of the classes.
#include "BinaryFrame.h"

#include "tests/shared/FieldVisitors.h"

#include <EditorModel/persistence/Document.h>
#include <EditorModel/persistence/Serializer.h>
#include <EditorModel/persistence/Type.h>

#include <QBuffer>
#include <QDir>
#include <QFile>
#include <QGuiApplication>

#include <cstdio>
#include <exception>
#include <memory>
#include <stdexcept>

namespace {

struct Way
{
    const char* folder;
    Document::Form form;
    Document::Route route;
};

constexpr Way ways[] = {
    {"json-stream", Document::Json, Document::Stream},
    {"json-archive", Document::Json, Document::Archive},
    {"xml-stream", Document::Xml, Document::Stream},
    {"binary-stream", Document::Binary, Document::Stream},
};

void write(const QDir& folder, const QString& name, const QByteArray& content)
{
    QFile file(folder.filePath(name));
    if (!file.open(QIODevice::WriteOnly) || file.write(content) != content.size())
        throw std::runtime_error(file.errorString().toStdString());
}

QDir folderIn(const QDir& parent, const char* name)
{
    if (!parent.mkpath(QLatin1String(name)))
        throw std::runtime_error("the folder cannot be made");
    return QDir(parent.filePath(QLatin1String(name)));
}

/// As the fuzzers take them: binary documents without their frame.
QByteArray documentOf(const std::deque<const Serialize::ISerializable*>& roots, const Way& way)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    Document::save(buffer, roots, way.form, way.route);
    return buffer.data().mid(way.form == Document::Binary ? Fuzzing::binaryFrameSize : 0);
}

void writeDocuments(const QDir& root, const Way& way)
{
    const QDir folder = folderIn(root, way.folder);
    write(folder, QStringLiteral("nothing"), documentOf({}, way));
    int number = 0;
    for (const std::string& name : Serialize::registeredNames()) {
        const Serialize::Type& type = *Serialize::findType(name);
        const std::unique_ptr<Serialize::ISerializable> plain(type.serializable(type.create()));
        Testing::Filler filler;
        const Serialize::ISerializable* const filled = filler.make(type);
        ++number;
        write(folder, QStringLiteral("plain-%1").arg(number), documentOf({plain.get()}, way));
        write(folder, QStringLiteral("filled-%1").arg(number), documentOf({filled, nullptr, filled}, way));
    }
}

void writeResourceTexts(const QDir& root)
{
    const QDir folder = folderIn(root, "resource-text");
    write(folder, QStringLiteral("video"), "resource_id=a:resource_type=video");
    write(folder, QStringLiteral("audio"), "resource_type=audio:resource_id=b");
    write(folder, QStringLiteral("image"), "resource_id=:other=c:resource_type=image");
}

void writeDictionary(const QDir& root)
{
    QByteArray names = "\"resource_id=\"\n\"resource_type=\"\n";
    for (const std::string& name : Serialize::registeredNames())
        names += '"' + QByteArray::fromStdString(name) + "\"\n";
    write(root, QStringLiteral("dictionary"), names);
}

} // namespace

int main(int argc, char** argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QGuiApplication application(argc, argv);
    if (argc != 2) {
        std::fputs("Usage: fuzz-seeds FOLDER\n", stderr);
        return 2;
    }
    try {
        const QDir root(QFile::decodeName(argv[1]));
        for (const Way& way : ways)
            writeDocuments(root, way);
        writeResourceTexts(root);
        writeDictionary(root);
    } catch (const std::exception& error) {
        std::fprintf(stderr, "fuzz-seeds: %s\n", error.what());
        return 1;
    }
    return 0;
}
