// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/TypedView.h>

namespace Preview::Details {

/// The view of a module that plays what is selected in a library: overlay presets, effects, transitions,
/// imports.
template <typename T>
class ObjectViewBase : private ::Message::View<T>
{
    EDITORMODEL_TYPED_VIEW(T, preview)
};

} // namespace Preview::Details
