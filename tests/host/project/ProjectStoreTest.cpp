// SPDX-License-Identifier: Apache-2.0
#include "SmallProject.h"
#include "tests/host/shared/Child.h"
#include "tests/host/shared/Samples.h"

#include "host/project/FileReplacement.h"
#include "host/project/ProjectContexts.h"

#include <EditorModel/bus/PubSub.h>

#include <QFileInfo>

#include <csignal>
#include <cstdlib>
#include <gmock/gmock.h>

#include <fcntl.h>
#include <sys/file.h>
#include <sys/resource.h>
#include <sys/stat.h>

namespace {

using namespace HostTests;
using Host::ProjectStore;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

/// In a child too.
std::string refusalOfSave(const Project::Content& content, const QString& path)
{
    try {
        ProjectStore::save(content, path);
        return "none";
    } catch (const Document::Error& error) {
        return error.what();
    }
}

mode_t modeOf(const QString& path)
{
    struct stat status
    {};
    EXPECT_EQ(stat(path.toUtf8().constData(), &status), 0);
    return status.st_mode & 07777;
}

class ProjectSaving : public testing::Test
{
protected:
    /// Two saves, so that there is a backup.
    void SetUp() override
    {
        SmallProject(1).save(m_path);
        SmallProject(2).save(m_path);
    }

    std::string names() const { return namesIn(m_folder.path()); }
    void expectUntouched() const
    {
        EXPECT_EQ(names(), "film.json film.json.backup");
        EXPECT_EQ(numberIn(m_path), 2);
        EXPECT_EQ(numberInBackup(m_path), 1);
    }
    /// Of a save in a child to which something has been done.
    std::string refusalAfter(const std::function<void()>& happening) const
    {
        return inChild([&] {
            const SmallProject project(3);
            happening();
            return refusalOfSave(project.content, m_path);
        });
    }
    std::string message(const std::string& reason) const { return m_path.toStdString() + ": " + reason; }

