// SPDX-License-Identifier: Apache-2.0
#include "tests/host/shared/Samples.h"

#include "host/media/MediaProbe.h"

#include <QDateTime>
#include <QFileInfo>

#include <gmock/gmock.h>

#include <cstdlib>

#include <unistd.h>

extern "C" {
#include <libavutil/samplefmt.h>
}

namespace {

using namespace HostTests;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;

class MediaProbe : public testing::Test
{
protected:
    void SetUp() override { Host::showMediaLibraryLog(false); }

    static Host::MediaDescription describe(const QString& path)
    {
        Host::MediaResult result = Host::probeMedia(path);
        if (const auto* const failure = std::get_if<Host::MediaFailure>(&result)) {
            throw std::runtime_error(path.toStdString() + " " + failure->reason.toStdString());
        }
        return std::get<Host::MediaDescription>(result);
    }

    static std::string reason(const QString& path)
    {
        const Host::MediaResult result = Host::probeMedia(path);
        const auto* const failure = std::get_if<Host::MediaFailure>(&result);
        return failure ? failure->reason.toStdString() : "is described";
    }

    static void expectLength(MTime expected, MTime actual, MTime codecFrame)
    {
        EXPECT_GE(actual, expected);
        EXPECT_LE(actual, expected + codecFrame);
    }

