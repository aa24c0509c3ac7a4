// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/analysis/Thumbnail.h>

#include <tuple>
#include <utility>

namespace Thumbnail {
namespace {

auto comparedFields(const Object& thumbnail)
{
    return std::tie(thumbnail.resource, thumbnail.resourceDuration, thumbnail.position, thumbnail.width,
                    thumbnail.height);
}

} // namespace

Object* Object::setResource(const ResourceRef& newResource)
{
    resource = newResource;
    return this;
}

Object* Object::setResourceDuration(MTime duration)
{
    resourceDuration = duration;
    return this;
}

Object* Object::setPosition(MTime newPosition)
{
    position = newPosition;
    return this;
}

Object* Object::setWidth(int pixels)
{
    width = pixels;
    return this;
}

Object* Object::setHeight(int pixels)
{
    height = pixels;
    return this;
}

Object* Object::setSize(int widthInPixels, int heightInPixels)
{
    width = widthInPixels;
    height = heightInPixels;
    return this;
}

Object* Object::setImage(std::shared_ptr<const Types::Image> newImage)
{
    image = std::move(newImage);
    return this;
}

bool Object::operator==(const Thumbnail::Object& other) const
{
    return comparedFields(*this) == comparedFields(other);
}

bool Object::operator!=(const Thumbnail::Object& other) const
{
    return !(*this == other);
}

} // namespace Thumbnail
