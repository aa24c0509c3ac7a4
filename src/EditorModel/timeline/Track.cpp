// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/Track.h>

#include <EditorModel/persistence/Fields.h>
#include <EditorModel/timeline/Object.h>

namespace Timeline {

Track::Track(TrackType type_) : type(type_) {}

Track::~Track() = default;

Track* Track::setType(TrackType newType)
{
    type = newType;
    return this;
}

Track* Track::setMuted(bool on)
{
    muted = on;
    return this;
}

Track* Track::setHidden(bool on)
{
    hidden = on;
    return this;
}

Track* Track::setLinked(bool on)
{
    linked = on;
    return this;
}

Track* Track::setGapless(bool on)
{
    gapless = on;
    return this;
}

Track* Track::setUsed(bool on)
{
    used = on;
    return this;
}

Track* Track::setTimeline(const Timeline::Object* newTimeline)
{
    timeline = newTimeline;
    return this;
}

bool operator==(const Track& a, const Track& b)
{
    return a.type == b.type && a.muted == b.muted && a.hidden == b.hidden && a.linked == b.linked &&
           a.gapless == b.gapless && a.used == b.used && a.timeline == b.timeline;
}

bool operator!=(const Track& a, const Track& b)
{
    return !(a == b);
}

void fields(Serialize::Fields& f, Track& track)
{
    f("type", track.type)("muted", track.muted)("hidden", track.hidden)("linked", track.linked);
    f("gapless", track.gapless)("used", track.used)("timeline", track.timeline);
}

} // namespace Timeline

EDITORMODEL_PERSISTENT_CLASS(Timeline::Track)
