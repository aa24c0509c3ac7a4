// SPDX-License-Identifier: Apache-2.0
#include "Command.h"
#include "tests/host/shared/Samples.h"

#include <EditorModel/effects/Envelope.h>
#include <EditorModel/media/File.h>
#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/persistence/Document.h>

#include <QDir>
#include <QImage>
#include <QStringList>

#include <gmock/gmock.h>
#include <nlohmann/json.hpp>

#include <algorithm>
#include <string>

namespace {

using namespace HostTests;
using testing::AllOf;
using testing::EndsWith;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;
using testing::StartsWith;

TEST(ProbeCommand, PrintsATableOfTheFilesAndTheirTracks)
{
    const Outcome outcome = editormodel({"probe", "speech.wav", "picture.png", "tracks.mkv"}, sample(""));
    EXPECT_EQ(outcome.exitCode, 0);
    EXPECT_THAT(outcome.errors, IsEmpty());
    EXPECT_THAT(outcome.output, StartsWith("File         Format"));
    EXPECT_THAT(outcome.output, hasLine({"speech.wav", "wav", "00:00:01.500", "132.4 kB"}));
    EXPECT_THAT(outcome.output,
                hasLine({"#0", "audio", "pcm_s16le", "44100 Hz", "mono", "s16", "706 kbit/s"}));
    EXPECT_THAT(outcome.output, hasLine({"picture.png", "png", "-"}));
    EXPECT_THAT(outcome.output, hasLine({"#0", "picture", "png", "64 x 48"}));
    EXPECT_THAT(outcome.output, hasLine({"tracks.mkv", "matroska"}));
    EXPECT_THAT(outcome.output, hasLine({"#2", "video", "ffv1", "96 x 64", "10 fps"}));
    EXPECT_THAT(outcome.output,
                hasLine({"#4", "audio", "ac3", "48000 Hz", "6 channels", "fltp", "448 kbit/s"}));
}

TEST(ProbeCommand, DescribesTheOthersWhereSomeFail)
{
    const Folder folder;
    folder.copy("film.mp4", "cut.mp4", 0.5);
    folder.copy("speech.wav", "good.wav");
    const Outcome outcome = editormodel({"probe", "cut.mp4", "good.wav", "missing.mp4", "."}, folder.path());
    EXPECT_EQ(outcome.exitCode, 1);
    EXPECT_THAT(outcome.output, hasLine({"good.wav", "wav", "00:00:01.500", "132.4 kB"}));
    EXPECT_THAT(outcome.output, Not(HasSubstr("cut.mp4")));
    EXPECT_EQ(outcome.errors, "cut.mp4: looks like QuickTime / MOV but is damaged or incomplete\n"
                              "missing.mp4: does not exist\n"
                              ".: is a folder\n");
}

TEST(ProbeCommand, PrintsNoTableOfNothing)
{
    const Outcome outcome = editormodel({"probe", "/no/such/file"});
    EXPECT_EQ(outcome.exitCode, 1);
    EXPECT_THAT(outcome.output, IsEmpty());
    EXPECT_EQ(outcome.errors, "/no/such/file: does not exist\n");
}

TEST(ProbeCommand, PrintsJsonForOtherPrograms)
{
    const Outcome outcome =
        editormodel({"probe", "--json", "speech.wav", "missing", "wide-pixels-quarter-turn.mov"}, sample(""));
    EXPECT_EQ(outcome.exitCode, 1);
    const auto files = nlohmann::json::parse(outcome.output);
    ASSERT_EQ(files.size(), 3u);
    EXPECT_EQ(files[0]["path"], "speech.wav");
    EXPECT_EQ(files[0]["format"], "wav");
    EXPECT_EQ(files[0]["length"], 1500);
    EXPECT_EQ(files[0]["size"], contentOf(sample("speech.wav")).size());
    EXPECT_EQ(files[0]["videoTracks"], nlohmann::json::array());
    EXPECT_EQ(files[0]["audioTracks"],
              nlohmann::json::parse(R"([{"index": 0, "codec": "pcm_s16le", "bitrate": 705600, "channels": 1,
                                         "sampleRate": 44100, "sampleFormat": "s16"}])"));
    EXPECT_EQ(files[1], nlohmann::json::parse(R"({"path": "missing", "error": "does not exist"})"));
    const auto& video = files[2]["videoTracks"][0];
    EXPECT_EQ(video["width"], 144);
    EXPECT_EQ(video["height"], 180);
    EXPECT_EQ(video["pixelAspect"], nlohmann::json::parse("[45, 64]"));
    EXPECT_EQ(video["frameRate"], nlohmann::json::parse("[25, 1]"));
}

