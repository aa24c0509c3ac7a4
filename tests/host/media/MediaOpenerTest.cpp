// SPDX-License-Identifier: Apache-2.0
#include "tests/host/shared/Samples.h"

#include "host/media/MediaDescriber.h"
#include "host/media/MediaOpener.h"
#include "host/media/OpeningFailed.h"
#include "tests/media/FileModule.h"

#include <gmock/gmock.h>

#include <functional>
#include <optional>

namespace {

using namespace HostTests;
using MediaTests::FileModule;
using MediaTests::flags;
using MediaTests::Lines;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

/// Writes down the reasons that go over the bus.
class ReasonListener : public PubSub::Subscriber<Host::OpeningFailed>
{
public:
    explicit ReasonListener(Lines& lines) : m_lines(lines) { subscribeAll<Media::File>(); }

    void notify(const Host::OpeningFailed& message) override
    {
        m_lines.push_back("reason: " + message.reason.toStdString() + " " + flags(*message.sender));
        if (onReason) {
            onReason();
        }
    }

    std::function<void()> onReason;

private:
    Lines& m_lines;
};

/// Does what a test wants when a file changes its state.
class Reactor : public Media::View<Media::File>
{
public:
    using Media::View<Media::File>::fileClose;
    using Media::View<Media::File>::fileObserve;
    using Media::View<Media::File>::fileOpen;
    using Media::View<Media::File>::fileRemove;

    std::function<void(const Media::File*, const Media::File*)> onChanged;
    std::function<void(const Media::File*)> onFailed;

protected:
    using Media::View<Media::File>::fileChanged;
    void fileChanged(const Media::File* file, const Media::File* oldValue) override
    {
        if (onChanged) {
            onChanged(file, oldValue);
        }
    }
    void fileFailed(const Media::File* file) override
    {
        if (onFailed) {
            onFailed(file);
        }
    }
};

const Lines opening = {"module: changed --- to p--", "module: changed from ---", "module: changed to p--"};
const Lines opened = {"module: changed p-- to -o-", "module: opened -o-", "module: changed from p--",
                      "module: changed to -o-"};
const Lines failed = {"module: changed p-- to --f", "module: failed --f", "module: changed from p--",
                      "module: changed to --f"};

Lines joined(std::initializer_list<Lines> parts)
{
    Lines all;
    for (const Lines& part : parts) {
        all.insert(all.end(), part.begin(), part.end());
    }
    return all;
}

class MediaOpener : public testing::Test
{
protected:
    void SetUp() override { Host::showMediaLibraryLog(false); }

