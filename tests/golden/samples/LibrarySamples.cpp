// SPDX-License-Identifier: Apache-2.0
#include "Parts.h"

#include <EditorModel/library/EditorCollection.h>
#include <EditorModel/library/Pack.h>
#include <EditorModel/library/PackCatalogue.h>
#include <EditorModel/library/PersistentItem.h>
#include <EditorModel/library/Project.h>
#include <EditorModel/library/UserObject.h>
#include <EditorModel/timeline/Timeline.h>
#include <EditorModel/types/Image.h>

#include <QImage>

namespace GoldenTests {
namespace {

/// A picture without pixels is stored in one way; others differ with the library that packs them.
template <class T>
T& fillStored(Sample& sample, const QString& collection)
{
    auto& stored = sample.root<EditorCollection::PersistentItem<T>>();
    stored.uniqueId = "{1}";
    stored.item = &sample.make<T>();
    stored.preview = std::make_shared<const Types::Image>();
    stored.categories = {"mine", "all"};
    stored.collectionId = collection;
    stored.customStrings = {{"author", "me"}};
    return *stored.item;
}

void fillStoredEffect(Sample& sample)
{
    fillStored<Effect::Object>(sample, "Effects").id = "blur";
}

void fillStoredImport(Sample& sample)
{
    fillStored<Import::Object>(sample, "Imports").tag = "Song";
}

void fillStoredTheme(Sample& sample)
{
    fillStored<Theme::Object>(sample, "Themes").tag = "Party";
}

void fillStoredTransition(Sample& sample)
{
    fillStored<Transition::Object>(sample, "Transitions").id = "fade";
}

void fillStoredOverlay(Sample& sample)
{
    fillStored<Overlay::Preset>(sample, "Titles").tag = "Greeting";
}

void fillStoredQuiz(Sample& sample)
{
    fillStored<Quiz::Preset>(sample, "Quizzes").tag = "Numbers";
}

void fillStoredMove(Sample& sample)
{
    fillStored<Envelope::TransformationPreset>(sample, "Moves").tag = "Zoom";
}

void fillImport(Sample& sample)
{
    fillSong(sample.root<Import::Object>());
}

void fillUserCollection(Sample& sample)
{
    auto& song = sample.make<Import::Object>();
    fillSong(song);
    auto& film = sample.make<Import::Object>();
    film.tag = "Film";
    sample.root<EditorCollection::UserObject>().items = {&song, &film, &song};
}

void fillMarks(Sample& sample)
{
    sample.root<Indication::Object>() = marks();
}

void fillResource(Sample& sample)
{
    sample.root<Package::Resource>() = package().overlays[0].resources[0];
}

void fillAddOn(Sample& sample)
{
    sample.root<Package::CollectionAddOn>() = package().overlays[0];
}

void fillPackage(Sample& sample)
{
    sample.root<Package::Object>() = package();
}

void fillStorageItem(Sample& sample)
{
    sample.root<Package::StorageItem>() = storage().package2storage["weather"];
}

void fillStorage(Sample& sample)
{
    sample.root<Package::Storage>() = storage();
}

void fillPack(Sample& sample)
{
    auto& pack = sample.root<Package::InApp::Pack>();
    pack.appId = "weather";
    pack.locale2productName = {{"en_US", "Weather"}, {"de_DE", "Wetter"}};
    pack.locale2previewUrl = {{"en_US", "https://example.org/weather.png"}};
    pack.downloadUrl = "https://example.org/weather.zip";
}

void fillCatalogue(Sample& sample)
{
    auto& pack = sample.make<Package::InApp::Pack>();
    pack.appId = "weather";
    sample.root<Package::InApp::Object>().packs = {&pack, &pack, nullptr};
}

void fillContent(Sample& sample)
{
    auto& content = sample.root<Project::Content>();
    content.timeline = &sample.make<Timeline::Object>();
    content.timeline->width = 320;
    auto& song = sample.make<Import::Object>();
    song.tag = "Song";
    content.userCollection = &sample.make<EditorCollection::UserObject>();
    content.userCollection->items = {&song};
    content.resourceTable = &sample.make<ResourceTable::Object>();
    content.resourceTable->resource2fileInfo[{"c", Resource::AudioType}] = {};
    content.portable = true;
}

void fillPicture(Sample& sample)
{
    QImage image(2, 1, QImage::Format_RGB32);
    image.setPixelColor(0, 0, QColor(255, 0, 0));
    image.setPixelColor(1, 0, QColor(0, 0, 255));
    auto& theme = sample.root<EditorCollection::PersistentItem<Theme::Object>>();
    theme.uniqueId = "{1}";
    theme.preview = std::make_shared<const Types::Image>(QPixmap::fromImage(image));
    auto& quiz = sample.root<EditorCollection::PersistentItem<Quiz::Preset>>();
    quiz.uniqueId = "{2}";
    quiz.preview = theme.preview;
}

} // namespace

void fillSong(Import::Object& song)
{
    song.tag = "Song";
    song.description = "A song";
    song.descriptionUrl = "https://example.org/song";
    song.setLocation("song.flac");
    song.setRemoteUrl("https://example.org/song.flac");
    song.setRemoteSize(5000000000);
    song.kind = Import::Object::Kind(2);
    song.category = "sample_music";
}

Indication::Object marks()
{
    Indication::Object marks;
    marks.id = "Effects";
    marks.favoriteItems = {"blur"};
    marks.newItems = {"haze", "glow"};
    marks.knownItems = {"dawn"};
    return marks;
}

Package::Object package()
{
    const auto addOnAt = [](const char* path) {
        Package::CollectionAddOn addOn;
        addOn.contentPath = path;
        return addOn;
    };
    Package::Resource rain;
    rain.type = Package::Resource::Type(3);
    rain.id = "rain";
    rain.file = "rain.mov";
    rain.timing.intro = 100;
    rain.timing.outro = 250;
    rain.timing.loopMinCount = 2;
    Package::CollectionAddOn titles = addOnAt("titles");
    titles.translationDir = "titles/lang";
    titles.category2collection = {{"Sun", "Callout"}, {"Rain", "Title"}};
    titles.resources = {rain};
    Package::Object package;
    package.overlays = {titles};
    package.transitions = {addOnAt("wipes")};
    package.effects = {addOnAt("blurs")};
    package.imports = {addOnAt("songs")};
    package.fontsDir = "fonts";
    package.quizzes = {addOnAt("riddles")};
    return package;
}

Package::Storage storage()
{
    Package::Storage storage;
    Package::StorageItem& weather = storage.package2storage["weather"];
    weather.collection2tags = {{"Title", {"Sun", "Rain"}}};
    weather.collection2categories = {{"Title", {"Weather"}}};
    return storage;
}

NamedSample sharedPicture()
{
    return {"picture", fillPicture};
}

std::vector<NamedSample> librarySamples()
{
    return {
        {"Collection::PersistentItem::Effect::Object", fillStoredEffect},
        {"Collection::PersistentItem::Import::Object", fillStoredImport},
        {"Collection::PersistentItem::Theme::Object", fillStoredTheme},
        {"Collection::PersistentItem::Transition::Object", fillStoredTransition},
        {"Collection::PersistentItem::Overlay::Preset", fillStoredOverlay},
        {"Collection::PersistentItem::Quiz::Preset", fillStoredQuiz},
        {"Collection::PersistentItem::Envelope::TransformationPreset", fillStoredMove},
        {"Import::Object", fillImport},
        {"EditorCollection::UserObject", fillUserCollection},
        {"Indication::Object", fillMarks},
        {"Package::Resource", fillResource},
        {"Package::CollectionAddOn", fillAddOn},
        {"Package::Object", fillPackage},
        {"Package::StorageItem", fillStorageItem},
        {"Package::Storage", fillStorage},
        {"Package::InApp::Pack", fillPack},
        {"Package::InApp::Object", fillCatalogue},
        {"Project::Content", fillContent},
    };
}

} // namespace GoldenTests
