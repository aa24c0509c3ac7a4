// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/Transition.h>

#include <EditorModel/persistence/Fields.h>

#include <algorithm>

namespace Transition {
namespace {

bool hasKind(const std::deque<ResourceRef>& resources, Resource::Type kind)
{
    return std::any_of(resources.begin(), resources.end(), [kind](const ResourceRef& resource) {
        return std::get<Resource::Type>(resource) == kind;
    });
}

} // namespace

Object::Object(const QString& id_) : id(id_) {}

bool Object::hasVideoResources() const
{
    return hasKind(resources, Resource::VideoType);
}

bool Object::hasAudioResources() const
{
    return hasKind(resources, Resource::AudioType);
}

void fields(Serialize::Fields& f, Object& transition)
{
    f("id", transition.id)("tag", transition.tag)("description", transition.description);
    f("strategy", transition.strategy)("type", transition.type)("resources", transition.resources);
    f("defaultDuration", transition.defaultDuration)("volume", transition.volume);
}

} // namespace Transition

EDITORMODEL_PERSISTENT_CLASS(Transition::Object)
