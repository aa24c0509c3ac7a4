// SPDX-License-Identifier: Apache-2.0
#include "Edits.h"
#include "tests/host/packages/PackageBuilder.h"
#include "tests/host/shared/Samples.h"

#include "host/commands/Refusal.h"
#include "host/editing/EditScript.h"
#include "host/editing/MissingTracks.h"
#include "host/media/CollectionKeeper.h"
#include "host/media/FileImporter.h"
#include "host/media/MediaOpener.h"
#include "host/packages/PackageShelf.h"
#include "host/project/ProjectStore.h"

#include <EditorModel/effects/Overlay.h>
#include <EditorModel/media/File.h>
#include <EditorModel/persistence/Document.h>

#include <QFileInfo>

#include <gmock/gmock.h>

#include <set>
#include <string>
#include <vector>

namespace {

using namespace EditTests;
using testing::IsEmpty;
using testing::StartsWith;

/// A picture of 10 s with a tracking, and a second one behind it.
class EditScript : public testing::Test
{
protected:
    EditScript()
    {
        a->setName("a")->setSourceDuration(10000)->addMotionTracking("face");
        b->setName("b")->setSourceDuration(10000);
        EXPECT_TRUE(session.addTrack(primary));
        EXPECT_TRUE(session.append({a, primary}));
        EXPECT_TRUE(session.append({b, primary}));
        script = std::make_unique<Host::EditScript>(session, clipKeeper, importer.clips());
    }

    void run(const QStringList& words) { EXPECT_EQ(refusalOf(words), "") << words.join(' ').toStdString(); }
    std::string refusalOf(const QStringList& words)
    {
        try {
            script->run(words);
        } catch (const Host::Refusal& refusal) {
            EXPECT_EQ(refusal.name, words.join(' '));
            return refusal.reason.toStdString();
        }
        return {};
    }
    const Timeline::Object& now() const { return *session.timeline(); }
    std::string titles() const { return row(now(), now().titleTrack()); }
    const Overlay::Preset* presetAt(MTime time) const
    {
        const auto found = now().clipsAt(now().titleTrack(), time);
        return found.size() == 1 ? (*found.begin())->overlay : nullptr;
    }

