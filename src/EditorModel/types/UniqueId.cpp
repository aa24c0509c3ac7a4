// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/types/UniqueId.h>

#include <QUuid>

QString Types::nextUniqueId()
{
    return QUuid::createUuid().toString();
}
