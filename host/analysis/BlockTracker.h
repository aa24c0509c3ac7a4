// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/analysis/LumaReader.h"

#include <EditorModel/analysis/MotionTracking.h>

#include <QRect>
#include <QString>

#include <optional>

namespace Host {

/// Where the content of a block in one picture stands in the next one: the place with the least sum of
/// absolute differences in brightness, up to a sixteenth of the picture's longer side away, and of equal ones
/// the nearest. None where the pictures are of different sizes, or where the best place differs by more than
/// an eighth of the full range on average: the block is lost. The block must lie within the picture.
std::optional<QRect> findBlock(const LumaPicture& from, const QRect& block, const LumaPicture& in);

/// Follows a rectangle through a video, forwards from the task's initial position to the end of its range,
/// from picture to picture by findBlock(), to whole pixels. It turns nothing and resizes nothing, and ends
/// early where the rectangle is lost. The task's resource and algorithm don't count.
///
/// Throws MediaError as LumaReader does, for a rectangle that is not valid or has no pixels, and for a video
/// that has no picture in the range.
MotionTracking::Data followRectangle(const QString& id, const QString& path, int track,
                                     const MotionTracking::AnalyzeTask& task);

} // namespace Host
