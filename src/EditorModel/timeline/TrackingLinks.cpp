// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/Object.h>

#include <iterator>

namespace Timeline {
namespace {

template <class Predicate>
void eraseLinks(std::map<const Clip*, TrackingLinkInfo>& links, Predicate isErased)
{
    for (auto link = links.begin(); link != links.end();)
        link = isErased(link->second) ? links.erase(link) : std::next(link);
}

} // namespace

Object* Object::addTrackingLink(const Clip* clip, const TrackingLinkInfo& info)
{
    trackingLinks[clip] = info;
    return this;
}

const TrackingLinkInfo* Object::getTrackingLink(const Clip* clip) const
{
    const auto found = trackingLinks.find(clip);
    return found == trackingLinks.end() ? nullptr : &found->second;
}

Object* Object::removeTrackingLink(const Clip* clip)
{
    trackingLinks.erase(clip);
    return this;
}

Object* Object::removeTrackingLink(const QString& trackingId)
{
    // A copy, since the text may be that of a link that is erased.
    eraseLinks(trackingLinks, [id = trackingId](const TrackingLinkInfo& link) {
        return link.trackedObject.trackingId == id;
    });
    return this;
}

Object* Object::clearTrackingLinks(const Clip* clip)
{
    eraseLinks(trackingLinks,
               [clip](const TrackingLinkInfo& link) { return link.trackedObject.clip == clip; });
    return this;
}

Object* Object::clearTrackingLinks()
{
    trackingLinks.clear();
    return this;
}

} // namespace Timeline