    const Folder m_folder{};
    const QString m_path = m_folder.path("film.json");
};

TEST_F(ProjectSaving, KeepsTheOldFileAsBackup)
{
    expectUntouched();
    SmallProject(3).save(m_path);
    EXPECT_EQ(numberIn(m_path), 3);
    EXPECT_EQ(numberInBackup(m_path), 2);
    EXPECT_EQ(ProjectStore::backupOf(m_path), m_path + ".backup");
    EXPECT_EQ(names(), "film.json film.json.backup");
}

TEST_F(ProjectSaving, LetsNoDamagedFileTakeThePlaceOfAWholeBackup)
{
    const QByteArray whole = contentOf(m_path);
    QByteArray altered = whole;
    altered[whole.size() / 2] = altered[whole.size() / 2] == 'x' ? 'y' : 'x';
    for (const QByteArray& damaged :
         {whole.left(whole.size() / 2), altered, QByteArray(), QByteArray("Dear Sir or Madam,\n")}) {
        m_folder.write("film.json", damaged);
        SmallProject(3).save(m_path);
        EXPECT_EQ(numberIn(m_path), 3);
        EXPECT_EQ(numberInBackup(m_path), 1);
        EXPECT_EQ(contentOf(m_path + ".replaced"), damaged);
        EXPECT_EQ(names(), "film.json film.json.backup film.json.replaced");
    }
    // What was whole is the backup again.
    SmallProject(4).save(m_path);
    EXPECT_EQ(numberInBackup(m_path), 3);
    EXPECT_EQ(contentOf(m_path + ".replaced"), "Dear Sir or Madam,\n");
}

TEST_F(ProjectSaving, KeepsADamagedFileAsBackupWhereThatIsDamagedToo)
{
    m_folder.write("film.json.backup", "half a ba");
    m_folder.write("film.json", "half a pro");
    SmallProject(3).save(m_path);
    EXPECT_EQ(contentOf(m_path + ".backup"), "half a pro");
    EXPECT_EQ(names(), "film.json film.json.backup");
}

TEST_F(ProjectSaving, LeavesWhatSomebodyElseHasSavedSinceTheProjectWasRead)
{
    const QByteArray read = Host::versionOf(m_path);
    SmallProject(3).save(m_path);
    const SmallProject mine(4);
    EXPECT_THROW(ProjectStore::save(mine.content, m_path, read), Document::Error);
    EXPECT_EQ(numberIn(m_path), 3);
    EXPECT_EQ(numberInBackup(m_path), 2);
    EXPECT_EQ(names(), "film.json film.json.backup");
    ProjectStore::save(mine.content, m_path, Host::versionOf(m_path));
    EXPECT_EQ(numberIn(m_path), 4);
}

TEST_F(ProjectSaving, KeepsThePermissions)
{
    for (const mode_t mode : {0600u, 0640u, 0664u, 0777u}) {
        ASSERT_EQ(chmod(m_path.toUtf8().constData(), mode), 0);
        SmallProject(3).save(m_path);
        EXPECT_EQ(modeOf(m_path), mode);
        EXPECT_EQ(modeOf(m_path + ".backup"), mode);
    }
    const mode_t before = umask(027);
    SmallProject().save(m_folder.path("new.json"));
    umask(before);
    EXPECT_EQ(modeOf(m_folder.path("new.json")), 0640u);
}

TEST_F(ProjectSaving, FollowsLinksAndLeavesThem)
{
    ASSERT_TRUE(QDir(m_folder.path()).mkdir("links"));
    ASSERT_TRUE(QFile::link("../film.json", m_folder.path("links/first.json")));
    ASSERT_TRUE(QFile::link("first.json", m_folder.path("links/second.json")));
    SmallProject(3).save(m_folder.path("links/second.json"));
    EXPECT_EQ(QFile::symLinkTarget(m_folder.path("links/second.json")), m_folder.path("links/first.json"));
    EXPECT_EQ(numberIn(m_path), 3);
    EXPECT_EQ(numberInBackup(m_path), 2);
    EXPECT_EQ(numberInBackup(m_folder.path("links/second.json")), 2);
    EXPECT_EQ(namesIn(m_folder.path("links")), "first.json second.json");

    ASSERT_TRUE(QFile::link("../later.json", m_folder.path("links/third.json")));
    SmallProject(4).save(m_folder.path("links/third.json"));
    EXPECT_EQ(numberIn(m_folder.path("later.json")), 4);

    ASSERT_TRUE(QFile::link("circle.json", m_folder.path("circle.json")));
    const SmallProject project;
    EXPECT_EQ(refusalOfSave(project.content, m_folder.path("circle.json")),
              m_folder.path("circle.json").toStdString() + ": is a link that leads in a circle");
}

TEST_F(ProjectSaving, IsNotHinderedByWhatKilledSavesLeft)
{
    m_folder.write(".film.json.saving", "half a pro");
    m_folder.write(".film.json.keeping", "half a ba");
    SmallProject(3).save(m_path);
    EXPECT_EQ(names(), "film.json film.json.backup");

    // Killed when the backup had its name and the new file had not, it leaves two names of one file.
    ASSERT_EQ(rename((m_path + ".backup").toUtf8().constData(), (m_path + ".other").toUtf8().constData()), 0);
    ASSERT_EQ(link(m_path.toUtf8().constData(), (m_path + ".backup").toUtf8().constData()), 0);
    ASSERT_TRUE(QFile::remove(m_path + ".other"));
    SmallProject(4).save(m_path);
    EXPECT_EQ(names(), "film.json film.json.backup");
    EXPECT_EQ(numberInBackup(m_path), 3);
    EXPECT_EQ(numberIn(m_path), 4);
}

TEST_F(ProjectSaving, WritesThroughNoLinkInThePlaceOfItsTemporary)
{
    m_folder.write("precious", "precious");
    ASSERT_TRUE(QFile::link(m_folder.path("precious"), m_folder.path(".film.json.saving")));
    SmallProject(3).save(m_path);
    ASSERT_EQ(link(m_folder.path("precious").toUtf8().constData(),
                   m_folder.path(".film.json.saving").toUtf8().constData()),
              0);
    SmallProject(4).save(m_path);
    EXPECT_EQ(contentOf(m_folder.path("precious")), "precious");
    EXPECT_EQ(numberIn(m_path), 4);
    EXPECT_EQ(names(), "film.json film.json.backup precious");
}

TEST_F(ProjectSaving, IsRefusedWhileAnotherProcessSaves)
{
    const int other =
        open(m_folder.path(".film.json.saving").toUtf8().constData(), O_CREAT | O_RDWR | O_CLOEXEC, 0600);
    ASSERT_EQ(flock(other, LOCK_EX), 0);
    const SmallProject project(3);
    EXPECT_EQ(refusalOfSave(project.content, m_path), message("is being saved by another process"));
    EXPECT_EQ(names(), ".film.json.saving film.json film.json.backup");
    close(other);
    project.save(m_path);
    EXPECT_EQ(numberIn(m_path), 3);
}

TEST_F(ProjectSaving, LeavesTheOldFileIfTheDiskIsFull)
{
    EXPECT_EQ(refusalAfter([] { refuseWriting(ENOSPC); }),
              message("cannot be written: No space left on device"));
    expectUntouched();
    // Full after the first bytes.
    EXPECT_EQ(refusalAfter([] {
                  std::signal(SIGXFSZ, SIG_IGN);
                  const rlimit few{100, 100};
                  setrlimit(RLIMIT_FSIZE, &few);
              }),
              message("cannot be written: File too large"));
    expectUntouched();
}

TEST_F(ProjectSaving, LeavesTheOldFileIfAnyStepFails)
{
    EXPECT_EQ(refusalAfter([] {
                  refuseCalls({SYS_fsync, SYS_fdatasync}, EIO);
              }),
              message("cannot be written: Input/output error"));
    expectUntouched();
    EXPECT_EQ(refusalAfter([] { refuseCalls({SYS_fchmod}, EPERM); }),
              message("cannot be written: Operation not permitted"));
    expectUntouched();
    EXPECT_EQ(refusalAfter([] { refuseCalls(renamingCalls, EIO); }),
              message("cannot be kept as a backup: Input/output error"));
    expectUntouched();
    EXPECT_EQ(refusalAfter([] { refuseCalls(openingCalls, EMFILE); }),
              message("cannot be written: Too many open files"));
    expectUntouched();
}

TEST_F(ProjectSaving, CopiesTheBackupWhereAFileHasOneNameOnly)
{
    ASSERT_EQ(chmod(m_path.toUtf8().constData(), 0640), 0);
    EXPECT_EQ(refusalAfter([] { refuseCalls(linkingCalls, EPERM); }), "none");
    EXPECT_EQ(names(), "film.json film.json.backup");
    EXPECT_EQ(numberIn(m_path), 3);
    EXPECT_EQ(numberInBackup(m_path), 2);
    EXPECT_EQ(modeOf(m_path + ".backup"), 0640u);
}

TEST_F(ProjectSaving, GoesOnWhereFilesCannotBeLockedOrGivenAway)
{
    EXPECT_EQ(refusalAfter([] { refuseCalls({SYS_flock}, ENOLCK); }), "none");
    EXPECT_EQ(refusalAfter([] { refuseCalls({SYS_fchown}, EPERM); }), "none");
    EXPECT_EQ(numberIn(m_path), 3);
}

TEST_F(ProjectSaving, TellsThatTheUserMayNot)
{
    const auto becomeNobody = [] {
        if (getuid() == 0 && setuid(65534) != 0)
            std::abort();
    };
    ASSERT_EQ(chmod(m_folder.path().toUtf8().constData(), 0555), 0);
    ASSERT_EQ(chmod(m_path.toUtf8().constData(), 0666), 0);
    EXPECT_EQ(refusalAfter(becomeNobody), message("cannot be written: Permission denied"));
    expectUntouched();
    ASSERT_EQ(chmod(m_folder.path().toUtf8().constData(), 0777), 0);
    ASSERT_EQ(chmod(m_path.toUtf8().constData(), 0444), 0);
    EXPECT_EQ(refusalAfter(becomeNobody), message("cannot be written: Permission denied"));
    expectUntouched();
    ASSERT_EQ(chmod(m_path.toUtf8().constData(), 0666), 0);
    EXPECT_EQ(refusalAfter(becomeNobody), "none");
    EXPECT_EQ(numberIn(m_path), 3);
}

TEST_F(ProjectSaving, TellsWhereNothingCanBeSaved)
{
    const SmallProject project;
    ASSERT_TRUE(QDir(m_folder.path()).mkdir("folder.json"));
    ASSERT_EQ(mkfifo(m_folder.path("pipe.json").toUtf8().constData(), 0600), 0);
    const std::pair<QString, const char*> wrong[] = {
        {m_folder.path("folder.json"), "is a folder"},
        {m_folder.path("pipe.json"), "is not a regular file"},
        {m_folder.path("no/such/folder.json"), "cannot be written: No such file or directory"},
        {m_path + "/film.json", "cannot be written: Not a directory"},
        {m_folder.path(QString(250, 'x') + ".json"), "cannot be written: File name too long"},
        {"/proc/film.json", "cannot be written: "},
        {m_folder.path("film.doc"), "is no name of a project: such a name ends in .json, .xml or .bin"},
        {m_folder.path("film"), "is no name of a project: such a name ends in .json, .xml or .bin"},
    };
    for (const auto& [path, reason] : wrong)
        EXPECT_THAT(refusalOfSave(project.content, path),
                    testing::StartsWith(path.toStdString() + ": " + reason));
    EXPECT_EQ(names(), "film.json film.json.backup folder.json pipe.json");
}

TEST_F(ProjectSaving, LeavesTheOldFileIfTheProjectCannotBeStored)
{
    SmallProject project(3);
    // It has no name to be stored under.
    class Unknown : public Timeline::Object
    {};
    Unknown unknown;
    project.content.timeline = &unknown;
    EXPECT_THAT(refusalOfSave(project.content, m_path), testing::StartsWith(message("")));
    expectUntouched();
}

TEST(ProjectOpening, TellsWhatIsWrongAndWhetherTheBackupOpens)
{
    const Folder folder;
    const QString path = folder.path("film.xml");
    const auto refusal = [&] {
        try {
            ProjectStore::open(path);
            return std::string("none");
        } catch (const Document::Error& error) {
            return std::string(error.what()).substr(path.toStdString().size());
        }
    };
    EXPECT_EQ(refusal(), ": does not exist");
    folder.write("film.xml", "Dear Sir or Madam,\n");
    EXPECT_EQ(refusal(), ": is no project");
    // The letter is the backup now.
    SmallProject(1).save(path);
    EXPECT_EQ(refusal(), "none");
    folder.write("film.xml", "Dear Sir or Madam,\n");
    EXPECT_EQ(refusal(), ": is no project");

    SmallProject(1).save(path);
    SmallProject(2).save(path);
    const std::string hint = "; its backup " + path.toStdString() + ".backup can be opened";
    folder.write("film.xml", "Dear Sir or Madam,\n");
    EXPECT_EQ(refusal(), ": is no project" + hint);
    folder.write("film.xml", "");
    EXPECT_EQ(refusal(), ": is empty" + hint);
    QFile::remove(path);
    EXPECT_EQ(refusal(), ": does not exist" + hint);
    EXPECT_EQ(numberInBackup(path), 1);
}

/// A module that keeps a note beside each project.
class Notes : private PubSub::Subscriber<ProjectExtraInfo::ProjectContentSaved>,
              private PubSub::Subscriber<ProjectExtraInfo::ProjectContentLoaded>
{
public:
    Notes()
    {
        PubSub::Subscriber<ProjectExtraInfo::ProjectContentSaved>::subscribeAll<
            ProjectExtraInfo::SaveContext>();
        PubSub::Subscriber<ProjectExtraInfo::ProjectContentLoaded>::subscribeAll<
            ProjectExtraInfo::LoadContext>();
    }

    QByteArray note;
    std::vector<std::string> heard;

private:
    static QString place(const Host::ProjectPlace& project) { return project.sideFolder() + "/notes"; }

    void notify(const ProjectExtraInfo::ProjectContentSaved& message) override
    {
        const ProjectExtraInfo::SaveContext& context = *message.sender;
        // The project is there already.
        heard.push_back("saved " + QFileInfo(context.path).fileName().toStdString() + " " +
                        context.content->userCollection->items[0]->tag.toStdString() +
                        (ProjectStore::isProject(context.path) ? "" : ", which is not there"));
        QDir().mkpath(context.sideFolder());
        QFile file(place(context));
        if (!file.open(QFile::WriteOnly) || file.write(note) != note.size())
            throw std::runtime_error("the note cannot be written");
    }

    void notify(const ProjectExtraInfo::ProjectContentLoaded& message) override
    {
        const ProjectExtraInfo::LoadContext& context = *message.sender;
        heard.push_back("loaded " + QFileInfo(context.path).fileName().toStdString() + " " +
                        context.content->userCollection->items[0]->tag.toStdString() +
                        (context.isBackup ? " of the backup" : ""));
        QFile file(place(context));
        note = file.open(QFile::ReadOnly) ? file.readAll() : QByteArray("none");
    }
};

TEST(ProjectModules, KeepDataOfTheirOwnBesideAProject)
{
    const Folder folder;
    const QString path = folder.path("film.bin");
    {
        Notes notes;
        notes.note = "buy milk";
        SmallProject(1).save(path);
        EXPECT_EQ(namesIn(folder.path()), "film.bin film.bin.data");
        EXPECT_THAT(notes.heard, ElementsAre("saved film.bin 1"));
    }
    Notes notes;
    EXPECT_EQ(numberIn(path), 1);
    EXPECT_EQ(notes.note, "buy milk");
    SmallProject(2).save(path);
    EXPECT_EQ(numberInBackup(path), 1);
    ASSERT_TRUE(QFile::link(path, folder.path("link.bin")));
    notes.note.clear();
    EXPECT_EQ(numberIn(folder.path("link.bin")), 2);
    EXPECT_EQ(notes.note, "buy milk");
    EXPECT_THAT(notes.heard, ElementsAre("loaded film.bin 1", "saved film.bin 2",
                                         "loaded film.bin 1 of the backup", "loaded link.bin 2"));
}

TEST(ProjectModules, HearNothingOfWhatFails)
{
    const Folder folder;
    const Notes notes;
    const SmallProject project;
    EXPECT_THROW(project.save(folder.path("no/such/film.bin")), Document::Error);
    EXPECT_THROW(ProjectStore::open(folder.path("film.bin")), Document::Error);
    EXPECT_THROW(ProjectStore::openBackup(folder.path("film.bin")), Document::Error);
    EXPECT_THAT(notes.heard, IsEmpty());
}

TEST(ProjectModules, ThatFailDoNotUndoASave)
{
    const Folder folder;
    const Notes notes;
    folder.write("film.bin.data", "a file in the place of the folder");
    const SmallProject project(5);
    EXPECT_THROW(project.save(folder.path("film.bin")), std::runtime_error);
    EXPECT_EQ(numberIn(folder.path("film.bin")), 5);
}

} // namespace
