// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/analysis/VUMeter.h>

namespace VUMeter {

Object::Object(const QString& sourceID_, Role role_) : sourceID(sourceID_), role(role_) {}

Object* Object::setSourceID(const QString& id)
{
    sourceID = id;
    return this;
}

Object* Object::setLeftChannelPeakLevel(const Decibel& level)
{
    leftChannelPeakLevel = level;
    return this;
}

Object* Object::setRightChannelPeakLevel(const Decibel& level)
{
    rightChannelPeakLevel = level;
    return this;
}

Object* Object::setLeftChannelLevel(const Decibel& level)
{
    leftChannelLevel = level;
    return this;
}

Object* Object::setRightChannelLevel(const Decibel& level)
{
    rightChannelLevel = level;
    return this;
}

Object* Object::setLeftChannelClippingDetected(const bool& detected)
{
    leftChannelClippingDetected = detected;
    return this;
}

Object* Object::setRightChannelClippingDetected(const bool& detected)
{
    rightChannelClippingDetected = detected;
    return this;
}

Object* Object::copyFrom(const VUMeter::Object* other)
{
    leftChannelPeakLevel = other->leftChannelPeakLevel;
    rightChannelPeakLevel = other->rightChannelPeakLevel;
    leftChannelLevel = other->leftChannelLevel;
    rightChannelLevel = other->rightChannelLevel;
    leftChannelClippingDetected = other->leftChannelClippingDetected;
    rightChannelClippingDetected = other->rightChannelClippingDetected;
    return this;
}

} // namespace VUMeter
