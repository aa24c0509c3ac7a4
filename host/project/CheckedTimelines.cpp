// SPDX-License-Identifier: Apache-2.0
#include "host/project/CheckedTimelines.h"

namespace Host {

QString CheckedTimeline::nameOf(const Timeline::Clip* clip) const
{
    const int number = outline.numberOf(clip);
    return number == 0
               ? "a clip" + suffix
               : QStringLiteral("clip %1 \"%2\"%3").arg(QString::number(number), Host::nameOf(*clip), suffix);
}

std::deque<CheckedTimeline> checkedTimelines(const std::deque<const Timeline::Object*>& timelines)
{
    std::deque<CheckedTimeline> found;
    std::set<const Timeline::Object*> seen = {nullptr};
    for (const Timeline::Object* const timeline : timelines) {
        if (seen.insert(timeline).second) {
            const bool isOnly = timelines.size() == 1;
            const QString name =
                isOnly ? QStringLiteral("the timeline") : QStringLiteral("timeline %1").arg(found.size() + 1);
            found.push_back({TimelineOutline(*timeline), name, isOnly ? QString() : " in " + name});
        }
    }
    for (std::size_t next = 0; next != found.size(); ++next) {
        for (const Timeline::Clip* const clip : found[next].outline.clips()) {
            if (seen.insert(clip->nestedTimeline).second) {
                const QString name = "the timeline of " + found[next].nameOf(clip);
                found.push_back({TimelineOutline(*clip->nestedTimeline), name, " in " + name});
            }
        }
    }
    return found;
}

} // namespace Host
