// SPDX-License-Identifier: Apache-2.0
#include "Command.h"
#include "tests/host/shared/SampleTimeline.h"
#include "tests/host/shared/Samples.h"

#include "host/timeline/TimelineTable.h"

#include <EditorModel/persistence/Document.h>

#include <QImage>

#include <gmock/gmock.h>

#include <algorithm>

namespace {

using namespace HostTests;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::StartsWith;
using Timeline::Clip;

/// Two clips with sound, a transition and a link.
void fill(SampleTimeline& sample)
{
    const Timeline::Track* const primary = sample.addTrack(PrimaryTrack);
    const Timeline::Track* const native = sample.addTrack(NativeAudioTrack);
    const Clip* const first = sample.addClip("first", Clip::VideoClip, primary, 0, 4000);
    const Clip* const second = sample.addClip("second", Clip::VideoClip, primary, 4000, 3000);
    sample.timeline.addLink(first, sample.addClip("first", Clip::AudioClip, native, 0, 4000), 0);
    sample.addTransition("dissolve", first, second, 1000);
}

void write(const QString& path, const Serialize::ISerializable& root)
{
    Document::saveFile(path, {&root}, *Document::formOfPath(path), Document::Stream);
}

class StoredTimelines : public testing::TestWithParam<const char*>
{};
INSTANTIATE_TEST_SUITE_P(Forms, StoredTimelines, testing::Values("json", "xml", "bin"),
                         [](const auto& form) { return std::string(form.param); });

TEST_P(StoredTimelines, AreShown)
{
    const Folder folder;
    const QString path = folder.path(QString("film.") + GetParam());
    SampleTimeline sample;
    fill(sample);
    write(path, sample.timeline);
    const Outcome shown = editormodel({"show", path});
    EXPECT_EQ(shown.exitCode, 0);
    EXPECT_THAT(shown.errors, IsEmpty());
    EXPECT_EQ(shown.output, Host::timelineTable(sample.timeline));
    EXPECT_THAT(shown.output, hasLine({"1", "dissolve", "1 first", "2 second", "00:00:01.000"}));
}

TEST_P(StoredTimelines, AreDrawn)
{
    const Folder folder;
    const QString path = folder.path(QString("film.") + GetParam());
    SampleTimeline sample;
    fill(sample);
    write(path, sample.timeline);
    const Outcome drawn = editormodel({"picture", path, folder.path("film.png")});
    EXPECT_EQ(drawn.exitCode, 0);
    EXPECT_THAT(drawn.output, IsEmpty());
    EXPECT_THAT(drawn.errors, IsEmpty());
    EXPECT_EQ(QImage(folder.path("film.png")).width(), 2584);
    EXPECT_EQ(editormodel({"picture", path, folder.path("film.SVG")}).exitCode, 0);
    EXPECT_TRUE(contentOf(folder.path("film.SVG")).contains("dissolve"));
}

TEST(ShowCommand, ShowsTimelinesBesideDescriptions)
{
    const Folder folder;
    const Timeline::Object timeline;
    Media::File file;
    file.setPath("old.wav")->setFormat("wav")->setSize(7);
    Document::saveFile(folder.path("both.json"), {&file, &timeline}, Document::Json, Document::Stream);
    EXPECT_EQ(editormodel({"show", "both.json"}, folder.path()).output,
              Host::timelineTable(timeline) + "\nFile     Format  Length  Size\n"
                                              "old.wav  wav          -   7 B\n");
}

TEST(PictureCommand, TellsInOneLineWhatIsWrong)
{
    const Folder folder;
    write(folder.path("empty.json"), Timeline::Object());
    write(folder.path("file.json"), Media::File());
    folder.write("letter.json", "Dear Sir or Madam,\n");
    const std::pair<QStringList, const char*> wrong[] = {
        {{"missing.json", "a.png"}, "missing.json: does not exist\n"},
        {{".", "a.png"}, ".: is a folder\n"},
        {{"/dev/zero", "a.png"}, "/dev/zero: is not a regular file\n"},
        {{"letter.json", "a.png"}, "letter.json: "},
        {{"file.json", "a.png"}, "file.json: holds no timeline, but File\n"},
        {{"empty.json", "a.gif"}, "a.gif: is no name of a picture: such a name ends in .png or .svg\n"},
        {{"empty.json", "no/such/folder/a.png"}, "no/such/folder/a.png: cannot be written: "},
    };
    for (const auto& [arguments, error] : wrong) {
        const Outcome outcome = editormodel(QStringList("picture") + arguments, folder.path());
        EXPECT_EQ(outcome.exitCode, 1) << error;
        EXPECT_THAT(outcome.output, IsEmpty()) << error;
        EXPECT_THAT(outcome.errors, StartsWith(error));
        EXPECT_EQ(std::count(outcome.errors.begin(), outcome.errors.end(), '\n'), 1) << outcome.errors;
    }
    EXPECT_EQ(editormodel({"picture", "empty.json", "a.png"}, folder.path()).exitCode, 0);
    EXPECT_EQ(editormodel({"picture", "empty.json"}, folder.path()).exitCode, 2);
}

} // namespace
