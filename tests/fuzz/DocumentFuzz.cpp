// SPDX-License-Identifier: Apache-2.0
// Loads what the fuzzer makes up as anybody's document. It is refused by an error, or it is saved, in this
// program's form and route, as a document that loads as the same again.
#include "BinaryFrame.h"

#include "tests/shared/FieldVisitors.h"

#include <EditorModel/persistence/Document.h>

#include <QBuffer>
#include <QGuiApplication>

#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <optional>
#include <string>

namespace {

constexpr Document::Form form = FUZZED_FORM;
constexpr Document::Route route = FUZZED_ROUTE;

Document::Graph loaded(QByteArray document)
{
    QBuffer buffer(&document);
    buffer.open(QIODevice::ReadOnly);
    return Document::load(buffer, Document::ForeignDocuments);
}

QByteArray saved(const Document::Graph& graph)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    Document::save(buffer, {graph.roots().begin(), graph.roots().end()}, form, route);
    return buffer.data();
}

std::optional<Document::Graph> loadedUnlessRefused(const QByteArray& document)
{
    try {
        return loaded(document);
    } catch (const Document::Error&) {
        return std::nullopt;
    }
}

/// What the roots hold. Documents cannot be compared: sets of pointers stand in them in the order of
/// addresses.
std::string textOf(const Document::Graph& graph)
{
    std::string text;
    for (const Serialize::ISerializable* const root : graph.roots())
        text += root ? Testing::Dump::of(*root) : "null\n";
    return text;
}

} // namespace

extern "C" int LLVMFuzzerInitialize(int*, char***)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    static char name[] = "fuzz";
    static char* arguments[] = {name, nullptr};
    static int count = 1;
    // Documents with pictures are refused where there is no application.
    static const QGuiApplication application(count, arguments);
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    const QByteArray input(reinterpret_cast<const char*>(data), int(size));
    const auto graph = loadedUnlessRefused(form == Document::Binary ? Fuzzing::framedStream(input) : input);
    if (!graph)
        return 0;
    const std::string once = textOf(*graph);
    const std::string twice = textOf(loaded(saved(*graph)));
    if (once != twice) {
        std::fprintf(stderr, "Loaded:\n%s\nSaved and loaded again:\n%s\n", once.c_str(), twice.c_str());
        std::abort();
    }
    return 0;
}
