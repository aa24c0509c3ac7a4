// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/Media.h>
#include <EditorModel/persistence/Document.h>
#include <EditorModel/timeline/Composition.h>

#include <QBuffer>

#include <gmock/gmock.h>

#include <type_traits>
#include <utility>

namespace Media {
class Metadata
{};
} // namespace Media

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using Track = Media::File::Track;

static_assert(std::is_base_of_v<Media::Object, Media::File>);
static_assert(std::is_base_of_v<Serialize::ISerializable, Media::File>);
static_assert(!std::is_base_of_v<PubSub::Object, Track>);
// One persistent root only, or these would be ambiguous.
static_assert(std::is_convertible_v<Track::Audio*, Serialize::ISerializable*>);
static_assert(std::is_convertible_v<Track::Video*, Serialize::ISerializable*>);
static_assert(std::is_convertible_v<Track::Audio*, PubSub::Object*>);
static_assert(std::is_convertible_v<Track::Video*, Media::Video*>);

const Composition::Object* someComposition()
{
    static const Composition::Object composition;
    return &composition;
}

struct Fixture
{
    Media::Metadata metadata;
    Track::Video picture;
    Track::Audio sound;
    Media::File file;

    Fixture()
    {
        file.label = "holiday";
        file.setPath("/films/holiday.mp4")->setSize(5000000000LL)->setLastModified(1600000000123LL);
        file.setFormat("mp4")->setLength(MTime(61000))->setMetadata(&metadata);
        file.setOpening(true)->setOpened(true)->setFailed(true);
        file.addTrack(&picture)->addTrack(&sound);
        file.setUnsupportedCodecs({"prores", "cook"})->setComposition(someComposition());
    }

    void expectEveryFieldSet(const Media::File& other) const
    {
        EXPECT_EQ(other.label, "holiday");
        EXPECT_EQ(other.path, "/films/holiday.mp4");
        EXPECT_EQ(other.size, 5000000000LL);
        EXPECT_EQ(other.lastModified, 1600000000123LL);
        EXPECT_EQ(other.format, "mp4");
        EXPECT_EQ(other.length, MTime(61000));
        EXPECT_EQ(other.metadata, &metadata);
        EXPECT_TRUE(other.isOpening);
        EXPECT_TRUE(other.isOpened);
        EXPECT_TRUE(other.isFailed);
        EXPECT_THAT(other.videoTracks, ElementsAre(&picture));
        EXPECT_THAT(other.audioTracks, ElementsAre(&sound));
        EXPECT_THAT(other.unsupportedCodecs, ElementsAre("prores", "cook"));
        EXPECT_EQ(other.composition, someComposition());
    }
};

void expectDefaults(const Media::File& file)
{
    EXPECT_EQ(file.label, "");
    EXPECT_EQ(file.path, "");
    EXPECT_EQ(file.size, 0);
    EXPECT_EQ(file.lastModified, 0);
    EXPECT_EQ(file.format, "");
    EXPECT_EQ(file.length, MTime());
    EXPECT_EQ(file.metadata, nullptr);
    EXPECT_FALSE(file.isOpening);
    EXPECT_FALSE(file.isOpened);
    EXPECT_FALSE(file.isFailed);
    EXPECT_THAT(file.videoTracks, IsEmpty());
    EXPECT_THAT(file.audioTracks, IsEmpty());
    EXPECT_THAT(file.unsupportedCodecs, IsEmpty());
    EXPECT_EQ(file.composition, nullptr);
}

/// Counts the tracks that live.
struct CountedTrack : Track::Video
{
    explicit CountedTrack(int& living) : count(living) { ++count; }
    ~CountedTrack() override { --count; }
    int& count;
};

TEST(MediaFile, IsClosedAndEmptyByDefault)
{
    expectDefaults(Media::File());
}

