// SPDX-License-Identifier: Apache-2.0
#include "Command.h"
#include "tests/host/shared/SampleTimeline.h"
#include "tests/host/shared/Samples.h"

#include "host/analysis/TrackingStore.h"
#include "host/project/GraphComparison.h"
#include "host/project/ProjectStore.h"

#include <EditorModel/effects/Effect.h>
#include <EditorModel/library/Import.h>
#include <EditorModel/library/PersistentItem.h>
#include <EditorModel/library/UserObject.h>
#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/persistence/Document.h>
#include <EditorModel/types/Image.h>

#include <QDir>
#include <QFileInfo>
#include <QImage>

#include <gmock/gmock.h>

#include <limits>
#include <map>

namespace {

using namespace HostTests;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::StartsWith;
using Timeline::Clip;

constexpr double infinity = std::numeric_limits<double>::infinity();

/// What is easily lost: times beyond 32 bits, numbers that no text has, shared objects, cycles and odd texts.
class Everything
{
public:
    Everything()
    {
        content.timeline = &sample.timeline;
        content.userCollection = &collection;
        content.resourceTable = &table;
        content.portable = true;
        const Timeline::Track* const primary = sample.addTrack(PrimaryTrack);
        const Timeline::Track* const audio = sample.addTrack(AudioTrack);
        Clip* const late = sample.addClip("late", Clip::VideoClip, primary, qint64(1) << 40, qint64(1) << 33);
        Clip* const next = sample.addClip(QString::fromUtf8("ü\n\t\"<&>"), Clip::VideoClip, primary,
                                          (qint64(1) << 40) + (qint64(1) << 33), 3000);
        Clip* const slave = sample.addClip("slave", Clip::AudioClip, audio, 0, 1);
        sample.addTransition("dissolve", late, next, 1000);
        sample.timeline.addLink(late, slave, -(qint64(1) << 35));
        sample.timeline.addTrackingLink(slave,
                                        Timeline::TrackingLinkInfo({late, "face"}, QPointF(-infinity, 0.1)));
        gain.addKeyValue(0.1, infinity)->addKeyValue(std::numeric_limits<double>::denorm_min(), -0.0);
        gain.defaultValue = std::numeric_limits<double>::quiet_NaN();
        late->setVolumeEnvelope(&gain)->addMotionTracking("face")->addEffect(&effect)->addEffect(&effect);
        next->setVolumeEnvelope(&gain)->setNestedTimeline(&sample.timeline);
        collection.addItem(&item);
    }

    SampleTimeline sample;
    VolumeEnvelope gain;
    Effect::Object effect;
    Import::Object item;
    EditorCollection::UserObject collection;
    ResourceTable::Object table;
    Project::Content content;
};

using Graphs = std::deque<const Serialize::ISerializable*>;

std::string textOf(const Graphs& roots)
{
    return Host::canonicalText(Host::recordOf(roots));
}

std::string textOf(const Document::Graph& graph)
{
    return textOf(Graphs(graph.roots().begin(), graph.roots().end()));
}

void expectDone(const Outcome& outcome)
{
    EXPECT_EQ(outcome.exitCode, 0);
    EXPECT_THAT(outcome.output, IsEmpty());
    EXPECT_THAT(outcome.errors, IsEmpty());
}

class Conversion : public testing::TestWithParam<std::pair<const char*, const char*>>
{
protected:
    QString input() const { return folder.path(QString("in.") + GetParam().first); }
    QString output() const { return folder.path(QString("out.") + GetParam().second); }