TEST(ProbeCommand, WritesNamesAsUtf8InEveryLocale)
{
    const Folder folder;
    const QString name = QString::fromUtf8("写真 'ä' \"б\".png");
    folder.copy("picture.png", name);
    for (const char* locale : {"C", "POSIX", "C.UTF-8"}) {
        const Outcome outcome = editormodel({"probe", name, "é"}, folder.path(), locale);
        EXPECT_THAT(outcome.output, HasSubstr("\n" + name.toStdString() + "  png")) << locale;
        EXPECT_EQ(outcome.errors, "é: does not exist\n") << locale;
    }
}

TEST(ProbeCommand, TakesNoNameForAnAddress)
{
    const Folder folder;
    for (const char* name : {"concat:a.wav", "http:b.wav", "file:c.wav", "pipe:0"}) {
        folder.copy("speech.wav", name);
        EXPECT_THAT(editormodel({"probe", name}, folder.path()).output,
                    hasLine({name, "wav", "00:00:01.500"}));
    }
    folder.copy("picture.tga", "http:d.tga");
    EXPECT_THAT(editormodel({"probe", "http:d.tga"}, folder.path()).output,
                hasLine({"#0", "picture", "targa"}));
}

TEST(ProbeCommand, LetsNoNameSteerTheTerminal)
{
    const Outcome outcome = editormodel({"probe", "a\nb\x1b[2J"});
    EXPECT_EQ(outcome.errors, "a\\x0ab\\x1b[2J: does not exist\n");
}

TEST(ProbeCommand, KeepsTheLibrariesQuietUnlessAskedNotTo)
{
    const Folder folder;
    folder.copy("film.mp4", "cut.mp4", 0.5);
    EXPECT_THAT(editormodel({"probe", "cut.mp4"}, folder.path()).errors, Not(HasSubstr("moov")));
    EXPECT_THAT(editormodel({"probe", "--verbose", "cut.mp4"}, folder.path()).errors, HasSubstr("moov"));
}

TEST(ProbeCommand, FailsWhereItsOutputCannotBeWritten)
{
    const Outcome outcome =
        run("sh", {"-c", "\"$0\" probe speech.wav > /dev/full", EDITORMODEL_COMMAND}, sample(""));
    EXPECT_EQ(outcome.exitCode, 1);
    EXPECT_EQ(outcome.errors, "standard output: cannot be written\n");
}

TEST(ProbeCommand, DrawsItsProgressOnATerminalOnly)
{
    const QString command = QString(EDITORMODEL_COMMAND) + " probe speech.wav picture.png";
    EXPECT_THAT(run("sh", {"-c", command}, sample("")).errors, IsEmpty());
    const Outcome onTerminal = run("script", {"-qec", command, "/dev/null"}, sample(""));
    EXPECT_EQ(onTerminal.exitCode, 0);
    EXPECT_THAT(onTerminal.output, HasSubstr("[##########          ]  1/2  picture.png"));
    EXPECT_THAT(onTerminal.output, HasSubstr("\r\x1b[KFile  "));
}

