// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/Media.h>
#include <EditorModel/persistence/Document.h>
#include <EditorModel/timeline/Composition.h>

#include <QBuffer>

#include <gmock/gmock.h>

#include <type_traits>

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

TEST(MediaFile, GivesItselfBackForEveryChangeOfItsTracks)
{
    const Track::Video picture;
    const Track::Audio sound;
    Media::File file;
    EXPECT_EQ(file.addTrack(&picture), &file);
    EXPECT_EQ(file.addTrack(&sound), &file);
    EXPECT_EQ(file.clearTracks(), &file);
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