    const Host::MediaOpener opener;
    const HostTests::Folder folder;
    EditSession session;
    Host::ClipKeeper clipKeeper{session.timeline()};
    Host::FileImporter importer{session};
    Track* primary = session.makeTrack(PrimaryTrack);
    Clip* a = session.makeClip(Clip::VideoClip);
    Clip* b = session.makeClip(Clip::VideoClip);
    std::unique_ptr<Host::EditScript> script;
};

TEST_F(EditScript, LaysATitleOfATextForSixSeconds)
{
    run({"title", "Hello, world", "1.5"});
    EXPECT_EQ(titles(), "Hello, world 1500-7500 @0");
    const Overlay::Preset* const preset = presetAt(2000);
    ASSERT_TRUE(preset);
    ASSERT_EQ(preset->items.size(), 1u);
    EXPECT_EQ(preset->items.front().text, "Hello, world");
}

TEST_F(EditScript, LaysTitlesAboveOneAnother)
{
    run({"title", "one", "1", "4"});
    run({"title", "two", "3", "2"});
    run({"title", "three", "5", "20"});
    EXPECT_EQ(titles(), "one 1000-5000 @0, three 5000-25000 @0, two 3000-5000 @0 L1");
    // Only tracks with levels have room above.
    EXPECT_THAT(refusalOf({"title", "four", "1", "4", "1"}), testing::HasSubstr("level 1"));
    run({"track", "add", "extra-video"});
    run({"title", "four", "1", "4", "3"});
    EXPECT_EQ(row(now(), now().extraVideoTrack()), "four 1000-5000 @0");
}

TEST_F(EditScript, LaysAPresetOfADocument)
{
    Overlay::Preset preset;
    preset.setTag("Ribbon")->setSourceDuration(2500)->setScriptId("ribbon");
    preset.appendItem(Overlay::Item().setText("left"))->appendItem(Overlay::Item().setText("right"));
    for (const auto& [name, form] : {std::pair("a.json", Document::Json), std::pair("a.xml", Document::Xml),
                                     std::pair("a.bin", Document::Binary)}) {
        const QString path = folder.path(name);
        Document::saveFile(path, {&preset}, form, Document::Stream);
        run({"title", path, "1"});
        ASSERT_EQ(titles(), "Ribbon 1000-3500 @0") << name;
        const Overlay::Preset* const laid = presetAt(2000);
        EXPECT_TRUE(*laid == preset) << name;
        EXPECT_EQ(laid->tag, "Ribbon");
        EXPECT_TRUE(session.lift(*now().clipsAt(now().titleTrack()).begin()));
    }
    preset.setTag("")->setSourceDuration(0);
    Document::saveFile(folder.path("plain.json"), {&preset}, Document::Json, Document::Stream);
    run({"title", folder.path("plain.json"), "0"});
    EXPECT_EQ(titles(), "plain 0-6000 @0");
}

TEST_F(EditScript, RefusesTitlesThatItCannotLay)
{
    EXPECT_EQ(refusalOf({"title", "text", "soon"}), "\"soon\" is no time: 1:02.5, 62.5 and 62500ms are");
    EXPECT_EQ(refusalOf({"title", "text", "1", "0"}), "\"0\" is no length of a title");
    EXPECT_EQ(refusalOf({"title", "text", "1", "2", "7"}), "there is no track \"7\"");
    EXPECT_EQ(refusalOf({"title", "text"}), "lacks a word");
    EXPECT_THAT(refusalOf({"title", "no/such.json", "1"}), StartsWith("no/such.json does not exist"));
    const Media::File file;
    const QString path = folder.path("file.json");
    Document::saveFile(path, {&file}, Document::Json, Document::Stream);
    EXPECT_EQ(refusalOf({"title", path, "1"}), path.toStdString() + " holds no title, but File");
    const QString project = folder.path("project.json");
    Host::ProjectStore::save(Project::Content(), project);
    EXPECT_EQ(refusalOf({"title", project, "1"}), project.toStdString() + " holds no title, but a project");
    const QString damaged = folder.write("damaged.json", "{");
    EXPECT_THAT(refusalOf({"title", damaged, "1"}), StartsWith(damaged.toStdString() + ": "));
    EXPECT_FALSE(now().titleTrack());
}

TEST_F(EditScript, LetsClipsFollowWhatIsTracked)
{
    run({"title", "tag", "1", "2"});
    run({"follow", "tag", "a", "face", "0.5", "-0.25"});
    const Clip* const tag = *now().clipsAt(now().titleTrack()).begin();
    ASSERT_TRUE(now().getTrackingLink(tag));
    EXPECT_EQ(now().getTrackingLink(tag)->trackedObject, Timeline::TrackedObject(a, "face"));
    EXPECT_EQ(now().getTrackingLink(tag)->objectRelativeOffset, QPointF(0.5, -0.25));
    run({"follow", "3", "1", "face"});
    EXPECT_EQ(now().getTrackingLink(tag)->objectRelativeOffset, QPointF());
    EXPECT_THAT(refusalOf({"follow", "3", "2", "face"}), testing::HasSubstr("no such tracking"));
    EXPECT_EQ(refusalOf({"follow", "3", "1", "face", "1"}), "lacks a word");
    EXPECT_EQ(refusalOf({"follow", "3", "1", "face", "1", "up"}), "\"up\" is no number");
    run({"unfollow", "tag"});
    EXPECT_THAT(now().trackingLinks, IsEmpty());
    EXPECT_THAT(refusalOf({"unfollow", "tag"}), testing::HasSubstr("follows no other clip"));
}

TEST_F(EditScript, LeavesNoTrackForWhatIsRefused)
{
    const std::size_t tracks = now().tracks.size();
    EXPECT_NE(refusalOf({"title", "text", "-1"}), "");
    EXPECT_NE(refusalOf({"overwrite", HostTests::sample("film.mp4"), "-1"}), "");
    EXPECT_NE(refusalOf({"overwrite", HostTests::sample("film.mp4"), "0", "1", "7"}), "");
    EXPECT_NE(refusalOf({"overwrite", HostTests::sample("speech.wav"), "-1"}), "");
    EXPECT_NE(refusalOf({"add", HostTests::sample("film.mp4"), "596:31:23"}), "");
    EXPECT_EQ(now().tracks.size(), tracks);
}

TEST_F(EditScript, KeepsATrackThatWasMadeForClipsWhereSomethingLiesOnItByNow)
{
    Host::MissingTracks missing(session);
    EXPECT_TRUE(missing.provide(PrimaryTrack)) << "it is there";
    EXPECT_TRUE(missing.provide(ExtraVideoTrack));
    EXPECT_TRUE(missing.provide(TitleTrack));
    const Track* const extra = now().extraVideoTrack();
    Clip* const clip = session.makeClip(Clip::VideoClip);
    clip->setSourceDuration(1000);
    EXPECT_TRUE(session.append({clip, extra}));
    missing.takeBack();
    EXPECT_THAT(now().tracks, testing::ElementsAre(primary, extra));
}

TEST_F(EditScript, OverwritesWithAFile)
{
    // Of 2 s, with its sound.
    run({"overwrite", HostTests::sample("film.mp4"), "9"});
    EXPECT_EQ(row(now(), primary), "a 0-9000 @0, film.mp4 9000-11000 @0, b 11000-20000 @1000");
    EXPECT_EQ(row(now(), now().nativeAudioTrack()), "film.mp4 9000-11000 @0");
    run({"track", "add", "extra-video"});
    run({"overwrite", HostTests::sample("picture.png"), "0", "3", "1"});
    EXPECT_EQ(row(now(), now().extraVideoTrack()), "picture.png 0-4000 @0 L1");
    // Without a track for it there is nothing that it could overwrite.
    run({"overwrite", HostTests::sample("speech.wav"), "1"});
    EXPECT_EQ(row(now(), now().detachedAudioTrack()), "speech.wav 1000-2500 @0");
    Track* const linked = session.makeTrack(AudioTrack);
    EXPECT_TRUE(session.addTrack(linked->setLinked(true)));
    EXPECT_TRUE(session.moveTrack(linked, now().detachedAudioTrack()));
    run({"overwrite", HostTests::sample("speech.wav"), "2"});
    EXPECT_EQ(row(now(), now().detachedAudioTrack()), "speech.wav 1000-2000 @0, speech.wav 2000-3500 @0");
    EXPECT_EQ(refusalOf({"overwrite", HostTests::sample("picture.png"), "0", "3", "high"}),
              "\"high\" is no level");
}

TEST_F(EditScript, AddsMediaToTheOtherPlacesOfTheProject)
{
    EditorCollection::UserObject collection;
    const Host::CollectionKeeper keeper(&collection);
    FileAdder::Contexts places;
    script = std::make_unique<Host::EditScript>(session, clipKeeper, importer.clips(),
                                                places.setContext(FileAdder::UserCollectionContext()));
    const auto listed = [&] {
        std::string names;
        for (const Import::Object* item : collection.items) {
            names += item->tag.toStdString() + '\n';
        }
        return names;
    };
    run({"add", HostTests::sample("picture.png")});
    EXPECT_EQ(row(now(), primary), "a 0-10000 @0, b 10000-20000 @0, picture.png 20000-24000 @0");
    EXPECT_EQ(listed(), "picture.png\n");
    run({"overwrite", HostTests::sample("film.mp4"), "9"});
    EXPECT_EQ(listed(), "picture.png\nfilm.mp4\n");
    // What can't be opened stands nowhere.
    EXPECT_THAT(refusalOf({"overwrite", "nobody.mp4", "9"}), StartsWith("nobody.mp4 does not exist"));
    EXPECT_EQ(listed(), "picture.png\nfilm.mp4\n");
}

/// Writes down which files are opened.
class Openings : private Message::View<Media::File>
{
public:
    Openings() { observeNew(); }