TEST(Command, TellsHowItIsUsed)
{
    for (const QStringList& wrong :
         {QStringList(), QStringList("probe"), QStringList("show"), QStringList("curve"),
          QStringList("nonsense"), QStringList({"probe", "a.wav", "--save", "a.doc"}),
          QStringList({"probe", "--no-such-option", "a"})}) {
        const Outcome outcome = editormodel(wrong);
        EXPECT_EQ(outcome.exitCode, 2) << wrong.join(' ').toStdString();
        EXPECT_THAT(outcome.output, IsEmpty());
        EXPECT_THAT(outcome.errors, Not(IsEmpty()));
    }
    const Outcome help = editormodel({"--help"});
    EXPECT_EQ(help.exitCode, 0);
    EXPECT_THAT(help.output, AllOf(HasSubstr("probe"), HasSubstr("show"), HasSubstr("curve")));
}

class SavedDescriptions : public testing::TestWithParam<const char*>
{};
class SavedEnvelopes : public testing::TestWithParam<const char*>
{};

TEST_P(SavedDescriptions, AreShownInTheTableThatProbePrinted)
{
    const Folder folder;
    const QString document = folder.path(QString("media.") + GetParam());
    const QStringList files = {"film.mp4", "tracks.mkv", "song.mp3", "picture.png", "film-quarter-turn.mp4"};
    const Outcome probed = editormodel(QStringList({"probe", "--save", document}) + files, sample(""));
    ASSERT_EQ(probed.exitCode, 0) << probed.errors;

    const Outcome shown = editormodel({"show", document});
    EXPECT_EQ(shown.exitCode, 0);
    EXPECT_THAT(shown.errors, IsEmpty());
    EXPECT_THAT(shown.output, StartsWith(probed.output + "\nResource "));
    EXPECT_THAT(shown.output, hasLine({".*", "video", "#2", "00:00:01.024", sample("tracks.mkv")}));
    EXPECT_THAT(shown.output, hasLine({".*-2", "audio", "#4", "00:00:01.024", sample("tracks.mkv")}));
    EXPECT_THAT(shown.output, hasLine({".*", "picture", "#0", "-", sample("picture.png")}));
    EXPECT_EQ(std::count(shown.output.begin(), shown.output.end(), '\n') -
                  std::count(probed.output.begin(), probed.output.end(), '\n'),
              2 + 2 + 5 + 2 + 1 + 2);
}

TEST_P(SavedDescriptions, AreThoseOfTheFilesThatCouldBeOpened)
{
    const Folder folder;
    const QString document = folder.path(QString("media.") + GetParam());
    const Outcome probed =
        editormodel({"probe", "speech.wav", "missing.wav", "--save", document}, sample(""));
    EXPECT_EQ(probed.exitCode, 1);
    const Outcome shown = editormodel({"show", document});
    EXPECT_THAT(shown.output, StartsWith(probed.output + "\nResource "));
    EXPECT_THAT(shown.output, EndsWith(sample("speech.wav").toStdString() + "\n"));
    EXPECT_THAT(shown.output, Not(HasSubstr("missing.wav")));
}

TEST_P(SavedDescriptions, AreShownWithoutResourcesWhereNoneWereSaved)
{
    const Folder folder;
    const QString document = folder.path(QString("files.") + GetParam());
    Media::File file;
    file.setPath("old.wav")->setFormat("wav")->setSize(7);
    Document::saveFile(document, {&file}, *Document::formOfPath(document), Document::Stream);
    EXPECT_EQ(editormodel({"show", document}).output, "File     Format  Length  Size\n"
                                                      "old.wav  wav          -   7 B\n");
}

