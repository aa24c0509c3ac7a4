// SPDX-License-Identifier: Apache-2.0
#include "host/project/FileReplacement.h"

#include <QFile>

#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <optional>
#include <system_error>
#include <utility>

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

namespace Host {
namespace {

namespace fs = std::filesystem;

[[noreturn]] void fail(const std::string& what)
{
    const int error = errno;
    throw ReplacementFailed(what + ": " + std::generic_category().message(error));
}

/// Repeats a call that a signal has interrupted.
template <class Call>
auto uninterrupted(Call call) -> decltype(call())
{
    decltype(call()) result;
    do {
        result = call();
    } while (result < 0 && errno == EINTR);
    return result;
}

class Descriptor
{
public:
    Descriptor() = default;
    explicit Descriptor(int number) : m_number(number) {}
    Descriptor(Descriptor&& other) noexcept : m_number(std::exchange(other.m_number, -1)) {}
    Descriptor& operator=(Descriptor&& other) noexcept
    {
        std::swap(m_number, other.m_number);
        return *this;
    }
    ~Descriptor()
    {
        if (m_number >= 0) {
            ::close(m_number);
        }
    }

    bool isOpen() const { return m_number >= 0; }
    int number() const { return m_number; }

private:
    int m_number = -1;
};

Descriptor opened(const fs::path& path, int flags, mode_t mode = 0)
{
    return Descriptor(uninterrupted([&] { return ::open(path.c_str(), flags | O_CLOEXEC, mode); }));
}

/// Where the links lead to, whether or not a file is there.
fs::path followed(const QString& path)
{
    constexpr int mostLinks = 40;
    fs::path file(QFile::encodeName(path).toStdString());
    std::error_code error;
    for (int links = 0; fs::is_symlink(fs::symlink_status(file, error)); ++links) {
        if (links == mostLinks) {
            throw ReplacementFailed("is a link that leads in a circle");
        }
        file = file.parent_path() / fs::read_symlink(file, error);
    }
    return file;
}

fs::path folderOf(const fs::path& file)
{
    return file.has_parent_path() ? file.parent_path() : fs::path(".");
}

/// In the same folder, where a rename cannot fail for want of room; hidden, and named after the file.
fs::path besides(const fs::path& file, const char* ending)
{
    return folderOf(file) / ("." + file.filename().string() + ending);
}

/// None if there is no file.
std::optional<struct stat> statusOf(const fs::path& file)
{
    struct stat status
    {};
    if (::stat(file.c_str(), &status) == 0) {
        return status;
    }
    if (errno != ENOENT) {
        fail("cannot be written");
    }
    return std::nullopt;
}

/// A file that is protected against writing could be replaced all the same, but is not meant to be.
void requireReplaceable(const fs::path& file, const struct stat& status)
{
    if (S_ISDIR(status.st_mode)) {
        throw ReplacementFailed("is a folder");
    }
    if (!S_ISREG(status.st_mode)) {
        throw ReplacementFailed("is not a regular file");
    }
    if (::access(file.c_str(), W_OK) != 0) {
        fail("cannot be written");
    }
}

bool namesFile(const fs::path& path, const Descriptor& file)
{
    struct stat named
    {};
    struct stat held
    {};
    return ::lstat(path.c_str(), &named) == 0 && ::fstat(file.number(), &held) == 0 &&
           named.st_dev == held.st_dev && named.st_ino == held.st_ino;
}

/// Takes the lock that a process holds on what it is writing; the system takes it from a process that ends.
/// Where there are no locks nobody else is known of.
bool isUnclaimed(const Descriptor& file)
{
    return uninterrupted([&] { return ::flock(file.number(), LOCK_EX | LOCK_NB); }) == 0 ||
           errno != EWOULDBLOCK;
}

/// The new content before it has its name. What is not put in place goes.
class Draft
{
public:
    Draft(fs::path path, mode_t mode) : m_path(std::move(path))
    {
        constexpr int attempts = 100;
        for (int i = 0; i != attempts; ++i) {
            m_file = opened(m_path, O_WRONLY | O_CREAT | O_EXCL, mode);
            if (!m_file.isOpen() && errno != EEXIST) {
                fail("cannot be written");
            }
            if (!m_file.isOpen()) {
                removeStale();
            } else if (isUnclaimed(m_file) && namesFile(m_path, m_file)) {
                return;
            }
        }
        throw ReplacementFailed("is being saved by another process");
    }
    Draft(const Draft&) = delete;
    Draft& operator=(const Draft&) = delete;
    ~Draft()
    {
        if (!m_isPlaced) {
            ::unlink(m_path.c_str());
        }
    }

    /// The owner first: giving a file away may take permissions from it.
    void take(const struct stat& status)
    {
        if (::fchown(m_file.number(), status.st_uid, status.st_gid) != 0 && errno != EPERM) {
            fail("cannot be written");
        }
        if (::fchmod(m_file.number(), status.st_mode & 07777) != 0) {
            fail("cannot be written");
        }
    }

