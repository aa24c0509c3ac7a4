// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/Console.h"
#include "host/playback/Player.h"

#include <EditorModel/types/MTime.h>

#include <QString>

namespace Host {

struct PlayOptions
{
    QString project;
    /// More than zero.
    MTime step = 40;
    /// In percent.
    int volume = 100;
    Player::Pace pace = Player::RealTime;
};

/// Plays the timeline of a document to a level meter, and writes its levels until the end, or until the user
/// interrupts the process. Clips whose media is not there are silent; each such file has one line on the
/// error output, and the outcome is a failure then.
ExitCode play(const PlayOptions& options);

} // namespace Host
