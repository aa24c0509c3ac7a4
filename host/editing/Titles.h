// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/editing/EditSession.h"

#include <EditorModel/effects/Overlay.h>

#include <QString>

namespace Host {

class PackageShelf;

/// What a title is to show, by the name that its clip gets.
struct Title
{
    QString name;
    Overlay::Preset preset;
};

/// What a word of a command stands for, the first of
/// - the preset of a package with this identifier; behind it "=" and the text of its first item may stand. A
///   word that begins as the package's identifiers do stands for nothing else;
/// - where the word is the name of a document, by its ending, the preset in that;
/// - a preset of this text alone.
/// The shelf may be null. Throws Refusal where the document is missing or holds no preset, or the preset no
/// item for the text, and Document::Error.
Title titleOf(const QString& word, const PackageShelf* shelf = nullptr);

struct TitlePlace
{
    MTime at;
    /// -1 is the preset's own length, or that of titles by default.
    MTime length = -1;
    /// Null is the first title track, which is made if it is missing.
    const Timeline::Track* track = nullptr;
};

/// Lays a clip with a copy of the preset on the lowest level that is free there. It may be trimmed to any
/// length.
EditResult layTitle(EditSession& session, const Title& title, const TitlePlace& place);

} // namespace Host
