// SPDX-License-Identifier: Apache-2.0
#include "host/media/MediaDescriber.h"

#include <algorithm>

namespace Host {

MediaDescriber::~MediaDescriber()
{
    for (Entry& entry : m_entries) {
        unsubscribe(&entry.file);
        if (fileIsObserved(&entry.file)) {
            fileRemove(&entry.file);
        }
    }
}

const MediaDescriber::Entry& MediaDescriber::describe(const QString& path)
{
    Entry& entry = m_entries.emplace_back();
    entry.file.setPath(path);
    entry.reason = "is not opened: there is no module for that";
    subscribe(&entry.file);
    fileAdd(&entry.file);
    if (fileIsObserved(&entry.file)) {
        fileOpen(&entry.file, path);
    }
    return entry;
}

std::deque<const Media::File*> MediaDescriber::opened() const
{
    std::deque<const Media::File*> files;
    for (const Entry& entry : m_entries) {
        if (entry.file.isOpened) {
            files.push_back(&entry.file);
        }
    }
    return files;
}

void MediaDescriber::fileOpened(const Media::File* file)
{
    entryOf(file).reason.clear();
}

void MediaDescriber::notify(const OpeningFailed& message)
{
    entryOf(message.sender).reason = message.reason;
}

MediaDescriber::Entry& MediaDescriber::entryOf(const Media::File* file)
{
    return *std::find_if(m_entries.begin(), m_entries.end(),
                         [file](const Entry& entry) { return &entry.file == file; });
}

} // namespace Host
