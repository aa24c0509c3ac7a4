// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/analysis/VUMeter.h>
#include <EditorModel/bus/TypedView.h>
#include <EditorModel/services/Playback.h>
#include <EditorModel/timeline/Composition.h>

namespace Host {

// The typed views of what the modules of a playback share.

class PlayerViewBase : private ::Message::View<Playback::Object>
{
    EDITORMODEL_TYPED_VIEW(Playback::Object, player)
};

class MarkerViewBase : private ::Message::View<Composition::Marker>
{
    EDITORMODEL_TYPED_VIEW(Composition::Marker, marker)
};

class MeterViewBase : private ::Message::View<VUMeter::Object>
{
    EDITORMODEL_TYPED_VIEW(VUMeter::Object, meter)
};

} // namespace Host
