// SPDX-License-Identifier: Apache-2.0
// What a replacement asks of the system, and in which order, so that it outlasts a power failure.
#include "tests/host/shared/Samples.h"

#include "host/project/FileReplacement.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <gmock/gmock.h>

#include <cerrno>
#include <cstdio>
#include <string>
#include <vector>

#include <fcntl.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <unistd.h>

namespace {

/// The calls since calls.clear(), by the last parts of the names.
std::vector<std::string> calls;
/// The error in which flushing a folder ends; 0 for none.
int folderError = 0;

std::string lastPart(const std::string& path)
{
    return path.substr(path.rfind('/') + 1);
}

std::string nameOf(int file)
{
    const QString link = QStringLiteral("/proc/self/fd/%1").arg(file);
    return lastPart(QFileInfo(link).symLinkTarget().toStdString());
}

bool isFolder(int file)
{
    struct stat status
    {};
    return fstat(file, &status) == 0 && S_ISDIR(status.st_mode);
}

} // namespace

// These stand in the way of the system's own, for all that is linked into the program.

extern "C" int fsync(int file)
{
    const bool isOfFolder = isFolder(file);
    calls.push_back((isOfFolder ? "flush folder " : "flush ") + nameOf(file));
    if (isOfFolder && folderError != 0) {
        errno = folderError;
        return -1;
    }
    return int(syscall(SYS_fsync, file));
}

extern "C" int rename(const char* from, const char* to) noexcept
{
    calls.push_back("rename " + lastPart(from) + " to " + lastPart(to));
    return renameat(AT_FDCWD, from, AT_FDCWD, to);
}

namespace {

using namespace HostTests;
using testing::ElementsAre;
using testing::StartsWith;

class Replacement : public testing::Test
{
protected:
    Replacement()
    {
        EXPECT_TRUE(QDir(folder.path()).mkdir("films"));
        folder.write("films/film.json", "old");
        calls.clear();
    }
    ~Replacement() override { folderError = 0; }

    /// Why it fails; empty if it doesn't.
    std::string replace(const QString& path) const
    {
        try {
            Host::replaceFile(path, {"new", " one"}, [] { return QStringLiteral(".backup"); });
        } catch (const Host::ReplacementFailed& failed) {
            return failed.what();
        }
        return {};
    }

    const Folder folder{};
    const QString film = folder.path("films/film.json");
};

TEST_F(Replacement, FlushesTheContentBeforeItHasItsNameAndTheFolderAfterwards)
{
    EXPECT_EQ(replace(film), "");
    EXPECT_THAT(calls, ElementsAre("flush .film.json.saving", "rename .film.json.keeping to film.json.backup",
                                   "rename .film.json.saving to film.json", "flush folder films"));
}

TEST_F(Replacement, FlushesTheFolderOfANewFile)
{
    EXPECT_EQ(replace(folder.path("films/other.json")), "");
    EXPECT_THAT(calls, ElementsAre("flush .other.json.saving", "rename .other.json.saving to other.json",
                                   "flush folder films"));
}

TEST_F(Replacement, FlushesTheFolderThatALinkLeadsTo)
{
    ASSERT_TRUE(QDir(folder.path()).mkdir("links"));
    ASSERT_TRUE(QFile::link("../films/film.json", folder.path("links/link.json")));
    EXPECT_EQ(replace(folder.path("links/link.json")), "");
    ASSERT_FALSE(calls.empty());
    EXPECT_EQ(calls.back(), "flush folder films");
}

TEST_F(Replacement, FlushesTheCurrentFolderForANameWithoutOne)
{
    const QString before = QDir::currentPath();
    ASSERT_TRUE(QDir::setCurrent(folder.path("films")));
    EXPECT_EQ(replace("film.json"), "");
    ASSERT_TRUE(QDir::setCurrent(before));
    ASSERT_FALSE(calls.empty());
    EXPECT_EQ(calls.back(), "flush folder films");
}

TEST_F(Replacement, TellsThatTheFolderCannotBeFlushed)
{
    folderError = EIO;
    EXPECT_THAT(replace(film), StartsWith("is saved, but may not outlast a power failure: "));
    EXPECT_EQ(contentOf(film), "new one");
    EXPECT_EQ(contentOf(film + ".backup"), "old");
}

/// As some file systems have it.
TEST_F(Replacement, IsDoneWhereFoldersAreNeverFlushed)
{
    folderError = EINVAL;
    EXPECT_EQ(replace(film), "");
    EXPECT_EQ(calls.back(), "flush folder films");
    EXPECT_EQ(contentOf(film), "new one");
}

} // namespace