TEST(MediaFile, SettersStoreAndReturnTheObject)
{
    Fixture fixture;
    Media::File& file = fixture.file;
    fixture.expectEveryFieldSet(file);
    EXPECT_EQ(file.setPath("x"), &file);
    EXPECT_EQ(file.setSize(-1), &file);
    EXPECT_EQ(file.setLastModified(-2), &file);
    EXPECT_EQ(file.setFormat(""), &file);
    EXPECT_EQ(file.setLength(MTime(-3)), &file);
    EXPECT_EQ(file.setMetadata(nullptr), &file);
    EXPECT_EQ(file.setOpening(false), &file);
    EXPECT_EQ(file.setOpened(false), &file);
    EXPECT_EQ(file.setFailed(false), &file);
    EXPECT_EQ(file.setUnsupportedCodecs({}), &file);
    EXPECT_EQ(file.setComposition(nullptr), &file);
    EXPECT_EQ(file.addTrack(&fixture.picture), &file);
    EXPECT_EQ(file.addTrack(&fixture.sound), &file);
    EXPECT_EQ(file.clearTracks(), &file);
    EXPECT_EQ(file.size, -1);
    EXPECT_EQ(file.lastModified, -2);
    EXPECT_EQ(file.length, MTime(-3));
    EXPECT_EQ(file.metadata, nullptr);
    EXPECT_EQ(file.composition, nullptr);
}

TEST(MediaFile, CopiesWhole)
{
    const Fixture fixture;
    const Media::File copy(fixture.file);
    fixture.expectEveryFieldSet(copy);

    Media::File assigned;
    EXPECT_EQ(&(assigned = fixture.file), &assigned);
    fixture.expectEveryFieldSet(assigned);
    const Media::File& itself = assigned;
    assigned = itself;
    fixture.expectEveryFieldSet(assigned);

    Media::File moved(std::move(assigned));
    fixture.expectEveryFieldSet(moved);
    Media::File target;
    target = std::move(moved);
    fixture.expectEveryFieldSet(target);
}

TEST(MediaFile, ForgetsEverythingWithoutDestroyingItsTracks)
{
    int living = 0;
    Fixture fixture;
    {
        const CountedTrack track(living);
        fixture.file.addTrack(&track);
        EXPECT_EQ(fixture.file.toDefaults(), &fixture.file);
        EXPECT_EQ(living, 1);
    }
    expectDefaults(fixture.file);
}

TEST(MediaFile, ListsATrackAsOftenAsItIsAddedAndInThatOrder)
{
    Track::Video first, second;
    first.index = 7;
    second.index = 1;
    Track::Audio sound;
    Media::File file;
    file.addTrack(&first)->addTrack(&second)->addTrack(&first);
    file.addTrack(&sound)->addTrack(&sound);
    file.addTrack(static_cast<const Track::Audio*>(nullptr));
    EXPECT_THAT(file.videoTracks, ElementsAre(&first, &second, &first));
    EXPECT_THAT(file.audioTracks, ElementsAre(&sound, &sound, nullptr));
}

TEST(MediaFile, LetsGoOfItsTracksAndNothingElse)
{
    const Fixture fixture;
    Media::File file = fixture.file;
    file.clearTracks();
    EXPECT_THAT(file.videoTracks, IsEmpty());
    EXPECT_THAT(file.audioTracks, IsEmpty());
    file.addTrack(&fixture.picture)->addTrack(&fixture.sound);
    fixture.expectEveryFieldSet(file);
}

TEST(MediaFileTrack, BelongsToNoFileByDefault)
{
    const Track track;
    EXPECT_EQ(track.file, nullptr);
    EXPECT_EQ(track.index, 0);
    EXPECT_EQ(track.codecId, "");
    EXPECT_EQ(track.bitrate, 0);
    EXPECT_FALSE(Track::Video().isImage);
    EXPECT_EQ(Track::Video().width, 1920);
    EXPECT_EQ(Track::Audio().sampleRate, 44100);
}

template <class T>
T trackWithEveryFieldSet(const Media::File& file)
{
    T track;
    track.file = &file;
    track.index = 3;
    track.codecId = "codec";
    track.bitrate = 128000;
    return track;
}

void expectEveryFieldSet(const Track& track, const Media::File& file)
{
    EXPECT_EQ(track.file, &file);
    EXPECT_EQ(track.index, 3);
    EXPECT_EQ(track.codecId, "codec");
    EXPECT_EQ(track.bitrate, 128000);
}

