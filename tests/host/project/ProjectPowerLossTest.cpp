// SPDX-License-Identifier: Apache-2.0
// Saves that are killed at any instant.
#include "SmallProject.h"
#include "tests/host/shared/Samples.h"

#include <gmock/gmock.h>

#include <chrono>
#include <csignal>
#include <random>
#include <thread>

#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

namespace {

using namespace HostTests;
using Clock = std::chrono::steady_clock;
using std::chrono::nanoseconds;

/// Enough for a file of some blocks.
class LongProject : public SmallProject
{
public:
    LongProject() { item.description = QString(200000, 'x'); }
};

/// A process that saves projects of ascending numbers until it is killed.
pid_t startSaving(SmallProject& project, const QString& path, int firstNumber)
{
    const pid_t child = fork();
    if (child == 0) {
        for (int number = firstNumber;; ++number) {
            project.setNumber(number);
            project.save(path);
        }
    }
    return child;
}

bool killProcess(pid_t child)
{
    int status = 0;
    return child > 0 && kill(child, SIGKILL) == 0 && waitpid(child, &status, 0) == child &&
           WIFSIGNALED(status);
}

class KilledSaves : public testing::TestWithParam<const char*>
{
protected:
    bool isThere(const char* name) const
    {
        return QFile::exists(m_folder.path(QString(name).arg("film." + QString(GetParam()))));
    }
    static std::size_t inodeOf(const QString& path)
    {
        struct stat status
        {};
        return stat(path.toUtf8().constData(), &status) == 0 ? status.st_ino : 0;
    }

    const Folder m_folder{};
    const QString m_path = m_folder.path(QString("film.") + GetParam());
    LongProject m_project;
};
INSTANTIATE_TEST_SUITE_P(Forms, KilledSaves, testing::Values("json", "xml", "bin"),
                         [](const auto& form) { return std::string(form.param); });

TEST_P(KilledSaves, LeaveTheOldProjectOrTheNewOneAndAWholeBackup)
{
    constexpr int kills = 170;
    m_project.setNumber(0);
    m_project.save(m_path);
    const auto begin = Clock::now();
    m_project.save(m_path);
    const nanoseconds length = Clock::now() - begin;

    std::mt19937 random(1);
    int cutSaves = 0;
    int last = 0;
    for (int i = 0; i != kills; ++i) {
        const pid_t child = startSaving(m_project, m_path, last + 1);
        std::this_thread::sleep_for(
            nanoseconds(std::uniform_int_distribution<qint64>(0, 2 * length.count())(random)));
        ASSERT_TRUE(killProcess(child));
        cutSaves += isThere(".%1.saving");

        const int number = numberIn(m_path);
        const int backup = numberInBackup(m_path);
        ASSERT_GE(number, last);
        // Between the two renames the old file has both names.
        ASSERT_TRUE(backup == number - 1 || inodeOf(m_path) == inodeOf(m_path + ".backup") || number == 0)
            << "project " << number << ", backup " << backup;
        last = number;
    }
    EXPECT_GT(last, 0) << "no save came to its end";
    EXPECT_GT(cutSaves, kills / 10) << "hardly a kill has hit a save";
    RecordProperty("killed within a save", cutSaves);

    m_project.setNumber(last + 1);
    m_project.save(m_path);
    const std::string name = "film." + std::string(GetParam());
    EXPECT_EQ(namesIn(m_folder.path()), name + " " + name + ".backup");
}

TEST(ConcurrentSaves, AreRefusedOrDoneAndNeverMixed)
{
    const Folder folder;
    const QString path = folder.path("film.json");
    SmallProject(0).save(path);
    pid_t children[4];
    for (pid_t& child : children) {
        child = fork();
        if (child == 0) {
            for (int i = 1; i != 40; ++i) {
                try {
                    SmallProject(i).save(path);
                } catch (const Document::Error& error) {
                    if (error.reason() != "is being saved by another process")
                        _exit(1);
                }
            }
            _exit(0);
        }
    }
    for (int i = 0; i != 100; ++i)
        EXPECT_NO_THROW(numberIn(path));
    for (const pid_t child : children) {
        int status = -1;
        waitpid(child, &status, 0);
        EXPECT_EQ(status, 0);
    }
    EXPECT_EQ(namesIn(folder.path()), "film.json film.json.backup");
    EXPECT_NO_THROW(numberIn(path));
    EXPECT_NO_THROW(numberInBackup(path));
}

} // namespace
