// SPDX-License-Identifier: Apache-2.0
#include "host/commands/ConvertCommand.h"

#include "host/analysis/ReplacedTrackings.h"
#include "host/analysis/TrackingStore.h"
#include "host/commands/Refusal.h"
#include "host/project/DocumentFile.h"
#include "host/project/FileReplacement.h"
#include "host/project/GraphComparison.h"
#include "host/project/ProjectFile.h"
#include "host/project/ProjectStore.h"
#include "host/text/DisplayText.h"

#include <EditorModel/library/Project.h>
#include <EditorModel/persistence/Document.h>

#include <QBuffer>
#include <QFile>
#include <QFileInfo>
#include <QSaveFile>

#include <deque>
#include <utility>

namespace Host {
namespace {

using Roots = std::deque<const Serialize::ISerializable*>;

Roots rootsOf(const Document::Graph& graph)
{
    return Roots(graph.roots().begin(), graph.roots().end());
}

bool isOntoItself(const ConvertOptions& options)
{
    return QFileInfo(options.input).canonicalFilePath() == QFileInfo(options.output).canonicalFilePath();
}

void requireFree(const ConvertOptions& options)
{
    if (!options.isForced && QFileInfo::exists(options.output)) {
        throw Refusal(options.output, isOntoItself(options)
                                          ? "is what is to be converted; --force replaces it"
                                          : "exists already; --force replaces it");
    }
}

/// Where the output is another project, or what is left of one, the folder of its trackings. Empty for what
/// is converted onto itself, which keeps them.
QString foreignTrackings(const ConvertOptions& options)
{
    try {
        return isOntoItself(options) ? QString() : TrackingStore::folderOf(options.output);
    } catch (const ReplacementFailed& failed) {
        throw Refusal(options.output, failed.what());
    }
}

bool tellKept(const QString& output, const QString& trackings)
{
    return trackings.isEmpty() ||
           writeOutput(printable(output) + ": the trackings of the project that was replaced are kept in " +
                       printable(trackings) + '\n');
}

Document::Form formOf(const QString& path)
{
    const auto form = Document::formOfPath(path);
    if (!form) {
        throw Refusal(path, "is no name of a document: such a name ends in .json, .xml or .bin");
    }
    return *form;
}

Document::Graph load(const ConvertOptions& options, TrackingStore& trackings)
{
    if (ProjectStore::isProject(options.input)) {
        return ProjectStore::open(options.input).takeGraph();
    }
    const auto origin = options.isOwn ? Document::OwnDocuments : Document::ForeignDocuments;
    Document::Graph graph = loadDocument(options.input, origin);
    trackings.load(TrackingStore::folderOf(options.input));
    return graph;
}

/// A tracking that cannot be read cannot be taken along.
void requireWhole(const TrackingStore& trackings)
{
    if (!trackings.damages().empty()) {
        throw Refusal(trackings.damages().front().path, trackings.damages().front().reason);
    }
}

Document::Graph graphOf(QByteArray bytes)
{
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::ReadOnly);
    return Document::load(buffer, Document::ForeignDocuments);
}

/// The document, which reads back as the roots.
QByteArray provenDocument(const Roots& roots, Document::Form form, const QString& path)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    Document::save(buffer, roots, form, Document::Stream);
    const Document::Graph copy = graphOf(buffer.data());
    if (const auto difference = firstDifference(recordOf(roots), recordOf(rootsOf(copy)))) {
        throw Refusal(path,
                      "is not written: it would hold something else, " + QString::fromStdString(*difference));
    }
    return buffer.data();
}

QByteArray bytesOf(const QString& path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        throw Refusal(path, "cannot be read back: " + file.errorString());
    }
    return file.readAll();
}

/// The trackings go with the project.
void writeProject(const Project::Content& content, const QByteArray& document, const QString& path)
{
    ProjectStore::save(content, path);
    if (projectDocument(bytesOf(path)) != document) {
        throw Refusal(path, "was not written as it should be");
    }
}

void writePlain(const QByteArray& document, const QString& path)
{
    QSaveFile file(path);
    const bool isWritten =
        file.open(QIODevice::WriteOnly) && file.write(document) == document.size() && file.commit();
    if (!isWritten) {
        throw Refusal(path, "cannot be written: " + file.errorString());
    }
}

void write(const Document::Graph& graph, const QString& path, TrackingStore& trackings)
{
    const Document::Form form = formOf(path);
    const auto* const content = graph.rootAs<Project::Content>();
    if (content && graph.roots().size() != 1) {
        throw Refusal(path, "is not written: a project would lose what stands beside it");
    }
    const QByteArray document = provenDocument(rootsOf(graph), form, path);
    if (content) {
        writeProject(*content, document, path);
        return;
    }
    writePlain(document, path);
    trackings.save(TrackingStore::folderOf(path));
}

} // namespace

ExitCode convert(const ConvertOptions& options)
{
    return unlessRefused([&] {
        formOf(options.output);
        requireFree(options);
        TrackingStore trackings;
        const Document::Graph graph = load(options, trackings);
        requireWhole(trackings);
        ReplacedTrackings replaced(foreignTrackings(options));
        write(graph, options.output, trackings);
        return tellKept(options.output, replaced.settle()) ? Success : Failure;
    });
}

} // namespace Host
