// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/Preview.h>
#include <EditorModel/effects/Effect.h>
#include <EditorModel/effects/Overlay.h>
#include <EditorModel/effects/Transition.h>

// The views of what a library shows, compiled once.

extern template class EDITORMODEL_EXPORT Message::View<Overlay::Preset>;
extern template class EDITORMODEL_EXPORT Message::View<Effect::Object>;
extern template class EDITORMODEL_EXPORT Message::View<Transition::Object>;

extern template class EDITORMODEL_EXPORT Preview::Details::ObjectViewBase<Overlay::Preset>;
extern template class EDITORMODEL_EXPORT Preview::Details::ObjectViewBase<Effect::Object>;
extern template class EDITORMODEL_EXPORT Preview::Details::ObjectViewBase<Transition::Object>;
