// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/PackageContent.h>

#include <EditorModel/persistence/Fields.h>

namespace Package {

void fields(Serialize::Fields& f, Package::Resource& resource)
{
    f("type", resource.type)("id", resource.id)("file", resource.file);
    f("intro", resource.timing.intro)("outro", resource.timing.outro)("count", resource.timing.loopMinCount);
}

void fields(Serialize::Fields& f, CollectionAddOn& addOn)
{
    f("contentPath", addOn.contentPath)("translationDir", addOn.translationDir);
    f("category2collection", addOn.category2collection)("resources", addOn.resources);
}

void fields(Serialize::Fields& f, Package::Object& package)
{
    f("overlays", package.overlays)("transitions", package.transitions)("effects", package.effects);
    f("imports", package.imports)("fontsDir", package.fontsDir)("quizzes", package.quizzes);
}

} // namespace Package

EDITORMODEL_PERSISTENT_CLASS(Package::Resource)
EDITORMODEL_PERSISTENT_CLASS(Package::CollectionAddOn)
EDITORMODEL_PERSISTENT_CLASS(Package::Object)
