// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/types/Decibel.h>

#include <QString>

namespace VUMeter {

/// The present levels of a source of sound. They are 0 dB until somebody has measured them; silence is minus
/// infinity.
class EDITORMODEL_EXPORT Object : public virtual PubSub::Object
{
public:
    /// The roles belong to the modules that measure; other values are reached by a cast.
    enum Role : int
    {
        DefaultRole = 1,
    };

    QString sourceID;
    Role role = DefaultRole;
    Decibel leftChannelPeakLevel;
    Decibel rightChannelPeakLevel;
    Decibel leftChannelLevel;
    Decibel rightChannelLevel;
    bool leftChannelClippingDetected = false;
    bool rightChannelClippingDetected = false;

    Object() = default;
    Object(const QString& sourceID_, Role role_);

    Object* setSourceID(const QString& id);
    Object* setLeftChannelPeakLevel(const Decibel& level);
    Object* setRightChannelPeakLevel(const Decibel& level);
    Object* setLeftChannelLevel(const Decibel& level);
    Object* setRightChannelLevel(const Decibel& level);
    Object* setLeftChannelClippingDetected(const bool& detected);
    Object* setRightChannelClippingDetected(const bool& detected);

    /// Takes over what was measured, which is all but `sourceID` and `role`. `other` is not null.
    Object* copyFrom(const VUMeter::Object* other);
};

} // namespace VUMeter
