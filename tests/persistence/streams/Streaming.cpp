// SPDX-License-Identifier: Apache-2.0
#include "Streaming.h"

#include <QBuffer>

namespace StreamTest {

QByteArray saved(Document::Form form, std::initializer_list<const Serialize::ISerializable*> roots)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    const auto writer = Serialize::makeStreamWriter(form, buffer);
    int number = 0;
    for (const auto* root : roots) {
        const std::string key = number == 0 ? "root" : "root" + std::to_string(number);
        writer->stream().field({key.c_str(), &root});
        writer->writePointer(root);
        ++number;
    }
    writer->finish();
    return buffer.data();
}

QByteArray saved(Document::Form form, const Serialize::ISerializable& root)
{
    return saved(form, {&root});
}

Loaded::Loaded(Document::Form form, const QByteArray& document, int roots)
{
    const auto reader = Serialize::makeStreamReader(form, document);
    for (int number = 0; number < roots; ++number) {
        const std::string key = number == 0 ? "root" : "root" + std::to_string(number);
        reader->stream().field({key.c_str(), nullptr});
        reader->readPointer(m_roots.emplace_back());
    }
    reader->finish();
}

Failure failureOf(Document::Form form, const QByteArray& document)
{
    const Serialize::Details::ConstructionLog log;
    std::unique_ptr<Serialize::StreamReader> reader;
    try {
        reader = Serialize::makeStreamReader(form, document);
        reader->stream().field({"root", nullptr});
        Serialize::ISerializable* root = nullptr;
        reader->readPointer(root);
        reader->finish();
    } catch (const std::exception& error) {
        return {error.what(), reader ? reader->position() : ""};
    }
    return {};
}

std::string nameOf(const testing::TestParamInfo<Document::Form>& form)
{
    return form.param == Document::Binary ? "Binary" : form.param == Document::Xml ? "Xml" : "Json";
}

INSTANTIATE_TEST_SUITE_P(Forms, Streams, testing::Values(Document::Binary, Document::Xml, Document::Json),
                         nameOf);

} // namespace StreamTest
