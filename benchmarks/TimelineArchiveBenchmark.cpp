// SPDX-License-Identifier: Apache-2.0
// A timeline of ten thousand clips, saved and loaded: by the library, beside the same records with
// Boost.Serialization's templates, and with a tree of nlohmann json, used by hand.
#include "ArchiveRuns.h"
#include "HandTimeline.h"
#include "HandTimelineJson.h"
#include "PeakMemory.h"
#include "Ratio.h"

#include <EditorModel/effects/Effect.h>
#include <EditorModel/media/File.h>
#include <EditorModel/timeline/Timeline.h>

#include <cstdio>
#include <string>
#include <unordered_set>
#include <utility>
#include <vector>

namespace {

using namespace ArchiveRuns;

constexpr int clipCount = 10000;
constexpr int trackCount = 4;
constexpr int clipsOfAFile = 10;

struct Listed
{
    using Timeline = ::Timeline::Object;
    using Track = ::Timeline::Track;
    using Clip = ::Timeline::Clip;
    using ClipTiming = ::Timeline::ClipTiming;
    using Link = ::Timeline::Link;
    using Effect = ::Effect::Object;
    using File = Media::File;
    using VideoTrack = Media::File::Track::Video;
    using AudioTrack = Media::File::Track::Audio;
};

struct ByHand
{
    using Timeline = Hand::Timeline;
    using Track = Hand::Track;
    using Clip = Hand::Clip;
    using ClipTiming = Hand::ClipTiming;
    using Link = Hand::Link;
    using Effect = Hand::Effect;
    using File = Hand::File;
    using VideoTrack = Hand::VideoTrack;
    using AudioTrack = Hand::AudioTrack;
};

template <class Enumeration>
void setNumber(Enumeration& value, int number)
{
    value = static_cast<Enumeration>(number);
}

/// Each clip has a timing and an effect, shares its file with a few others, and every second one is linked to
/// its neighbour. The addresses of clips ascend, so that both kinds are walked in one order.
template <class Types>
struct Project
{
    std::vector<typename Types::Clip> clips;
    std::vector<typename Types::Track> tracks;
    std::vector<typename Types::Effect> effects;
    std::vector<typename Types::File> files;
    std::vector<typename Types::VideoTrack> videoTracks;
    std::vector<typename Types::AudioTrack> audioTracks;
    typename Types::Timeline timeline;

    Project()
        : clips(clipCount),
          tracks(trackCount),
          effects(clipCount),
          files(clipCount / clipsOfAFile),
          videoTracks(files.size()),
          audioTracks(files.size())
    {
        for (int i = 0; i != trackCount; ++i) {
            setNumber(tracks[std::size_t(i)].type, PrimaryTrack * (i + 1));
            tracks[std::size_t(i)].timeline = &timeline;
            timeline.tracks.push_back(&tracks[std::size_t(i)]);
        }
        for (std::size_t i = 0; i != files.size(); ++i)
            addFile(i);
        for (int i = 0; i != clipCount; ++i)
            addClip(i);
    }

private:
    void addFile(std::size_t i)
    {
        typename Types::File& file = files[i];
        file.path = QStringLiteral("/films/holiday/file number %1.mov").arg(i);
        file.size = (qint64(1) << 32) + qint64(i);
        file.format = "mov";
        file.length = 60000;
        file.isOpened = true;
        videoTracks[i].file = &file;
        videoTracks[i].codecId = "h264";
        videoTracks[i].bitrate = 8000000;
        audioTracks[i].file = &file;
        audioTracks[i].index = 1;
        audioTracks[i].codecId = "aac";
        audioTracks[i].bitrate = 128000;
        file.videoTracks.push_back(&videoTracks[i]);
        file.audioTracks.push_back(&audioTracks[i]);
    }

    void addClip(int i)
    {
        typename Types::Effect& effect = effects[std::size_t(i)];
        effect.id = QStringLiteral("blur");
        effect.uniqueId = QString::number(i);
        effect.tag = QStringLiteral("Blur");
        effect.intensity = 0.25 * i + 0.1;

        typename Types::Clip& clip = clips[std::size_t(i)];
        clip.timeline = &timeline;
        setNumber(clip.type, 1 + i % 2);
        clip.name = QStringLiteral("clip number %1").arg(i);
        clip.file = &files[std::size_t(i / clipsOfAFile)];
        clip.mediaTrack = i % 2;
        clip.sourceDuration = 60000;
        clip.effects.push_back(&effect);

        typename Types::ClipTiming& timing = timeline.clips[&clip];
        timing.track = &tracks[std::size_t(i % trackCount)];
        timing.timestamp = MTime(1000 * (i / trackCount));
        timing.duration = 1000;
        timing.sourcePosition = MTime(i);
        timing.sourceDuration = 60000;
        if (i % 2 == 1) {
            typename Types::Link& link = timeline.links[&clip];
            link.master = &clips[std::size_t(i - 1)];
            link.offset = MTime(i);
        }
    }
};

const Listed::Timeline& listed()
{
    static const Project<Listed> project;
    return project.timeline;
}

const ByHand::Timeline& byHand()
{
    static const Project<ByHand> project;
    return project.timeline;
}

template <class Timeline>
void freeTimeline(const Timeline* timeline)
{
    std::unordered_set<decltype(timeline->clips.begin()->first->file)> files;
    for (const auto& entry : timeline->clips) {
        files.insert(entry.first->file);
        for (const auto* const effect : entry.first->effects)
            delete effect;
        delete entry.first;
    }
    for (const auto* const file : files) {
        for (const auto* const track : file->videoTracks)
            delete track;
        for (const auto* const track : file->audioTracks)
            delete track;
        delete file;
    }
    for (const auto* const track : timeline->tracks)
        delete track;
    delete timeline;
}

} // namespace

