// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>

#include <QObject>

/// Names for the application's tutorials. `QMetaEnum::fromType<Tutorial::Type>()` turns a value into its name
/// and back.
namespace Tutorial {

Q_NAMESPACE_EXPORT(EDITORMODEL_EXPORT)

/// Where a tutorial belongs. The numbers are fixed.
enum Type : int
{
    EditorStarted = 0,
    EffectsPage = 1,
    TransitionsPage = 2,
    TitlesPage = 3,
    CalloutsPage = 4,
    StickersPage = 5,
    ColorFiltersPage = 6,
    LutsPage = 7,
    SampleProject = 8,
    WebImportSaved = 9,
};
Q_ENUM_NS(Type)

} // namespace Tutorial
