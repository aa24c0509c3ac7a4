// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/Effect.h>

#include <EditorModel/persistence/Fields.h>

namespace Effect {

const QString* Object::mimeType(Type type)
{
    switch (type) {
    case Video:
        return videoMimeType;
    case Audio:
        return audioMimeType;
    }
    return nullptr;
}

Object::Object(const QString& id_, const QString& uniqueId_) : id(id_), uniqueId(uniqueId_) {}

Object::Type Object::type() const
{
    return Video;
}

Object::Impl Object::impl() const
{
    return DefaultImpl;
}

bool Object::hasIntensity() const
{
    return false;
}

QString Object::defaultTag() const
{
    return QString();
}

Object* Object::setTag(const QString& newTag)
{
    tag = newTag;
    return this;
}

Object* Object::setDescription(const QString& newDescription)
{
    description = newDescription;
    return this;
}

Object* Object::setBypass(bool on)
{
    bypass = on;
    return this;
}

void fields(Serialize::Fields& f, Object& effect)
{
    f("id", effect.id)("tag", effect.tag)("uniqueId", effect.uniqueId);
    f("description", effect.description)("intensity", effect.intensity)("bypass", effect.bypass);
}

} // namespace Effect

EDITORMODEL_PERSISTENT_CLASS(Effect::Object)