TEST_P(SavedDescriptions, MayBeResourcesAlone)
{
    const Folder folder;
    const QString document = folder.path(QString("resources.") + GetParam());
    ResourceTable::Object table;
    table.resource2fileInfo[{"a\n1", Resource::NoType}].info.path = "some.mov";
    ResourceTable::FileResourceInfo& sound = table.resource2fileInfo[{"b", Resource::AudioType}];
    sound.info.track = 1;
    sound.info.duration = MTime(1500);
    Document::saveFile(document, {&table}, *Document::formOfPath(document), Document::Stream);
    EXPECT_EQ(editormodel({"show", document}).output, "Resource  Kind   Track        Length  File\n"
                                                      "a\\x0a1    -      #0                -  some.mov\n"
                                                      "b         audio  #1     00:00:01.500\n");
}

TEST_P(SavedDescriptions, AreNoEnvelopes)
{
    const Folder folder;
    const QString document = folder.path(QString("media.") + GetParam());
    ASSERT_EQ(editormodel({"probe", "speech.wav", "--save", document}, sample("")).exitCode, 0);
    const Outcome outcome = editormodel({"curve", document});
    EXPECT_EQ(outcome.exitCode, 1);
    EXPECT_THAT(outcome.output, IsEmpty());
    EXPECT_EQ(outcome.errors,
              document.toStdString() + ": holds neither a volume nor a transformation envelope, but File\n");
}

TEST_P(SavedEnvelopes, AreNoDescriptions)
{
    const Folder folder;
    const QString document = folder.path(QString("curve.") + GetParam());
    ASSERT_EQ(editormodel({"curve", "--sample", "volume", document}).exitCode, 0);
    const Outcome shown = editormodel({"show", document});
    EXPECT_EQ(shown.exitCode, 1);
    EXPECT_THAT(shown.errors,
                HasSubstr("holds no project, no timeline, no descriptions of media files and no resources"));
}

TEST_P(SavedEnvelopes, AreReadInEveryForm)
{
    const Folder folder;
    const QString document = folder.path(QString("curve.") + GetParam());
    const Outcome made = editormodel({"curve", "--sample", "volume", document, "--steps", "4"});
    EXPECT_EQ(made.exitCode, 0) << made.errors;
    EXPECT_THAT(made.output, StartsWith("Volume envelope: 7 keys over 00:00:10.000\n"));
    EXPECT_THAT(made.output, hasLine({"#4", "00:00:03.800", "0.38", "25 %", "-12.0 dB"}));
    EXPECT_THAT(made.output, hasLine({"00:00:05.000", "25 %", "-12.0 dB"}));
    EXPECT_EQ(editormodel({"curve", document, "--steps", "4"}).output, made.output);

    VolumeEnvelope envelope;
    envelope.addKeyValue(0.5, 0.5);
    Document::saveFile(document, {&envelope}, *Document::formOfPath(document), Document::Archive);
    const Outcome own = editormodel({"curve", "--own", document});
    EXPECT_EQ(own.exitCode, 0) << own.errors;
    EXPECT_THAT(own.output, hasLine({"#1", "00:00:05.000", "0.5", "50 %", "-6.0 dB"}));
    // Boost's readers do not withstand malice.
    EXPECT_EQ(editormodel({"curve", document}).exitCode, std::string(GetParam()) == "json" ? 0 : 1);
}

TEST_P(SavedDescriptions, AreRefusedInOneLineIfTheyAreDamaged)
{
    const Folder folder;
    const QString document = folder.path(QString("media.") + GetParam());
    ASSERT_EQ(editormodel({"probe", "speech.wav", "--save", document}, sample("")).exitCode, 0);
    const QByteArray whole = contentOf(document);
    folder.write("damaged", whole.left(whole.size() / 2));

    const Outcome shown = editormodel({"show", "damaged"}, folder.path());
    EXPECT_EQ(shown.exitCode, 1);
    EXPECT_THAT(shown.output, IsEmpty());
    EXPECT_THAT(shown.errors, AllOf(HasSubstr("damaged"), EndsWith("\n")));
    EXPECT_EQ(std::count(shown.errors.begin(), shown.errors.end(), '\n'), 1) << shown.errors;
}

