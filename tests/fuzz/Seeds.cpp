// SPDX-License-Identifier: Apache-2.0
// Usage: fuzz-seeds FOLDER
// Writes what the fuzzers begin with: a folder for each, with the frozen documents of its form and route,
// which hold every persistent class with every field set, and a dictionary with the names of the classes.
#include "BinaryFrame.h"

#include "tests/golden/FrozenDocument.h"

#include <EditorModel/persistence/Serializer.h>

#include <QDir>
#include <QFile>

#include <cstdio>
#include <exception>
#include <stdexcept>

namespace {

using GoldenTests::FrozenDocument;

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

void writeDocuments(const QDir& root, const char* fuzzer, const Way& way)
{
    const QDir folder = folderIn(root, fuzzer);
    // The fuzzers take binary documents without their frame.
    const int skipped = way.form == Document::Binary ? Fuzzing::binaryFrameSize : 0;
    write(folder, QStringLiteral("nothing"), documentOf({}, way).mid(skipped));
    int number = 0;
    for (const FrozenDocument& document : FrozenDocument::all(way))
        write(folder, QString::number(++number), document.bytes.mid(skipped));
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
    if (argc != 2) {
        std::fputs("Usage: fuzz-seeds FOLDER\n", stderr);
        return 2;
    }
    try {
        const QDir root(QFile::decodeName(argv[1]));
        writeDocuments(root, "json-stream", {Document::Json, Document::Stream, "JsonStream"});
        writeDocuments(root, "json-archive", {Document::Json, Document::Archive, "JsonArchive"});
        writeDocuments(root, "xml-stream", {Document::Xml, Document::Stream, "XmlStream"});
        writeDocuments(root, "binary-stream", {Document::Binary, Document::Stream, "BinaryStream"});
        writeResourceTexts(root);
        writeDictionary(root);
    } catch (const std::exception& error) {
        std::fprintf(stderr, "fuzz-seeds: %s\n", error.what());
        return 1;
    }
    return 0;
}
