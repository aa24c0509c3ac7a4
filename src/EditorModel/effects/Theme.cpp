// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/Theme.h>

#include <EditorModel/persistence/Fields.h>

namespace Theme {

void fields(Serialize::Fields& f, Object& theme)
{
    f("tag", theme.tag)("transitionsList", theme.transitionsList)("previewVideo", theme.previewVideo);
    f("music", theme.music)("startTitle", theme.startTitle)("finalTitle", theme.finalTitle);
    f("minSceneDuration", theme.minSceneDuration)("maxSceneDuration", theme.maxSceneDuration);
}

} // namespace Theme

EDITORMODEL_PERSISTENT_CLASS(Theme::Object)
