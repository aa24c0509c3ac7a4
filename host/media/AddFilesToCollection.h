// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/Messages.h>
#include <EditorModel/library/EditorCollection.h>
#include <EditorModel/media/File.h>

#include <deque>

namespace Host {

/// Asks for media files, which the asker has had opened, to be listed in the user's collection. It has no
/// answer but CollectingFailed: the collection shows what came of it. The sender is
/// EditorCollection::globalObject().
class AddFilesToCollection : public Message::Types::Request<EditorCollection::Object>
{
public:
    explicit AddFilesToCollection(const std::deque<const Media::File*>& opened)
        : Request(EditorCollection::globalObject()), files(opened)
    {}

    /// None is null.
    std::deque<const Media::File*> files;
};

} // namespace Host