    Folder folder;
};

TEST_F(MediaProbe, DescribesVideoWithSound)
{
    const Host::MediaDescription film = describe(sample("film.mp4"));
    const QFileInfo info(sample("film.mp4"));
    EXPECT_EQ(film.size, info.size());
    EXPECT_EQ(film.lastModified, info.lastModified().toMSecsSinceEpoch());
    EXPECT_THAT(film.format, HasSubstr("mp4"));
    // A frame of AAC has 1024 samples.
    expectLength(MTime(2000), film.length, MTime(1024 * 1000 / 48000 + 1));
    EXPECT_THAT(film.unsupportedCodecs, IsEmpty());

    ASSERT_THAT(film.videoTracks, SizeIs(1));
    const auto& video = film.videoTracks.front();
    EXPECT_EQ(video.file, nullptr);
    EXPECT_EQ(video.index, 0);
    EXPECT_EQ(video.codecId, "mpeg4");
    EXPECT_GT(video.bitrate, 0);
    EXPECT_FALSE(video.isImage);
    EXPECT_TRUE(video.opaque);
    EXPECT_EQ(video.width, 320);
    EXPECT_EQ(video.height, 240);
    EXPECT_EQ(video.frameRateN, 25);
    EXPECT_EQ(video.frameRateD, 1);
    EXPECT_EQ(video.aspectX, 1);
    EXPECT_EQ(video.aspectY, 1);

    ASSERT_THAT(film.audioTracks, SizeIs(1));
    const auto& audio = film.audioTracks.front();
    EXPECT_EQ(audio.index, 1);
    EXPECT_EQ(audio.codecId, "aac");
    EXPECT_NEAR(audio.bitrate, 96000, 9600);
    EXPECT_EQ(audio.sampleRate, 48000);
    EXPECT_EQ(audio.channelLayout, 2);
    EXPECT_EQ(audio.sampleFormat, AV_SAMPLE_FMT_FLTP);
}

TEST_F(MediaProbe, ExchangesWidthAndHeightOfAPictureThatIsShownOnItsSide)
{
    const auto quarter = describe(sample("film-quarter-turn.mp4")).videoTracks.at(0);
    EXPECT_EQ(quarter.width, 240);
    EXPECT_EQ(quarter.height, 320);
    const auto half = describe(sample("film-half-turn.mp4")).videoTracks.at(0);
    EXPECT_EQ(half.width, 320);
    EXPECT_EQ(half.height, 240);
}

TEST_F(MediaProbe, TellsTheShapeOfPixels)
{
    const auto wide = describe(sample("wide-pixels.mov")).videoTracks.at(0);
    EXPECT_EQ(wide.width, 180);
    EXPECT_EQ(wide.height, 144);
    EXPECT_EQ(wide.aspectX, 64);
    EXPECT_EQ(wide.aspectY, 45);
}

TEST_F(MediaProbe, TurnsThePixelsWithThePicture)
{
    const auto turned = describe(sample("wide-pixels-quarter-turn.mov")).videoTracks.at(0);
    EXPECT_EQ(turned.width, 144);
    EXPECT_EQ(turned.height, 180);
    EXPECT_EQ(turned.aspectX, 45);
    EXPECT_EQ(turned.aspectY, 64);
}

TEST_F(MediaProbe, KeepsTheFrameRateAsAFraction)
{
    const Host::MediaDescription cinema = describe(sample("cinema.mkv"));
    EXPECT_EQ(cinema.videoTracks.at(0).frameRateN, 24000);
    EXPECT_EQ(cinema.videoTracks.at(0).frameRateD, 1001);
    // 48 frames of 1001/24000 s.
    EXPECT_EQ(cinema.length, MTime(2002));
}

TEST_F(MediaProbe, KnowsNoBitrateOfVideoWhoseRateVaries)
{
    const auto video = describe(sample("variable-rate.mpg")).videoTracks.at(0);
    EXPECT_EQ(video.codecId, "mpeg1video");
    EXPECT_EQ(video.bitrate, 0);
}

TEST_F(MediaProbe, ListsTheTracksOfEachKindInTheOrderOfTheFile)
{
    const Host::MediaDescription tracks = describe(sample("tracks.mkv"));
    ASSERT_THAT(tracks.videoTracks, SizeIs(2));
    EXPECT_EQ(tracks.videoTracks[0].index, 0);
    EXPECT_EQ(tracks.videoTracks[0].codecId, "mpeg4");
    EXPECT_EQ(tracks.videoTracks[0].width, 160);
    EXPECT_EQ(tracks.videoTracks[0].height, 120);
    EXPECT_EQ(tracks.videoTracks[0].frameRateN, 25);
    EXPECT_EQ(tracks.videoTracks[1].index, 2);
    EXPECT_EQ(tracks.videoTracks[1].codecId, "ffv1");
    EXPECT_EQ(tracks.videoTracks[1].width, 96);
    EXPECT_EQ(tracks.videoTracks[1].height, 64);
    EXPECT_EQ(tracks.videoTracks[1].frameRateN, 10);
    EXPECT_EQ(tracks.videoTracks[1].frameRateD, 1);

    ASSERT_THAT(tracks.audioTracks, SizeIs(3));
    EXPECT_EQ(tracks.audioTracks[0].index, 1);
    EXPECT_EQ(tracks.audioTracks[0].codecId, "pcm_s16le");
    EXPECT_EQ(tracks.audioTracks[0].sampleRate, 44100);
    EXPECT_EQ(tracks.audioTracks[0].channelLayout, 1);
    EXPECT_EQ(tracks.audioTracks[0].sampleFormat, AV_SAMPLE_FMT_S16);
    EXPECT_EQ(tracks.audioTracks[0].bitrate, 44100 * 16);
    EXPECT_EQ(tracks.audioTracks[1].index, 3);
    EXPECT_EQ(tracks.audioTracks[1].codecId, "flac");
    EXPECT_EQ(tracks.audioTracks[1].sampleRate, 48000);
    EXPECT_EQ(tracks.audioTracks[1].channelLayout, 2);
    EXPECT_EQ(tracks.audioTracks[2].index, 4);
    EXPECT_EQ(tracks.audioTracks[2].codecId, "ac3");
    EXPECT_EQ(tracks.audioTracks[2].channelLayout, 6);
}

TEST_F(MediaProbe, DescribesSoundAlone)
{
    const Host::MediaDescription speech = describe(sample("speech.wav"));
    EXPECT_EQ(speech.format, "wav");
    EXPECT_EQ(speech.length, MTime(1500));
    EXPECT_THAT(speech.videoTracks, IsEmpty());
    ASSERT_THAT(speech.audioTracks, SizeIs(1));
    EXPECT_EQ(speech.audioTracks[0].sampleRate, 44100);
    EXPECT_EQ(speech.audioTracks[0].channelLayout, 1);
    EXPECT_EQ(speech.audioTracks[0].bitrate, 44100 * 16);

    const Host::MediaDescription surround = describe(sample("surround.flac"));
    EXPECT_EQ(surround.format, "flac");
    EXPECT_EQ(surround.length, MTime(1000));
    ASSERT_THAT(surround.audioTracks, SizeIs(1));
    EXPECT_EQ(surround.audioTracks[0].sampleRate, 48000);
    EXPECT_EQ(surround.audioTracks[0].channelLayout, 6);
    EXPECT_EQ(surround.audioTracks[0].sampleFormat, AV_SAMPLE_FMT_S16);
}

TEST_F(MediaProbe, DescribesPicturesWithoutLengthAndRate)
{
    const struct
    {
        QString path;
        std::string codec;
        int width;
        int height;
        bool opaque;
    } pictures[] = {{sample("picture.png"), "png", 64, 48, true},
                    {sample("glass.png"), "png", 64, 48, false},
                    {sample("picture.jpg"), "mjpeg", 80, 60, true},
                    // Has nothing at its start that tells the format; known by its name.
                    {sample("picture.tga"), "targa", 64, 48, true},
                    // Found by their content alone, and no series of pictures.
                    {folder.copy("picture.png", "wrong-ending.mp4"), "png", 64, 48, true},
                    {folder.copy("picture.jpg", "100%03d.jpg"), "mjpeg", 80, 60, true}};
    for (const auto& expected : pictures) {
        SCOPED_TRACE(expected.path.toStdString());
        const Host::MediaDescription picture = describe(expected.path);
        EXPECT_EQ(picture.length, MTime());
        EXPECT_THAT(picture.audioTracks, IsEmpty());
        ASSERT_THAT(picture.videoTracks, SizeIs(1));
        const auto& track = picture.videoTracks.front();
        EXPECT_TRUE(track.isImage);
        EXPECT_EQ(track.codecId, expected.codec);
        EXPECT_EQ(track.width, expected.width);
        EXPECT_EQ(track.height, expected.height);
        EXPECT_EQ(track.opaque, expected.opaque);
        EXPECT_EQ(track.frameRateN, 0);
        EXPECT_EQ(track.frameRateD, 1);
    }
}

TEST_F(MediaProbe, TellsTheFormatOfAPictureByItsContent)
{
    EXPECT_EQ(describe(sample("picture.jpg")).format, "jpeg_pipe");
    EXPECT_EQ(describe(folder.copy("picture.png", "picture.jpg")).format, "png_pipe");
}

TEST_F(MediaProbe, TakesAFileNamedLikeASeriesForItself)
{
    folder.copy("picture.tga", "1.tga");
    const auto picture = describe(folder.copy("picture.jpg", "%d.tga")).videoTracks.at(0);
    EXPECT_EQ(picture.width, 80);
    EXPECT_EQ(picture.height, 60);
    EXPECT_EQ(reason(folder.write("%d.tga", "no picture")),
              "is damaged or incomplete: a picture without a size");
}

TEST_F(MediaProbe, TakesAMovingPictureForVideo)
{
    const Host::MediaDescription moving = describe(sample("moving.gif"));
    EXPECT_EQ(moving.length, MTime(1200));
    ASSERT_THAT(moving.videoTracks, SizeIs(1));
    EXPECT_FALSE(moving.videoTracks[0].isImage);
    EXPECT_EQ(moving.videoTracks[0].frameRateN, 10);
}

TEST_F(MediaProbe, TakesCoverArtForAPicture)
{
    const Host::MediaDescription song = describe(sample("song.mp3"));
    // A frame of MP3 has 1152 samples; the encoder adds up to two.
    expectLength(MTime(2000), song.length, MTime(2 * 1152 * 1000 / 44100 + 1));
    ASSERT_THAT(song.audioTracks, SizeIs(1));
    EXPECT_EQ(song.audioTracks[0].codecId, "mp3");
    EXPECT_EQ(song.audioTracks[0].bitrate, 128000);
    ASSERT_THAT(song.videoTracks, SizeIs(1));
    EXPECT_TRUE(song.videoTracks[0].isImage);
    EXPECT_EQ(song.videoTracks[0].width, 80);
    EXPECT_EQ(song.videoTracks[0].height, 60);
}

TEST_F(MediaProbe, FindsFilesWhateverTheirNames)
{
    for (const QString& name :
         {QString("with spaces.wav"), QString("\"quoted\" 'name'.wav"), QString::fromUtf8("写真 фильм é.wav"),
          QString("concat:a.wav"), QString("http:b.wav"), QString("-v.wav"), QString("line\nbreak.wav")}) {
        SCOPED_TRACE(name.toStdString());
        EXPECT_EQ(describe(folder.copy("speech.wav", name)).length, MTime(1500));
    }
}

/// The film with its sound marked as one that FFmpeg knows, but cannot decode.
QByteArray filmWithUnknownSound()
{
    QByteArray content = contentOf(sample("film.mp4"));
    const int entry = content.indexOf("mp4a");
    const int description = content.indexOf("esds", entry);
    return content.replace(entry, 4, "mhm1").replace(description, 4, "free");
}

TEST_F(MediaProbe, NamesTheCodecsOfTracksThatItLeavesOut)
{
    const Host::MediaDescription film = describe(folder.write("unknown.mp4", filmWithUnknownSound()));
    EXPECT_THAT(film.videoTracks, SizeIs(1));
    EXPECT_THAT(film.audioTracks, IsEmpty());
    EXPECT_THAT(film.unsupportedCodecs, ElementsAre("mpegh_3d_audio"));
}

TEST_F(MediaProbe, TellsWhyThereIsNothingToOpen)
{
    EXPECT_EQ(reason(folder.path("missing.mp4")), "does not exist");
    EXPECT_EQ(reason(QString()), "has no name");
    EXPECT_EQ(reason(folder.path()), "is a folder");
    EXPECT_EQ(reason(folder.write("empty.mp4", QByteArray())), "is empty");
    EXPECT_EQ(reason("/dev/null"), "is not a regular file");
    ASSERT_TRUE(QFile::link(folder.path("missing.mp4"), folder.path("link.mp4")));
    EXPECT_EQ(reason(folder.path("link.mp4")), "is a link to a file that does not exist");
}

TEST_F(MediaProbe, TellsThatAFileHoldsNoMedia)
{
    EXPECT_EQ(reason(folder.write("letter.txt", "Dear Sir or Madam,\n")),
              "is in no media format that is known here");
    EXPECT_EQ(reason(folder.write("zeros.dat", QByteArray(5000, '\0'))),
              "is in no media format that is known here");
    EXPECT_EQ(reason(folder.write("hello.mp4", "hello")), "is in no media format that is known here");
    EXPECT_EQ(reason(folder.write("titles.srt", "1\n00:00:00,000 --> 00:00:01,000\nHello\n")),
              "holds neither picture nor sound");
}

TEST_F(MediaProbe, TellsThatAFileIsDamaged)
{
    EXPECT_EQ(reason(folder.copy("film.mp4", "no-index.mp4", 0.5)),
              "looks like QuickTime / MOV but is damaged or incomplete");
    EXPECT_EQ(reason(folder.copy("long.mkv", "half.mkv", 0.5)),
              "is cut off: it ends long before its header says");
    EXPECT_THAT(reason(folder.copy("picture.png", "half.png", 0.05)), HasSubstr("damaged or incomplete"));
}

TEST_F(MediaProbe, OpensWhatLacksLittleOfItsEnd)
{
    EXPECT_EQ(describe(folder.copy("long.mkv", "almost-whole.mkv", 0.9)).length, MTime(4000));
}

/// Root may read everything: acts as nobody where the tests run as root.
class AsOrdinaryUser
{
public:
    AsOrdinaryUser() : m_wasRoot(geteuid() == 0) { isOrdinary = !m_wasRoot || seteuid(65534) == 0; }
    ~AsOrdinaryUser()
    {
        if (m_wasRoot && isOrdinary && seteuid(0) != 0) {
            std::abort();
        }
    }

