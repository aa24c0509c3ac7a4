// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/media/FileAdder.h>

#include <QString>

namespace Host {

/// Why a file that was asked to be added is missing from a place. It goes out before the answer to the
/// request. The sender is FileAdder::globalObject().
class FileNotAdded : public Message::Types::Notification<FileAdder::Object>
{
public:
    enum Place
    {
        AnyPlace, ///< it can't be opened, and is added nowhere
        TablePlace,
        CollectionPlace,
        TimelinePlace,
    };

    FileNotAdded(const QString& file, Place where, const QString& why)
        : Notification(FileAdder::globalObject()), path(file), place(where), reason(why)
    {}

    /// As it was asked for.
    QString path;
    Place place;
    /// One line that completes the sentence "The file ...".
    QString reason;
};

} // namespace Host