INSTANTIATE_TEST_SUITE_P(Forms, SavedDescriptions, testing::Values("json", "xml", "bin"),
                         [](const auto& form) { return std::string(form.param); });
INSTANTIATE_TEST_SUITE_P(Forms, SavedEnvelopes, testing::Values("json", "xml", "bin"),
                         [](const auto& form) { return std::string(form.param); });

TEST(ShowCommand, TellsInOneLineThatAFileIsNoDocument)
{
    const Folder folder;
    folder.write("empty.json", QByteArray());
    folder.write("letter.xml", "Dear Sir or Madam,\n");
    folder.write("other.json", "{\"a\": 1}");
    folder.copy("film.mp4", "film.bin");
    for (const char* name : {"empty.json", "letter.xml", "other.json", "film.bin", "missing.json", "."}) {
        const Outcome shown = editormodel({"show", name}, folder.path());
        EXPECT_EQ(shown.exitCode, 1) << name;
        EXPECT_THAT(shown.output, IsEmpty()) << name;
        EXPECT_THAT(shown.errors, HasSubstr(name));
        EXPECT_EQ(std::count(shown.errors.begin(), shown.errors.end(), '\n'), 1) << shown.errors;
    }
}

TEST(ShowCommand, TakesRegularFilesOnly)
{
    EXPECT_EQ(editormodel({"show", "/dev/zero"}).exitCode, 1);
    EXPECT_EQ(editormodel({"show", "/dev/zero"}).errors, "/dev/zero: is not a regular file\n");
    EXPECT_EQ(editormodel({"show", "/"}).errors, "/: is a folder\n");
}

/// Boost's readers do not withstand malice, and --save does not write for them.
TEST(ShowCommand, TakesNoArchiveThatOneMustTrust)
{
    const Folder folder;
    const Media::File file;
    for (const auto form : {Document::Binary, Document::Xml}) {
        const QString path = folder.path() + "/archive";
        Document::saveFile(path, {&file}, form, Document::Archive);
        const Outcome shown = editormodel({"show", path});
        EXPECT_EQ(shown.exitCode, 1);
        EXPECT_THAT(shown.errors, HasSubstr("an archive of this form is taken from oneself alone"));
    }
}

TEST(CurveCommand, DrawsPicturesOfBothEnvelopes)
{
    const Folder folder;
    const Outcome volume = editormodel({"curve", "--sample", "volume", "v.json", "-o", "v.png", "--fade-in",
                                        "1000", "--fade-out", "2500", "--length", "20000"},
                                       folder.path());
    EXPECT_EQ(volume.exitCode, 0);
    EXPECT_THAT(volume.errors, IsEmpty());
    EXPECT_THAT(volume.output, StartsWith("Volume envelope: 7 keys over 00:00:20.000, fade-in 00:00:01.000, "
                                          "fade-out 00:00:02.500\n"));
    EXPECT_EQ(QImage(folder.path("v.png")).size(), QSize(2560, 1200));

    const Outcome transformation =
        editormodel({"curve", "--sample", "transformation", "t.bin", "-o", "t.svg"}, folder.path());
    EXPECT_EQ(transformation.exitCode, 0);
    EXPECT_THAT(transformation.errors, IsEmpty());
    EXPECT_THAT(transformation.output, hasLine({"Opacity", ".*", "0 %", "100 %"}));
    EXPECT_TRUE(contentOf(folder.path("t.svg")).contains("<svg "));
}

TEST(CurveCommand, ShowsTheFirstEnvelopeWhicheverItIs)
{
    const Folder folder;
    const Media::File file;
    VolumeEnvelope volume;
    const TransformationEnvelope transformation;
    Document::saveFile(folder.path("a.json"), {nullptr, &file, &transformation, &volume}, Document::Json,
                       Document::Stream);
    EXPECT_THAT(editormodel({"curve", "a.json"}, folder.path()).output,
                StartsWith("Transformation envelope"));
    Document::saveFile(folder.path("b.json"), {&file, &volume, &transformation}, Document::Json,
                       Document::Stream);
    EXPECT_THAT(editormodel({"curve", "b.json"}, folder.path()).output, StartsWith("Volume envelope"));
}

