// SPDX-License-Identifier: Apache-2.0
#include "host/packages/ImportFetch.h"

#include "host/media/MediaInput.h"

#include <EditorModel/library/Pack.h>

#include <QDir>
#include <QDirIterator>
#include <QFileInfo>
#include <QUrl>

#include <algorithm>

#include <unistd.h>

namespace Host {
namespace {

/// A path is taken as it stands: "%20" in it is no blank.
QString localPathOf(const QString& address)
{
    if (address.isEmpty()) {
        throw ImportError(NoAddress, "the item has no address from which it can be fetched");
    }
    if (address.startsWith('/')) {
        return address;
    }
    const QUrl url(address);
    const bool isHere = url.host().isEmpty() || url.host() == "localhost";
    if (!url.isLocalFile() || !isHere || !url.path().startsWith('/')) {
        throw ImportError(NotOnMachine, address + ": does not lead to a file of this machine");
    }
    return url.path();
}

void requireReadable(const QString& path)
{
    try {
        requireFile(path);
    } catch (const MediaError& error) {
        throw ImportError(NotReadable, path + ": " + error.reason);
    }
}

/// The template of a folder's name that is hidden, so that nobody takes it for something complete.
QString temporaryIn(const QString& folder)
{
    if (!QDir().mkpath(folder)) {
        throw ImportError(NotWritable, folder + ": cannot be made");
    }
    return folder + "/.fetching-XXXXXX";
}

/// "a.wav", "a-2.wav", "a-3.wav", ...
QString numbered(const QString& name, int number)
{
    if (number == 1) {
        return name;
    }
    const int dot = name.lastIndexOf('.');
    return name.left(dot) + '-' + QString::number(number) + (dot < 0 ? QString() : name.mid(dot));
}

bool exists(const QString& path)
{
    const QFileInfo info(path);
    return info.exists() || info.isSymLink();
}

} // namespace

ImportError::ImportError(ImportFailure kindOfFailure, const QString& why)
    : std::runtime_error(why.toStdString()), failure(kindOfFailure), reason(why)
{}

ImportFetch::ImportFetch(const Import::Object& item, const QString& folder)
    : m_folder(folder), m_temporary(temporaryIn(folder))
{
    if (!m_temporary.isValid()) {
        throw ImportError(NotWritable, folder + ": cannot be written to: " + m_temporary.errorString());
    }
    const QString path = localPathOf(item.remoteUrl());
    if (item.pack) {
        listFolder(path, item.pack->appId);
    } else {
        listFile(path);
    }
    for (const Entry& file : m_files) {
        m_total += file.size;
    }
    checkSize(item.remoteSize());
}

ImportFetch::~ImportFetch()
{
    if (m_installed.isEmpty()) {
        return;
    }
    if (m_isFolder) {
        QDir(m_installed).removeRecursively();
    } else {
        QFile::remove(m_installed);
    }
}

double ImportFetch::progress() const
{
    if (isComplete()) {
        return 1.0;
    }
    return m_total == 0 ? 0.0 : static_cast<double>(m_copied) / static_cast<double>(m_total);
}

void ImportFetch::copyBlock()
{
    if (isComplete()) {
        return;
    }
    if (!m_source.isOpen()) {
        openNext();
    }
    const QByteArray block = m_source.read(blockSize);
    if (m_source.error() != QFile::NoError) {
        throw ImportError(NotReadable, m_source.fileName() + ": cannot be read: " + m_source.errorString());
    }
    if (m_target.write(block) != block.size()) {
        throw ImportError(NotWritable,
                          m_target.fileName() + ": cannot be written: " + m_target.errorString());
    }
    m_copied += block.size();
    m_copiedOfFile += block.size();
    const qint64 size = m_files[m_next].size;
    if (m_source.size() != size || (block.isEmpty() && m_copiedOfFile < size)) {
        throw ImportError(WrongSize, m_source.fileName() + ": has changed while it was fetched");
    }
    if (m_copiedOfFile == size) {
        closeCurrent();
    }
}

QString ImportFetch::install()
{
    const QString source = m_temporary.filePath(m_name);
    for (int number = 1;; ++number) {
        const QString target = m_folder + '/' + (m_isFolder ? m_name : numbered(m_name, number));
        if (!exists(target)) {
            if (!QFile::rename(source, target)) {
                throw ImportError(NotWritable, target + ": cannot be made");
            }
            m_installed = target;
            return target;
        }
        if (m_isFolder) {
            throw ImportError(NotWritable, target + ": is there already");
        }
    }
}

void ImportFetch::listFile(const QString& path)
{
    requireReadable(path);
    m_name = QFileInfo(path).fileName();
    m_files.push_back({path, m_name, QFileInfo(path).size()});
}

void ImportFetch::listFolder(const QString& path, const QString& appId)
{
    if (appId.isEmpty() || appId.startsWith('.') || appId.contains('/')) {
        throw ImportError(NotWritable, appId + ": the pack's identifier cannot be the name of a folder");
    }
    if (QFileInfo(path).isFile()) {
        throw ImportError(PackedFile, path + ": is a file; packs are fetched as folders");
    }
    m_isFolder = true;
    m_name = appId;
    const QDir root(path);
    QDirIterator entries(path, QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot,
                         QDirIterator::Subdirectories);
    while (entries.hasNext()) {
        const QString entry = entries.next();
        const QFileInfo info = entries.fileInfo();
        if (info.isSymLink()) {
            throw ImportError(NotReadable, entry + ": is a link; packs are fetched without any");
        }
        if (info.isFile()) {
            m_files.push_back({entry, m_name + '/' + root.relativeFilePath(entry), info.size()});
        } else if (!info.isDir()) {
            throw ImportError(NotReadable, entry + ": is not a regular file");
        }
    }
    if (m_files.empty()) {
        throw ImportError(NotReadable, path + ": holds no files");
    }
}

void ImportFetch::checkSize(qint64 told) const
{
    if (told >= 0 && told != m_total) {
        throw ImportError(WrongSize, m_name + ": has " + QString::number(m_total) + " bytes instead of " +
                                         QString::number(told));
    }
}

void ImportFetch::openNext()
{
    const Entry& file = m_files[m_next];
    m_source.setFileName(file.source);
    m_target.setFileName(m_temporary.filePath(file.name));
    m_copiedOfFile = 0;
    if (!m_source.open(QFile::ReadOnly)) {
        throw ImportError(NotReadable, file.source + ": cannot be read: " + m_source.errorString());
    }
    if (!QDir().mkpath(QFileInfo(m_target.fileName()).path()) || !m_target.open(QFile::WriteOnly)) {
        throw ImportError(NotWritable,
                          m_target.fileName() + ": cannot be written: " + m_target.errorString());
    }
}

/// On the disk before it gets its name.
void ImportFetch::closeCurrent()
{
    if (!m_target.flush() || fsync(m_target.handle()) != 0) {
        throw ImportError(NotWritable,
                          m_target.fileName() + ": cannot be written: " + m_target.errorString());
    }
    m_target.close();
    m_source.close();
    ++m_next;
}

} // namespace Host
