// SPDX-License-Identifier: Apache-2.0
#include "host/media/MediaTable.h"
#include "host/media/MediaText.h"
#include "host/text/DisplayText.h"
#include "host/text/Table.h"

#include <gmock/gmock.h>

#include <limits>

namespace {

using testing::ElementsAre;

TEST(DisplayText, CountsTheCellsOfATerminal)
{
    EXPECT_EQ(Host::displayWidth(""), 0);
    EXPECT_EQ(Host::displayWidth("abc"), 3);
    EXPECT_EQ(Host::displayWidth("фильм"), 5);
    EXPECT_EQ(Host::displayWidth("写真"), 4);
    EXPECT_EQ(Host::displayWidth("e\u0301"), 1);
}

TEST(DisplayText, WritesOutWhatWouldSteerTheTerminal)
{
    EXPECT_EQ(Host::printable(QString::fromUtf8("写真 \"ä\"")), "写真 \"ä\"");
    EXPECT_EQ(Host::printable("a\nb\x1b[2Jc"), "a\\x0ab\\x1b[2Jc");
    EXPECT_EQ(Host::printable(QString(QChar(0x2028))), "\\x2028");
    // What turns a line round, and what joins the parts of an emoji.
    EXPECT_EQ(Host::printable(QString(QChar(0x202E))), "\\x202e");
    EXPECT_EQ(Host::printable(QString(QChar(0x200D))), "\xE2\x80\x8D");
}

TEST(DisplayText, CutsLongTextsToTheWidth)
{
    EXPECT_EQ(Host::elided("clip.mp4", 8), "clip.mp4");
    EXPECT_EQ(Host::elided("clip.mp4", 7), "clip...");
    EXPECT_EQ(Host::elided(QString::fromUtf8("写真写真"), 6), "写...");
    EXPECT_EQ(Host::elided("clip.mp4", 2), "..");
    EXPECT_EQ(Host::elided("clip.mp4", 0), "");
}

TEST(Table, AlignsItsColumnsByWhatATerminalShows)
{
    Host::Table table({Host::Table::Left, Host::Table::Right, Host::Table::Left});
    table.addRow({"写真", "1", "x"});
    table.addRow({"clip", "234"});
    table.addRow({"é"});
    EXPECT_THAT(table.lines(), ElementsAre("写真    1  x", "clip  234", "é"));
}

TEST(Table, GivesAnEmptyColumnNoRoom)
{
    Host::Table table({Host::Table::Left, Host::Table::Left, Host::Table::Left});
    table.addRow({"a", "", "b"});
    table.addRow({"c", "", "d"});
    EXPECT_THAT(table.lines(), ElementsAre("a  b", "c  d"));
    EXPECT_THAT(Host::Table({Host::Table::Left}).lines(), ElementsAre());
}

TEST(MediaText, WritesLengthsAsHoursMinutesAndSeconds)
{
    EXPECT_EQ(Host::lengthText(MTime()), "00:00:00.000");
    EXPECT_EQ(Host::lengthText(MTime(3723004)), "01:02:03.004");
    EXPECT_EQ(Host::lengthText(MTime(-1500)), "-00:00:01.500");
    EXPECT_EQ(Host::lengthText(MTime(400000000)), "111:06:40.000");
    // 2^63 ms: 2562047788015 hours, 12 minutes, 55.808 seconds.
    EXPECT_EQ(Host::lengthText(std::numeric_limits<qint64>::min()), "-2562047788015:12:55.808");
}

TEST(MediaText, WritesSizesWithAFittingUnit)
{
    EXPECT_EQ(Host::sizeText(0), "0 B");
    EXPECT_EQ(Host::sizeText(999), "999 B");
    EXPECT_EQ(Host::sizeText(1000), "1.0 kB");
    EXPECT_EQ(Host::sizeText(999949), "999.9 kB");
    EXPECT_EQ(Host::sizeText(999950), "1.0 MB");
    EXPECT_EQ(Host::sizeText(1234567890), "1.2 GB");
    EXPECT_EQ(Host::sizeText(std::numeric_limits<qint64>::max()), "9.2 EB");
}

TEST(MediaText, WritesRatesWithoutNeedlessZeros)
{
    EXPECT_EQ(Host::frameRateText(25, 1), "25 fps");
    EXPECT_EQ(Host::frameRateText(30000, 1001), "29.97 fps");
    EXPECT_EQ(Host::frameRateText(24000, 1001), "23.976 fps");
    EXPECT_EQ(Host::frameRateText(1000, 1), "1000 fps");
    EXPECT_EQ(Host::frameRateText(0, 1), "");
    EXPECT_EQ(Host::frameRateText(25, 0), "");
    EXPECT_EQ(Host::bitrateText(0), "");
    EXPECT_EQ(Host::bitrateText(128000), "128 kbit/s");
    EXPECT_EQ(Host::bitrateText(1536000), "1.5 Mbit/s");
}

TEST(MediaText, NamesChannelsPixelsAndSampleFormats)
{
    EXPECT_EQ(Host::channelsText(1), "mono");
    EXPECT_EQ(Host::channelsText(2), "stereo");
    EXPECT_EQ(Host::channelsText(6), "6 channels");
    Media::Video video;
    EXPECT_EQ(Host::aspectText(video), "");
    video.setAspect(64, 45);
    EXPECT_EQ(Host::aspectText(video), "pixels 64:45");
    EXPECT_EQ(Host::sampleFormatText(1), "s16");
    EXPECT_EQ(Host::sampleFormatText(-1), "");
    EXPECT_EQ(Host::sampleFormatText(10000), "");
}

TEST(MediaText, CallsAFormatByTheNameThatTheFileGoesBy)
{
    Media::File file;
    file.setPath("/a/b.MP4")->setFormat("mov,mp4,m4a");
    EXPECT_EQ(Host::formatText(file), "mp4");
    file.setPath("b.dat");
    EXPECT_EQ(Host::formatText(file), "mov");
    file.setFormat("png_pipe");
    EXPECT_EQ(Host::formatText(file), "png");
    file.setFormat("image2")->setPath("c.TGA");
    EXPECT_EQ(Host::formatText(file), "tga");
    file.setFormat("");
    EXPECT_EQ(Host::formatText(file), "");
}

TEST(MediaTable, ShowsEachFileWithItsTracksBelow)
{
    Media::File::Track::Audio sound;
    sound.index = 0;
    sound.codecId = "aac";
    sound.bitrate = 96000;
    Media::File::Track::Video picture;
    picture.index = 1;
    picture.codecId = "h264";
    Media::File::Track::Video cover;
    cover.codecId = "png";
    cover.isImage = true;
    cover.setGeometry(64, 48)->setFrameRate(0, 1)->setAspect(4, 3);

    Media::File film;
    film.setPath("film.mp4")->setFormat("mov,mp4")->setLength(MTime(61500))->setSize(1500000);
    film.addTrack(&picture)->addTrack(&sound);
    Media::File still;
    still.setPath(QString::fromUtf8("写真.png"))->setFormat("png_pipe")->setSize(554)->addTrack(&cover);

    EXPECT_EQ(Host::mediaTable({&film, &still}),
              "File      Format        Length    Size\n"
              "film.mp4  mp4     00:01:01.500  1.5 MB\n"
              "  #0  audio    aac      44100 Hz     stereo         s16  96 kbit/s\n"
              "  #1  video    h264  1920 x 1080  29.97 fps\n"
              "写真.png  png                -   554 B\n"
              "  #0  picture  png       64 x 48             pixels 4:3\n");
}

} // namespace
