// SPDX-License-Identifier: Apache-2.0
#include "host/editing/Titles.h"

#include "host/commands/Refusal.h"
#include "host/editing/MissingTracks.h"
#include "host/editing/TimelineInvariants.h"
#include "host/packages/PackageShelf.h"
#include "host/project/DocumentFile.h"
#include "host/project/ProjectStore.h"

#include <QFileInfo>

#include <optional>
#include <set>

namespace Host {
namespace {

using Timeline::Clip;
using Timeline::ClipTiming;
using Timeline::Track;

/// On a track without levels this may be one that it does not have.
int freeLevel(const Timeline::Object& timeline, const ClipTiming& wanted)
{
    std::set<int> taken;
    for (const auto& [clip, timing] : timeline.clips) {
        if (timing.track == wanted.track && timing.overlapsWith(wanted)) {
            taken.insert(timing.trackLevel);
        }
    }
    int level = 0;
    while (taken.count(level) != 0) {
        ++level;
    }
    return level;
}

MTime lengthOf(const Overlay::Preset& preset, MTime wish)
{
    if (wish != MTime(-1)) {
        return wish;
    }
    return preset.sourceDuration > MTime() ? preset.sourceDuration : Clip::DEFAULT_TITLE_CLIP_DURATION;
}

QString nameOf(const Overlay::Preset& preset, const QString& otherwise)
{
    return preset.tag.isEmpty() ? otherwise : preset.tag;
}

/// A slip in an identifier is not to become a title's text.
void requireNoPackage(const QString& id, const PackageShelf& shelf)
{
    const QString appId = id.section('.', 0, 0);
    if (appId != id && shelf.package(appId)) {
        throw Refusal(id, "is no title of the package " + appId);
    }
}

/// None if the word names nothing in a package.
std::optional<Title> packagedTitle(const QString& word, const PackageShelf& shelf)
{
    const QString id = word.section('=', 0, 0);
    const auto* const found = shelf.find<Overlay::Preset>(id);
    if (!found) {
        requireNoPackage(id, shelf);
        return std::nullopt;
    }
    if (id == word) {
        return Title{nameOf(*found, id), *found};
    }
    if (found->items.empty()) {
        throw Refusal(id, "has no item for the text");
    }
    Title title{word.section('=', 1), *found};
    title.preset.items.front().setText(title.name);
    return title;
}

} // namespace

Title titleOf(const QString& word, const PackageShelf* shelf)
{
    if (shelf) {
        if (auto title = packagedTitle(word, *shelf)) {
            return *title;
        }
    }
    if (!Document::formOfPath(word)) {
        Overlay::Preset preset;
        preset.appendItem(Overlay::Item().setText(word));
        return {word, preset};
    }
    if (ProjectStore::isProject(word)) {
        throw Refusal(word, "holds no title, but a project");
    }
    const Document::Graph graph = loadDocument(word);
    const auto* const preset = graph.rootAs<Overlay::Preset>();
    if (!preset) {
        throw Refusal(word, "holds no title, but " + contentOf(graph));
    }
    return {nameOf(*preset, QFileInfo(word).completeBaseName()), *preset};
}

EditResult layTitle(EditSession& session, const Title& title, const TitlePlace& place)
{
    MissingTracks missing(session);
    EditResult result = place.track ? EditResult() : missing.provide(TitleTrack);
    if (!result) {
        return result;
    }
    const Track* const track = place.track ? place.track : trackFor(*session.timeline(), TitleTrack);
    const MTime length = lengthOf(title.preset, place.length);
    Clip* const clip = session.makeClip(Clip::OverlayClip);
    clip->setName(title.name)->setOverlay(session.makeOverlay(title.preset));
    clip->setSourceDuration(length)->setUnlimitedDuration(true);
    const bool isInRange = place.at >= MTime() && place.at <= LATEST_TIME && length <= LATEST_TIME;
    const int level =
        isInRange ? freeLevel(*session.timeline(), ClipTiming(track, 0, place.at, length, 0, length)) : 0;
    result = session.overwrite({clip, track, level}, place.at);
    if (!result) {
        missing.takeBack();
    }
    return result;
}

} // namespace Host
