// SPDX-License-Identifier: Apache-2.0
#include "tests/host/shared/SampleTimeline.h"
#include "tests/host/shared/Samples.h"

#include "host/analysis/FilmstripMaker.h"
#include "host/timeline/ClipFilmstrips.h"
#include "host/timeline/TimelineLayout.h"
#include "host/timeline/TimelineOutline.h"

#include <EditorModel/media/File.h>

#include <gmock/gmock.h>

#include <deque>
#include <map>
#include <set>
#include <string>
#include <utility>
#include <vector>

namespace {

using namespace HostTests;
using testing::ElementsAre;
using testing::IsEmpty;
using Timeline::Clip;
using Lines = std::vector<std::string>;

/// Owns filmstrips and writes down what is asked for, as "file from ms".
class Asked : public Message::View<Filmstrip::Object>
{
public:
    explicit Asked(std::map<ResourceRef, std::string> names) : m_names(std::move(names))
    {
        processAddRequests();
    }

    Lines lines;

private:
    void addRequested(Filmstrip::Object* filmstrip) override
    {
        View::addRequested(filmstrip);
        lines.push_back(m_names.at(filmstrip->resource) + " from " +
                        std::to_string(filmstrip->sourceRange.from.ms()));
    }

    const std::map<ResourceRef, std::string> m_names;
};

/// Writes down how far the pictures have come.
class Progresses : private Message::View<Report::Progress>
{
public:
    explicit Progresses(const Report::Progress* progress) : total(progress->total) { observe(progress); }

    const int total;
    std::vector<int> passed;
    std::set<QString> labels;

private:
    using View::changed;
    void changed(const Report::Progress* progress) override
    {
        passed.push_back(progress->passed);
        labels.insert(progress->label);
    }
};

/// Clips of a second each, which show a file of 100 s from some second on.
class FilmstripsOfClips : public testing::Test
{
protected:
    Media::File* addFile(const QString& path)
    {
        m_videos.emplace_back();
        m_videos.back().width = 160;
        m_videos.back().height = 120;
        m_files.emplace_back();
        return m_files.back().setPath(path)->addTrack(&m_videos.back());
    }
    const Clip* addClip(const Media::File* file, MTime from)
    {
        const MTime at = 1000 * qint64(sample.clips.size());
        Clip* const clip = sample.addClip("clip", Clip::VideoClip, m_track, at, 1000);
        sample.trim(clip, from, MTime(99000) - from);
        clip->setFile(file);
        return clip;
    }

    SampleTimeline sample;

private:
    std::deque<Media::File::Track::Video> m_videos;
    std::deque<Media::File> m_files;
    const Timeline::Track* const m_track = sample.addTrack(PrimaryTrack);
};

TEST_F(FilmstripsOfClips, AreAskedForFileByFileInTheOrderOfTheSource)
{
    const Media::File* const a = addFile("/a.mkv");
    const Media::File* const b = addFile("/b.mkv");
    addClip(b, 20000);
    const Clip* const first = addClip(a, 50000);
    const Clip* const second = addClip(b, 10000);
    addClip(a, 2000);
    addClip(b, 90000);
    Asked asked({{Host::pictureResourceOf(*first), "a"}, {Host::pictureResourceOf(*second), "b"}});
    const Host::TimelineOutline outline(sample.timeline);
    Host::ClipFilmstrips filmstrips(Host::TimelineLayout(outline), outline);
    EXPECT_THAT(asked.lines, IsEmpty());
    filmstrips.request();
    EXPECT_THAT(asked.lines,
                ElementsAre("a from 2000", "a from 50000", "b from 10000", "b from 20000", "b from 90000"));
}

TEST_F(FilmstripsOfClips, TellHowManyPicturesHaveCome)
{
    const Media::File* const film = addFile(HostTests::sample("patch.mkv"));
    const Media::File* const missing = addFile(HostTests::sample("missing.mkv"));
    const Clip* const shown = addClip(film, 0);
    const Clip* const lost = addClip(missing, 0);
    const Host::FilmstripMaker maker({{Host::pictureResourceOf(*shown), {film->path, 0}},
                                      {Host::pictureResourceOf(*lost), {missing->path, 0}}});
    const Host::TimelineOutline outline(sample.timeline);
    Host::ClipFilmstrips filmstrips(Host::TimelineLayout(outline), outline);
    const auto each = int(Host::picturePositions(*filmstrips.of(*shown)).size());
    ASSERT_GT(each, 2);
    Progresses progresses(filmstrips.progress());
    EXPECT_EQ(progresses.total, 2 * each);
    progresses.passed.clear();
    filmstrips.request();
    // The missing one comes first, by its name; its pictures come at once.
    std::vector<int> expected = {0};
    for (int i = 0; i <= each; ++i) {
        expected.push_back(each + i);
    }
    expected.push_back(2 * each);
    EXPECT_EQ(progresses.passed, expected);
    EXPECT_EQ(progresses.labels, std::set<QString>({"", film->path, missing->path}));
}

} // namespace
