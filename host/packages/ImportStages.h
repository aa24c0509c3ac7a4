// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/library/ImportState.h>

#include <QString>

namespace Host {

/// What the stages of an import mean to ImportKeeper.
enum ImportStage : int
{
    NotFetched = Import::State::Initial,
    Waiting = Import::State::Requested, ///< behind other imports
    Fetching = Import::State::Cancellable4,
    Fetched = 6,                              ///< its location() is the way to it
    Installing = Import::State::Cancellable5, ///< all is there, and is about to be put in its place
    FetchFailed = Import::State::Importable7, ///< can be tried again
};

/// What the keeper takes Package::DeployResult for.
enum ImportFailure : int
{
    NoFailure = Package::DefaultDeployResult,
    NoAddress = 1,    ///< there is nothing to fetch it by
    NotOnMachine = 2, ///< its address leads to another machine
    NotReadable = 3,
    NotWritable = 4,
    WrongSize = 5,   ///< it has another size than was told, or grew or shrank meanwhile
    NotAccepted = 6, ///< nobody owns the item, or nobody takes its pack
    PackedFile = 7,  ///< a pack can be fetched as a folder alone
};

/// Why the sender failed. It goes out right before the state is marked as failed.
class ImportFailed : public Message::Types::Notification<Import::State>
{
public:
    ImportFailed(const Import::State* state, const QString& why) : Notification(state), reason(why) {}

    /// One line, which names the file or the address.
    QString reason;
};

} // namespace Host