    std::vector<std::string> names;

private:
    using View::changed;
    void changed(const Media::File* file, const Media::File* old) override
    {
        if (file->isOpened && !old->isOpened) {
            names.push_back(QFileInfo(file->path).fileName().toStdString());
        }
    }
};

TEST_F(EditScript, OpensAFileOnceForAllPlacesAndEdits)
{
    EditorCollection::UserObject collection;
    const Host::CollectionKeeper keeper(&collection);
    FileAdder::Contexts places;
    places.setContext(FileAdder::UserCollectionContext());
    script = std::make_unique<Host::EditScript>(session, clipKeeper, importer.clips(), places);
    const Openings openings;
    run({"overwrite", HostTests::sample("film.mp4"), "9"});
    run({"overwrite", HostTests::sample("speech.wav"), "1"});
    run({"add", HostTests::sample("film.mp4")});
    run({"overwrite", HostTests::sample("film.mp4"), "14"});
    EXPECT_THAT(openings.names, testing::ElementsAre("film.mp4", "speech.wav"));
    EXPECT_EQ(collection.items.size(), 2u);
    std::set<const Media::File*> films;
    for (const auto& [clip, timing] : now().clips) {
        if (clip->name == "film.mp4") {
            films.insert(clip->file);
        }
    }
    EXPECT_EQ(films.size(), 1u);
}

TEST_F(EditScript, TellsWhyMediaAreNotAdded)
{
    EXPECT_EQ(refusalOf({"add", HostTests::sample("picture.png"), "-1ms"}),
              "\"-1ms\" lies before the timeline");
    EXPECT_THAT(refusalOf({"add", HostTests::sample("picture.png"), "5ms"}),
                StartsWith(HostTests::sample("picture.png").toStdString() +
                           " can't be laid: The clip \"a\" can't be split at 00:00:00.005: "));
    EditSession alone;
    Host::ClipKeeper lonelyKeeper(alone.timeline());
    Host::MediaClips lonelyMedia(alone);
    Host::EditScript lonely(alone, lonelyKeeper, lonelyMedia);
    try {
        lonely.run({"add", HostTests::sample("picture.png")});
        ADD_FAILURE() << "nobody can add it";
    } catch (const Host::Refusal& refusal) {
        EXPECT_THAT(refusal.reason.toStdString(), testing::HasSubstr("picture.png"));
    }
    EXPECT_THAT(alone.timeline()->clips, IsEmpty());
}

/// A package with a title of two texts, an empty one, and a transition.
class PackagedEditScript : public EditScript
{
protected:
    PackagedEditScript()
    {
        HostTests::PackageBuilder package(folder.path("extras"), "extras");
        Overlay::Preset banner;
        banner.setTag("Banner")->setSourceDuration(2500);
        banner.appendItem(Overlay::Item().setText("above"))->appendItem(Overlay::Item().setText("below"));
        package.write("banner.json", banner);
        package.write("bare.json", Overlay::Preset());
        Transition::Object wipe("wipe");
        wipe.tag = "Wipe";
        wipe.type = static_cast<Transition::Object::Type>(3);
        package.write("wipe.json", wipe);
        using HostTests::PackageBuilder;
        package.description.overlays = {PackageBuilder::addOn(
            {{"banners", "Title"}}, {PackageBuilder::resource("extras.banner", "banner.json"),
                                     PackageBuilder::resource("extras.bare", "bare.json")})};
        package.description.transitions = {PackageBuilder::addOn(
            {{"wipes", "Transitions"}}, {PackageBuilder::resource("extras.wipe", "wipe.json")})};
        package.writeDescription();
        EXPECT_EQ(shelf.put(folder.path("extras")), 1u);
        EXPECT_THAT(shelf.faults(), IsEmpty());
        script = std::make_unique<Host::EditScript>(session, clipKeeper, importer.clips(),
                                                    FileAdder::Contexts(), &shelf);
    }

