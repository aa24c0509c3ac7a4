// SPDX-License-Identifier: Apache-2.0
#include "ProbeCommand.h"

#include "MediaDescriber.h"
#include "MediaJson.h"
#include "MediaOpener.h"
#include "MediaTable.h"
#include "ProgressBar.h"

#include <EditorModel/bus/View.h>
#include <EditorModel/persistence/Document.h>
#include <EditorModel/services/Report.h>

#include <cstdio>

namespace Host {
namespace {

void describeAll(MediaDescriber& describer, const QStringList& paths)
{
    Report::Progress progress;
    Message::View<Report::Progress> reporter;
    reporter.own(&progress)->setTotal(paths.size());
    const ProgressBar bar(&progress, stderr);
    for (const QString& path : paths) {
        reporter.change(&progress)->setLabel(path);
        describer.describe(path);
        reporter.change(&progress)->setPassed(progress.passed + 1);
    }
    reporter.remove(&progress);
}

bool print(const MediaDescriber& describer, bool asJson)
{
    if (asJson) {
        return writeOutput(mediaJson(describer.entries()));
    }
    const std::deque<const Media::File*> files = describer.opened();
    return files.empty() || writeOutput(mediaTable(files));
}

bool save(const MediaDescriber& describer, const QString& path)
{
    const std::deque<const Media::File*> files = describer.opened();
    if (files.empty()) {
        writeError(path, "is not written: there is nothing to save");
        return false;
    }
    try {
        const std::deque<const Serialize::ISerializable*> roots(files.begin(), files.end());
        Document::saveFile(path, roots, Document::formOfPath(path).value(), Document::Stream);
        return true;
    } catch (const Document::Error& error) {
        writeError(error.what());
        return false;
    }
}

/// Returns whether there was nothing to report.
bool reportFailures(const MediaDescriber& describer)
{
    bool allOpened = true;
    for (const MediaDescriber::Entry& entry : describer.entries()) {
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
    MediaDescriber describer;
    describeAll(describer, options.paths);

    const bool isPrinted = print(describer, options.json);
    const bool isOpened = reportFailures(describer);
    const bool isSaved = options.savePath.isEmpty() || save(describer, options.savePath);
    return isPrinted && isOpened && isSaved ? Success : Failure;
}

} // namespace Host
