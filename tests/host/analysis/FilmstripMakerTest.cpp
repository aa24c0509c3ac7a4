// SPDX-License-Identifier: Apache-2.0
#include "tests/host/shared/Pictures.h"
#include "tests/host/shared/Samples.h"

#include "host/analysis/FilmstripMaker.h"
#include "host/analysis/PictureReader.h"

#include <EditorModel/types/Image.h>

#include <QFile>

#include <gmock/gmock.h>

#include <deque>
#include <utility>
#include <vector>

namespace {

using namespace HostTests;
using Host::FilmstripMaker;
using Host::MediaPlace;
using Host::PictureReader;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;

const ResourceRef film("film", Resource::VideoType);

/// The column in which the patch of patch.mkv begins: 22 + 2 n in picture n of 25 in a second, on grey.
int patchIn(const QImage& image)
{
    for (int x = 0; x < image.width(); ++x) {
        if (!isNear(image.pixelColor(x, image.height() / 2), image.pixelColor(0, 0))) {
            return x;
        }
    }
    return -1;
}

TEST(PictureReader, TakesThePictureThatIsShown)
{
    PictureReader reader(sample("patch.mkv"), 0);
    const QSize size(160, 120);
    const auto at = [&](MTime time) { return patchIn(reader.at(time, size)); };
    EXPECT_NEAR(at(0), 22, 1);
    EXPECT_NEAR(at(79), 24, 1);
    EXPECT_NEAR(at(80), 26, 1);
    EXPECT_NEAR(at(400), 42, 1);
    // Back, behind the end, and before the start.
    EXPECT_NEAR(at(200), 32, 1);
    EXPECT_NEAR(at(9000), 70, 1);
    EXPECT_NEAR(at(-5), 22, 1);
}

TEST(PictureReader, ScalesAndTurns)
{
    PictureReader reader(sample("patch.mkv"), 0);
    EXPECT_EQ(reader.at(0, QSize(80, 60)).size(), QSize(80, 60));
    EXPECT_NEAR(patchIn(reader.at(0, QSize(80, 60))), 11, 1);

    // A quarter turn to the left: what was on the right is on top.
    const QImage upright = PictureReader(sample("film.mp4"), 0).at(0, QSize(320, 240));
    const QImage turned = PictureReader(sample("film-quarter-turn.mp4"), 0).at(0, QSize(240, 320));
    ASSERT_EQ(turned.size(), QSize(240, 320));
    const QImage half = PictureReader(sample("film-half-turn.mp4"), 0).at(0, QSize(320, 240));
    EXPECT_TRUE(isNear(half.pixelColor(10, 20), upright.pixelColor(309, 219)));
    EXPECT_TRUE(isNear(turned.pixelColor(20, 10), upright.pixelColor(309, 20)));
    EXPECT_FALSE(isNear(turned.pixelColor(20, 10), upright.pixelColor(10, 219)));
}

TEST(PicturePositions, GoThroughTheRangeByStepsEitherWay)
{
    Filmstrip::Object strip;
    strip.setResource(film)->setSourceRange(1000, 2000)->setStep(400);
    EXPECT_THAT(Host::picturePositions(strip), ElementsAre(MTime(1000), MTime(1400), MTime(1800)));
    strip.setReversed(true);
    EXPECT_THAT(Host::picturePositions(strip), ElementsAre(MTime(1999), MTime(1599), MTime(1199)));
    strip.setResource({"still", Resource::ImageType});
    EXPECT_THAT(Host::picturePositions(strip), ElementsAre(MTime(0), MTime(0), MTime(0)));
    EXPECT_THAT(Host::picturePositions(Filmstrip::Object()), IsEmpty());
    strip.setStep(0);
    EXPECT_THAT(Host::picturePositions(strip), IsEmpty());
}

/// Writes down what comes to a filmstrip.
class Watcher : private Message::View<Filmstrip::Object>
{
public:
    explicit Watcher(Filmstrip::Object* strip) { add(strip); }