    const Folder folder;
    Everything everything;
};
INSTANTIATE_TEST_SUITE_P(
    Between, Conversion,
    testing::Values(std::pair("json", "xml"), std::pair("json", "bin"), std::pair("xml", "json"),
                    std::pair("xml", "bin"), std::pair("bin", "json"), std::pair("bin", "xml"),
                    std::pair("json", "json"), std::pair("xml", "xml"), std::pair("bin", "bin")),
    [](const auto& forms) { return std::string(forms.param.first) + "_" + forms.param.second; });

TEST_P(Conversion, OfAProjectLosesNothing)
{
    Host::ProjectStore::save(everything.content, input());
    const QByteArray before = contentOf(input());
    expectDone(editormodel({"convert", input(), output()}));
    EXPECT_EQ(contentOf(input()), before);
    EXPECT_TRUE(Host::ProjectStore::isProject(output()));
    const Host::OpenedProject converted = Host::ProjectStore::open(output());
    EXPECT_EQ(textOf(converted.graph()), textOf({&everything.content}));
    EXPECT_TRUE(converted.content().portable);
}

TEST_P(Conversion, OfADocumentLosesNothing)
{
    QImage image(3, 2, QImage::Format_ARGB32);
    image.fill(qRgba(10, 20, 30, 255));
    image.setPixel(1, 1, qRgba(200, 100, 50, 255));
    EditorCollection::PersistentItem<Effect::Object> item;
    item.item = &everything.effect;
    item.preview = std::make_shared<const Types::Image>(QPixmap::fromImage(image));
    const Graphs roots = {&everything.sample.timeline, nullptr, &item, &everything.effect};
    Document::saveFile(input(), roots, *Document::formOfPath(input()), Document::Stream);
    expectDone(editormodel({"convert", input(), output()}));
    EXPECT_FALSE(Host::ProjectStore::isProject(output()));
    const Document::Graph converted = Document::loadFile(output(), Document::ForeignDocuments);
    EXPECT_EQ(textOf(converted), textOf(roots));
    ASSERT_EQ(converted.roots().size(), 4u);
    const auto* const copy =
        dynamic_cast<const EditorCollection::PersistentItem<Effect::Object>*>(converted.roots()[2]);
    ASSERT_TRUE(copy && copy->preview);
    EXPECT_EQ(copy->preview->toImage().pixel(1, 1), qRgba(200, 100, 50, 255));
    EXPECT_EQ(copy->item, dynamic_cast<const Effect::Object*>(converted.roots()[3]));
}

TEST_P(Conversion, ReadsArchivesOfOnesOwn)
{
    // An archive keeps times in 32 bits.
    SampleTimeline sample;
    sample.addClip("a", Clip::VideoClip, sample.addTrack(PrimaryTrack), 100, 1000);
    Document::saveFile(input(), {&sample.timeline}, *Document::formOfPath(input()), Document::Archive);
    const bool isJson = input().endsWith("json");
    EXPECT_EQ(editormodel({"convert", input(), output()}).exitCode, isJson ? 0 : 1);
    expectDone(editormodel({"convert", "--own", "--force", input(), output()}));
    EXPECT_EQ(textOf(Document::loadFile(output(), Document::ForeignDocuments)), textOf({&sample.timeline}));
}

TEST(ConvertCommand, TakesTheTrackingsOfAProjectAlong)
{
    const Folder folder;
    const Everything everything;
    {
        Host::TrackingStore store;
        MotionTracking::Data face("face");
        face.frames[MTime(qint64(1) << 40)].left = 0.5;
        store.put(face);
        Host::ProjectStore::save(everything.content, folder.path("in.json"));
    }
    expectDone(editormodel({"convert", "in.json", "out.bin"}, folder.path()));
    Host::TrackingStore store;
    Host::ProjectStore::open(folder.path("out.bin"));
    ASSERT_TRUE(store.find("face"));
    EXPECT_EQ(store.find("face")->frames.at(MTime(qint64(1) << 40)).left, 0.5);

    const QString place = Host::TrackingStore::folderOf(folder.path("in.json")) + "/t-face.json";
    QFile::resize(place, 20);
    const Outcome refused = editormodel({"convert", "in.json", "other.bin"}, folder.path());
    EXPECT_EQ(refused.exitCode, 1);
    EXPECT_THAT(refused.errors, HasSubstr("t-face.json: "));
    EXPECT_FALSE(QFileInfo::exists(folder.path("other.bin")));
}

TEST(ConvertCommand, ReplacesAFileOnlyByForce)
{
    const Folder folder;
    const Everything everything;
    Host::ProjectStore::save(everything.content, folder.path("in.json"));
    folder.write("out.xml", "mine");
    const QByteArray before = contentOf(folder.path("in.json"));

    const Outcome refused = editormodel({"convert", "in.json", "out.xml"}, folder.path());
    EXPECT_EQ(refused.exitCode, 1);
    EXPECT_EQ(refused.errors, "out.xml: exists already; --force replaces it\n");
    EXPECT_EQ(contentOf(folder.path("out.xml")), "mine");
    const Outcome itself = editormodel({"convert", "in.json", "./in.json"}, folder.path());
    EXPECT_EQ(itself.exitCode, 1);
    EXPECT_EQ(itself.errors, "./in.json: is what is to be converted; --force replaces it\n");
    EXPECT_EQ(contentOf(folder.path("in.json")), before);

    expectDone(editormodel({"convert", "--force", "in.json", "out.xml"}, folder.path()));
    EXPECT_TRUE(Host::ProjectStore::isProject(folder.path("out.xml")));
    expectDone(editormodel({"convert", "--force", "in.json", "in.json"}, folder.path()));
    EXPECT_EQ(textOf(Host::ProjectStore::open(folder.path("in.json")).graph()),
              textOf({&everything.content}));
}

/// The projects one.json and two.json, each with trackings of its own and one that has the name of the
/// other's.
class ReplacingConversion : public testing::Test
{
protected:
    ReplacingConversion()
    {
        save("one.json", {{"face", 0.125}, {"shared", 0.25}});
        save("two.json", {{"hand", 0.5}, {"shared", 0.75}});
    }

