// SPDX-License-Identifier: Apache-2.0
#include "host/editing/EditText.h"

#include "host/media/MediaText.h"

#include <EditorModel/effects/Transition.h>
#include <EditorModel/media/File.h>

#include <QFileInfo>

namespace Host {
namespace {

QString named(const QString& kind, const QString& name)
{
    return name.isEmpty() ? kind + " without a name" : kind + " \"" + name + "\"";
}

} // namespace

QString clipText(const Timeline::Clip* clip)
{
    const bool isNamedByFile = clip->name.isEmpty() && clip->file;
    return named("clip", isNamedByFile ? QFileInfo(clip->file->path).fileName() : clip->name);
}

QString transitionText(const Transition::Object* transition)
{
    return named("transition", transition->tag.isEmpty() ? transition->id : transition->tag);
}

QString timeText(MTime time)
{
    return QString::fromStdString(lengthText(time));
}

} // namespace Host
