// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/media/File.h>

#include <QString>

namespace Host {

/// As the system walks it: links stay, but where ".." leads out of the folder that one names.
QString absolutePath(const QString& path);

/// Null unless the file has a track of moving pictures; cover art is none.
const Media::File::Track::Video* movingPicture(const Media::File& file);
/// The first track of pictures that stand still: the picture of a picture file, or cover art. May be null.
const Media::File::Track::Video* stillPicture(const Media::File& file);

} // namespace Host
