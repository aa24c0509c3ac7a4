// SPDX-License-Identifier: Apache-2.0
// Projects that go from process to process, in every form and in a locale with a decimal comma.
#include "tests/host/shared/Samples.h"
#include "tests/shared/FullProject.h"
#include "tests/shared/TimelineComparison.h"

#include "host/project/ProjectStore.h"

#include <QProcess>
#include <QProcessEnvironment>

#include <gmock/gmock.h>

namespace {

using namespace HostTests;
using Host::ProjectStore;
using Testing::FullProject;
using testing::IsEmpty;
using Testing::projectDifferences;

/// Opens and saves in a new process; returns what it said.
std::string copyElsewhere(const QString& from, const QString& to, const QString& locale)
{
    QProcess process;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert("LC_ALL", locale);
    environment.insert("LOCPATH", PROJECT_LOCALES);
    environment.insert("QT_QPA_PLATFORM", "offscreen");
    process.setProcessEnvironment(environment);
    process.start(PROJECT_COPIER, {from, to});
    EXPECT_TRUE(process.waitForFinished(60000));
    EXPECT_EQ(process.exitCode(), 0) << process.readAllStandardError().toStdString();
    return process.readAllStandardOutput().toStdString();
}

class ProjectJourney : public testing::TestWithParam<const char*>
{
protected:
    /// Through every form, by a process each, back to the first.
    void travel(const QString& locale, const std::string& half) const
    {
        const FullProject project;
        const QString stations[] = {m_folder.path("a." + QString(GetParam())), m_folder.path("b.json"),
                                    m_folder.path("c.xml"), m_folder.path("d.bin"),
                                    m_folder.path("e." + QString(GetParam()))};
        ProjectStore::save(project.content, stations[0]);
        for (std::size_t i = 1; i != std::size(stations); ++i) {
            ASSERT_EQ(copyElsewhere(stations[i - 1], stations[i], locale), half);
            const Host::OpenedProject copy = ProjectStore::open(stations[i]);
            EXPECT_THAT(projectDifferences(project.content, copy.content()), IsEmpty())
                << stations[i].toStdString();
        }
    }

    const Folder m_folder{};
};
INSTANTIATE_TEST_SUITE_P(Forms, ProjectJourney, testing::Values("json", "xml", "bin"),
                         [](const auto& form) { return std::string(form.param); });

TEST_P(ProjectJourney, ThroughProcessesAndFormsChangesNothing)
{
    travel("C.UTF-8", "0.5");
}

TEST_P(ProjectJourney, ThroughALocaleWithADecimalCommaChangesNothing)
{
    travel("de_DE.UTF-8", "0,5");
}

TEST_P(ProjectJourney, LeavesThePortableFlagAndWhatIsMissing)
{
    const QString path = m_folder.path("a." + QString(GetParam()));
    Project::Content content;
    content.portable = true;
    ProjectStore::save(content, path);
    const Host::OpenedProject copy = ProjectStore::open(path);
    EXPECT_TRUE(copy.content().portable);
    EXPECT_TRUE(copy.content() == Project::Content());
    EXPECT_EQ(copy.graph().size(), 1u);
}

} // namespace
