// SPDX-License-Identifier: Apache-2.0
#include "host/project/ProjectStore.h"

#include "host/media/MediaInput.h"
#include "host/project/FileReplacement.h"
#include "host/project/ProjectContexts.h"
#include "host/project/ProjectFile.h"

#include <EditorModel/bus/PubSub.h>

#include <QBuffer>
#include <QFile>
#include <QFileInfo>

#include <algorithm>
#include <utility>

namespace Host {
namespace {

constexpr const char* backupEnding = ".backup";
constexpr const char* replacedEnding = ".replaced";

[[noreturn]] void refuse(const QString& path, const std::string& reason)
{
    throw Document::Error(path.toStdString(), "", reason);
}

/// The error with the name of the file in front.
[[noreturn]] void refuse(const QString& path, const Document::Error& error)
{
    const std::string file = path.toStdString();
    throw Document::Error(error.form().empty() ? file : file + ": " + error.form(), error.place(),
                          error.reason());
}

Document::Form formOf(const QString& path)
{
    const auto form = Document::formOfPath(path);
    if (!form) {
        refuse(path, "is no name of a project: such a name ends in .json, .xml or .bin");
    }
    return *form;
}

QByteArray documentOf(const Project::Content& content, Document::Form form)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    Document::save(buffer, content, form, Document::Stream);
    return buffer.data();
}

QByteArray bytesOf(const QString& path)
{
    try {
        requireFile(path);
    } catch (const MediaError& error) {
        refuse(path, error.reason.toStdString());
    }
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        refuse(path, "cannot be read: " + file.errorString().toStdString());
    }
    QByteArray bytes = file.readAll();
    if (file.error() != QFile::NoError) {
        refuse(path, "cannot be read: " + file.errorString().toStdString());
    }
    return bytes;
}

/// Throws Document::Error for what is no whole project.
QByteArray documentIn(const QByteArray& file)
{
    if (!isProjectFile(file, file)) {
        throw Document::Error("", "", "is no project");
    }
    return projectDocument(file);
}

/// By its marks and its checksum.
bool isWhole(const QString& path)
{
    try {
        const QByteArray file = bytesOf(path);
        documentIn(file);
        return true;
    } catch (const Document::Error&) {
        return false;
    }
}

/// Any if none was read.
void requireVersion(const QString& path, const QByteArray& read)
{
    if (!read.isEmpty() && versionOf(path) != read) {
        throw ReplacementFailed("is not replaced: somebody has changed it since it was read");
    }
}

/// As what the file is kept that a save replaces.
const char* endingForOld(const QString& path)
{
    return isWhole(path) || !isWhole(ProjectStore::backupOf(path)) ? backupEnding : replacedEnding;
}

Document::Graph graphOf(const QByteArray& file)
{
    QByteArray document = documentIn(file);
    QBuffer buffer(&document);
    buffer.open(QIODevice::ReadOnly);
    return Document::load(buffer, Document::ForeignDocuments);
}

OpenedProject opened(const QString& path)
{
    const QByteArray file = bytesOf(path);
    try {
        Document::Graph graph = graphOf(file);
        auto* const content = graph.rootAs<Project::Content>();
        if (!content) {
            throw Document::Error("", "", "holds something else than a project");
        }
        return OpenedProject(std::move(graph), content);
    } catch (const Document::Error& error) {
        refuse(path, error);
    }
}

bool opens(const QString& path)
{
    try {
        opened(path);
        return true;
    } catch (const Document::Error&) {
        return false;
    }
}

OpenedProject openedOrHint(const QString& path)
{
    try {
        return opened(path);
    } catch (const Document::Error& error) {
        throw Document::Error(error.form(), error.place(), error.reason() + ProjectStore::backupHint(path));
    }
}

void announceLoad(const QString& path, const OpenedProject& project, bool isBackup)
{
    const ProjectExtraInfo::LoadContext context({path, &project.content()}, isBackup);
    PubSub::publish(ProjectExtraInfo::ProjectContentLoaded(&context));
}

} // namespace

OpenedProject::OpenedProject(Document::Graph graph, Project::Content* content)
    : m_graph(std::move(graph)), m_content(content)
{}

void ProjectStore::save(const Project::Content& content, const QString& path, const QByteArray& readVersion)
{
    const Document::Form form = formOf(path);
    try {
        const QByteArray document = documentOf(content, form);
        const ProjectSeal seal = projectSeal(document, form);
        replaceFile(path, {seal.before, document, seal.behind}, [&] {
            requireVersion(path, readVersion);
            return endingForOld(path);
        });
    } catch (const Document::Error& error) {
        refuse(path, error);
    } catch (const ReplacementFailed& error) {
        refuse(path, error.what());
    }
    const ProjectExtraInfo::SaveContext context({path, &content});
    PubSub::publish(ProjectExtraInfo::ProjectContentSaved(&context));
}

OpenedProject ProjectStore::open(const QString& path)
{
    OpenedProject project = openedOrHint(path);
    announceLoad(path, project, false);
    return project;
}

OpenedProject ProjectStore::openBackup(const QString& path)
{
    OpenedProject project = opened(backupOf(path));
    announceLoad(path, project, true);
    return project;
}

std::string ProjectStore::backupHint(const QString& path)
{
    const QString backup = backupOf(path);
    return opens(backup) ? "; its backup " + backup.toStdString() + " can be opened" : std::string();
}

bool ProjectStore::isProject(const QString& path)
{
    // Opening anything else may block.
    QFile file(path);
    if (!QFileInfo(path).isFile() || !file.open(QIODevice::ReadOnly)) {
        return false;
    }
    const QByteArray begin = file.read(projectMarkLength);
    file.seek(std::max(qint64(0), file.size() - projectMarkLength));
    return isProjectFile(begin, file.read(projectMarkLength));
}

QString ProjectStore::backupOf(const QString& path)
{
    try {
        return siblingOf(path, backupEnding);
    } catch (const ReplacementFailed& error) {
        refuse(path, error.what());
    }
}

} // namespace Host
