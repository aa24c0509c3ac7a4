// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/analysis/Waveform.h>

namespace Waveform {

Object* Object::setResource(const ResourceRef& newResource)
{
    resource = newResource;
    return this;
}

Object* Object::setData(const std::shared_ptr<const Types::Blob>& newData)
{
    data = newData;
    return this;
}

} // namespace Waveform
