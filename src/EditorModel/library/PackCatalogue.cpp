// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/PackCatalogue.h>

#include <EditorModel/library/Pack.h>
#include <EditorModel/persistence/Fields.h>

namespace Package::InApp {

InApp::Object* Object::addPack(const Pack* pack)
{
    packs.append(pack);
    appId2pack[pack->appId] = pack;
    return this;
}

InApp::Object* Object::removePack(const Pack* pack)
{
    packs.removeAll(pack);
    appId2pack.remove(pack->appId);
    return this;
}

const Pack* Object::findPack(const QString& appId) const
{
    return appId2pack.value(appId);
}

std::set<const Pack*> Object::packsDifference(const InApp::Object& other) const
{
    std::set<const Pack*> difference(packs.begin(), packs.end());
    for (const Pack* pack : other.packs)
        difference.erase(pack);
    return difference;
}

InApp::Object* Object::update()
{
    updateStatus = 1;
    return this;
}

void fields(Serialize::Fields& f, InApp::Object& catalogue)
{
    f("packs", catalogue.packs);
}

} // namespace Package::InApp

EDITORMODEL_PERSISTENT_CLASS(Package::InApp::Object)
