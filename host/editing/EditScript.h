// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/editing/ClipKeeper.h"
#include "host/editing/EditSession.h"
#include "host/media/MediaClips.h"

#include <EditorModel/media/FileAdder.h>

#include <QString>
#include <QStringList>

#include <vector>

namespace Host {

class PackageShelf;

/// Carries out edits that are given in words. Clips, tracks and transitions go by the numbers that they had
/// in the timeline's outline at the start; what an edit makes is numbered on from there. Clips go by their
/// names as well.
class EditScript
{
public:
    /// The keeper is that of the clips of the session's timeline, and `media` makes clips for it. Media that
    /// are added go to the timeline, and to these places besides. Titles and transitions may come from the
    /// shelf, which outlives the script.
    EditScript(EditSession& session, ClipKeeper& keeper, MediaClips& media,
               const FileAdder::Contexts& places = {}, const PackageShelf* shelf = nullptr);
    EditScript(const EditScript&) = delete;

    /// One command. Throws Refusal, by which the command is named, and has changed nothing of the timeline
    /// then; a file may stand in the other places already.
    void run(const QStringList& words);

private:
    using Runner = EditResult (EditScript::*)(const QStringList& words);
    struct Command
    {
        const char* name;
        int leastWords;
        int mostWords;
        Runner run;
    };

    static const std::vector<Command>& commands();
    static const Command& commandFor(const QStringList& words);

    EditResult add(const QStringList& words);
    EditResult overwrite(const QStringList& words);
    EditResult title(const QStringList& words);
    EditResult move(const QStringList& words);
    EditResult trimLeft(const QStringList& words);
    EditResult trimRight(const QStringList& words);
    EditResult split(const QStringList& words);
    EditResult setSpeed(const QStringList& words);
    EditResult reverse(const QStringList& words);
    EditResult fadeIn(const QStringList& words);
    EditResult fadeOut(const QStringList& words);
    EditResult enable(const QStringList& words);
    EditResult disable(const QStringList& words);
    EditResult setVolume(const QStringList& words);
    EditResult lift(const QStringList& words);
    EditResult extract(const QStringList& words);
    EditResult link(const QStringList& words);
    EditResult unlink(const QStringList& words);
    EditResult follow(const QStringList& words);
    EditResult unfollow(const QStringList& words);
    EditResult addTransition(const QStringList& words);
    EditResult removeTransition(const QStringList& words);
    EditResult addTrack(const QStringList& words);
    EditResult moveTrack(const QStringList& words);
    EditResult removeTrack(const QStringList& words);

    const Timeline::Object& timeline() const { return *m_session.timeline(); }
    const Timeline::Clip* clipAt(const QString& word) const;
    const Timeline::Track* trackAt(const QString& word) const;
    const Transition::Object* transitionAt(const QString& word) const;
    void numberTheNew();

    EditSession& m_session;
    ClipKeeper& m_keeper;
    FileAdder::Contexts m_places;
    const PackageShelf* m_shelf;
    MediaClips& m_media;
    std::vector<const Timeline::Clip*> m_clips;
    std::vector<const Timeline::Track*> m_tracks;
    std::vector<const Transition::Object*> m_transitions;
};

} // namespace Host
