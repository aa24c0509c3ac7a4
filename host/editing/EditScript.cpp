// SPDX-License-Identifier: Apache-2.0
#include "host/editing/EditScript.h"

#include "host/commands/Refusal.h"
#include "host/editing/EditWords.h"
#include "host/timeline/TimelineOutline.h"

#include <EditorModel/persistence/Document.h>

#include <algorithm>
#include <iterator>
#include <set>

namespace Host {
namespace {

using Timeline::Clip;
using Timeline::Track;

template <class T>
void append(std::vector<const T*>& numbered, const std::vector<const T*>& present)
{
    const std::set<const T*> known(numbered.begin(), numbered.end());
    std::copy_if(present.begin(), present.end(), std::back_inserter(numbered),
                 [&known](const T* object) { return known.count(object) == 0; });
}

} // namespace

EditScript::EditScript(EditSession& session, ClipKeeper& keeper, MediaClips& media,
                       const FileAdder::Contexts& places, const PackageShelf* shelf)
    : m_session(session), m_keeper(keeper), m_places(places), m_shelf(shelf), m_media(media)
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
    } catch (const Document::Error& error) {
        throw Refusal(words.join(' '), QString::fromStdString(error.what()));
    }
    numberTheNew();
}

const std::vector<EditScript::Command>& EditScript::commands()
{
    static const std::vector<Command> all = {
        {"add", 2, 3, &EditScript::add},
        {"overwrite", 3, 5, &EditScript::overwrite},
        {"title", 3, 5, &EditScript::title},
        {"move", 3, 5, &EditScript::move},
        {"trim-left", 3, 4, &EditScript::trimLeft},
        {"trim-right", 3, 4, &EditScript::trimRight},
        {"split", 3, 3, &EditScript::split},
        {"speed", 3, 4, &EditScript::setSpeed},
        {"reverse", 2, 2, &EditScript::reverse},
        {"fade-in", 3, 3, &EditScript::fadeIn},
        {"fade-out", 3, 3, &EditScript::fadeOut},
        {"enable", 2, 2, &EditScript::enable},
        {"disable", 2, 2, &EditScript::disable},
        {"volume", 3, 3, &EditScript::setVolume},
        {"delete", 2, 2, &EditScript::lift},
        {"extract", 2, 2, &EditScript::extract},
        {"link", 3, 3, &EditScript::link},
        {"unlink", 2, 2, &EditScript::unlink},
        {"follow", 4, 6, &EditScript::follow},
        {"unfollow", 2, 2, &EditScript::unfollow},
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

const Clip* EditScript::clipAt(const QString& word) const
{
    return clipOf(timeline(), m_clips, word);
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
