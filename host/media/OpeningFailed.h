// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/Messages.h>
#include <EditorModel/media/File.h>

#include <QString>

namespace Host {

/// Why the sender cannot be opened. It goes out right before the file is marked as failed, so that whoever
/// hears of that knows the reason.
class OpeningFailed : public Message::Types::Notification<Media::File>
{
public:
    OpeningFailed(const Media::File* file, const QString& why) : Notification(file), reason(why) {}

    /// One line that completes the sentence "The file ...".
    QString reason;
};

} // namespace Host
