// SPDX-License-Identifier: Apache-2.0
#include "host/editing/EditScript.h"

#include "host/commands/Refusal.h"
#include "host/text/TimeText.h"
#include "host/timeline/TimelineOutline.h"

#include <EditorModel/effects/Transition.h>

#include <algorithm>
#include <cmath>

namespace Host {
namespace {

using Timeline::Clip;
using Timeline::ClipTiming;
using Timeline::Track;

QString quoted(const QString& word)
{
    return '"' + word + '"';
}

/// Why a command cannot be understood; the command names it.
[[noreturn]] void reject(const QString& why)
{
    throw Refusal(QString(), why);
}

MTime timeAt(const QString& word)
{
    const auto time = timeOfText(word);
    if (!time) {
        reject(quoted(word) + " is no time: 1:02.5, 62.5 and 62500ms are");
    }
    return *time;
}

double factorAt(const QString& word)
{
    bool isNumber = false;
    const double factor = word.toDouble(&isNumber);
    if (!isNumber || !std::isfinite(factor)) {
        reject(quoted(word) + " is no speed: 2 and 0.5 are");
    }
    return factor;
}

/// The last word of a command may ask the later clips to follow.
Ripple rippleAt(const QStringList& words, int index)
{
    if (words.size() <= index) {
        return Ripple::No;
    }
    if (words[index] != "ripple") {
        reject(quoted(words[index]) + " is not understood: \"ripple\" may stand there");
    }
    return Ripple::Yes;
}

TrackType roleAt(const QString& word)
{
    const QString role = QString(word).replace('-', ' ').toLower();
    for (const TrackType type :
         {PrimaryTrack, ExtraVideoTrack, NativeAudioTrack, AudioTrack, TitleTrack, QuizTrack}) {
        if (role == QString::fromStdString(roleText(type))) {
            return type;
        }
    }
    reject(quoted(word) + " is no role of a track: primary, extra-video, native-audio, audio, title and quiz "
                          "are");
}

/// By its number, from 1 on; null for what is no number of anything.
template <class T>
const T* numbered(const std::vector<const T*>& objects, const QString& word)
{
    bool isNumber = false;
    const uint number = word.toUInt(&isNumber);
    return isNumber && number >= 1 && number <= objects.size() ? objects[number - 1] : nullptr;
}

/// The sound of a video has its name, and is edited by way of the video.
bool isPartOfVideo(const Timeline::Object& timeline, const Clip* clip)
{
    return timeline.isNativeAudio(clip) && timeline.isSlave(clip);
}

template <class T>
void append(std::vector<const T*>& numbered, const std::vector<const T*>& present)
{
    for (const T* object : present) {
        if (std::find(numbered.begin(), numbered.end(), object) == numbered.end()) {
            numbered.push_back(object);
        }
    }
}

} // namespace

EditScript::EditScript(EditSession& session) : m_session(session), m_media(session)
{
    numberTheNew();
}

void EditScript::run(const QStringList& words)
{
    try {
        const EditResult result = (this->*commandFor(words).run)(words);
        if (!result) {
            reject(result.refusal);
        }
    } catch (const Refusal& refusal) {
        const QString about = refusal.name.isEmpty() ? QString() : refusal.name + ' ';
        throw Refusal(words.join(' '), about + refusal.reason);
    }
    numberTheNew();
}

const std::vector<EditScript::Command>& EditScript::commands()
{
    static const std::vector<Command> all = {
        {"add", 2, 3, &EditScript::add},
        {"move", 3, 5, &EditScript::move},
        {"trim-left", 3, 4, &EditScript::trimLeft},
        {"trim-right", 3, 4, &EditScript::trimRight},
        {"split", 3, 3, &EditScript::split},
        {"speed", 3, 4, &EditScript::setSpeed},
        {"reverse", 2, 2, &EditScript::reverse},
        {"fade-in", 3, 3, &EditScript::fadeIn},
        {"fade-out", 3, 3, &EditScript::fadeOut},
        {"delete", 2, 2, &EditScript::lift},
        {"extract", 2, 2, &EditScript::extract},
        {"link", 3, 3, &EditScript::link},
        {"unlink", 2, 2, &EditScript::unlink},
        {"transition add", 4, 6, &EditScript::addTransition},
        {"transition remove", 3, 3, &EditScript::removeTransition},
        {"track add", 3, 3, &EditScript::addTrack},
        {"track move", 4, 4, &EditScript::moveTrack},
        {"track remove", 3, 3, &EditScript::removeTrack},
    };
    return all;
}

const EditScript::Command& EditScript::commandFor(const QStringList& words)
{
    const QString text = words.join(' ') + ' ';
    const auto found = std::find_if(commands().begin(), commands().end(), [&text](const Command& command) {
        return text.startsWith(QString(command.name) + ' ');
    });
    if (found == commands().end()) {
        reject("is no edit; editormodel edit --help lists them");
    }
    if (words.size() < found->leastWords || words.size() > found->mostWords) {
        reject(words.size() < found->leastWords ? "lacks a word" : "has a word too many");
    }
    return *found;
}

EditResult EditScript::add(const QStringList& words)
{
    if (words.size() == 2) {
        return lay(m_session, m_media.make(words[1]));
    }
    const MTime at = timeAt(words[2]);
    return lay(m_session, m_media.make(words[1]), &at);
}

EditResult EditScript::move(const QStringList& words)
{
    const Clip* const clip = clipAt(words[1]);
    const MTime at = timeAt(words[2]);
    if (words.size() == 3) {
        return m_session.move(clip, at);
    }
    bool isLevel = true;
    const int level = words.size() == 5 ? words[4].toInt(&isLevel) : 0;
    if (!isLevel) {
        reject(quoted(words[4]) + " is no level");
    }
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
    transition->tag = name;
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

const Clip* EditScript::clipAt(const QString& word) const
{
    const Clip* found = numbered(m_clips, word);
    if (!found) {
        for (const Clip* clip : m_clips) {
            if (timeline().contains(clip) && nameOf(*clip) == word && !isPartOfVideo(timeline(), clip)) {
                if (found) {
                    reject("there are several clips " + quoted(word) + ": give the number of one");
                }
                found = clip;
            }
        }
    }
    if (!found || !timeline().contains(found)) {
        reject("there is no clip " + quoted(word));
    }
    return found;
}

const Track* EditScript::trackAt(const QString& word) const
{
    const Track* const track = numbered(m_tracks, word);
    if (!track || !timeline().contains(track)) {
        reject("there is no track " + quoted(word));
    }
    return track;
}

const Transition::Object* EditScript::transitionAt(const QString& word) const
{
    const Transition::Object* const transition = numbered(m_transitions, word);
    if (!transition || !timeline().hasTransition(transition)) {
        reject("there is no transition " + quoted(word));
    }
    return transition;
}

void EditScript::numberTheNew()
{
    const TimelineOutline outline(timeline());
    append(m_clips, outline.clips());
    append(m_tracks, outline.tracks());
    append(m_transitions, outline.transitions());
}

} // namespace Host
