// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/media/ResourceRef.h>
#include <EditorModel/media/TimingMode.h>
#include <EditorModel/types/MTime.h>
#include <EditorModel/types/Range.h>

#include <QtGlobal>

#include <memory>

namespace Filmstrip {

/// Defined by whichever module fills filmstrips in.
class Payload;

/// What a row of pictures of a resource is to show. Nothing is checked.
class EDITORMODEL_EXPORT Object : public virtual PubSub::Object
{
public:
    ResourceRef resource;
    /// Width and height in pixels; whether of a picture or of the row, those who fill it in and draw it agree
    /// on.
    int width = 0;
    int height = 0;
    /// The length of the whole source.
    MTime sourceDuration;
    Media::TimingMode timingMode = Media::DefaultTimingMode;
    /// The stretch of the source that the row shows.
    Types::Range sourceRange;
    /// The part of it that is looked at now.
    Types::Range currentRange;
    /// From one picture to the next.
    MTime step;
    bool reversed = false;
    quint64 bumpCount = 0;
    /// Null until somebody fills it in; copies share it.
    std::shared_ptr<const Payload> payload;

    Object* setResource(const ResourceRef& newResource);
    Object* setWidth(int pixels);
    Object* setHeight(int pixels);
    Object* setSourceDuration(MTime duration);
    Object* setTimingMode(Media::TimingMode mode);
    Object* setSourceRange(const Types::Range& range);
    Object* setSourceRange(MTime from, MTime to);
    Object* setCurrentRange(const Types::Range& range);
    Object* setCurrentRange(MTime from, MTime to);
    Object* setStep(MTime newStep);
    Object* setReversed(bool on);

    /// Adds 1 to `bumpCount`, so that observers see a change although the parameters stay.
    Object* bump();
};

} // namespace Filmstrip
