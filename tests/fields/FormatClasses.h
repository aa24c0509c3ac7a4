// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "ClassTable.h"

#include <EditorModel/media/Media.h>

namespace FieldTests {

/// The formats of sound and picture are bases of other classes.
ClassOf<Media::Audio> audioFormat();
ClassOf<Media::Video> videoFormat();

} // namespace FieldTests
