// SPDX-License-Identifier: Apache-2.0
#include "host/editing/NestedTimelines.h"

#include <algorithm>
#include <deque>
#include <iterator>
#include <map>
#include <set>

namespace Host {
namespace {

using Timeline::Clip;
using Timelines = std::set<const Timeline::Object*>;

Timelines shownBy(const std::vector<const Clip*>& nesting)
{
    Timelines shown;
    for (const Clip* const clip : nesting) {
        shown.insert(clip->nestedTimeline);
    }
    return shown;
}

/// Which timelines are shown by which, as far as they are shown by one of them.
class Showing
{
public:
    Showing(const Timeline::Object& timeline, const std::vector<const Clip*>& nesting)
    {
        add(&timeline, shownBy(nesting));
        while (!m_unread.empty()) {
            const Timeline::Object* const next = m_unread.front();
            m_unread.pop_front();
            if (m_shown.count(next) == 0) {
                add(next, shownBy(nestingClips(*next)));
            }
        }
    }

    /// What is left when those that show nothing are taken away, and those that show nothing then, and so on.
    Timelines endless()
    {
        std::deque<const Timeline::Object*> finite;
        for (const auto& [timeline, shown] : m_shown) {
            if (shown.empty()) {
                finite.push_back(timeline);
            }
        }
        while (!finite.empty()) {
            const Timeline::Object* const taken = finite.front();
            finite.pop_front();
            m_shown.erase(taken);
            for (const Timeline::Object* const showing : m_showing[taken]) {
                Timelines& shown = m_shown[showing];
                shown.erase(taken);
                if (shown.empty()) {
                    finite.push_back(showing);
                }
            }
        }
        Timelines left;
        for (const auto& entry : m_shown) {
            left.insert(entry.first);
        }
        return left;
    }

private:
    void add(const Timeline::Object* timeline, const Timelines& shown)
    {
        m_shown[timeline] = shown;
        for (const Timeline::Object* const other : shown) {
            m_showing[other].insert(timeline);
            m_unread.push_back(other);
        }
    }

    std::map<const Timeline::Object*, Timelines> m_shown;
    std::map<const Timeline::Object*, Timelines> m_showing;
    std::deque<const Timeline::Object*> m_unread;
};

} // namespace

std::vector<const Clip*> endlessClips(const Timeline::Object& timeline,
                                      const std::vector<const Clip*>& nesting)
{
    std::vector<const Clip*> found;
    if (!nesting.empty()) {
        const Timelines endless = Showing(timeline, nesting).endless();
        std::copy_if(nesting.begin(), nesting.end(), std::back_inserter(found),
                     [&endless](const Clip* clip) { return endless.count(clip->nestedTimeline) != 0; });
    }
    return found;
}

std::vector<const Clip*> nestingClips(const Timeline::Object& timeline)
{
    std::vector<const Clip*> found;
    for (const auto& entry : timeline.clips) {
        if (entry.first && entry.first->nestedTimeline) {
            found.push_back(entry.first);
        }
    }
    return found;
}

} // namespace Host
