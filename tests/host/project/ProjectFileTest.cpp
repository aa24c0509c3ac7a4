// SPDX-License-Identifier: Apache-2.0
#include "SmallProject.h"
#include "tests/host/shared/Samples.h"

#include "host/commands/Refusal.h"
#include "host/project/ProjectDocument.h"
#include "host/project/ProjectFile.h"

#include <QBuffer>
#include <QFileInfo>
#include <QXmlStreamReader>

#include <gmock/gmock.h>
#include <nlohmann/json.hpp>

namespace {

using namespace HostTests;
using testing::AllOf;
using testing::EndsWith;
using testing::HasSubstr;
using testing::StartsWith;

/// As the standard that defines the digest has it for the three letters "abc".
const QByteArray digestOfAbc("ba7816bf8f01cfea414140de5dae2223b00361a396177a9cb410ff61f20015ad");

QByteArray sealed(const QByteArray& document, Document::Form form)
{
    const Host::ProjectSeal seal = Host::projectSeal(document, form);
    return seal.before + document + seal.behind;
}

std::string refusalOf(const QByteArray& file)
{
    try {
        Host::projectDocument(file);
        return "none";
    } catch (const Document::Error& error) {
        return error.what();
    }
}

TEST(ProjectFile, BeginsWithASignatureAndTheDigestInBinary)
{
    EXPECT_EQ(sealed("abc", Document::Binary).toHex(), "89454d500d0a1a0a"
                                                       "01000000"
                                                       "0300000000000000" +
                                                           digestOfAbc + "616263");
}

TEST(ProjectFile, HasItsSealInTheFirstLineInJson)
{
    EXPECT_EQ(sealed("abc", Document::Json),
              "{\"format\": \"EditorModel project\", \"version\": 1, \"length\": 3, \"sha256\": \"" +
                  digestOfAbc + "\", \"document\":\nabc\n}\n");
}

TEST(ProjectFile, HasItsSealInTheLastLineInXml)
{
    EXPECT_EQ(sealed("abc", Document::Xml),
              "abc<!-- EditorModel project: version 1, length 3, SHA-256 " + digestOfAbc + " -->\n");
}

TEST(ProjectFile, IsRefusedIfANewerVersionHasWrittenIt)
{
    const std::string reason = "it was written by a newer version: its layout has the number 2, and 1 is the "
                               "latest that is known here";
    QByteArray binary = sealed("abc", Document::Binary);
    binary[8] = 2;
    EXPECT_EQ(refusalOf(binary), "binary project: " + reason);
    // What else a later layout has is not known.
    EXPECT_EQ(refusalOf("{\"format\": \"EditorModel project\", \"version\": 2, \"parts\": []}"),
              "Json project: " + reason);
    EXPECT_EQ(refusalOf("<?xml version=\"1.0\"?><a/>\n<!-- EditorModel project: version 2, anything -->\n"),
              "XML project: " + reason);
}

TEST(ProjectFile, TellsWhatIsWrongWithIt)
{
    const auto cut = [](Document::Form form) {
        return sealed("abc", form).left(sealed("abc", form).size() - 1);
    };
    EXPECT_EQ(refusalOf(cut(Document::Binary)),
              "binary project: it is cut off: 3 bytes are expected, 2 are there");
    EXPECT_EQ(refusalOf(cut(Document::Json)),
              "Json project: it is cut off: 3 bytes are expected, 2 are there");
    EXPECT_EQ(refusalOf(cut(Document::Xml)),
              "XML project: it is damaged: its content does not fit its checksum");
    for (const auto& [form, name] :
         {std::pair(Document::Binary, "binary"), std::pair(Document::Json, "Json")})
        EXPECT_EQ(refusalOf(sealed("abc", form) + "xy"),
                  std::string(name) +
                      " project: it goes on behind its end: 3 bytes are expected, 5 are there");
    EXPECT_EQ(refusalOf(sealed("abc", Document::Xml) + "xy"),
              "XML project: it is damaged: its content does not fit its checksum");
    EXPECT_EQ(refusalOf(sealed("abc", Document::Json).replace("\nabc\n", "\nabd\n")),
              "Json project: it is damaged: its content does not fit its checksum");
    EXPECT_EQ(refusalOf("<?xml version=\"1.0\"?><a class=\"Project::Content\"/>"),
              "XML project: it is cut off: the line that closes a project is missing");
    EXPECT_EQ(refusalOf("{\"format\":\"EditorModel project\",\"version\":1}"),
              "Json project: it is damaged: its first line is not that of a project");
}

class ProjectFiles : public testing::TestWithParam<const char*>
{
protected:
    QString path() const { return m_folder.path(QString("film.") + GetParam()); }
    /// A file that is cut to be written again would be flushed to the disk each time.
    void write(const QByteArray& content) const
    {
        QFile::remove(path());
        m_folder.write(QFileInfo(path()).fileName(), content);
    }

