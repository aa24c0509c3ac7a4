// SPDX-License-Identifier: Apache-2.0
// A module of its own, with hidden visibility and a persistent class that nobody else knows.
#include <EditorModel/persistence/Fields.h>

namespace Plugin {

class Thing : public Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Thing)

    int size = 0;
    QString name;
    const Thing* self = nullptr;
};

void fields(Serialize::Fields& f, Thing& thing)
{
    f("size", thing.size)("name", thing.name)("self", thing.self);
}

} // namespace Plugin

EDITORMODEL_ARCHIVE_NAME(Plugin::Thing, "Plugin::Thing")
EDITORMODEL_PERSISTENT_CLASS(Plugin::Thing)

extern "C" __attribute__((visibility("default"))) Serialize::ISerializable* makeThing()
{
    auto* const thing = new Plugin::Thing;
    thing->size = 7;
    thing->name = QStringLiteral("of a plug-in");
    thing->self = thing;
    return thing;
}
