// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/Audio.h>

#include <EditorModel/persistence/Fields.h>

namespace Media {

Audio::~Audio() = default;

Audio* Audio::setChannelLayout(Norvel::Conf::ChannelLayout layout)
{
    channelLayout = layout;
    return this;
}

Audio* Audio::setSampleRate(int samplesPerSecond)
{
    sampleRate = samplesPerSecond;
    return this;
}

Audio* Audio::setSampleFormat(Norvel::Conf::SampleFormats format)
{
    sampleFormat = format;
    return this;
}

void fields(Serialize::Fields& f, Audio& audio)
{
    f("channelLayout", audio.channelLayout)("sampleRate", audio.sampleRate)("sampleFormat",
                                                                            audio.sampleFormat);
}

} // namespace Media

EDITORMODEL_PERSISTENT_CLASS(Media::Audio)
