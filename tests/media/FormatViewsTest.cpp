// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/Views.h>

#include <gmock/gmock.h>

#include <string>
#include <vector>

namespace {

using testing::ElementsAre;

/// A module that shares files, and each kind of format in two ways at once.
class Module : public Media::View<Media::File>,
               public Media::View<Media::Audio>,
               public Media::View<Media::Video>,
               public Media::TView<Media::Audio>,
               public Media::TView<Media::Video>
{
public:
    using Media::View<Media::Audio>::audioChange;
    using Media::View<Media::Audio>::audioOwn;
    using Media::View<Media::Audio>::audios;
    using Media::View<Media::Video>::videoChange;
    using Media::View<Media::Video>::videoOwn;
    using Media::View<Media::Video>::videos;
    using Media::TView<Media::Audio>::tAudioObserve;
    using Media::TView<Media::Audio>::tAudios;
    using Media::TView<Media::Video>::tVideoObserve;
    using Media::TView<Media::Video>::tVideos;
    using Media::View<Media::File>::files;

    std::vector<std::string> lines;

protected:
    void audioChanged(const Media::Audio* audio) override { write("audio", audio->sampleRate); }
    void tAudioChanged(const Media::Audio* audio) override { write("tAudio", audio->sampleRate); }
    void videoChanged(const Media::Video* video) override { write("video", video->width); }
    void tVideoChanged(const Media::Video* video) override { write("tVideo", video->width); }

private:
    void write(const std::string& who, int value) { lines.push_back(who + " " + std::to_string(value)); }
};

TEST(FormatViews, OneModuleWatchesFormatsInTwoWaysSideBySide)
{
    Media::Audio audio;
    Media::Video video;
    Module module;
    module.audioOwn(&audio);
    module.tAudioObserve(&audio);
    module.videoOwn(&video);
    module.tVideoObserve(&video);
    module.lines.clear();

    module.audioChange(&audio)->setSampleRate(48000);
    module.videoChange(&video)->setGeometry(640, 480);
    EXPECT_THAT(module.lines, ElementsAre("audio 48000", "tAudio 48000", "video 640", "tVideo 640"));
    EXPECT_THAT(module.audios(), ElementsAre(&audio));
    EXPECT_THAT(module.tAudios(), ElementsAre(&audio));
    EXPECT_THAT(module.videos(), ElementsAre(&video));
    EXPECT_THAT(module.tVideos(), ElementsAre(&video));
    EXPECT_TRUE(module.files().empty());
}

TEST(FormatViews, ShareTheFormatOfATrack)
{
    Media::File::Track::Video track;
    Module owner, observer;
    owner.videoOwn(&track);
    observer.tVideoObserve(&track);
    owner.videoChange(&track)->setGeometry(320, 240);
    EXPECT_THAT(observer.lines, ElementsAre("tVideo 1920", "tVideo 320"));
}

} // namespace