/// Qt would write to another name.
TEST(Command, WritesToNoNameThatItCannotTake)
{
    const Folder folder;
    folder.copy("speech.wav", "a.wav");
    ASSERT_EQ(editormodel({"curve", "--sample", "volume", "v.json"}, folder.path()).exitCode, 0);
    const QStringList before = QDir(folder.path()).entryList();
    for (const char* arguments :
         {"probe a.wav --save \"$(printf 'caf\\351.json')\"", "curve v.json -o \"$(printf 'caf\\351.png')\"",
          "curve --sample volume \"$(printf 'caf\\351.json')\"",
          "picture v.json \"$(printf 'caf\\351.svg')\"", "new \"$(printf 'caf\\351.json')\" --media a.wav"}) {
        const Outcome outcome =
            run("/bin/sh", {"-c", QString("exec \"$0\" ") + arguments, EDITORMODEL_COMMAND}, folder.path());
        EXPECT_EQ(outcome.exitCode, 2) << arguments;
        EXPECT_THAT(outcome.errors, AllOf(HasSubstr("caf\uFFFD"), HasSubstr("is not UTF-8")));
        EXPECT_THAT(outcome.output, IsEmpty());
    }
    EXPECT_EQ(editormodel({"curve", "v.json", "-o", ""}, folder.path()).exitCode, 2);
    EXPECT_EQ(QDir(folder.path()).entryList(), before);
}

TEST(ProbeCommand, SavesAlsoWhereNobodyReadsItsOutput)
{
    const Folder folder;
    folder.copy("speech.wav", "a.wav");
    // The reader has ended before anything is written.
    const Outcome outcome = run(
        "/bin/sh",
        {"-c", "{ sleep 0.3; \"$0\" probe a.wav --save a.json; echo $? >code; } | true", EDITORMODEL_COMMAND},
        folder.path());
    EXPECT_EQ(outcome.errors, "standard output: cannot be written\n");
    EXPECT_EQ(contentOf(folder.path("code")), "1\n");
    EXPECT_EQ(editormodel({"show", "a.json"}, folder.path()).exitCode, 0);
}

TEST(CurveCommand, TellsInOneLineWhatIsWrong)
{
    const Folder folder;
    ASSERT_EQ(editormodel({"curve", "--sample", "transformation", folder.path("t.json")}).exitCode, 0);
    folder.write("letter.json", "Dear Sir or Madam,\n");
    const std::pair<QStringList, const char*> wrong[] = {
        {{"missing.json"}, "missing.json: does not exist\n"},
        {{"."}, ".: is a folder\n"},
        {{"/dev/zero"}, "/dev/zero: is not a regular file\n"},
        {{"letter.json"}, "letter.json: "},
        {{"t.json", "-o", "t.gif"}, "t.gif: is no name of a picture: such a name ends in .png or .svg\n"},
        {{"t.json", "--fade-in", "5"}, "t.json: holds a transformation envelope, which takes no fades\n"},
        {{"--sample", "volume", "t.doc"},
         "t.doc: is no name of a document: such a name ends in .json, .xml or .bin\n"},
    };
    for (const auto& [arguments, error] : wrong) {
        const Outcome outcome = editormodel(QStringList("curve") + arguments, folder.path());
        EXPECT_EQ(outcome.exitCode, 1) << error;
        EXPECT_THAT(outcome.output, IsEmpty()) << error;
        EXPECT_THAT(outcome.errors, StartsWith(error));
        EXPECT_EQ(std::count(outcome.errors.begin(), outcome.errors.end(), '\n'), 1) << outcome.errors;
    }
    const Outcome unwritten = editormodel({"curve", "t.json", "-o", "/no/such/folder/t.png"}, folder.path());
    EXPECT_EQ(unwritten.exitCode, 1);
    EXPECT_THAT(unwritten.output, StartsWith("Transformation envelope"));
    EXPECT_THAT(unwritten.errors, StartsWith("/no/such/folder/t.png: cannot be written: "));
    EXPECT_EQ(std::count(unwritten.errors.begin(), unwritten.errors.end(), '\n'), 1) << unwritten.errors;
}

