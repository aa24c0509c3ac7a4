// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/effects/Envelope.h>

class QSize;

namespace PanAndZoom {

/// A random move over a picture of `sourceSize` in a frame of `frameSize`: two keys, at `fromStep` and at
/// `toStep`, sorted whichever is the greater. The caller owns the envelope.
///
/// With `randomStart` the move zooms out of the picture three times in four and zooms in otherwise, and only
/// the nearer end is shifted; without it the picture shrinks from 0.9 to 0.8 and both ends are shifted.
/// `fitMode` says along which side the picture is fitted where the aspect ratios differ; an empty size leaves
/// it as it is.
///
/// Draws from `rand()`, which it doesn't seed: threads that call it side by side share the sequence.
EDITORMODEL_EXPORT TransformationEnvelope* generateEnvelope(bool randomStart, bool fitMode,
                                                            const QSize& sourceSize, const QSize& frameSize,
                                                            double fromStep, double toStep);

} // namespace PanAndZoom
