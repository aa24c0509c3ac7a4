// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/media/ResourceRef.h>

#include <memory>

namespace Types {
class Blob;
}

namespace Waveform {

/// The waveform of a resource, for the module that draws it.
class EDITORMODEL_EXPORT Object : public virtual PubSub::Object
{
public:
    ResourceRef resource;
    /// Only whoever fills it in and whoever draws it know what it holds. Null until it is there; copies share
    /// it.
    std::shared_ptr<const Types::Blob> data;

    Object* setResource(const ResourceRef& newResource);
    Object* setData(const std::shared_ptr<const Types::Blob>& newData);
};

} // namespace Waveform
