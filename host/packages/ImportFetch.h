// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/packages/ImportStages.h"

#include <EditorModel/library/ImportObject.h>

#include <QFile>
#include <QString>
#include <QTemporaryDir>

#include <cstddef>
#include <deque>
#include <stdexcept>

namespace Host {

/// Why an item could not be fetched.
class ImportError : public std::runtime_error
{
public:
    ImportError(ImportFailure kindOfFailure, const QString& why);

    const ImportFailure failure;
    /// One line, which names the file or the address.
    const QString reason;
};

/// Copies the media of an item, a file, or its pack, a folder of files, block by block into a hidden folder
/// beside the place where it goes. What is not kept is gone when the fetch ends. All operations throw
/// ImportError.
class ImportFetch
{
public:
    static constexpr qint64 blockSize = 256 * 1024;

    /// Fetches nothing yet.
    ImportFetch(const Import::Object& item, const QString& folder);
    ~ImportFetch();

    bool isComplete() const { return m_next == m_files.size(); }
    /// From 0 to 1.
    double progress() const;
    void copyBlock();
    /// Puts what is complete in its place in one step, under a name that is free; gives its path.
    QString install();
    void keep() { m_installed.clear(); }

private:
    struct Entry
    {
        QString source;
        QString name;
        qint64 size;
    };

    void listFile(const QString& path);
    void listFolder(const QString& path, const QString& appId);
    void checkSize(qint64 told) const;
    void openNext();
    void closeCurrent();

    QString m_folder;
    /// Of the file or folder in its place.
    QString m_name;
    bool m_isFolder = false;
    std::deque<Entry> m_files;
    std::size_t m_next = 0;
    qint64 m_total = 0;
    qint64 m_copied = 0;
    qint64 m_copiedOfFile = 0;
    QTemporaryDir m_temporary;
    QFile m_source;
    QFile m_target;
    QString m_installed;
};

} // namespace Host
