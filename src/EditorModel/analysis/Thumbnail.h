// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/media/ResourceRef.h>
#include <EditorModel/types/MTime.h>

#include <memory>

namespace Types {
class Image;
}

namespace Thumbnail {

/// One picture of a resource: which one is wanted, and the picture once it is there.
class EDITORMODEL_EXPORT Object : public virtual PubSub::Object
{
public:
    ResourceRef resource;
    MTime resourceDuration;
    /// Where in the resource the picture is taken.
    MTime position;
    int width = 0;  ///< in pixels
    int height = 0; ///< in pixels
    /// Null until it is there; copies share it.
    std::shared_ptr<const Types::Image> image;

    Object* setResource(const ResourceRef& newResource);
    Object* setResourceDuration(MTime duration);
    Object* setPosition(MTime newPosition);
    Object* setWidth(int pixels);
    Object* setHeight(int pixels);
    Object* setSize(int widthInPixels, int heightInPixels);
    Object* setImage(std::shared_ptr<const Types::Image> newImage);

    /// The image isn't compared: a thumbnail that waits for its picture equals the one that has it.
    bool operator==(const Thumbnail::Object& other) const;
    bool operator!=(const Thumbnail::Object& other) const;
};

} // namespace Thumbnail
