// SPDX-License-Identifier: Apache-2.0
#include "Command.h"
#include "tests/host/shared/SampleTimeline.h"
#include "tests/host/shared/Samples.h"

#include "host/analysis/TrackingStore.h"
#include "host/project/FaultList.h"
#include "host/project/ProjectStore.h"

#include <EditorModel/persistence/Document.h>

#include <nlohmann/json.hpp>

#include <QFileInfo>

#include <gmock/gmock.h>

#include <algorithm>

namespace {

using namespace HostTests;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::StartsWith;
using Timeline::Clip;

/// A project with one clip of some seconds.
class CheckCommand : public testing::Test
{
protected:
    CheckCommand()
    {
        content.timeline = &timeline.timeline;
        clip = timeline.addClip("holiday", Clip::VideoClip, timeline.addTrack(PrimaryTrack), 0, 4000);
    }

    QString save(const QString& name) const
    {
        Host::ProjectStore::save(content, folder.path(name));
        return folder.path(name);
    }

    const Folder folder;
    SampleTimeline timeline;
    Timeline::Clip* clip;
    Project::Content content;
};

TEST_F(CheckCommand, FindsNothingWrongInASoundProject)
{
    for (const char* const name : {"film.json", "film.xml", "film.bin"}) {
        const Outcome checked = editormodel({"check", save(name)});
        EXPECT_EQ(checked.exitCode, 0) << name;
        EXPECT_EQ(checked.output, "No faults.\n");
        EXPECT_THAT(checked.errors, IsEmpty());
    }
    Document::saveFile(folder.path("plain.json"), {&timeline.timeline}, Document::Json, Document::Stream);
    EXPECT_EQ(editormodel({"check", folder.path("plain.json")}).exitCode, 0);
}

TEST_F(CheckCommand, WhatNewMakesIsSound)
{
    const QString path = folder.path("new.json");
    ASSERT_EQ(
        editormodel({"new", path, "--media", sample("film.mp4"), sample("speech.wav"), sample("picture.png")})
            .exitCode,
        0);
    const Outcome checked = editormodel({"check", path});
    EXPECT_EQ(checked.output, "No faults.\n");
    EXPECT_EQ(checked.exitCode, 0);
}

TEST_F(CheckCommand, NamesTheFaultTheClipAndWhatToDo)
{
    timeline.timeline.setClipDuration(clip, 5000);
    const Outcome checked = editormodel({"check", save("film.json")});
    EXPECT_EQ(checked.exitCode, 1);
    EXPECT_EQ(
        checked.output,
        "outside-source: clip 1 \"holiday\": The clip \"holiday\" shows its source from 00:00:00.000 to "
        "00:00:05.000, but that lasts 00:00:04.000. Trim the clip.\n");
    EXPECT_THAT(checked.errors, IsEmpty());
}

TEST_F(CheckCommand, PrintsJson)
{
    clip->setVolume(-1);
    const Outcome checked = editormodel({"check", "--json", save("film.json")});
    EXPECT_EQ(checked.exitCode, 1);
    const auto json = nlohmann::json::parse(checked.output);
    EXPECT_EQ(json["readable"], true);
    ASSERT_EQ(json["faults"].size(), 1u);
    EXPECT_EQ(json["faults"][0]["code"], "value-out-of-range");
    EXPECT_EQ(json["faults"][0]["about"], "clip 1 \"holiday\"");
    EXPECT_EQ(json["faults"][0]["text"], "Clip 1 \"holiday\" has a volume of -1 percent.");
    EXPECT_EQ(json["faults"][0]["advice"], "Set it to another value.");
}

TEST_F(CheckCommand, LooksForTrackingsBesideTheProject)
{
    clip->addMotionTracking("face");
    QString path;
    {
        Host::TrackingStore store;
        store.put(MotionTracking::Data("face"));
        path = save("film.json");
    }
    EXPECT_EQ(editormodel({"check", path}).exitCode, 0);
    const QString place = Host::TrackingStore::folderOf(path) + "/t-face.json";
    ASSERT_TRUE(QFile::remove(place));
    const Outcome checked = editormodel({"check", path});
    EXPECT_EQ(checked.exitCode, 1);
    EXPECT_THAT(checked.output, StartsWith("lost-tracking: clip 1 \"holiday\": "));
}

TEST_F(CheckCommand, TellsThatTheFileIsDamagedAndThatItsBackupOpens)
{
    const QString path = save("film.json");
    save("film.json");
    const QByteArray whole = contentOf(path);
    folder.write("film.json", whole.left(whole.size() - 100));
    const Outcome checked = editormodel({"check", path});
    EXPECT_EQ(checked.exitCode, 2);
    EXPECT_THAT(checked.output, IsEmpty());
    EXPECT_THAT(checked.errors, HasSubstr("it is cut off"));
    EXPECT_THAT(checked.errors, HasSubstr(Host::ProjectStore::backupOf(path).toStdString()));
    EXPECT_EQ(std::count(checked.errors.begin(), checked.errors.end(), '\n'), 1);

    const Outcome inJson = editormodel({"check", "--json", path});
    EXPECT_EQ(inJson.exitCode, 2);
    const auto json = nlohmann::json::parse(inJson.output);
    EXPECT_EQ(json["readable"], false);
    EXPECT_EQ(json["reason"].get<std::string>() + '\n', checked.errors);
}

TEST_F(CheckCommand, EndsWithTwoWhereThereIsNothingToCheck)
{
    EXPECT_EQ(editormodel({"check", folder.path("missing.json")}).exitCode, 2);
    EXPECT_EQ(editormodel({"check", folder.path()}).exitCode, 2);
    EXPECT_EQ(editormodel({"check", folder.write("letter.json", "Dear Sir or Madam,\n")}).exitCode, 2);
    EXPECT_EQ(editormodel({"check"}).exitCode, 2);
    EXPECT_EQ(editormodel({"check", "--wrong", "a.json"}).exitCode, 2);
}

TEST_F(CheckCommand, HelpTellsEveryCode)
{
    const Outcome help = editormodel({"check", "--help"});
    EXPECT_EQ(help.exitCode, 0);
    for (const Host::FaultRule& rule : Host::faultRules()) {
        EXPECT_THAT(help.output, HasSubstr(std::string("  ") + rule.name + " "));
    }
}

TEST_F(CheckCommand, ChangesNothing)
{
    const QString path = save("film.json");
    const QByteArray before = contentOf(path);
    editormodel({"check", path});
    EXPECT_EQ(contentOf(path), before);
    EXPECT_FALSE(QFileInfo::exists(Host::ProjectStore::backupOf(path)));
}

} // namespace
