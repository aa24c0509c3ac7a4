// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/Console.h"

#include <QString>

namespace Host {

struct ConvertOptions
{
    QString input;
    /// The ending tells the form.
    QString output;
    /// The output may replace a file that is there, and be the input itself. Trackings of a project that it
    /// replaces are kept, beside its own, and it is told where.
    bool isForced = false;
    /// Binary and XML archives are read too; they must be of one's own making.
    bool isOwn = false;
};

/// Writes a document or a project in another form: a project becomes a project, with its trackings beside it,
/// and a plain document a plain one. What is to be written is read back and compared with the input first,
/// object by object; where they differ nothing is written. What fails has one line on the error output.
ExitCode convert(const ConvertOptions& options);

} // namespace Host
