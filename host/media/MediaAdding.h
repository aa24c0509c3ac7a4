// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/media/FileAdder.h>

#include <QString>
#include <QStringList>

#include <deque>

namespace Host {

/// How a request to add media files went, for the command that made it.
struct MediaAdding
{
    struct Failure
    {
        QString path;
        /// See FileNotAdded.
        QString reason;
    };

    /// In the order in which they were told.
    std::deque<Failure> failures;
    /// Every file stands at every place.
    bool isDone = false;
};

/// Asks whichever module adds media files. If there is none, each of the files has failed.
MediaAdding addMedia(const QStringList& paths, const FileAdder::Contexts& places);

} // namespace Host
