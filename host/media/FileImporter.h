// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/media/MediaClips.h"

#include <EditorModel/bus/PubSub.h>
#include <EditorModel/media/FileAdder.h>

namespace Host {

/// The module that adds media files: to the timeline of its session, to the user's collection and to a table
/// of resources, as a request says. It opens the files, edits its session, and has the rest done by whichever
/// modules keep tables (AddFilesToTableRequest) and the collection (AddFilesToCollection).
///
/// A request is worked off place by place:
/// 1. All files are opened. One that can't be opened is added nowhere.
/// 2. The table of resources, in one change: whoever hears of the clips may ask about their media.
/// 3. The user's collection, in one change.
/// 4. The timeline, file by file, each in one change, or two or three where tracks are missing.
///
/// What fails at one place fails there alone, for that file alone; nothing that was done is taken back. For
/// each such failure FileNotAdded goes out, and at the end the answer, always one. A file that a place holds
/// already counts as added there; on a timeline it is laid again, and as often as the request names it.
///
/// On the timeline:
/// - Without a track a clip goes to the first track of its kind, which is made where it is missing; with one,
///   to that track. Native audio goes to its own track in either case. A level of -1 is level 0.
/// - Without a position clips are appended to their lanes. At a position they are inserted, one after another
///   on each track; one that is refused leaves no gap.
/// - The type of clip and the strategy are those of MediaClips::make(). The flag has no meaning.
/// - The files stay open as long as the importer lives. It outlives the timeline's use of them: store the
///   timeline before.
///
/// Where several importers are on the bus, each of them works and answers; the timeline of another one is
/// refused.
class FileImporter : private PubSub::Subscriber<FileAdder::AddMediaFiles>
{
public:
    /// The answers. `files` of an answer lists, in the order of the request, those that stand at one place at
    /// least that the request named.

    /// Every file, at every place.
    static constexpr auto AllAdded = static_cast<FileAdder::AddedResult>(1);
    /// Something, but not all.
    static constexpr auto SomeAdded = static_cast<FileAdder::AddedResult>(2);
    /// No file, at no place.
    static constexpr auto NoneAdded = static_cast<FileAdder::AddedResult>(3);
    /// There was no file or no place in the request.
    static constexpr auto NothingAsked = static_cast<FileAdder::AddedResult>(4);

    /// The session outlives the importer.
    explicit FileImporter(EditSession& session);
    FileImporter(const FileImporter&) = delete;
    FileImporter& operator=(const FileImporter&) = delete;

    /// Those of the timeline, and the files that are open for them, which are not opened again for another
    /// place.
    MediaClips& clips() { return m_clips; }

private:
    class Run;

    void notify(const FileAdder::AddMediaFiles& request) override;

    EditSession& m_session;
    MediaClips m_clips;
};

} // namespace Host
