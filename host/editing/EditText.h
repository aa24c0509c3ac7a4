// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/timeline/Timeline.h>

#include <QString>

namespace Transition {
class Object;
}

namespace Host {

// How the sentences about edits name things. None must be null.

/// `clip "holiday"`: by its name, or by that of its file.
QString clipText(const Timeline::Clip* clip);
/// `transition "dissolve"`: by its name in the library, or by its identifier.
QString transitionText(const Transition::Object* transition);
/// "00:00:01.500".
QString timeText(MTime time);

} // namespace Host
