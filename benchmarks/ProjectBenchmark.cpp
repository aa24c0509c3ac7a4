// SPDX-License-Identifier: Apache-2.0
// A project of ten thousand clips, with its table of resources and its collection, saved to the disk and
// opened: by the store of projects, beside a bare archive in memory whose bytes are written and flushed.
#include "ArchiveRuns.h"
#include "LongTimeline.h"
#include "PeakMemory.h"
#include "Ratio.h"

#include "host/project/ProjectStore.h"

#include <EditorModel/library/Import.h>
#include <EditorModel/library/UserObject.h>
#include <EditorModel/media/ResourceTable.h>

#include <QTemporaryDir>

#include <fcntl.h>

#include <cstdio>
#include <stdexcept>
#include <string>
#include <vector>

namespace {

using namespace ArchiveRuns;
using namespace LongTimelines;

constexpr int itemCount = 1000;

/// Every track of a file is a resource.
class LongProject
{
public:
    LongProject() : m_items(itemCount)
    {
        for (std::size_t i = 0; i != m_timeline.files.size(); ++i)
            addResources(i);
        for (std::size_t i = 0; i != m_items.size(); ++i)
            addItem(i);
        content.timeline = &m_timeline.timeline;
        content.userCollection = &m_collection;
        content.resourceTable = &m_table;
    }

    Project::Content content;

private:
    void addResources(std::size_t i)
    {
        const Media::File& file = m_timeline.files[i];
        for (const Resource::Type type : {Resource::VideoType, Resource::AudioType}) {
            Resource::FileInfo& info = m_table.resource2fileInfo[{QString::number(i * 7919, 16), type}].info;
            info.path = file.path;
            info.track = type == Resource::AudioType;
            info.duration = file.length;
        }
    }

    void addItem(std::size_t i)
    {
        Import::Object& item = m_items[i];
        item.tag = QStringLiteral("import number %1").arg(i);
        item.category = QStringLiteral("user_files");
        item.setLocation(QStringLiteral("/films/imports/%1.mov").arg(i));
        item.setRemoteSize(qint64(i));
        m_collection.addItem(&item);
    }

    LongTimeline<Listed> m_timeline;
    std::vector<Import::Object> m_items;
    EditorCollection::UserObject m_collection;
    ResourceTable::Object m_table;
};

const Project::Content& project()
{
    static const LongProject longProject;
    return longProject.content;
}

} // namespace

// Where the measurements look for it.
namespace Project {
static void freeGraph(const Content* content)
{
    freeTimeline(content->timeline);
    for (const auto* const item : content->userCollection->items)
        delete item;
    delete content->userCollection;
    delete content->resourceTable;
    delete content;
}
} // namespace Project

