// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/media/MediaProbe.h"

#include <EditorModel/bus/View.h>
#include <EditorModel/media/Views.h>

#include <QString>

#include <deque>
#include <map>
#include <memory>

namespace Host {

/// The module that opens media files. It takes every file that is added on the bus; when one of its files is
/// opened, by itself or by a module that asks for the change, it describes it with FFmpeg's libraries and
/// answers by a second change: to opened or to failed. Before the latter it tells the reason by
/// OpeningFailed.
///
/// All of this happens inside the request: when another module's fileOpen() returns, the file is opened or
/// failed, and everybody has heard first of the one change and then of the other. Reading the file takes its
/// time there.
///
/// A file that is opening already when it is added is refused: a view that has no file adds a value that ends
/// with the call. Add the file first, then open it.
///
/// The tracks in a file belong to the opener. They live until the file is closed, opened anew or removed and
/// the outermost request about it has been answered, or until the opener ends.
class MediaOpener : private Message::View<Media::File>
{
public:
    MediaOpener();
    MediaOpener(const MediaOpener&) = delete;
    ~MediaOpener() override;

    /// Takes a file in without a request. The file stays the caller's and must outlive the opener or be
    /// removed.
    void take(Media::File* file);
    /// Opens one of the opener's own files.
    void open(const Media::File* file, const QString& path);

private:
    struct Tracks;
    class Request;

    void addRequested(Media::File* file) override;
    void changeRequested(Media::File* file, Media::File* value) override;
    void removeRequested(Media::File* file) override;

    using Message::View<Media::File>::changed;
    void changed(const Media::File* file) override;
    void removed(const Media::File* file) override;

    /// Other modules may do anything with the file while a message about it goes round.
    bool isStillOpening(const Media::File* file) const;
    void answer(const Media::File* file);
    void fail(const Media::File* file, const QString& reason);
    void succeed(const Media::File* file, MediaDescription description);
    void retireTracks(const Media::File* file);

    std::map<const Media::File*, std::unique_ptr<Tracks>> m_tracks;
    /// No file has them any more, but the old value in a message that is still going round may.
    std::deque<std::unique_ptr<Tracks>> m_retired;
    int m_requests = 0;
};

} // namespace Host
