// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/analysis/Filmstrip.h>

namespace Filmstrip {

Object* Object::setResource(const ResourceRef& newResource)
{
    resource = newResource;
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

Object* Object::setSourceDuration(MTime duration)
{
    sourceDuration = duration;
    return this;
}

Object* Object::setTimingMode(Media::TimingMode mode)
{
    timingMode = mode;
    return this;
}

Object* Object::setSourceRange(const Types::Range& range)
{
    sourceRange = range;
    return this;
}

Object* Object::setSourceRange(MTime from, MTime to)
{
    return setSourceRange(Types::Range(from, to));
}

Object* Object::setCurrentRange(const Types::Range& range)
{
    currentRange = range;
    return this;
}

Object* Object::setCurrentRange(MTime from, MTime to)
{
    return setCurrentRange(Types::Range(from, to));
}

Object* Object::setStep(MTime newStep)
{
    step = newStep;
    return this;
}

Object* Object::setReversed(bool on)
{
    reversed = on;
    return this;
}

Object* Object::bump()
{
    ++bumpCount;
    return this;
}

} // namespace Filmstrip
