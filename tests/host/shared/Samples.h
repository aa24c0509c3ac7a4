// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QByteArray>
#include <QFile>
#include <QString>
#include <QTemporaryDir>

#include <stdexcept>

namespace HostTests {

/// The path of a file that samples.cmake makes.
inline QString sample(const QString& name)
{
    return QString(HOST_SAMPLES "/") + name;
}

inline QByteArray contentOf(const QString& path)
{
    QFile file(path);
    if (!file.open(QFile::ReadOnly)) {
        throw std::runtime_error("cannot read " + path.toStdString());
    }
    return file.readAll();
}

/// A folder for files that are broken or named in a special way.
class Folder
{
public:
    QString path(const QString& name = QString()) const
    {
        return name.isEmpty() ? m_folder.path() : m_folder.filePath(name);
    }

    QString write(const QString& name, const QByteArray& content) const
    {
        QFile file(path(name));
        if (!file.open(QFile::WriteOnly) || file.write(content) != content.size()) {
            throw std::runtime_error("cannot write " + name.toStdString());
        }
        return path(name);
    }

    /// The first part of a sample, or all of it, under another name.
    QString copy(const QString& sampleName, const QString& name, double part = 1.0) const
    {
        const QByteArray content = contentOf(sample(sampleName));
        return write(name, content.left(static_cast<int>(content.size() * part)));
    }

private:
    const QTemporaryDir m_folder;
};

} // namespace HostTests