    const Folder m_folder{};
};
INSTANTIATE_TEST_SUITE_P(Forms, ProjectFiles, testing::Values("json", "xml", "bin"),
                         [](const auto& form) { return std::string(form.param); });

TEST_P(ProjectFiles, AreKnownByTheirMarks)
{
    SmallProject(1).save(path());
    EXPECT_TRUE(Host::ProjectStore::isProject(path()));
    const SmallProject project;
    Document::saveFile(path(), {&project.timeline}, *Document::formOfPath(path()), Document::Stream);
    EXPECT_FALSE(Host::ProjectStore::isProject(path()));
    EXPECT_FALSE(Host::ProjectStore::isProject(m_folder.path("missing")));
    EXPECT_FALSE(Host::ProjectStore::isProject(m_folder.path()));
    EXPECT_FALSE(Host::ProjectStore::isProject("/dev/zero"));
}

/// Why the file is refused; what is taken is none.
std::string refusalOf(const QString& path)
{
    try {
        Host::ProjectDocument::load(path);
        return "none";
    } catch (const std::exception& error) {
        return error.what();
    }
}

TEST_P(ProjectFiles, AreRefusedWithAnyByteAlteredOrMissingAndTheirBackupIsNamed)
{
    SmallProject(1).save(path());
    SmallProject(2).save(path());
    const QByteArray whole = contentOf(path());
    const std::string backup =
        "; its backup " + Host::ProjectStore::backupOf(path()).toStdString() + " can be opened";
    const auto refused = AllOf(StartsWith(path().toStdString() + ": "), EndsWith(backup));
    for (int i = 0; i != whole.size(); ++i) {
        QByteArray altered = whole;
        altered[i] = static_cast<char>(altered[i] ^ (1 << (i % 8)));
        write(altered);
        ASSERT_THAT(refusalOf(path()), refused) << "byte " << i << " altered";
        QByteArray lacking = whole;
        lacking.remove(i, 1);
        write(lacking);
        ASSERT_THAT(refusalOf(path()), refused) << "byte " << i << " missing";
        write(whole.left(i));
        ASSERT_THAT(refusalOf(path()), refused) << "cut to " << i << " of " << whole.size();
    }
    EXPECT_EQ(numberInBackup(path()), 1);
    write(whole);
    EXPECT_EQ(numberIn(path()), 2);
}

TEST_P(ProjectFiles, AreReadAsForeignEvenIfTheirChecksumIsRight)
{
    // A class that does not exist, with the right checksum around it.
    const SmallProject project;
    const Document::Form form = *Document::formOfPath(path());
    project.save(path());
    const QByteArray file = contentOf(path());
    QByteArray document = Host::projectDocument(file);
    document.replace("EditorCollection::UserObject", "EditorCollection::UserObjecx");
    write(sealed(document, form));
    // A binary document has a checksum of its own.
    EXPECT_THAT(refusalOf(path()),
                HasSubstr(form == Document::Binary ? "binary document: it is damaged"
                                                   : "derived class not registered or exported"));

    Document::saveFile(path(), {&project.content}, form, Document::Archive);
    write(sealed(contentOf(path()), form));
    if (form == Document::Json)
        EXPECT_EQ(refusalOf(path()), "none");
    else
        EXPECT_THAT(refusalOf(path()), HasSubstr("an archive of this form is taken from oneself alone"));
}

TEST_P(ProjectFiles, HoldProjects)
{
    const Timeline::Object timeline;
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    Document::save(buffer, timeline, *Document::formOfPath(path()), Document::Stream);
    write(sealed(buffer.data(), *Document::formOfPath(path())));
    EXPECT_EQ(refusalOf(path()), path().toStdString() + ": holds something else than a project");
}

TEST_P(ProjectFiles, AreNothingWithoutTheirSeal)
{
    const SmallProject project;
    Document::saveFile(path(), {&project.content}, *Document::formOfPath(path()), Document::Stream);
    EXPECT_THAT(refusalOf(path()), std::string(GetParam()) == "xml"
                                       ? HasSubstr("the line that closes a project is missing")
                                       : HasSubstr("holds a project without its checksum"));
}

TEST(ProjectFile, IsNoXmlArchiveOfAProject)
{
    const QByteArray archive = "<?xml version=\"1.0\"?>\n<!DOCTYPE boost_serialization>\n"
                               "<content class=\"Project::Content\">";
    EXPECT_FALSE(Host::isProjectFile(archive, archive));
    EXPECT_TRUE(Host::isProjectFile(QByteArray(archive).replace("DOCTYPE", "OTHER"), archive));
}

TEST(ProjectFile, IsJsonAndXmlForOtherPrograms)
{
    const Folder folder;
    const SmallProject project(7);
    project.save(folder.path("film.json"));
    const auto json = nlohmann::json::parse(contentOf(folder.path("film.json")).toStdString());
    EXPECT_EQ(json["format"], "EditorModel project");
    EXPECT_EQ(json["version"], 1);
    EXPECT_EQ(json["document"]["EditorModel"], "stream");
    EXPECT_EQ(json["document"]["objects"][0]["Data"]["portable"], false);

    project.save(folder.path("film.xml"));
    QXmlStreamReader xml(contentOf(folder.path("film.xml")));
    while (!xml.atEnd())
        xml.readNext();
    EXPECT_EQ(xml.errorString().toStdString(), "");
}

} // namespace
