// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/Console.h"

#include <QString>
#include <QStringList>

namespace Host {

struct ProbeOptions
{
    QStringList paths;
    /// Where the descriptions go as a document; empty for nowhere. The ending tells the form.
    QString savePath;
    bool json = false;
};

/// Describes files on the standard output. Each that cannot be opened has a line on the error output and
/// makes the command fail; the others are described all the same, and saved with a table of their resources
/// if that is wanted. An interrupt (Ctrl-C) ends it behind the file that is being read: what is known by then
/// is printed and saved, and the command fails.
ExitCode probe(const ProbeOptions& options);

} // namespace Host