    Lines lines;
    Media::File file;
};

TEST_F(MediaOpener, AnswersTheRequestOfAnotherModuleWithinIt)
{
    Host::MediaOpener opener;
    const ReasonListener reasons(lines);
    FileModule module(lines, "module");
    module.fileAdd(&file);
    EXPECT_EQ(std::exchange(lines, {}),
              Lines({"module: added ---", "module: changed --- to ---", "module: changed to ---"}));
    EXPECT_FALSE(module.fileIsOwned(&file));

    module.fileOpen(&file, sample("film.mp4"));
    EXPECT_EQ(lines, joined({opening, opened}));
    EXPECT_EQ(file.path, sample("film.mp4"));
    EXPECT_EQ(file.size, contentOf(sample("film.mp4")).size());
    ASSERT_THAT(file.videoTracks, SizeIs(1));
    EXPECT_EQ(file.videoTracks[0]->file, &file);
    EXPECT_EQ(file.videoTracks[0]->width, 320);
    ASSERT_THAT(file.audioTracks, SizeIs(1));
    EXPECT_EQ(file.audioTracks[0]->file, &file);
    EXPECT_EQ(file.audioTracks[0]->sampleRate, 48000);
}

TEST_F(MediaOpener, TellsEveryObserverOfBothChangesInTheirOrder)
{
    Host::MediaOpener opener;
    Lines requesterLines;
    FileModule requester(requesterLines, "module");
    FileModule watcher(lines, "module");
    requester.fileAdd(&file);
    watcher.fileObserve(&file);
    requesterLines.clear();
    lines.clear();

    requester.fileOpen(&file, sample("speech.wav"));
    EXPECT_EQ(requesterLines, joined({opening, opened}));
    EXPECT_EQ(lines, joined({opening, opened}));
}

TEST_F(MediaOpener, TellsTheReasonBeforeItMarksAFileAsFailed)
{
    Host::MediaOpener opener;
    const ReasonListener reasons(lines);
    FileModule module(lines, "module");
    module.fileAdd(&file);
    lines.clear();

    module.fileOpen(&file, "/no/such/file.mp4");
    EXPECT_EQ(lines, joined({opening, {"reason: does not exist p--"}, failed}));
    EXPECT_EQ(file.path, "/no/such/file.mp4");
    EXPECT_THAT(file.videoTracks, IsEmpty());
}

TEST_F(MediaOpener, OpensItsOwnFilesInTheSameWay)
{
    Host::MediaOpener opener;
    opener.take(&file);
    FileModule module(lines, "module");
    module.fileObserve(&file);
    lines.clear();

    opener.open(&file, sample("picture.png"));
    EXPECT_EQ(lines, joined({opening, opened}));
    EXPECT_TRUE(file.videoTracks.at(0)->isImage);
}

TEST_F(MediaOpener, KeepsOldTracksUntilNobodyIsToldOfThemAnyMore)
{
    Host::MediaOpener opener;
    Reactor reactor;
    FileModule module(lines, "module");
    module.fileAdd(&file);
    module.fileOpen(&file, sample("film.mp4"));
    reactor.fileObserve(&file);
    // Opens another file from within the first message that still has the old tracks, and reads them
    // afterwards.
    std::vector<std::string> codecs;
    reactor.onChanged = [&](const Media::File* changed, const Media::File* oldValue) {
        if (changed->isOpening && changed->path == sample("song.mp3")) {
            reactor.fileOpen(changed, sample("speech.wav"));
            codecs.push_back(oldValue->videoTracks.at(0)->codecId + " " +
                             oldValue->audioTracks.at(0)->codecId);
        }
    };
    module.fileOpen(&file, sample("song.mp3"));
    EXPECT_THAT(codecs, ElementsAre("mpeg4 aac"));
    EXPECT_EQ(file.path, sample("speech.wav"));
    EXPECT_TRUE(file.isOpened);
    EXPECT_FALSE(file.isOpening);
    EXPECT_THAT(file.videoTracks, IsEmpty());
    EXPECT_EQ(file.audioTracks.at(0)->codecId, "pcm_s16le");
}

TEST_F(MediaOpener, LetsAModuleTryAnotherPathWhenTheFirstHasFailed)
{
    Host::MediaOpener opener;
    Reactor reactor;
    reactor.onFailed = [&](const Media::File* failedFile) {
        reactor.fileOpen(failedFile, sample("speech.wav"));
    };
    FileModule module(lines, "module");
    module.fileAdd(&file);
    reactor.fileObserve(&file);
    module.fileOpen(&file, "/no/such/file.wav");
    EXPECT_EQ(flags(file), "-o-");
    EXPECT_EQ(file.path, sample("speech.wav"));
    EXPECT_EQ(file.length, MTime(1500));
}

TEST_F(MediaOpener, MarksNothingAsFailedThatIsClosedOverTheReason)
{
    Host::MediaOpener opener;
    ReasonListener reasons(lines);
    FileModule module(lines, "module");
    module.fileAdd(&file);
    reasons.onReason = [&] { module.fileClose(&file); };
    lines.clear();
    module.fileOpen(&file, "/no/such/file.wav");
    EXPECT_EQ(lines, joined({opening,
                             {"reason: does not exist p--", "module: changed p-- to ---",
                              "module: changed from p--", "module: changed to ---"}}));
    EXPECT_EQ(flags(file), "---");
}

TEST_F(MediaOpener, LeavesAFileAloneThatIsRemovedAndDestroyedWhileItOpens)
{
    Host::MediaOpener opener;
    auto shortLived = std::make_unique<Media::File>();
    Reactor reactor;
    FileModule module(lines, "module");
    module.fileAdd(shortLived.get());
    reactor.fileObserve(shortLived.get());
    bool wasRemoved = false;
    ReasonListener reasons(lines);
    reasons.onReason = [&] {
        reactor.fileRemove(shortLived.get());
        shortLived.reset();
        wasRemoved = true;
    };
    module.fileOpen(shortLived.get(), "/no/such/file.wav");
    EXPECT_TRUE(wasRemoved);
    EXPECT_EQ(module.file(), nullptr);
}

TEST_F(MediaOpener, FreesTheTracksOfAClosedFileAndOpensItAgain)
{
    Host::MediaOpener opener;
    FileModule module(lines, "module");
    module.fileAdd(&file);
    for (int round = 0; round != 3; ++round) {
        module.fileOpen(&file, sample("tracks.mkv"));
        EXPECT_THAT(file.audioTracks, SizeIs(3));
        EXPECT_EQ(file.audioTracks[2]->codecId, "ac3");
        module.fileClose(&file);
        EXPECT_EQ(flags(file), "---");
        EXPECT_THAT(file.audioTracks, IsEmpty());
    }
}

TEST_F(MediaOpener, ChangesNothingThatIsNoOpening)
{
    Host::MediaOpener opener;
    FileModule module(lines, "module");
    module.fileAdd(&file);
    module.fileOpen(&file, sample("speech.wav"));
    const Media::File::Track::Audio* const track = file.audioTracks.at(0);
    module.fileChange(&file)->setPath("/moved.wav");
    EXPECT_EQ(file.path, "/moved.wav");
    EXPECT_EQ(flags(file), "-o-");
    EXPECT_THAT(file.audioTracks, ElementsAre(track));
    EXPECT_EQ(track->codecId, "pcm_s16le");
}

TEST_F(MediaOpener, RefusesTheValueOfAViewThatHasNoFile)
{
    Host::MediaOpener opener;
    FileModule module(lines, "module");
    module.fileOpen(sample("speech.wav"));
    EXPECT_THAT(lines, IsEmpty());
    Message::View<Media::File> any;
    EXPECT_THAT(any.enumerateAll(), IsEmpty());
}

TEST_F(MediaOpener, LeavesRequestsUnansweredWhenItHasEnded)
{
    FileModule module(lines, "module");
    {
        Host::MediaOpener opener;
        module.fileAdd(&file);
    }
    lines.clear();
    module.fileOpen(&file, sample("speech.wav"));
    EXPECT_THAT(lines, IsEmpty());
    EXPECT_EQ(flags(file), "---");
}

TEST(MediaDescriber, KeepsWhatBecameOfEachFile)
{
    Host::showMediaLibraryLog(false);
    Host::MediaOpener opener;
    Host::MediaDescriber describer;
    EXPECT_EQ(describer.describe(sample("speech.wav")).reason, "");
    EXPECT_EQ(describer.describe("/no/such/file").reason, "does not exist");
    EXPECT_EQ(describer.describe(sample("speech.wav")).reason, "");
    ASSERT_THAT(describer.entries(), SizeIs(3));
    EXPECT_TRUE(describer.entries()[0].file.isOpened);
    EXPECT_TRUE(describer.entries()[1].file.isFailed);
    EXPECT_THAT(describer.opened(), ElementsAre(&describer.entries()[0].file, &describer.entries()[2].file));
}

TEST(MediaDescriber, SaysSoWhereNoModuleOpensFiles)
{
    Host::MediaDescriber describer;
    EXPECT_EQ(describer.describe(sample("speech.wav")).reason, "is not opened: there is no module for that");
    EXPECT_THAT(describer.opened(), IsEmpty());
}

TEST(MediaDescriber, EndsTheSharingOfItsFiles)
{
    Host::MediaOpener opener;
    Message::View<Media::File> any;
    {
        Host::MediaDescriber describer;
        describer.describe("/no/such/file");
        EXPECT_THAT(any.enumerateAll(), SizeIs(1));
    }
    EXPECT_THAT(any.enumerateAll(), IsEmpty());
}

} // namespace
