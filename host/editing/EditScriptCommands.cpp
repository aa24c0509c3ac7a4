// SPDX-License-Identifier: Apache-2.0
// What the commands of a script do.
#include "host/editing/EditScript.h"

#include "host/commands/Refusal.h"
#include "host/editing/EditWords.h"
#include "host/editing/Titles.h"
#include "host/media/MediaAdding.h"
#include "host/packages/PackageShelf.h"

#include <EditorModel/effects/Transition.h>

namespace Host {

using Timeline::Clip;
using Timeline::Track;

namespace {

void requireAdded(const QString& path, const FileAdder::Contexts& places)
{
    const MediaAdding adding = addMedia({path}, places);
    if (!adding.failures.empty()) {
        throw Refusal(adding.failures.front().path, adding.failures.front().reason);
    }
}

} // namespace

EditResult EditScript::add(const QStringList& words)
{
    FileAdder::TimelineContext place(&timeline());
    if (words.size() > 2) {
        place.position = timeAt(words[2]);
        if (place.position < MTime()) {
            reject(quoted(words[2]) + " lies before the timeline");
        }
    }
    FileAdder::Contexts places = m_places;
    requireAdded(words[1], places.setContext(place));
    return {};
}

EditResult EditScript::overwrite(const QStringList& words)
{
    const MTime at = timeAt(words[2]);
    const Track* const track = words.size() > 3 ? trackAt(words[3]) : nullptr;
    const int level = words.size() > 4 ? levelAt(words[4]) : 0;
    const MediaClips::Clips clips = m_media.make(words[1]);
    if (m_places.userCollection || m_places.resourceTable) {
        requireAdded(words[1], m_places);
    }
    return lay(m_session, clips, LayingPlace{track, level, at, true});
}

EditResult EditScript::title(const QStringList& words)
{
    const MTime at = timeAt(words[2]);
    const MTime length = words.size() > 3 ? timeAt(words[3]) : MTime(-1);
    const Track* const track = words.size() > 4 ? trackAt(words[4]) : nullptr;
    if (words.size() > 3 && !(length > MTime())) {
        reject(quoted(words[3]) + " is no length of a title");
    }
    return layTitle(m_session, titleOf(words[1], m_shelf), {at, length, track});
}

EditResult EditScript::move(const QStringList& words)
{
    const Clip* const clip = clipAt(words[1]);
    const MTime at = timeAt(words[2]);
    if (words.size() == 3) {
        return m_session.move(clip, at);
    }
    const int level = words.size() == 5 ? levelAt(words[4]) : 0;
    return m_session.move(clip, at, trackAt(words[3]), level);
}

EditResult EditScript::trimLeft(const QStringList& words)
{
    const Clip* const clip = clipAt(words[1]);
    return m_session.trimLeft(clip, timeAt(words[2]) - timeline().clipTiming(clip).timestamp,
                              rippleAt(words, 3));
}

EditResult EditScript::trimRight(const QStringList& words)
{
    const Clip* const clip = clipAt(words[1]);
    return m_session.trimRight(clip, timeline().clipTiming(clip).end() - timeAt(words[2]),
                               rippleAt(words, 3));
}

EditResult EditScript::split(const QStringList& words)
{
    return m_session.split(clipAt(words[1]), timeAt(words[2]));
}

EditResult EditScript::setSpeed(const QStringList& words)
{
    return m_session.setSpeed(clipAt(words[1]), factorAt(words[2]), rippleAt(words, 3));
}

EditResult EditScript::reverse(const QStringList& words)
{
    return m_session.reverse(clipAt(words[1]));
}

EditResult EditScript::fadeIn(const QStringList& words)
{
    const Clip* const clip = clipAt(words[1]);
    return m_session.setFades(clip, timeAt(words[2]), timeline().clipTiming(clip).fadeOutDuration);
}

EditResult EditScript::fadeOut(const QStringList& words)
{
    const Clip* const clip = clipAt(words[1]);
    return m_session.setFades(clip, timeline().clipTiming(clip).fadeInDuration, timeAt(words[2]));
}

EditResult EditScript::enable(const QStringList& words)
{
    return m_keeper.setEnabled(clipAt(words[1]), true);
}

EditResult EditScript::disable(const QStringList& words)
{
    return m_keeper.setEnabled(clipAt(words[1]), false);
}

EditResult EditScript::setVolume(const QStringList& words)
{
    return m_keeper.setVolume(clipAt(words[1]), percentAt(words[2]));
}

EditResult EditScript::lift(const QStringList& words)
{
    return m_session.lift(clipAt(words[1]));
}

EditResult EditScript::extract(const QStringList& words)
{
    return m_session.extract(clipAt(words[1]));
}

EditResult EditScript::link(const QStringList& words)
{
    return m_session.link(clipAt(words[1]), clipAt(words[2]));
}

EditResult EditScript::unlink(const QStringList& words)
{
    return m_session.unlink(clipAt(words[1]));
}

EditResult EditScript::follow(const QStringList& words)
{
    if (words.size() == 5) {
        reject("lacks a word");
    }
    const Timeline::TrackedObject object(clipAt(words[2]), words[3]);
    const QPointF offset = words.size() == 6 ? QPointF(numberAt(words[4]), numberAt(words[5])) : QPointF();
    return m_session.follow(clipAt(words[1]), Timeline::TrackingLinkInfo(object, offset));
}

EditResult EditScript::unfollow(const QStringList& words)
{
    return m_session.unfollow(clipAt(words[1]));
}

EditResult EditScript::addTransition(const QStringList& words)
{
    const auto clipOrNone = [this](const QString& word) { return word == "-" ? nullptr : clipAt(word); };
    const Timeline::ClipPair pair(clipOrNone(words[2]), clipOrNone(words[3]));
    const MTime wish = words.size() > 4 ? timeAt(words[4]) : MTime(-1);
    if (words.size() > 4 && !(wish > MTime())) {
        reject(quoted(words[4]) + " is no length of a transition");
    }
    const QString name = words.size() > 5 ? words[5] : "dissolve";
    Transition::Object* const transition = m_session.makeTransition(name);
    if (const auto* const packaged = m_shelf ? m_shelf->find<Transition::Object>(name) : nullptr) {
        *transition = *packaged;
    } else {
        transition->tag = name;
    }
    return m_session.addTransition(transition, pair, wish);
}

EditResult EditScript::removeTransition(const QStringList& words)
{
    return m_session.removeTransition(transitionAt(words[2]));
}

EditResult EditScript::addTrack(const QStringList& words)
{
    return m_session.addTrack(m_session.makeTrack(roleAt(words[2])));
}

EditResult EditScript::moveTrack(const QStringList& words)
{
    return m_session.moveTrack(trackAt(words[2]), trackAt(words[3]));
}

EditResult EditScript::removeTrack(const QStringList& words)
{
    return m_session.removeTrack(trackAt(words[2]));
}

} // namespace Host
