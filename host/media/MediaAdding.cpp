// SPDX-License-Identifier: Apache-2.0
#include "host/media/MediaAdding.h"

#include "host/media/FileImporter.h"
#include "host/media/FileNotAdded.h"

namespace Host {
namespace {

/// Nobody tells sources apart so far.
constexpr auto FromCommand = static_cast<FileAdder::Asrc>(0);
constexpr auto NoAnswer = static_cast<FileAdder::AddedResult>(0);

class FailureList : private PubSub::Subscriber<FileNotAdded>
{
public:
    explicit FailureList(MediaAdding& adding) : m_adding(adding) { subscribe(FileAdder::globalObject()); }
    FailureList(const FailureList&) = delete;

private:
    void notify(const FileNotAdded& message) override
    {
        m_adding.failures.push_back({message.path, message.reason});
    }

    MediaAdding& m_adding;
};

} // namespace

MediaAdding addMedia(const QStringList& paths, const FileAdder::Contexts& places)
{
    MediaAdding adding;
    const FailureList failures(adding);
    const FileAdder::AddedResult result = FileAdder::addMediaFiles(paths, FromCommand, places);
    adding.isDone = result == FileImporter::AllAdded;
    if (result == NoAnswer) {
        for (const QString& path : paths) {
            adding.failures.push_back({path, "cannot be added: there is no module that does it"});
        }
    }
    return adding;
}

} // namespace Host
