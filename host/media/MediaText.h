// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/media/File.h>

#include <QtGlobal>

#include <string>

namespace Host {

/// "00:01:02.345"; hours beyond 99 take more room.
std::string lengthText(MTime length);
/// With a unit of a thousand bytes or a power of it: "999 B", "1.2 MB".
std::string sizeText(qint64 bytes);
/// "29.97 fps"; empty for a rate of nothing.
std::string frameRateText(int numerator, int denominator);
/// "96 kbit/s"; empty for a rate that is not known.
std::string bitrateText(int bitsPerSecond);
/// "mono", "stereo" or the number of channels.
std::string channelsText(int channels);
/// "pixels 64:45"; empty for square ones.
std::string aspectText(const Media::Video& video);
/// FFmpeg's name of its sample format; empty for an unknown one.
std::string sampleFormatText(int format);
/// FFmpeg has one name for all that one reader reads, "mov,mp4,m4a,3gp,3g2,mj2": the one that the file goes
/// by.
std::string formatText(const Media::File& file);

} // namespace Host
