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

void expectSoundOrRefused(Document::Form form, const QByteArray& document)
{
    const Serialize::Details::ConstructionLog log;
    Serialize::ISerializable* root = nullptr;
    try {
        const auto reader = Serialize::makeStreamReader(form, document);
        reader->stream().field({"root", nullptr});
        reader->readPointer(root);
        reader->finish();
    } catch (const std::exception& error) {
        EXPECT_STRNE(error.what(), "");
        return;
    }
    // Bytes that only the binary form can hold may have come in, and a value behind its pointer.
    try {
        const Loaded again(Document::Binary, saved(Document::Binary, {root}));
    } catch (const std::runtime_error& error) {
        EXPECT_THAT(error.what(), testing::HasSubstr("is held by value"));
    }
}

QByteArray damaged(QByteArray document, std::mt19937& random)
{
    const auto below = [&random](int limit) {
        return static_cast<int>(random() % static_cast<unsigned>(limit));
    };
    for (int changes = 1 + below(3); changes > 0 && !document.isEmpty(); --changes) {
        const int place = below(document.size());
        const char byte = static_cast<char>(below(256));
        switch (below(6)) {
        case 0:
            document[place] = byte;
            break;
        case 1:
            document[place] = static_cast<char>(document[place] ^ (1 << below(8)));
            break;
        case 2:
            document.insert(place, byte);
            break;
        case 3:
            document.remove(place, 1 + below(4));
            break;
        case 4:
            // What stands elsewhere is more likely to mean something here.
            document[place] = document[below(document.size())];
            break;
        default:
            document.insert(place, document.mid(below(document.size()), 1 + below(40)));
            break;
        }
    }
    return document;
}

std::string nameOf(const testing::TestParamInfo<Document::Form>& form)
{
    return form.param == Document::Binary ? "Binary" : form.param == Document::Xml ? "Xml" : "Json";
}

INSTANTIATE_TEST_SUITE_P(Forms, Streams, testing::Values(Document::Binary, Document::Xml, Document::Json),
                         nameOf);

} // namespace StreamTest