    std::vector<std::string> lines;

private:
    using View::changed;
    void added(const Filmstrip::Object* strip) override
    {
        lines.emplace_back(strip->payload ? "added filled" : "added empty");
    }
    void changed(const Filmstrip::Object* strip, const Filmstrip::Object*) override
    {
        lines.push_back("changed " + std::to_string(strip->bumpCount) +
                        (strip->payload ? " filled" : " empty"));
    }
};

TEST(FilmstripMaker, FillsWhatIsAdded)
{
    const FilmstripMaker maker({{film, MediaPlace{sample("patch.mkv"), 0}}});
    Filmstrip::Object strip;
    strip.setResource(film)->setWidth(160)->setHeight(120)->setSourceDuration(1000);
    strip.setSourceRange(200, 1000)->setStep(400)->setReversed(true);
    const Watcher watcher(&strip);
    EXPECT_THAT(watcher.lines, ElementsAre("added empty", "changed 1 filled"));
    ASSERT_TRUE(strip.payload);
    const auto& pictures = strip.payload->pictures;
    ASSERT_EQ(pictures.size(), 2u);
    EXPECT_EQ(pictures[1].resource, film);
    EXPECT_EQ(pictures[1].position, MTime(599));
    EXPECT_EQ(pictures[1].resourceDuration, MTime(1000));
    ASSERT_TRUE(pictures[0].image && pictures[1].image);
    // Pictures 24 and 14.
    EXPECT_NEAR(patchIn(pictures[0].image->toImage()), 70, 1);
    EXPECT_NEAR(patchIn(pictures[1].image->toImage()), 50, 1);
    EXPECT_THAT(maker.failures(), IsEmpty());
}

TEST(FilmstripMaker, OpensAFileOnceForFilmstripsThatFollowOneAnother)
{
    const Folder folder;
    const QString path = folder.copy("patch.mkv", "patch.mkv");
    const FilmstripMaker maker({{film, MediaPlace{path, 0}}});
    std::deque<Filmstrip::Object> strips(3);
    std::deque<Watcher> watchers;
    // From the middle, on from there, and back to the start.
    for (const auto& [strip, from] : {std::pair(0, 400), std::pair(1, 600), std::pair(2, 0)}) {
        Filmstrip::Object& asked = strips[std::size_t(strip)];
        asked.setResource(film)->setWidth(160)->setHeight(120)->setSourceDuration(1000);
        asked.setSourceRange(from, from + 80)->setStep(40);
        watchers.emplace_back(&asked);
        // Only what is open can still be read.
        QFile::remove(path);
    }
    const auto patchAt = [&](int strip, int picture) {
        const auto& image = strips[std::size_t(strip)].payload->pictures[std::size_t(picture)].image;
        return image ? patchIn(image->toImage()) : -2;
    };
    // Pictures 10, 11, 15, 16, 0 and 1.
    EXPECT_NEAR(patchAt(0, 0), 42, 1);
    EXPECT_NEAR(patchAt(0, 1), 44, 1);
    EXPECT_NEAR(patchAt(1, 0), 52, 1);
    EXPECT_NEAR(patchAt(1, 1), 54, 1);
    EXPECT_NEAR(patchAt(2, 0), 22, 1);
    EXPECT_NEAR(patchAt(2, 1), 24, 1);
    EXPECT_THAT(maker.failures(), IsEmpty());
}

TEST(FilmstripMaker, TakesPicturesOutOfSeveralFilesInTurn)
{
    const ResourceRef still("still", Resource::ImageType);
    const ResourceRef none("none", Resource::VideoType);
    const FilmstripMaker maker({{film, MediaPlace{sample("patch.mkv"), 0}},
                                {still, MediaPlace{sample("picture.png"), 0}},
                                {none, MediaPlace{sample("patch.mkv"), 7}}});
    std::deque<Filmstrip::Object> strips(5);
    std::deque<Watcher> watchers;
    std::vector<bool> shown;
    std::size_t next = 0;
    for (const ResourceRef& resource : {film, still, none, none, film}) {
        Filmstrip::Object& asked = strips[next++];
        asked.setResource(resource)->setWidth(160)->setHeight(120)->setSourceRange(0, 1000)->setStep(1000);
        watchers.emplace_back(&asked);
        shown.push_back(asked.payload->pictures.front().image != nullptr);
    }
    EXPECT_THAT(shown, ElementsAre(true, true, false, false, true));
    EXPECT_THAT(maker.failures(), ElementsAre(Pair(sample("patch.mkv"), QString("has no video track 7"))));
}

TEST(FilmstripMaker, SharesThePictureOfAStill)
{
    const ResourceRef still("still", Resource::ImageType);
    const FilmstripMaker maker({{still, MediaPlace{sample("picture.png"), 0}}});
    Filmstrip::Object strip;
    strip.setResource(still)->setWidth(64)->setHeight(48)->setSourceRange(0, 1000)->setStep(500);
    const Watcher watcher(&strip);
    ASSERT_EQ(strip.payload->pictures.size(), 2u);
    EXPECT_FALSE(strip.payload->pictures[0].image->isNull());
    EXPECT_EQ(strip.payload->pictures[0].image, strip.payload->pictures[1].image);
}

TEST(FilmstripMaker, LeavesOutWhatIsMissing)
{
    const FilmstripMaker maker({{film, MediaPlace{"/no/such.mp4", 0}}});
    Filmstrip::Object strip;
    strip.setResource(film)->setWidth(160)->setHeight(120)->setSourceRange(0, 1000)->setStep(1000);
    const Watcher watcher(&strip);
    ASSERT_EQ(strip.payload->pictures.size(), 1u);
    EXPECT_FALSE(strip.payload->pictures[0].image);
    EXPECT_THAT(maker.failures(), ElementsAre(Pair(QString("/no/such.mp4"), QString("does not exist"))));
    Filmstrip::Object other;
    other.setResource({"other", Resource::VideoType})->setSourceRange(0, 1000)->setStep(1000);
    const Watcher second(&other);
    EXPECT_FALSE(other.payload->pictures[0].image);
}

} // namespace