    void save(const char* name, const std::map<QString, double>& trackings) const
    {
        Host::TrackingStore store;
        for (const auto& [id, left] : trackings) {
            MotionTracking::Data data(id);
            data.frames[0].left = left;
            store.put(data);
        }
        Host::ProjectStore::save(m_everything.content, m_folder.path(name));
    }
    Outcome convert(const QString& input, const QString& output) const
    {
        return editormodel({"convert", "--force", input, output}, m_folder.path());
    }
    /// What is in a folder of trackings: where each is in its first picture.
    std::map<QString, double> trackingsIn(const QString& folder) const
    {
        Host::TrackingStore store;
        store.load(m_folder.path(folder));
        std::map<QString, double> found;
        for (const QString& id : store.ids()) {
            found[id] = store.find(id)->frames.at(0).left;
        }
        return found;
    }

    using Trackings = std::map<QString, double>;
    const Trackings m_one = {{"face", 0.125}, {"shared", 0.25}};
    const Trackings m_two = {{"hand", 0.5}, {"shared", 0.75}};
    const Folder m_folder{};
    const Everything m_everything{};
};

TEST_F(ReplacingConversion, KeepsTheTrackingsOfTheReplacedProjectBesideTheNewOnes)
{
    const Outcome outcome = convert("one.json", "two.json");
    EXPECT_EQ(outcome.exitCode, 0);
    EXPECT_EQ(outcome.errors, "");
    EXPECT_EQ(outcome.output, "two.json: the trackings of the project that was replaced are kept in "
                              "two.json.data/trackings-replaced\n");
    EXPECT_EQ(trackingsIn("two.json.data/trackings"), m_one);
    EXPECT_EQ(trackingsIn("two.json.data/trackings-replaced"), m_two);
    EXPECT_EQ(trackingsIn("one.json.data/trackings"), m_one);

    // The same once more loses nothing, and another project again nothing.
    expectDone(convert("one.json", "two.json"));
    EXPECT_EQ(trackingsIn("two.json.data/trackings-replaced"), m_two);
    save("three.json", {});
    EXPECT_THAT(convert("three.json", "two.json").output, HasSubstr("two.json.data/trackings-replaced-2\n"));
    EXPECT_EQ(trackingsIn("two.json.data/trackings"), Trackings());
    EXPECT_EQ(trackingsIn("two.json.data/trackings-replaced"), m_two);
    EXPECT_EQ(trackingsIn("two.json.data/trackings-replaced-2"), m_one);
}

TEST_F(ReplacingConversion, KeepsTheTrackingsOfAProjectThatAPlainDocumentReplaces)
{
    const Timeline::Object timeline;
    Document::saveFile(m_folder.path("plain.json"), {&timeline}, Document::Json, Document::Stream);
    EXPECT_THAT(convert("plain.json", "two.json").output, HasSubstr("two.json.data/trackings-replaced\n"));
    EXPECT_EQ(trackingsIn("two.json.data/trackings"), Trackings());
    EXPECT_EQ(trackingsIn("two.json.data/trackings-replaced"), m_two);
}

TEST_F(ReplacingConversion, KeepsADamagedTrackingToo)
{
    m_folder.write("two.json.data/trackings/t-hand.json", "{");
    EXPECT_EQ(convert("one.json", "two.json").exitCode, 0);
    EXPECT_EQ(contentOf(m_folder.path("two.json.data/trackings-replaced/t-hand.json")), "{");
    EXPECT_FALSE(QFileInfo::exists(m_folder.path("two.json.data/trackings/t-hand.json")));
}

TEST_F(ReplacingConversion, OntoItselfKeepsItsTrackingsWhereTheyAre)
{
    expectDone(convert("one.json", "./one.json"));
    EXPECT_EQ(trackingsIn("one.json.data/trackings"), m_one);
    ASSERT_TRUE(QFile::link(m_folder.path("one.json"), m_folder.path("link.json")));
    expectDone(convert("one.json", "link.json"));
    EXPECT_EQ(trackingsIn("one.json.data/trackings"), m_one);
    EXPECT_EQ(QDir(m_folder.path("one.json.data")).entryList(QDir::AllEntries | QDir::NoDotAndDotDot),
              QStringList("trackings"));
}

TEST_F(ReplacingConversion, PutsTheTrackingsBackWhereNothingIsReplaced)
{
    // A folder stands where the draft of the new file would be made.
    ASSERT_TRUE(QDir(m_folder.path()).mkpath(".two.json.saving/full"));
    const QByteArray before = contentOf(m_folder.path("two.json"));
    const Outcome outcome = convert("one.json", "two.json");
    EXPECT_EQ(outcome.exitCode, 1);
    EXPECT_THAT(outcome.errors, StartsWith("two.json: cannot be written"));
    EXPECT_EQ(contentOf(m_folder.path("two.json")), before);
    EXPECT_EQ(trackingsIn("two.json.data/trackings"), m_two);
    EXPECT_FALSE(QFileInfo::exists(m_folder.path("two.json.data/trackings-replaced")));
}

TEST_F(ReplacingConversion, RefusesALinkThatLeadsInACircle)
{
    ASSERT_TRUE(QFile::link("loop.json", m_folder.path("loop.json")));
    const Outcome outcome = convert("one.json", "loop.json");
    EXPECT_EQ(outcome.exitCode, 1);
    EXPECT_EQ(outcome.errors, "loop.json: is a link that leads in a circle\n");
}

TEST(ConvertCommand, ADamagedInputLeavesNoOutput)
{
    const Folder folder;
    const Everything everything;
    Host::ProjectStore::save(everything.content, folder.path("in.xml"));
    const QByteArray whole = contentOf(folder.path("in.xml"));
    folder.write("in.xml", QByteArray(whole).replace("slave", "slove"));
    folder.write("letter.json", "Dear Sir or Madam,\n");
    folder.write("out.json", "mine");
    for (const char* const input : {"in.xml", "letter.json", "missing.json", "."}) {
        const Outcome outcome = editormodel({"convert", "--force", input, "out.json"}, folder.path());
        EXPECT_EQ(outcome.exitCode, 1) << input;
        EXPECT_THAT(outcome.errors, StartsWith(input));
        EXPECT_EQ(contentOf(folder.path("out.json")), "mine");
    }
}

TEST(ConvertCommand, TellsWhatIsWrongWithTheOutput)
{
    const Folder folder;
    const Timeline::Object timeline;
    Document::saveFile(folder.path("in.json"), {&timeline}, Document::Json, Document::Stream);
    EXPECT_EQ(editormodel({"convert", "in.json", "out.txt"}, folder.path()).exitCode, 2);
    EXPECT_EQ(editormodel({"convert", "in.json"}, folder.path()).exitCode, 2);
    const Outcome outcome = editormodel({"convert", "in.json", "no/such/folder/out.bin"}, folder.path());
    EXPECT_EQ(outcome.exitCode, 1);
    EXPECT_THAT(outcome.errors, StartsWith("no/such/folder/out.bin: cannot be written: "));
}

} // namespace
