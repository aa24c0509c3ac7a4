// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/Video.h>

#include <EditorModel/persistence/Fields.h>

namespace Media {

Video::~Video() = default;

Video* Video::setGeometry(int widthInPixels, int heightInPixels)
{
    width = widthInPixels;
    height = heightInPixels;
    return this;
}

Video* Video::setFrameRate(int numerator, int denominator)
{
    frameRateN = numerator;
    frameRateD = denominator;
    return this;
}

Video* Video::setAspect(int x, int y)
{
    aspectX = x;
    aspectY = y;
    return this;
}

Video* Video::setExportMode(bool on)
{
    exportMode = on;
    return this;
}

Video* Video::setOpaque(bool on)
{
    opaque = on;
    return this;
}

void fields(Serialize::Fields& f, Video& video)
{
    f("width", video.width)("height", video.height);
    f("frameRateN", video.frameRateN)("frameRateD", video.frameRateD);
    f("aspectX", video.aspectX)("aspectY", video.aspectY);
}

} // namespace Media

EDITORMODEL_PERSISTENT_CLASS(Media::Video)