namespace {

/// What each form's bare archive stores, and how that is loaded.
struct Bare
{
    std::string (*save)();
    Project::Content* (*load)(const std::string& text);
};

Bare bareArchive(Document::Form form)
{
    switch (form) {
    case Document::Binary:
        return {[] { return stored<binary_oarchive>(project()); },
                &loaded<binary_iarchive, Project::Content>};
    case Document::Xml:
        return {[] { return stored<xml_oarchive>(project()); }, &loaded<xml_iarchive, Project::Content>};
    case Document::Json:
        return {[] { return storedAsJson(project()); }, &loadedFromJson<Project::Content>};
    }
    throw std::invalid_argument("there is no form " + std::to_string(form));
}

/// In the current folder: where temporary files go may be no disk.
QString fileOf(Document::Form form, const char* name)
{
    static const QTemporaryDir folder("project-benchmark-XXXXXX");
    const char* const endings[] = {".bin", ".xml", ".json"};
    return folder.filePath(name) + endings[form];
}

/// The least that makes bytes outlast a power failure, were nothing in their place before.
void writeBytes(const QString& path, const char* bytes, std::size_t count)
{
    const int file = open(path.toUtf8().constData(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0666);
    const bool isWritten =
        file >= 0 && write(file, bytes, count) == ssize_t(count) && fsync(file) == 0 && close(file) == 0;
    if (!isWritten)
        throw std::runtime_error("a file cannot be written");
}

std::string bytesOf(const QString& path)
{
    const int file = open(path.toUtf8().constData(), O_RDONLY | O_CLOEXEC);
    std::string bytes(file < 0 ? 0 : std::size_t(lseek(file, 0, SEEK_END)), '\0');
    if (file < 0 || pread(file, bytes.data(), bytes.size(), 0) != ssize_t(bytes.size()))
        throw std::runtime_error("a file cannot be read");
    close(file);
    return bytes;
}

void storeSave(benchmark::State& state, Document::Form form)
{
    for (auto _ : state)
        Host::ProjectStore::save(project(), fileOf(form, "store"));
}
void documentSave(benchmark::State& state, Document::Form form)
{
    runDocumentSave(state, project(), clipCount, form, Document::Stream);
}
void documentSaveAndWrite(benchmark::State& state, Document::Form form)
{
    for (auto _ : state) {
        const QByteArray document = documentOf(project(), form, Document::Stream);
        writeBytes(fileOf(form, "document"), document.constData(), std::size_t(document.size()));
    }
}
void archiveSave(benchmark::State& state, Document::Form form)
{
    runSave(state, bareArchive(form).save);
}
void archiveSaveAndWrite(benchmark::State& state, Document::Form form)
{
    for (auto _ : state) {
        const std::string text = bareArchive(form).save();
        writeBytes(fileOf(form, "archive"), text.data(), text.size());
    }
}

void storeLoad(benchmark::State& state, Document::Form form)
{
    Host::ProjectStore::save(project(), fileOf(form, "store"));
    for (auto _ : state)
        benchmark::DoNotOptimize(Host::ProjectStore::open(fileOf(form, "store")).graph().size());
}
void documentLoad(benchmark::State& state, Document::Form form)
{
    runDocumentLoad(state, project(), form, Document::Stream);
}
void archiveReadAndLoad(benchmark::State& state, Document::Form form)
{
    const std::string text = bareArchive(form).save();
    writeBytes(fileOf(form, "archive"), text.data(), text.size());
    for (auto _ : state)
        Project::freeGraph(bareArchive(form).load(bytesOf(fileOf(form, "archive"))));
}

#define PROJECT_BENCHMARK(function)                                                                          \
    BENCHMARK_CAPTURE(function, Binary, Document::Binary)->Unit(benchmark::kMillisecond);                    \
    BENCHMARK_CAPTURE(function, Xml, Document::Xml)->Unit(benchmark::kMillisecond);                          \
    BENCHMARK_CAPTURE(function, Json, Document::Json)->Unit(benchmark::kMillisecond)

PROJECT_BENCHMARK(storeSave);
PROJECT_BENCHMARK(documentSave);
PROJECT_BENCHMARK(documentSaveAndWrite);
PROJECT_BENCHMARK(archiveSave);
PROJECT_BENCHMARK(archiveSaveAndWrite);
PROJECT_BENCHMARK(storeLoad);
PROJECT_BENCHMARK(documentLoad);
PROJECT_BENCHMARK(archiveReadAndLoad);

/// For one form. Only what the store itself adds has a goal: what a form costs beside a bare archive is told
/// where documents are measured.
bool compareForm(const std::string& form)
{
    using Ratios::compare;
    return compare(form + " store, save : bare archive, write, fsync", "storeSave/" + form,
                   "archiveSaveAndWrite/" + form) &&
           compare(form + " store, save : document, write, fsync", "storeSave/" + form,
                   "documentSaveAndWrite/" + form, 1.2) &&
           compare(form + " document, save : bare archive", "documentSave/" + form, "archiveSave/" + form) &&
           compare(form + " store, open : read, bare archive", "storeLoad/" + form,
                   "archiveReadAndLoad/" + form) &&
           compare(form + " store, open : document in memory", "storeLoad/" + form, "documentLoad/" + form,
                   1.2);
}

const bool compared = compareForm("Binary") && compareForm("Xml") && compareForm("Json");

/// For each clip, in bytes: what is stored, and what saving and opening take at most beyond what was there
/// before. What is loaded counts into the latter.
void printMemory(const char* what, qint64 size, long saving, long loading)
{
    std::printf("%-40s %12.0f %12.0f %12.0f\n", what, double(size) / clipCount, double(saving) / clipCount,
                double(loading) / clipCount);
}

void printMemory(const char* name, Document::Form form)
{
    const QString path = fileOf(form, "store");
    const long saving = PeakMemory::growth([&] { Host::ProjectStore::save(project(), path); });
    const long loading =
        PeakMemory::growth([&] { benchmark::DoNotOptimize(Host::ProjectStore::open(path).graph().size()); });
    printMemory((std::string(name) + ", store").c_str(), qint64(bytesOf(path).size()), saving, loading);

    const QString archive = fileOf(form, "archive");
    const long bareSaving = PeakMemory::growth([&] {
        const std::string text = bareArchive(form).save();
        writeBytes(archive, text.data(), text.size());
    });
    const long bareLoading =
        PeakMemory::growth([&] { benchmark::DoNotOptimize(bareArchive(form).load(bytesOf(archive))); });
    printMemory((std::string(name) + ", bare archive").c_str(), qint64(bytesOf(archive).size()), bareSaving,
                bareLoading);
}

void printMemory()
{
    // It is there before anything is measured.
    project();
    std::printf("%-40s %12s %12s %12s\n", "Bytes for each clip", "stored", "peak, save", "peak, load");
    printMemory("binary", Document::Binary);
    printMemory("XML", Document::Xml);
    printMemory("Json", Document::Json);
    std::printf("\n");
    std::fflush(stdout);
}

} // namespace

int main(int argc, char** argv)
{
    printMemory();
    keepMemory();
    return Ratios::run(argc, argv);
}
