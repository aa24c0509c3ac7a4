// SPDX-License-Identifier: Apache-2.0
#include "host/commands/Refusal.h"

#include <EditorModel/persistence/Document.h>

namespace Host {

Refusal::Refusal(const QString& about, const QString& why)
    : std::runtime_error((about + ": " + why).toStdString()), name(about), reason(why)
{}

ExitCode unlessRefused(const std::function<ExitCode()>& command)
{
    try {
        return command();
    } catch (const Refusal& refusal) {
        writeError(refusal.name, refusal.reason);
    } catch (const Document::Error& error) {
        writeError(error.what());
    }
    return Failure;
}

} // namespace Host
