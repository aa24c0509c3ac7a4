// SPDX-License-Identifier: Apache-2.0
#include "host/commands/ProbeCommand.h"

#include "host/commands/Interrupt.h"
#include "host/commands/ProgressBar.h"
#include "host/media/AnalysisProgress.h"
#include "host/media/AnalysisRunner.h"
#include "host/media/MediaJson.h"
#include "host/media/MediaOpener.h"
#include "host/media/MediaTable.h"
#include "host/media/ResourceKeeper.h"

#include <EditorModel/bus/View.h>
#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/persistence/Document.h>

#include <cstdio>
#include <deque>

namespace Host {
namespace {

using Entries = std::deque<MediaDescriber::Entry>;

/// The job is cancelled if the user interrupts the process.
void analyse(AnalysisRunner& runner, FileAnalyzer::Object& job, const QStringList& paths)
{
    const Interrupt interrupt;
    const AnalysisProgress progress(&job, paths, interrupt);
    const ProgressBar bar(progress.progress(), stderr);
    runner.run();
}

bool print(const FileAnalyzer::Object& job, const Entries& entries, bool asJson)
{
    if (asJson) {
        return writeOutput(mediaJson(entries));
    }
    return job.opened.empty() || writeOutput(mediaTable(job.opened));
}

/// Has the resources of the files entered into a table.
void fillTable(ResourceTable::Object& table, const std::deque<const Media::File*>& files)
{
    const ResourceKeeper keeper;
    Message::View<ResourceTable::Object> client;
    client.add(&table);
    QStringList paths;
    for (const Media::File* file : files) {
        paths << file->path;
    }
    PubSub::publish(ResourceTable::AddFilesToTableRequest(&table, paths));
    client.remove(&table);
}

bool save(const std::deque<const Media::File*>& files, const QString& path)
{
    if (files.empty()) {
        writeError(path, "is not written: there is nothing to save");
        return false;
    }
    try {
        ResourceTable::Object table;
        fillTable(table, files);
        std::deque<const Serialize::ISerializable*> roots(files.begin(), files.end());
        roots.push_back(&table);
        Document::saveFile(path, roots, Document::formOfPath(path).value(), Document::Stream);
        return true;
    } catch (const Document::Error& error) {
        writeError(error.what());
        return false;
    }
}

/// Returns whether there was nothing to report.
bool reportFailures(const Entries& entries)
{
    bool allOpened = true;
    for (const MediaDescriber::Entry& entry : entries) {
        if (!entry.file.isOpened) {
            allOpened = false;
            writeError(entry.file.path, entry.reason);
        }
        for (const std::string& codec : entry.file.unsupportedCodecs) {
            writeError(entry.file.path,
                       "has tracks that are left out: no decoder for " + QString::fromStdString(codec));
        }
    }
    return allOpened;
}

} // namespace

ExitCode probe(const ProbeOptions& options)
{
    // The opener holds the tracks and stays until nobody looks at the files any more.
    MediaOpener opener;
    FileAnalyzer::Object job;
    AnalysisRunner runner;
    analyse(runner, job, options.paths);

    const Entries& entries = runner.entries(&job);
    const bool isPrinted = print(job, entries, options.json);
    const bool isOpened = reportFailures(entries);
    const bool isSaved = options.savePath.isEmpty() || save(job.opened, options.savePath);
    if (job.canceled()) {
        writeError(QString("interrupted after %1 of %2 files").arg(entries.size()).arg(options.paths.size()));
    }
    return isPrinted && isOpened && isSaved && job.processed() ? Success : Failure;
}

} // namespace Host
