// SPDX-License-Identifier: Apache-2.0
#include "host/project/ProjectContexts.h"

#include "host/project/FileReplacement.h"

namespace Host {

QString ProjectPlace::sideFolder() const
{
    return siblingOf(path, QStringLiteral(".data"));
}

} // namespace Host
