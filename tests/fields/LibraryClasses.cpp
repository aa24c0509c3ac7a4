// SPDX-License-Identifier: Apache-2.0
#include "ClassTable.h"

#include <EditorModel/effects/Effect.h>
#include <EditorModel/effects/Overlay.h>
#include <EditorModel/effects/Quiz.h>
#include <EditorModel/effects/Theme.h>
#include <EditorModel/effects/TransformationPreset.h>
#include <EditorModel/effects/Transition.h>
#include <EditorModel/library/ImportObject.h>
#include <EditorModel/library/ImportState.h>
#include <EditorModel/library/Indication.h>
#include <EditorModel/library/Pack.h>
#include <EditorModel/library/PackCatalogue.h>
#include <EditorModel/library/PackageContent.h>
#include <EditorModel/library/PackageStorage.h>
#include <EditorModel/library/PersistentItem.h>
#include <EditorModel/library/Project.h>
#include <EditorModel/library/UserBlob.h>
#include <EditorModel/library/UserObject.h>

namespace FieldTests {
namespace {

ClassTable projectContent()
{
    using Project::Content;
    return ClassOf<Content>("Project::Content")
        .field<&Content::timeline>("timeline", nullptr)
        .field<&Content::userCollection>("userCollection", nullptr)
        .field<&Content::resourceTable>("resourceTable", nullptr)
        .field<&Content::portable>("portable", false);
}

template <class T>
ClassTable persistentItem(const char* name)
{
    using Item = EditorCollection::PersistentItem<T>;
    return ClassOf<Item>(name)
        .template field<&Item::uniqueId>("uniqueId", "")
        .template field<&Item::item>("item", nullptr)
        .template field<&Item::preview>("preview", nullptr)
        .template field<&Item::categories>("categories", {})
        .template field<&Item::collectionId>("collectionId", "")
        .template field<&Item::customStrings>("customStrings", {});
}

ClassTable packageResource()
{
    using Package::Resource;
    return ClassOf<Resource>("Package::Resource")
        .field<&Resource::type>("type", Resource::Type(0))
        .field<&Resource::id>("id", "")
        .field<&Resource::file>("file", "")
        .field<&Resource::timing>("timing", {});
}

ClassTable collectionAddOn()
{
    using Package::CollectionAddOn;
    return ClassOf<CollectionAddOn>("Package::CollectionAddOn")
        .field<&CollectionAddOn::contentPath>("contentPath", "")
        .field<&CollectionAddOn::translationDir>("translationDir", "")
        .field<&CollectionAddOn::category2collection>("category2collection", {})
        .field<&CollectionAddOn::resources>("resources", {});
}

ClassTable package()
{
    using Package::Object;
    return ClassOf<Object>("Package::Object")
        .field<&Object::reservedFirst>("reservedFirst", "")
        .field<&Object::reservedSecond>("reservedSecond", "")
        .field<&Object::reservedThird>("reservedThird", "")
        .field<&Object::overlays>("overlays", {})
        .field<&Object::transitions>("transitions", {})
        .field<&Object::effects>("effects", {})
        .field<&Object::imports>("imports", {})
        .field<&Object::quizzes>("quizzes", {})
        .field<&Object::fontsDir>("fontsDir", "");
}

ClassTable storageItem()
{
    using Package::StorageItem;
    return ClassOf<StorageItem>("Package::StorageItem")
        .field<&StorageItem::collection2tags>("collection2tags", {})
        .field<&StorageItem::collection2categories>("collection2categories", {});
}

ClassTable storage()
{
    using Package::Storage;
    return ClassOf<Storage>("Package::Storage").field<&Storage::package2storage>("package2storage", {});
}

ClassTable userCollection()
{
    using EditorCollection::UserObject;
    return ClassOf<UserObject>("EditorCollection::UserObject", Returns::Sender)
        .field<&UserObject::items, &UserObject::setItems>("items", {});
}

ClassTable indication()
{
    using Indication::Object;
    return ClassOf<Object>("Indication::Object", Returns::Reference)
        .field<&Object::id, &Object::setId>("id", "")
        .field<&Object::favoriteItems>("favoriteItems", {})
        .field<&Object::newItems>("newItems", {})
        .field<&Object::knownItems>("knownItems", {});
}

ClassTable import()
{
    using Import::Object;
    return ClassOf<Object>("Import::Object", Returns::Nothing)
        .field<&Object::tag>("tag", "")
        .field<&Object::description>("description", "")
        .field<&Object::descriptionUrl>("descriptionUrl", "")
        .field<&Object::kind>("kind", Object::Kind(0))
        .field<&Object::category>("category", "")
        .property<&Object::location, &Object::setLocation>("location", "")
        .property<&Object::remoteUrl, &Object::setRemoteUrl>("remoteUrl", "")
        .property<&Object::remoteSize, &Object::setRemoteSize>("remoteSize", -1);
}

/// Apart from the rest: a pack answers for the place of its imports.
ClassTable importOfPack()
{
    return ClassOf<Import::Object>("Import::Object of a pack").field<&Import::Object::pack>("pack", nullptr);
}

ClassTable importState()
{
    using Import::State;
    return ClassOf<State>("Import::State")
        .field<&State::import, &State::setImport>("import", nullptr)
        .field<&State::deployError, &State::setDeployError>("deployError", Package::DeployResult(0))
        .field<&State::progress, &State::setProgress>("progress", 0.0)
        .field<&State::stage, &State::setStage>("stage", State::Stage(2));
}

ClassTable createResult()
{
    using Result = UserBlob::Helper::CreateResult;
    return ClassOf<Result>("UserBlob::Helper::CreateResult")
        .field<&Result::reservedFirst>("reservedFirst", 0)
        .field<&Result::reservedSecond>("reservedSecond", "")
        .field<&Result::reservedThird>("reservedThird", 2)
        .field<&Result::reservedFourth>("reservedFourth", "");
}

ClassTable pack()
{
    using Package::InApp::Pack;
    return ClassOf<Pack>("Package::InApp::Pack")
        .field<&Pack::appId>("appId", "")
        .field<&Pack::locale2productName>("locale2productName", {})
        .field<&Pack::locale2previewUrl>("locale2previewUrl", {})
        .field<&Pack::downloadUrl>("downloadUrl", "")
        .field<&Pack::reservedText>("reservedText", "")
        .field<&Pack::installationStatus, &Pack::setInstallationStatus>("installationStatus",
                                                                        Pack::InstallationStatus(0));
}

ClassTable packCatalogue()
{
    using Package::InApp::Object;
    return ClassOf<Object>("Package::InApp::Object")
        .field<&Object::packs>("packs", {})
        .field<&Object::appId2pack>("appId2pack", {})
        .field<&Object::updateStatus>("updateStatus", 0);
}

} // namespace

std::vector<ClassTable> libraryClasses()
{
    return {projectContent(),
            persistentItem<Effect::Object>("EditorCollection::PersistentItem<Effect::Object>"),
            persistentItem<Import::Object>("EditorCollection::PersistentItem<Import::Object>"),
            persistentItem<Theme::Object>("EditorCollection::PersistentItem<Theme::Object>"),
            persistentItem<Transition::Object>("EditorCollection::PersistentItem<Transition::Object>"),
            persistentItem<Overlay::Preset>("EditorCollection::PersistentItem<Overlay::Preset>"),
            persistentItem<Quiz::Preset>("EditorCollection::PersistentItem<Quiz::Preset>"),
            persistentItem<Envelope::TransformationPreset>(
                "EditorCollection::PersistentItem<Envelope::TransformationPreset>"),
            packageResource(),
            collectionAddOn(),
            package(),
            storageItem(),
            storage(),
            userCollection(),
            indication(),
            import(),
            importOfPack(),
            importState(),
            createResult(),
            pack(),
            packCatalogue()};
}

} // namespace FieldTests
