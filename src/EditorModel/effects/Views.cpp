// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/Views.h>

template class Message::View<Overlay::Preset>;
template class Message::View<Effect::Object>;
template class Message::View<Transition::Object>;

template class Preview::Details::ObjectViewBase<Overlay::Preset>;
template class Preview::Details::ObjectViewBase<Effect::Object>;
template class Preview::Details::ObjectViewBase<Transition::Object>;
