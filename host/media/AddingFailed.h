// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/Messages.h>
#include <EditorModel/media/ResourceTable.h>

#include <QString>

namespace Host {

/// Why a file that was to be added to the sender is not added.
class AddingFailed : public Message::Types::Notification<ResourceTable::Object>
{
public:
    AddingFailed(const ResourceTable::Object* table, const QString& file, const QString& why)
        : Notification(table), path(file), reason(why)
    {}

    /// As it was asked for.
    QString path;
    /// One line that completes the sentence "The file ...".
    QString reason;
};

} // namespace Host
