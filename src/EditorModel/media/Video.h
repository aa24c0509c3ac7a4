// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/media/Object.h>
#include <EditorModel/persistence/Persistent.h>

namespace Media {

/// The format of pictures: of a file's track, a timeline, an output. The setters don't check.
class EDITORMODEL_EXPORT Video : public Media::Object, public virtual Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Video)

public:
    int width = 1920;  ///< in pixels
    int height = 1080; ///< in pixels
    /// Pictures per second, as a fraction: `frameRateN` in `frameRateD` seconds.
    int frameRateN = 30000;
    int frameRateD = 1001;
    /// A pixel's width to its height, as `aspectX` to `aspectY`.
    int aspectX = 1;
    int aspectY = 1;
    /// Not read by the model. Lives in memory only: a loaded record has the default.
    bool exportMode = false;
    /// Not read by the model. Lives in memory only: a loaded record has the default.
    bool opaque = true;

    Video() = default;
    Video(const Video&) = default;
    Video(Video&&) = default;
    Video& operator=(const Video&) = default;
    Video& operator=(Video&&) = default;
    ~Video() override;

    Video* setGeometry(int widthInPixels, int heightInPixels);
    Video* setFrameRate(int numerator, int denominator);
    Video* setAspect(int x, int y);
    Video* setExportMode(bool on);
    Video* setOpaque(bool on);
};

} // namespace Media

EDITORMODEL_ARCHIVE_NAME(Media::Video, "Video")