TEST(MediaFileTrack, CopiesWhole)
{
    const Media::File file;
    const Track track = trackWithEveryFieldSet<Track>(file);
    Track assigned;
    assigned = track;
    const Track& itself = assigned;
    assigned = itself;
    expectEveryFieldSet(assigned, file);
    expectEveryFieldSet(Track(std::move(assigned)), file);
}

TEST(MediaFileTrack, CopiesWholeWithItsSound)
{
    const Media::File file;
    auto track = trackWithEveryFieldSet<Track::Audio>(file);
    track.label = "commentary";
    track.setChannelLayout(Norvel::Conf::ChannelLayout(1))->setSampleRate(8000);
    track.setSampleFormat(Norvel::Conf::SampleFormats(3));
    const auto expectWhole = [&file](const Track::Audio& other) {
        expectEveryFieldSet(other, file);
        EXPECT_EQ(other.label, "commentary");
        EXPECT_EQ(other.channelLayout, 1);
        EXPECT_EQ(other.sampleRate, 8000);
        EXPECT_EQ(other.sampleFormat, 3);
    };
    Track::Audio assigned;
    assigned = track;
    expectWhole(assigned);
    const Track::Audio& itself = assigned;
    assigned = itself;
    expectWhole(assigned);
    expectWhole(Track::Audio(std::move(assigned)));
}

TEST(MediaFileTrack, CopiesWholeWithItsPicture)
{
    const Media::File file;
    auto track = trackWithEveryFieldSet<Track::Video>(file);
    track.isImage = true;
    track.label = "cover";
    track.setGeometry(300, 200)->setFrameRate(1, 2)->setAspect(3, 4)->setExportMode(true)->setOpaque(false);
    const auto expectWhole = [&file](const Track::Video& other) {
        expectEveryFieldSet(other, file);
        EXPECT_TRUE(other.isImage);
        EXPECT_EQ(other.label, "cover");
        EXPECT_EQ(other.width, 300);
        EXPECT_EQ(other.height, 200);
        EXPECT_EQ(other.frameRateN, 1);
        EXPECT_EQ(other.frameRateD, 2);
        EXPECT_EQ(other.aspectX, 3);
        EXPECT_EQ(other.aspectY, 4);
        EXPECT_TRUE(other.exportMode);
        EXPECT_FALSE(other.opaque);
    };
    Track::Video assigned;
    assigned = track;
    expectWhole(assigned);
    const Track::Video& itself = assigned;
    assigned = itself;
    expectWhole(assigned);
    expectWhole(Track::Video(std::move(assigned)));
}

/// In the form that is given, with the text of its file replaced.
Document::Graph trackWithFile(Document::Form form, Document::Route route, const char* oldText,
                              const char* newText)
{
    Track track;
    track.index = 3;
    QBuffer buffer;
    buffer.open(QIODevice::ReadWrite);
    Document::save(buffer, track, form, route);
    EXPECT_EQ(buffer.data().count(oldText), 1) << buffer.data().toStdString();
    buffer.buffer().replace(oldText, newText);
    buffer.seek(0);
    return Document::load(buffer);
}

TEST(MediaFileTrack, ReadsAnObjectThatIsNoFileAsNone)
{
    const auto archive = trackWithFile(Document::Json, Document::Archive, R"("file": null)",
                                       R"("file": {"$meta": {"class": "Resource::Timing", "id": 9},
                                       "mode": 0, "intro": 0, "outro": 0, "loopMinCount": 0})");
    const auto stream = trackWithFile(Document::Xml, Document::Stream, R"(<file null="true"/>)",
                                      R"(<file class="Resource::Timing" id="9"><mode>0</mode><intro>0</intro>
                                      <outro>0</outro><loopMinCount>0</loopMinCount></file>)");
    for (const Document::Graph* const graph : {&archive, &stream}) {
        const Track* const loaded = graph->rootAs<Track>();
        ASSERT_NE(loaded, nullptr);
        EXPECT_EQ(loaded->file, nullptr);
        EXPECT_EQ(loaded->index, 3);
    }
}

} // namespace