    bool isOrdinary = false;

private:
    const bool m_wasRoot;
};

TEST_F(MediaProbe, TellsThatAFileMayNotBeRead)
{
    const QString file = folder.copy("speech.wav", "secret.wav");
    ASSERT_TRUE(QFile::setPermissions(file, QFile::Permissions()));
    const Folder closed;
    const QString inside = closed.copy("speech.wav", "inside.wav");
    ASSERT_TRUE(QFile::setPermissions(folder.path(), QFile::Permissions(0x5555)));
    ASSERT_TRUE(QFile::setPermissions(closed.path(), QFile::Permissions()));
    {
        const AsOrdinaryUser user;
        EXPECT_TRUE(user.isOrdinary) << "root cannot act as somebody else here";
        EXPECT_EQ(reason(file), "may not be read: permission denied");
        EXPECT_EQ(reason(inside), "may not be read: permission denied");
    }
    ASSERT_TRUE(QFile::setPermissions(folder.path(), QFile::Permissions(0x7755)));
    ASSERT_TRUE(QFile::setPermissions(closed.path(), QFile::Permissions(0x7755)));
}

TEST_F(MediaProbe, NeverThrowsOverDamagedFilesNorDescribesTracksOfNoSize)
{
    for (const char* name :
         {"film.mp4", "tracks.mkv", "song.mp3", "surround.flac", "picture.png", "moving.gif"}) {
        const QByteArray whole = contentOf(sample(name));
        for (int round = 0; round != 12; ++round) {
            QByteArray damaged = whole;
            for (int i = round; i < std::min(damaged.size(), 4000); i += 37 + round) {
                damaged[i] = static_cast<char>(damaged[i] ^ (0x55 + round));
            }
            const Host::MediaResult result = Host::probeMedia(folder.write("damaged", damaged));
            if (const auto* const description = std::get_if<Host::MediaDescription>(&result)) {
                EXPECT_FALSE(description->videoTracks.empty() && description->audioTracks.empty());
                for (const auto& track : description->videoTracks) {
                    EXPECT_GT(track.width * track.height, 0);
                }
            } else {
                EXPECT_FALSE(std::get<Host::MediaFailure>(result).reason.contains('\n'));
            }
        }
    }
}

} // namespace
