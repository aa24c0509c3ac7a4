// SPDX-License-Identifier: Apache-2.0
// The names by which documents know the classes of the library. They are stored data: none may change, and
// none may go.
#include <EditorModel/EditorModel.h>

#include <gmock/gmock.h>

#include <memory>
#include <stdexcept>
#include <string>
#include <typeinfo>
#include <vector>

namespace {

using ::testing::UnorderedElementsAreArray;

struct Row
{
    std::string name;
    const std::type_info& info;
    const char* own;
    const char* exportKey;
};

template <class T>
Row row(const char* name)
{
    return {name, typeid(T), T::NameInArchive(), boost::serialization::guid<T>()};
}

/// By hand; a new class of the library is entered here.
const std::vector<Row> classes = {
    row<Media::Audio>("Audio"),
    row<Media::Video>("Video"),
    row<Media::File>("File"),
    row<Media::File::Track>("Track"),
    row<Media::File::Track::Audio>("AudioTrack"),
    row<Media::File::Track::Video>("VideoTrack"),
    row<VolumeEnvelope>("VolumeEnvelope"),
    row<TransformationEnvelope>("TransformationEnvelope"),
    row<Animation::KeyValue<double>>("AnimationDoubleKeyValue"),
    row<Animation::KeyValue<Transformation::Object>>("AnimationTransformationKeyValue"),
    row<EditorCollection::PersistentItem<Effect::Object>>("Collection::PersistentItem::Effect::Object"),
    row<EditorCollection::PersistentItem<Import::Object>>("Collection::PersistentItem::Import::Object"),
    row<EditorCollection::PersistentItem<Theme::Object>>("Collection::PersistentItem::Theme::Object"),
    row<EditorCollection::PersistentItem<Transition::Object>>(
        "Collection::PersistentItem::Transition::Object"),
    row<EditorCollection::PersistentItem<Overlay::Preset>>("Collection::PersistentItem::Overlay::Preset"),
    row<EditorCollection::PersistentItem<Quiz::Preset>>("Collection::PersistentItem::Quiz::Preset"),
    row<EditorCollection::PersistentItem<Envelope::TransformationPreset>>(
        "Collection::PersistentItem::Envelope::TransformationPreset"),
    row<Timeline::Clip>("Timeline::Clip"),
    row<Timeline::ClipTiming>("Timeline::ClipTiming"),
    row<Timeline::Label>("Timeline::Label"),
    row<Timeline::Link>("Timeline::Link"),
    row<Timeline::Object>("Timeline::Object"),
    row<Timeline::Track>("Timeline::Track"),
    row<Timeline::TrackedObject>("Timeline::TrackedObject"),
    row<Timeline::TrackingLinkInfo>("Timeline::TrackingLinkInfo"),
    row<Project::Content>("Project::Content"),
    row<Package::CollectionAddOn>("Package::CollectionAddOn"),
    row<Package::Object>("Package::Object"),
    row<Package::Resource>("Package::Resource"),
    row<Package::Storage>("Package::Storage"),
    row<Package::StorageItem>("Package::StorageItem"),
    row<Package::InApp::Object>("Package::InApp::Object"),
    row<Package::InApp::Pack>("Package::InApp::Pack"),
    row<MotionTracking::Data>("MotionTracking::Data"),
    row<MotionTracking::Frame>("MotionTracking::Frame"),
    row<MotionTracking::TimedFrame>("MotionTracking::TimedFrame"),
    row<Overlay::DropShadow>("Overlay::DropShadow"),
    row<Overlay::Item>("Overlay::Item"),
    row<Overlay::Preset>("Overlay::Preset"),
    row<Quiz::Preset>("Quiz::Preset"),
    row<Quiz::Question>("Quiz::Question"),
    row<Resource::FileInfo>("Resource::FileInfo"),
    row<Resource::Timing>("Resource::Timing"),
    row<ResourceTable::FileResourceInfo>("ResourceTable::FileResourceInfo"),
    row<ResourceTable::Object>("ResourceTable::Object"),
    row<BeatDetection::Object>("BeatDetection::Object"),
    row<Editor::Object>("Editor::Object"),
    row<Effect::Object>("Effect::Object"),
    row<EditorCollection::UserObject>("EditorCollection::UserObject"),
    row<Envelope::TransformationPreset>("Envelope::TransformationPreset"),
    row<Film::Object>("Film::Object"),
    row<Import::Object>("Import::Object"),
    row<Indication::Object>("Indication::Object"),
    row<Stabilization::Object>("Stabilization::Object"),
    row<Theme::Object>("Theme::Object"),
    row<Transformation::Object>("Transformation::Object"),
    row<Transition::Object>("Transition::Object"),
    row<Types::Pen>("Types::Pen"),
    row<Types::Rect>("Types::Rect"),
    row<Types::Transform>("Types::Transform"),
};

TEST(Registry, HoldsTheseNamesAndNoOthers)
{
    std::vector<std::string> names;
    for (const Row& row : classes)
        names.push_back(row.name);
    EXPECT_EQ(names.size(), 60u);
    EXPECT_THAT(Serialize::registeredNames(), UnorderedElementsAreArray(names));
}

TEST(Registry, MakesAnObjectOfTheRightClassForEachName)
{
    for (const Row& row : classes) {
        const Serialize::BaseCreator* const creator = Serialize::findCreator(row.name);
        ASSERT_NE(creator, nullptr) << row.name;
        const std::unique_ptr<Serialize::ISerializable> made(creator->Create());
        ASSERT_NE(made, nullptr) << row.name;
        const Serialize::ISerializable& object = *made;
        EXPECT_TRUE(typeid(object) == row.info) << row.name << " makes " << typeid(object).name();
        EXPECT_EQ(object.GetNameInArchive(), row.name);
        EXPECT_EQ(row.own, row.name);
    }
}

TEST(Registry, OneNameServesBothRoutes)
{
    for (const Row& row : classes) {
        EXPECT_EQ(row.exportKey, row.name);
        const Serialize::Type* const type = Serialize::findType(row.name);
        ASSERT_NE(type, nullptr) << row.name;
        EXPECT_TRUE(type->info == row.info) << row.name;
        EXPECT_EQ(type->version, 0u) << row.name;
    }
}

TEST(Registry, RefusesANameThatIsTaken)
{
    const Serialize::BaseCreator* const clips = Serialize::findCreator("Timeline::Clip");
    const Timeline::Label::Creator labels;
    EXPECT_THROW(Serialize::Registrator("Timeline::Clip", &labels), std::logic_error);
    EXPECT_EQ(Serialize::findCreator("Timeline::Clip"), clips);
}

TEST(Registry, KnowsNoCreatorOfWhatIsWrittenInItsPlaceOnly)
{
    EXPECT_STREQ(Statistics::Object::NameInArchive(), "Statistics::Object");
    for (const char* const name :
         {"Statistics::Object", "QByteArray", "QPixmap", "Types::Image", "Timeline", ""})
        EXPECT_EQ(Serialize::findCreator(name), nullptr) << name;
    EXPECT_STREQ(boost::serialization::guid<QByteArray>(), "QByteArray");
    EXPECT_STREQ(boost::serialization::guid<QPixmap>(), "QPixmap");
}

} // namespace
