// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/streams/Streams.h>

#include <EditorModel/persistence/streams/GraphReader.h>
#include <EditorModel/persistence/streams/GraphWriter.h>

#include <stdexcept>

namespace Serialize {
namespace {

std::unique_ptr<Details::FormWriter> makeWriter(Document::Form form, QIODevice& device)
{
    switch (form) {
    case Document::Binary:
        return Details::makeBinaryWriter(device);
    case Document::Xml:
        return Details::makeXmlWriter(device);
    case Document::Json:
        return Details::makeJsonWriter(device);
    }
    throw std::logic_error("there is no form " + std::to_string(form));
}

std::unique_ptr<Details::FormReader> makeReader(Document::Form form, const QByteArray& document)
{
    switch (form) {
    case Document::Binary:
        return Details::makeBinaryReader(document);
    case Document::Xml:
        return Details::makeXmlReader(document);
    case Document::Json:
        return Details::makeJsonReader(document);
    }
    throw std::logic_error("there is no form " + std::to_string(form));
}

} // namespace

StreamWriter::~StreamWriter() = default;

StreamReader::~StreamReader() = default;

std::unique_ptr<StreamWriter> makeStreamWriter(Document::Form form, QIODevice& device)
{
    return std::make_unique<Details::GraphWriter>(makeWriter(form, device));
}

std::unique_ptr<StreamReader> makeStreamReader(Document::Form form, const QByteArray& document)
{
    return std::make_unique<Details::GraphReader>(makeReader(form, document));
}

} // namespace Serialize