    Host::PackageShelf shelf;
};

TEST_F(PackagedEditScript, TakesTitlesFromPackages)
{
    run({"title", "extras.banner", "1"});
    run({"title", "extras.banner=Once = upon a time", "5", "2"});
    EXPECT_EQ(titles(), "Banner 1000-3500 @0, Once = upon a time 5000-7000 @0");
    EXPECT_EQ(presetAt(2000)->items.front().text, "above");
    const Overlay::Preset* const own = presetAt(6000);
    ASSERT_EQ(own->items.size(), 2u);
    EXPECT_EQ(own->items.front().text, "Once = upon a time");
    EXPECT_EQ(own->items.back().text, "below");
    // The package's own preset keeps its text.
    EXPECT_EQ(shelf.find<Overlay::Preset>("extras.banner")->items.front().text, "above");
    EXPECT_EQ(refusalOf({"title", "extras.bare=text", "1"}), "extras.bare has no item for the text");
    EXPECT_EQ(refusalOf({"title", "extras.baner", "1"}), "extras.baner is no title of the package extras");
    EXPECT_EQ(refusalOf({"title", "extras.wipe=text", "1"}), "extras.wipe is no title of the package extras");
    run({"title", "other.banner", "8", "1"});
    EXPECT_EQ(presetAt(8500)->items.front().text, "other.banner");
}

TEST_F(PackagedEditScript, TakesTransitionsFromPackages)
{
    EXPECT_TRUE(session.trimRight(a, 1000, Host::Ripple::Yes));
    EXPECT_TRUE(session.trimLeft(b, 1000, Host::Ripple::Yes));
    run({"transition", "add", "a", "b", "1", "extras.wipe"});
    ASSERT_EQ(now().transitions.size(), 1u);
    const Transition::Object& laid = *now().transitions.begin()->first;
    EXPECT_EQ(laid.id, "wipe");
    EXPECT_EQ(laid.tag, "Wipe");
    EXPECT_EQ(laid.type, 3);
    EXPECT_NE(&laid, shelf.find<Transition::Object>("extras.wipe"));
}

} // namespace
