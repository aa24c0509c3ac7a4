// SPDX-License-Identifier: Apache-2.0
// A timeline of ten thousand clips, saved and loaded: by the library, beside the same records with
// Boost.Serialization's templates, and with a tree of nlohmann json, used by hand.
#include "ArchiveRuns.h"
#include "HandTimeline.h"
#include "HandTimelineJson.h"
#include "LongTimeline.h"
#include "PeakMemory.h"
#include "Ratio.h"

#include <cstdio>
#include <string>
#include <utility>

namespace {

using namespace ArchiveRuns;
using namespace LongTimelines;

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

const Listed::Timeline& listed()
{
    static const LongTimeline<Listed> project;
    return project.timeline;
}

const ByHand::Timeline& byHand()
{
    static const LongTimeline<ByHand> project;
    return project.timeline;
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
