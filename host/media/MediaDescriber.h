// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/media/OpeningFailed.h"

#include <EditorModel/bus/PubSub.h>
#include <EditorModel/media/Views.h>

#include <QString>

#include <deque>

namespace Host {

/// A module that has files described by whichever module opens them. It holds the files; their tracks belong
/// to the module that opens.
class MediaDescriber : private Media::View<Media::File>, private PubSub::Subscriber<OpeningFailed>
{
public:
    struct Entry
    {
        Media::File file;
        /// Why the file is not opened; empty if it is.
        QString reason;
    };

    MediaDescriber() = default;
    MediaDescriber(const MediaDescriber&) = delete;
    /// Ends the sharing of the files.
    ~MediaDescriber() override;

    /// Asks for one more file; the answer is there when the call returns.
    const Entry& describe(const QString& path);

    /// In the order of asking.
    const std::deque<Entry>& entries() const { return m_entries; }
    std::deque<const Media::File*> opened() const;

private:
    using Media::View<Media::File>::fileOpened;
    void fileOpened(const Media::File* file) override;
    void notify(const OpeningFailed& message) override;
    Entry& entryOf(const Media::File* file);

    std::deque<Entry> m_entries;
};

} // namespace Host
