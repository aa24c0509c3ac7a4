// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/TransformationPreset.h>

#include <EditorModel/persistence/Fields.h>

namespace Envelope {

TransformationPreset::TransformationPreset() = default;
TransformationPreset::~TransformationPreset() = default;

void fields(Serialize::Fields& f, TransformationPreset& preset)
{
    f("type", preset.type)("tag", preset.tag)("description", preset.description);
    f("sourceDuration", preset.sourceDuration)("transformation", preset.transformation);
}

} // namespace Envelope

EDITORMODEL_PERSISTENT_CLASS(Envelope::TransformationPreset)
