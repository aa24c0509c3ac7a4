// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/media/Object.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/Norvel.h>

namespace Media {

/// The format of sound: of a file's track, a timeline, an output. The setters don't check.
class EDITORMODEL_EXPORT Audio : public Media::Object, public virtual Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Audio)

public:
    Norvel::Conf::ChannelLayout channelLayout = static_cast<Norvel::Conf::ChannelLayout>(2);
    /// Samples per second.
    int sampleRate = 44100;
    Norvel::Conf::SampleFormats sampleFormat = static_cast<Norvel::Conf::SampleFormats>(1);

    Audio() = default;
    Audio(const Audio&) = default;
    Audio(Audio&&) = default;
    Audio& operator=(const Audio&) = default;
    Audio& operator=(Audio&&) = default;
    ~Audio() override;

    Audio* setChannelLayout(Norvel::Conf::ChannelLayout layout);
    Audio* setSampleRate(int samplesPerSecond);
    Audio* setSampleFormat(Norvel::Conf::SampleFormats format);
};

} // namespace Media

EDITORMODEL_ARCHIVE_NAME(Media::Audio, "Audio")
