// SPDX-License-Identifier: Apache-2.0
#include "Command.h"
#include "tests/host/project/SmallProject.h"
#include "tests/host/shared/Samples.h"

#include "host/analysis/TrackingStore.h"
#include "host/project/ProjectStore.h"

#include <EditorModel/analysis/MotionTracking.h>
#include <EditorModel/media/File.h>
#include <EditorModel/persistence/Document.h>

#include <gmock/gmock.h>

namespace {

using namespace HostTests;
using testing::IsEmpty;
using testing::StartsWith;

class CompareCommand : public testing::Test
{
protected:
    Outcome compare(const QStringList& names) const
    {
        return editormodel(QStringList("compare") + names, m_folder.path());
    }
    QString path(const QString& name) const { return m_folder.path(name); }

    const Folder m_folder;
};

TEST_F(CompareCommand, FindsProjectsTheSameInAnyForm)
{
    const SmallProject project;
    for (const char* const name : {"a.json", "b.xml", "c.bin"}) {
        Host::ProjectStore::save(project.content, path(name));
    }
    const Outcome outcome = compare({"a.json", "b.xml", "c.bin"});
    EXPECT_EQ(outcome.exitCode, 0);
    EXPECT_THAT(outcome.errors, IsEmpty());
    EXPECT_EQ(outcome.output, "b.xml is the same as a.json.\nc.bin is the same as a.json.\n");
}

TEST_F(CompareCommand, TellsOfEachThatDiffersWhere)
{
    Media::File file;
    file.setPath("one.mov");
    for (const auto& [name, other] :
         {std::pair("a.json", "one.mov"), std::pair("b.json", "two.mov"), std::pair("c.json", "one.mov")}) {
        file.setPath(other);
        Document::saveFile(path(name), {&file}, Document::Json, Document::Stream);
    }
    const Outcome outcome = compare({"a.json", "b.json", "c.json"});
    EXPECT_EQ(outcome.exitCode, 1);
    EXPECT_THAT(outcome.errors, IsEmpty());
    EXPECT_THAT(outcome.output, StartsWith("b.json differs from a.json: "));
    EXPECT_THAT(outcome.output, testing::HasSubstr("two.mov"));
    EXPECT_THAT(outcome.output, testing::EndsWith("c.json is the same as a.json.\n"));
}

TEST_F(CompareCommand, ComparesTheTrackingsBesideProjects)
{
    const SmallProject project;
    Host::TrackingStore trackings;
    MotionTracking::Data tracking("face");
    trackings.put(tracking);
    Host::ProjectStore::save(project.content, path("a.json"));
    Host::ProjectStore::save(project.content, path("b.json"));
    EXPECT_EQ(compare({"a.json", "b.json"}).exitCode, 0);
    tracking.frames[0].duration = 40;
    trackings.put(tracking);
    Host::ProjectStore::save(project.content, path("b.json"));
    EXPECT_EQ(compare({"a.json", "b.json"}).exitCode, 1);
}

TEST_F(CompareCommand, CannotCompareWhatItCannotRead)
{
    const SmallProject project;
    Host::ProjectStore::save(project.content, path("a.json"));
    m_folder.write("letter.json", "Dear Sir or Madam,\n");
    for (const char* const name : {"letter.json", "missing.json"}) {
        const Outcome outcome = compare({"a.json", name});
        EXPECT_EQ(outcome.exitCode, 2);
        EXPECT_THAT(outcome.output, IsEmpty());
        EXPECT_THAT(outcome.errors, StartsWith(name));
    }
    EXPECT_EQ(compare({"a.json"}).exitCode, 2);
}

} // namespace
