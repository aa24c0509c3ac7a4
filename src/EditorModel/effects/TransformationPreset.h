// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/effects/Envelope.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/MTime.h>

#include <QString>

namespace Envelope {

/// A named move over a picture, as the library offers it.
class EDITORMODEL_EXPORT TransformationPreset : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(TransformationPreset)

public:
    /// Values belong to whoever makes the preset; the model stores them as numbers.
    enum Type : int
    {
    };

    /// "x-application/TransformationItem-serialized", for the clipboard and for drag and drop.
    static const QString* const mimeType;

    Type type = Type(0);
    /// The name in the library.
    QString tag;
    QString description;
    /// Not read by the model.
    MTime sourceDuration;
    TransformationEnvelope transformation;

    TransformationPreset();
    TransformationPreset(const TransformationPreset&) = default;
    TransformationPreset(TransformationPreset&&) = default;
    TransformationPreset& operator=(const TransformationPreset&) = default;
    TransformationPreset& operator=(TransformationPreset&&) = default;
    ~TransformationPreset() override;
};

} // namespace Envelope

EDITORMODEL_ARCHIVE_NAME(Envelope::TransformationPreset, "Envelope::TransformationPreset")