TEST(CurveCommand, TakesNoNumbersThatMakeNoSense)
{
    for (const QStringList& options : {QStringList({"--length", "0"}), QStringList({"--length", "360000000"}),
                                       QStringList({"--fade-in", "-1"}), QStringList({"--steps", "0"}),
                                       QStringList({"--steps", "x"}), QStringList({"--sample", "colour"})}) {
        const Outcome outcome = editormodel(QStringList({"curve", "a.json"}) + options);
        EXPECT_EQ(outcome.exitCode, 2) << options.join(' ').toStdString();
        EXPECT_THAT(outcome.output, IsEmpty());
    }
}

TEST(Command, EndsByItselfWhereItCanTellNobody)
{
    EXPECT_EQ(run("/bin/sh", {"-c", "exec \"$0\" probe missing 2>/dev/full", EDITORMODEL_COMMAND}).exitCode,
              1);
    EXPECT_EQ(run("/bin/sh", {"-c", "exec \"$0\" probe missing 2>&-", EDITORMODEL_COMMAND}).exitCode, 1);
}

TEST(Command, NamesTheOptionThatItDoesNotKnow)
{
    const Outcome outcome = editormodel({"probe", "-dash\x1b[2J.mp4"});
    EXPECT_EQ(outcome.exitCode, 2);
    EXPECT_THAT(outcome.errors, HasSubstr("-dash\\x1b[2J.mp4"));
    EXPECT_THAT(outcome.errors, HasSubstr("goes after --"));
    EXPECT_THAT(editormodel({"probe", "--", "-dash.mp4"}).errors, StartsWith("-dash.mp4: does not exist"));
}

TEST(ProbeCommand, TellsWhichNamesItCannotTake)
{
    EXPECT_THAT(editormodel({"probe", ""}).errors, HasSubstr("\"\": has no name"));
    EXPECT_EQ(editormodel({"probe", ""}).exitCode, 1);
    const Outcome latin1 =
        run("/bin/sh", {"-c", "exec \"$0\" probe \"$(printf 'caf\\351.wav')\"", EDITORMODEL_COMMAND});
    EXPECT_EQ(latin1.exitCode, 1);
    EXPECT_THAT(latin1.errors, HasSubstr("its name is not UTF-8"));
}

TEST(ProbeCommand, TellsWhereADocumentCannotBeWritten)
{
    const Outcome outcome =
        editormodel({"probe", "speech.wav", "--save", "/no/such/folder/media.json"}, sample(""));
    EXPECT_EQ(outcome.exitCode, 1);
    EXPECT_THAT(outcome.output, hasLine({"speech.wav", "wav"}));
    EXPECT_THAT(outcome.errors, HasSubstr("/no/such/folder/media.json"));
    EXPECT_EQ(std::count(outcome.errors.begin(), outcome.errors.end(), '\n'), 1) << outcome.errors;
}

TEST(ProbeCommand, SavesNothingWhereNothingCouldBeDescribed)
{
    const Folder folder;
    const Outcome outcome = editormodel({"probe", "missing", "--save", "media.json"}, folder.path());
    EXPECT_EQ(outcome.exitCode, 1);
    EXPECT_EQ(outcome.errors,
              "missing: does not exist\nmedia.json: is not written: there is nothing to save\n");
    EXPECT_FALSE(QFile::exists(folder.path("media.json")));
}

} // namespace
