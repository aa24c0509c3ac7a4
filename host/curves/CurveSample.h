// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/effects/Envelope.h>

namespace Host {

/// Music that makes room for a voice, and comes up a little too loud behind it.
VolumeEnvelope sampleVolumeEnvelope();

/// A picture that is zoomed into, leans to the left and to the right, and fades away. A unit of translation
/// is meant to be the height of the frame.
TransformationEnvelope sampleTransformationEnvelope();

} // namespace Host