// Where the measurements look for them.
namespace Timeline {
static void freeGraph(const Object* timeline)
{
    freeTimeline(timeline);
}
} // namespace Timeline
namespace Hand {
static void freeGraph(const Timeline* timeline)
{
    freeTimeline(timeline);
}
} // namespace Hand

namespace {

std::string storedAsJsonByHand()
{
    return Hand::JsonWriter()(byHand()).dump();
}

Hand::Timeline* loadedFromJsonByHand(const std::string& text)
{
    return Hand::JsonReader()(json::parse(text));
}

/// A floor is one only where it does the whole of the work.
void checkSameSize(benchmark::State& state, const std::string& subject, const std::string& floor)
{
    if (subject.size() != floor.size()) {
        const std::string text = std::to_string(subject.size()) + " bytes, by hand " +
                                 std::to_string(floor.size()) + ": they are not the same work";
        state.SkipWithError(text.c_str());
    }
}

void BinarySave(benchmark::State& state)
{
    checkSameSize(state, stored<binary_oarchive>(listed()), stored<binary_oarchive>(byHand()));
    runSave(state, [] { return stored<binary_oarchive>(listed()); });
}
void BinarySaveByHand(benchmark::State& state)
{
    runSave(state, [] { return stored<binary_oarchive>(byHand()); });
}
void BinaryLoad(benchmark::State& state)
{
    runLoad(state, stored<binary_oarchive>(listed()), &loaded<binary_iarchive, Listed::Timeline>);
}
void BinaryLoadByHand(benchmark::State& state)
{
    runLoad(state, stored<binary_oarchive>(byHand()), &loaded<binary_iarchive, ByHand::Timeline>);
}
void XmlSave(benchmark::State& state)
{
    checkSameSize(state, stored<xml_oarchive>(listed()), stored<xml_oarchive>(byHand()));
    runSave(state, [] { return stored<xml_oarchive>(listed()); });
}
void XmlSaveByHand(benchmark::State& state)
{
    runSave(state, [] { return stored<xml_oarchive>(byHand()); });
}
void XmlLoad(benchmark::State& state)
{
    runLoad(state, stored<xml_oarchive>(listed()), &loaded<xml_iarchive, Listed::Timeline>);
}
void XmlLoadByHand(benchmark::State& state)
{
    runLoad(state, stored<xml_oarchive>(byHand()), &loaded<xml_iarchive, ByHand::Timeline>);
}
void JsonSave(benchmark::State& state)
{
    if (storedAsJson(listed()) != storedAsJsonByHand())
        state.SkipWithError("the tree written by hand is not the archive's");
    runSave(state, [] { return storedAsJson(listed()); });
}
void JsonSaveByHand(benchmark::State& state)
{
    runSave(state, &storedAsJsonByHand);
}
void JsonLoad(benchmark::State& state)
{
    runLoad(state, storedAsJson(listed()), &loadedFromJson<Listed::Timeline>);
}
void JsonLoadByHand(benchmark::State& state)
{
    runLoad(state, storedAsJson(listed()), &loadedFromJsonByHand);
}

BENCHMARK(BinarySave)->Unit(benchmark::kMillisecond);
BENCHMARK(BinarySaveByHand)->Unit(benchmark::kMillisecond);
BENCHMARK(BinaryLoad)->Unit(benchmark::kMillisecond);
BENCHMARK(BinaryLoadByHand)->Unit(benchmark::kMillisecond);
BENCHMARK(XmlSave)->Unit(benchmark::kMillisecond);
BENCHMARK(XmlSaveByHand)->Unit(benchmark::kMillisecond);
BENCHMARK(XmlLoad)->Unit(benchmark::kMillisecond);
BENCHMARK(XmlLoadByHand)->Unit(benchmark::kMillisecond);
BENCHMARK(JsonSave)->Unit(benchmark::kMillisecond);
BENCHMARK(JsonSaveByHand)->Unit(benchmark::kMillisecond);
BENCHMARK(JsonLoad)->Unit(benchmark::kMillisecond);
BENCHMARK(JsonLoadByHand)->Unit(benchmark::kMillisecond);

void documentSave(benchmark::State& state, Document::Form form, Document::Route route)
{
    runDocumentSave(state, listed(), clipCount, form, route);
}

void documentLoad(benchmark::State& state, Document::Form form, Document::Route route)
{
    runDocumentLoad(state, listed(), form, route);
}

#define DOCUMENT_BENCHMARKS(Form, Route)                                                                     \
    BENCHMARK_CAPTURE(documentSave, Form##Route, Document::Form, Document::Route)                            \
        ->Unit(benchmark::kMillisecond);                                                                     \
    BENCHMARK_CAPTURE(documentLoad, Form##Route, Document::Form, Document::Route)                            \
        ->Unit(benchmark::kMillisecond)

DOCUMENT_BENCHMARKS(Binary, Archive);
DOCUMENT_BENCHMARKS(Binary, Stream);
DOCUMENT_BENCHMARKS(Xml, Archive);
DOCUMENT_BENCHMARKS(Xml, Stream);
DOCUMENT_BENCHMARKS(Json, Archive);
DOCUMENT_BENCHMARKS(Json, Stream);

using Ratios::compare;

const bool compared =
    compare("binary archive, save : Boost by hand", "BinarySave", "BinarySaveByHand", 1.2) &&
    compare("binary archive, load : Boost by hand", "BinaryLoad", "BinaryLoadByHand", 1.2) &&
    compare("XML archive, save : Boost by hand", "XmlSave", "XmlSaveByHand", 1.2) &&
    compare("XML archive, load : Boost by hand", "XmlLoad", "XmlLoadByHand", 1.2) &&
    compare("Json archive, save : a tree by hand and its dump", "JsonSave", "JsonSaveByHand", 1.3) &&
    compare("Json archive, load : a parse and reading by hand", "JsonLoad", "JsonLoadByHand", 1.3);

// Memory

/// For each clip, in bytes: the size of what is stored, and what saving and loading take at most beyond what
/// was there before. What is loaded counts into the latter, the text that it is loaded from does not.
template <class Save, class Load>
void printMemory(const char* what, Save save, Load load)
{
    const auto text = save();
    const double saving = double(PeakMemory::growth([&] { benchmark::DoNotOptimize(save()); }));
    const double loading = double(PeakMemory::growth([&] { benchmark::DoNotOptimize(load(text)); }));
    std::printf("%-58s %12.0f %12.0f %12.0f\n", what, double(text.size()) / clipCount, saving / clipCount,
                loading / clipCount);
}

template <class Archive, class Input, class Timeline>
void printBoostMemory(const char* what, const Timeline& timeline)
{
    printMemory(
        what, [&] { return stored<Archive>(timeline); }, &loaded<Input, Timeline>);
}

void printDocumentMemory(const char* what, Document::Form form, Document::Route route)
{
    printMemory(
        what, [=] { return documentOf(listed(), form, route); },
        [](const QByteArray& document) { return graphOf(document).size(); });
}

void printMemory()
{
    // Both graphs are there before anything is measured.
    listed();
    byHand();
    std::printf("%-58s %12s %12s %12s\n", "Bytes for each clip", "stored", "peak, save", "peak, load");
    printBoostMemory<binary_oarchive, binary_iarchive>("binary archive", listed());
    printBoostMemory<binary_oarchive, binary_iarchive>("binary archive, Boost by hand", byHand());
    printBoostMemory<xml_oarchive, xml_iarchive>("XML archive", listed());
    printBoostMemory<xml_oarchive, xml_iarchive>("XML archive, Boost by hand", byHand());
    printMemory(
        "Json archive", [] { return storedAsJson(listed()); }, &loadedFromJson<Listed::Timeline>);
    printMemory("Json archive, a tree by hand", &storedAsJsonByHand, &loadedFromJsonByHand);
    printDocumentMemory("document, binary archive", Document::Binary, Document::Archive);
    printDocumentMemory("document, binary stream", Document::Binary, Document::Stream);
    printDocumentMemory("document, XML archive", Document::Xml, Document::Archive);
    printDocumentMemory("document, XML stream", Document::Xml, Document::Stream);
    printDocumentMemory("document, Json archive", Document::Json, Document::Archive);
    printDocumentMemory("document, Json stream", Document::Json, Document::Stream);
    std::printf("\n");
    std::fflush(stdout);
}

} // namespace

int main(int argc, char** argv)
{
    printMemory();
    keepMemory();
    return Ratios::run(argc, argv);
}
