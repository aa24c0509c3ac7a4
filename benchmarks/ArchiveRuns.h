// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Document.h>
#include <EditorModel/persistence/Json.h>

#include <boost/archive/binary_iarchive.hpp>
#include <boost/archive/binary_oarchive.hpp>
#include <boost/archive/xml_iarchive.hpp>
#include <boost/archive/xml_oarchive.hpp>
#include <boost/serialization/nvp.hpp>

#include <benchmark/benchmark.h>

#include <QBuffer>

#include <malloc.h>

#include <sstream>
#include <string>

/// What the measurements of archives have in common: a graph is saved and loaded by its root. `freeGraph` is
/// found by the root's type.
namespace ArchiveRuns {

using boost::archive::binary_iarchive;
using boost::archive::binary_oarchive;
using boost::archive::xml_iarchive;
using boost::archive::xml_oarchive;
using boost::serialization::make_nvp;
using nlohmann::json;

/// Memory that goes back to the system between two rounds would be measured with whichever asks for it next.
inline void keepMemory()
{
    mallopt(M_TRIM_THRESHOLD, 1 << 30);
    mallopt(M_MMAP_THRESHOLD, 1 << 30);
}

template <class Archive, class Root>
std::string stored(const Root& content)
{
    std::ostringstream stream;
    {
        Archive archive(stream);
        const Root* const root = &content;
        archive << make_nvp("content", root);
    }
    return stream.str();
}

template <class Archive, class Root>
Root* loaded(const std::string& text)
{
    std::istringstream stream(text);
    Root* root = nullptr;
    Archive archive(stream);
    archive >> make_nvp("content", root);
    return root;
}

template <class Root>
std::string storedAsJson(const Root& content)
{
    json tree;
    {
        Serialize::Json::oarchive archive(tree);
        const Root* const root = &content;
        archive << make_nvp("content", root);
    }
    return tree.dump();
}

template <class Root>
Root* loadedFromJson(const std::string& text)
{
    const json tree = json::parse(text);
    Root* root = nullptr;
    Serialize::Json::iarchive archive(tree);
    archive >> make_nvp("content", root);
    return root;
}

template <class Root>
QByteArray documentOf(const Root& content, Document::Form form, Document::Route route)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    Document::save(buffer, content, form, route);
    return buffer.data();
}

inline Document::Graph graphOf(QByteArray document)
{
    QBuffer buffer(&document);
    buffer.open(QIODevice::ReadOnly);
    return Document::load(buffer);
}

/// Measures `save`, which gives a text.
template <class Save>
void runSave(benchmark::State& state, Save save)
{
    for (auto _ : state)
        benchmark::DoNotOptimize(save());
}

/// Measures `load`, which makes a graph of a text, and freeing that graph.
template <class Load>
void runLoad(benchmark::State& state, const std::string& text, Load load)
{
    for (auto _ : state) {
        auto* const root = load(text);
        benchmark::DoNotOptimize(root);
        freeGraph(root);
    }
}

/// Tells the size in bytes for each of `count` records.
template <class Root>
void runDocumentSave(benchmark::State& state, const Root& content, int count, Document::Form form,
                     Document::Route route)
{
    qint64 size = 0;
    for (auto _ : state)
        size = documentOf(content, form, route).size();
    state.counters["bytes/record"] = static_cast<double>(size) / count;
}

template <class Root>
void runDocumentLoad(benchmark::State& state, const Root& content, Document::Form form, Document::Route route)
{
    const QByteArray document = documentOf(content, form, route);
    for (auto _ : state)
        benchmark::DoNotOptimize(graphOf(document).size());
}

} // namespace ArchiveRuns
