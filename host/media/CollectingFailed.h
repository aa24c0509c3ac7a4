// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/Messages.h>
#include <EditorModel/library/EditorCollection.h>

#include <QString>

namespace Host {

/// Why a module that was to list a file in the user's collection doesn't. Another module may have listed it.
/// The sender is EditorCollection::globalObject().
class CollectingFailed : public Message::Types::Notification<EditorCollection::Object>
{
public:
    CollectingFailed(const QString& file, const QString& why)
        : Notification(EditorCollection::globalObject()), path(file), reason(why)
    {}

    /// As its description has it.
    QString path;
    /// One line that completes the sentence "The file ...".
    QString reason;
};

} // namespace Host