    void write(const QByteArray& part)
    {
        for (int at = 0; at < part.size();) {
            const auto count = uninterrupted([&] {
                return ::write(m_file.number(), part.constData() + at, std::size_t(part.size() - at));
            });
            if (count < 0) {
                fail("cannot be written");
            }
            at += int(count);
        }
    }

    void flush()
    {
        if (uninterrupted([&] { return ::fsync(m_file.number()); }) != 0) {
            fail("cannot be written");
        }
    }

    void place(const fs::path& file)
    {
        if (std::rename(m_path.c_str(), file.c_str()) != 0) {
            fail("cannot be written");
        }
        m_isPlaced = true;
    }

private:
    /// What a process that was killed has left; a link under this name is nobody's either.
    void removeStale()
    {
        const Descriptor stale = opened(m_path, O_RDONLY | O_NOFOLLOW | O_NONBLOCK);
        if (stale.isOpen() && !isUnclaimed(stale)) {
            throw ReplacementFailed("is being saved by another process");
        }
        // Between opening and locking it may have got its name, and the next one may be here.
        if (stale.isOpen() && !namesFile(m_path, stale)) {
            return;
        }
        if (::unlink(m_path.c_str()) != 0 && errno != ENOENT) {
            fail("cannot be written, as " + m_path.filename().string() + " cannot be removed");
        }
    }

    fs::path m_path;
    Descriptor m_file;
    bool m_isPlaced = false;
};

/// Where a file system has no second names.
void copyFile(const fs::path& from, const fs::path& to, const struct stat& status)
{
    const Descriptor source = opened(from, O_RDONLY);
    if (!source.isOpen()) {
        fail("cannot be kept as a backup");
    }
    Draft copy(to.string() + "-copy", 0600);
    copy.take(status);
    QByteArray block(1 << 20, Qt::Uninitialized);
    for (;;) {
        const auto count =
            uninterrupted([&] { return ::read(source.number(), block.data(), std::size_t(block.size())); });
        if (count < 0) {
            fail("cannot be kept as a backup");
        }
        if (count == 0) {
            break;
        }
        copy.write(QByteArray::fromRawData(block.constData(), int(count)));
    }
    copy.flush();
    copy.place(to);
}

/// The old file gets a second name, and that one the name of the backup.
void keepBackup(const fs::path& file, const fs::path& backup, const struct stat& status)
{
    const fs::path second = besides(file, ".keeping");
    ::unlink(second.c_str());
    if (::link(file.c_str(), second.c_str()) != 0) {
        copyFile(file, second, status);
    }
    const bool isKept = std::rename(second.c_str(), backup.c_str()) == 0;
    const int error = errno;
    // Two names of one file, as a process that was killed may leave them, are not renamed into one.
    ::unlink(second.c_str());
    if (!isKept) {
        errno = error;
        fail("cannot be kept as a backup");
    }
}

/// A new name is on the disk once its folder is.
void flushFolder(const fs::path& folder)
{
    const Descriptor opening = opened(folder, O_RDONLY | O_DIRECTORY);
    if (!opening.isOpen()) {
        // A folder that may be written and not be read.
        return;
    }
    if (::fsync(opening.number()) != 0 && errno != EINVAL) {
        fail("is saved, but may not outlast a power failure");
    }
}

fs::path withEnding(fs::path file, const QString& ending)
{
    file += QFile::encodeName(ending).toStdString();
    return file;
}

} // namespace

void replaceFile(const QString& path, const std::vector<QByteArray>& parts,
                 const std::function<QString()>& ending)
{
    const fs::path file = followed(path);
    const std::optional<struct stat> old = statusOf(file);
    if (old) {
        requireReplaceable(file, *old);
    }
    Draft draft(besides(file, ".saving"), old ? 0600 : 0666);
    if (old) {
        draft.take(*old);
    }
    for (const QByteArray& part : parts) {
        draft.write(part);
    }
    draft.flush();
    if (old) {
        keepBackup(file, withEnding(file, ending()), *old);
    }
    draft.place(file);
    flushFolder(folderOf(file));
}

QByteArray versionOf(const QString& path)
{
    struct stat status
    {};
    if (::stat(QFile::encodeName(path).constData(), &status) != 0) {
        return {};
    }
    QByteArray version;
    for (const qint64 number : {qint64(status.st_dev), qint64(status.st_ino), qint64(status.st_size),
                                qint64(status.st_mtim.tv_sec), qint64(status.st_mtim.tv_nsec)}) {
        version += QByteArray::number(number) + ' ';
    }
    return version;
}

QString siblingOf(const QString& path, const QString& ending)
{
    return QFile::decodeName(withEnding(followed(path), ending).c_str());
}

} // namespace Host
