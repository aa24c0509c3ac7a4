// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/Console.h"

#include <QString>

#include <functional>
#include <stdexcept>

namespace Host {

/// Why a command cannot go on: the name of what it is about, and a line that completes "The file ...".
class Refusal : public std::runtime_error
{
public:
    Refusal(const QString& about, const QString& why);

    const QString name;
    const QString reason;
};

/// Runs a command. A Refusal or a Document::Error out of it becomes a line of the error output, and Failure.
ExitCode unlessRefused(const std::function<ExitCode()>& command);

} // namespace Host
