// SPDX-License-Identifier: Apache-2.0
#include "tests/host/shared/Samples.h"

#include "host/commands/Interrupt.h"
#include "host/media/AnalysisProgress.h"
#include "host/media/AnalysisRunner.h"
#include "host/media/MediaOpener.h"

#include <EditorModel/media/Views.h>

#include <gmock/gmock.h>

#include <csignal>
#include <functional>
#include <memory>
#include <set>

namespace {

using namespace HostTests;
using Job = FileAnalyzer::Object;
using Lines = std::vector<std::string>;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

const char* statusName(FileAnalyzer::Status status)
{
    const char* const names[] = {"queued", "processing", "processed", "cancelled"};
    return names[status];
}

/// A module that hands jobs in and writes down all that it hears of them, one line a change: the status, and
/// how many files are opened and have failed.
class Client : public FileAnalyzer::View
{
public:
    using FileAnalyzer::View::fileAnalyzerAdd;
    using FileAnalyzer::View::fileAnalyzerChange;
    using FileAnalyzer::View::fileAnalyzerRemove;
    using FileAnalyzer::View::fileAnalyzers;

    Job* add(Job& job, const QString& name, const QStringList& files)
    {
        names[&job] = name.toStdString();
        fileAnalyzerAdd(&job)->setFiles(files);
        return &job;
    }

    std::map<const Job*, std::string> names;
    Lines lines;
    std::function<void(const Job*)> onChanged;

protected:
    using FileAnalyzer::View::fileAnalyzerChanged;
    void fileAnalyzerChanged(const Job* job) override
    {
        lines.push_back(names[job] + ": " + statusName(job->status) + " " +
                        std::to_string(job->opened.size()) + "+" + std::to_string(job->failed.size()));
        if (onChanged) {
            onChanged(job);
        }
    }
    void statusChanged(const Job* job, FileAnalyzer::Status oldStatus) override
    {
        lines.push_back(names[job] + ": from " + statusName(oldStatus));
    }
    void cancelled(const Job* job) override { lines.push_back(names[job] + ": cancelled()"); }
    void processed(const Job* job) override { lines.push_back(names[job] + ": processed()"); }
};

/// Does what a test wants when a file begins to open.
class FileWatcher : public Media::View<Media::File>,
                    private PubSub::Subscriber<Message::Types::Added<Media::File>>
{
public:
    explicit FileWatcher(std::function<void(const Media::File*)> onOpening)
        : m_onOpening(std::move(onOpening))
    {
        subscribeAll<Media::File>();
    }

protected:
    void notify(const Message::Types::Added<Media::File>& message) override { fileObserve(message.sender); }
    using Media::View<Media::File>::fileChanged;
    void fileChanged(const Media::File* file) override
    {
        if (file->isOpening) {
            m_onOpening(file);
        }
    }

private:
    std::function<void(const Media::File*)> m_onOpening;
};

std::vector<QString> paths(const std::deque<const Media::File*>& files)
{
    std::vector<QString> texts;
    for (const Media::File* file : files) {
        texts.push_back(file->path);
    }
    return texts;
}

class AnalysisRunner : public testing::Test
{
protected:
    void SetUp() override { Host::showMediaLibraryLog(false); }

    const QString wav = sample("speech.wav");
    const QString png = sample("picture.png");
    const QString missing = "/no/such/file.mp4";
    Host::MediaOpener opener;
    Job job;
};

TEST_F(AnalysisRunner, TakesAJobFromQueuedThroughProcessingToProcessed)
{
    Host::AnalysisRunner runner;
    Client client;
    client.add(job, "a", {wav, missing, png});
    EXPECT_EQ(std::exchange(client.lines, {}), Lines({"a: queued 0+0"}));
    EXPECT_TRUE(job.queued());
    EXPECT_THAT(runner.entries(&job), IsEmpty());

    runner.run();
    EXPECT_EQ(client.lines,
              Lines({"a: from queued", "a: processing 0+0", "a: processing 1+0", "a: processing 1+1",
                     "a: processing 2+1", "a: from processing", "a: processed()", "a: processed 2+1"}));
    EXPECT_THAT(paths(job.opened), ElementsAre(wav, png));
    EXPECT_THAT(paths(job.failed), ElementsAre(missing));
    EXPECT_TRUE(job.opened[0]->isOpened);
    EXPECT_EQ(job.opened[0]->length, MTime(1500));
    EXPECT_TRUE(job.failed[0]->isFailed);
    ASSERT_THAT(runner.entries(&job), SizeIs(3));
    EXPECT_EQ(runner.entries(&job)[1].reason, "does not exist");
}

TEST_F(AnalysisRunner, ProcessesAJobWithoutFilesAtOnce)
{
    Host::AnalysisRunner runner;
    Client client;
    client.add(job, "a", {});
    runner.run();
    EXPECT_EQ(client.lines, Lines({"a: queued 0+0", "a: from queued", "a: processing 0+0",
                                   "a: from processing", "a: processed()", "a: processed 0+0"}));
}

TEST_F(AnalysisRunner, WorksQueuedJobsOffOneAfterAnother)
{
    Host::AnalysisRunner runner;
    Client client;
    Job second;
    Job third;
    client.add(job, "a", {wav});
    client.add(second, "b", {missing});
    client.add(third, "c", {});
    client.lines.clear();
    runner.run();
    EXPECT_EQ(client.lines,
              Lines({"a: from queued", "a: processing 0+0", "a: processing 1+0", "a: from processing",
                     "a: processed()", "a: processed 1+0", "b: from queued", "b: processing 0+0",
                     "b: processing 0+1", "b: from processing", "b: processed()", "b: processed 0+1",
                     "c: from queued", "c: processing 0+0", "c: from processing", "c: processed()",
                     "c: processed 0+0"}));
}

TEST_F(AnalysisRunner, StopsBetweenFilesWhenAnObserverCancels)
{
    Host::AnalysisRunner runner;
    Client client;
    client.onChanged = [&](const Job* changed) {
        if (changed->processing() && changed->opened.size() + changed->failed.size() == 2) {
            client.fileAnalyzerChange(changed)->cancel();
        }
    };
    client.add(job, "a", {wav, missing, png, wav, wav});
    client.lines.clear();
    runner.run();
    // The cancellation is told of from within the change in which it was asked for.
    EXPECT_EQ(client.lines,
              Lines({"a: from queued", "a: processing 0+0", "a: processing 1+0", "a: processing 1+1",
                     "a: from processing", "a: cancelled()", "a: cancelled 1+1"}));
    EXPECT_THAT(paths(job.opened), ElementsAre(wav));
    EXPECT_THAT(paths(job.failed), ElementsAre(missing));
    EXPECT_TRUE(job.opened[0]->isOpened);
    EXPECT_THAT(runner.entries(&job), SizeIs(2));
}

TEST_F(AnalysisRunner, StartsNoFileOfAJobThatIsCancelledAsItStarts)
{
    Host::AnalysisRunner runner;
    Client client;
    client.onChanged = [&](const Job* changed) {
        if (changed->processing()) {
            client.fileAnalyzerChange(changed)->cancel();
        }
    };
    client.add(job, "a", {wav});
    runner.run();
    EXPECT_TRUE(job.canceled());
    EXPECT_THAT(runner.entries(&job), IsEmpty());
}

TEST_F(AnalysisRunner, LeavesOutTheFileThatWasOpeningWhenItWasCancelled)
{
    Host::AnalysisRunner runner;
    Client client;
    client.add(job, "a", {wav, png, missing});
    const FileWatcher watcher([&](const Media::File* file) {
        if (file->path == png) {
            client.fileAnalyzerChange(&job)->cancel();
        }
    });
    runner.run();
    EXPECT_TRUE(job.canceled());
    EXPECT_THAT(paths(job.opened), ElementsAre(wav));
    EXPECT_THAT(job.failed, IsEmpty());
    EXPECT_EQ(client.lines.back(), "a: cancelled 1+0");
}

TEST_F(AnalysisRunner, PassesOverAJobThatIsCancelledWhileItWaits)
{
    Host::AnalysisRunner runner;
    Client client;
    Job second;
    client.add(job, "a", {wav});
    client.add(second, "b", {wav});
    client.fileAnalyzerChange(&job)->cancel();
    client.lines.clear();
    runner.run();
    EXPECT_TRUE(job.canceled());
    EXPECT_THAT(job.opened, IsEmpty());
    EXPECT_TRUE(second.processed());
    EXPECT_EQ(client.lines.front(), "b: from queued");
}

TEST_F(AnalysisRunner, GoesOnToTheNextJobBehindACancelledOne)
{
    Host::AnalysisRunner runner;
    Client client;
    Job second;
    client.onChanged = [&](const Job* changed) {
        if (changed == &job && changed->processing() && !changed->opened.empty()) {
            client.fileAnalyzerChange(changed)->cancel();
        }
    };
    client.add(job, "a", {wav, png});
    client.add(second, "b", {png});
    runner.run();
    EXPECT_TRUE(job.canceled());
    EXPECT_THAT(paths(job.opened), ElementsAre(wav));
    EXPECT_TRUE(second.processed());
    EXPECT_THAT(paths(second.opened), ElementsAre(png));
}

TEST_F(AnalysisRunner, TakesJobsThatAreQueuedWhileItWorks)
{
    Host::AnalysisRunner runner;
    Client client;
    Job second;
    client.onChanged = [&](const Job* changed) {
        if (changed == &job && changed->opened.size() == 1 && client.names.count(&second) == 0) {
            client.add(second, "b", {png});
            runner.run(); // does nothing: the outer call goes on
            EXPECT_TRUE(second.queued());
        }
    };
    client.add(job, "a", {wav, wav});
    runner.run();
    EXPECT_TRUE(job.processed());
    EXPECT_THAT(job.opened, SizeIs(2));
    EXPECT_TRUE(second.processed());
}

TEST_F(AnalysisRunner, LooksAtFilesThatAreAddedToTheJobMeanwhile)
{
    Host::AnalysisRunner runner;
    Client client;
    client.onChanged = [&](const Job* changed) {
        if (changed->files.size() == 1 && !changed->opened.empty()) {
            client.fileAnalyzerChange(changed)->setFiles({wav, png});
        }
    };
    client.add(job, "a", {wav});
    runner.run();
    EXPECT_THAT(paths(job.opened), ElementsAre(wav, png));
}

TEST_F(AnalysisRunner, StartsAJobThatIsQueuedAgainFromTheBeginning)
{
    Host::AnalysisRunner runner;
    Client client;
    client.add(job, "a", {wav, missing});
    runner.run();
    client.lines.clear();
    client.fileAnalyzerChange(&job)->setStatus(FileAnalyzer::Queued)->setFiles({png});
    EXPECT_EQ(std::exchange(client.lines, {}), Lines({"a: from processed", "a: queued 1+1"}));
    EXPECT_TRUE(job.opened[0]->isOpened);

    runner.run();
    EXPECT_EQ(client.lines, Lines({"a: from queued", "a: processing 0+0", "a: processing 1+0",
                                   "a: from processing", "a: processed()", "a: processed 1+0"}));
    EXPECT_THAT(paths(job.opened), ElementsAre(png));
    EXPECT_THAT(job.failed, IsEmpty());
    EXPECT_THAT(runner.entries(&job), SizeIs(1));
}

TEST_F(AnalysisRunner, PutsAJobThatIsCancelledAndQueuedAgainBehindTheOthers)
{
    Host::AnalysisRunner runner;
    Client client;
    Job second;
    bool isDone = false;
    client.onChanged = [&](const Job* changed) {
        if (changed == &job && !changed->opened.empty() && !std::exchange(isDone, true)) {
            client.fileAnalyzerChange(changed)->cancel();
            client.fileAnalyzerChange(changed)->setStatus(FileAnalyzer::Queued);
        }
    };
    client.add(job, "a", {wav, png});
    client.add(second, "b", {});
    client.lines.clear();
    runner.run();
    EXPECT_EQ(client.lines,
              Lines({"a: from queued",    "a: processing 0+0",  "a: processing 1+0",  "a: from processing",
                     "a: cancelled()",    "a: cancelled 1+0",   "a: from cancelled",  "a: queued 1+0",
                     "b: from queued",    "b: processing 0+0",  "b: from processing", "b: processed()",
                     "b: processed 0+0",  "a: from queued",     "a: processing 0+0",  "a: processing 1+0",
                     "a: processing 2+0", "a: from processing", "a: processed()",     "a: processed 2+0"}));
}

TEST_F(AnalysisRunner, LeavesAJobAloneThatIsRemovedAndDestroyedWhileItWorks)
{
    Host::AnalysisRunner runner;
    Client client;
    Job second;
    auto shortLived = std::make_unique<Job>();
    const Job* const address = shortLived.get();
    client.add(*shortLived, "a", {wav, png});
    client.add(second, "b", {wav});
    std::string codec;
    const FileWatcher watcher([&](const Media::File* file) {
        if (file->path == png) {
            const Media::File* const seen = shortLived->opened.at(0);
            client.fileAnalyzerRemove(shortLived.get());
            shortLived.reset();
            // The files live on until the run has ended.
            codec = seen->audioTracks.at(0)->codecId;
        }
    });
    runner.run();
    EXPECT_FALSE(shortLived);
    EXPECT_EQ(codec, "pcm_s16le");
    EXPECT_THAT(runner.entries(address), IsEmpty());
    EXPECT_TRUE(second.processed());
}

TEST_F(AnalysisRunner, FreesTheFilesOfAJobThatIsRemoved)
{
    Host::AnalysisRunner runner;
    Client client;
    Message::View<Media::File> any;
    client.add(job, "a", {wav, missing});
    runner.run();
    EXPECT_THAT(any.enumerateAll(), SizeIs(2));
    client.fileAnalyzerRemove(&job);
    EXPECT_THAT(any.enumerateAll(), IsEmpty());
    runner.run();
    EXPECT_THAT(runner.entries(&job), IsEmpty());
}

/// Looks at the files of the old value of each change, and calls something when a job is queued again.
class OldValueReader : public Message::View<Job>
{
public:
    OldValueReader(const Job* job, std::function<void()> whenQueued) : onQueued(std::move(whenQueued))
    {
        observe(job);
    }

    std::function<void()> onQueued;
    std::size_t lost = 0;

protected:
    using Message::View<Job>::changed;
    void changed(const Job* job, const Job* old) override
    {
        if (job->queued() && onQueued) {
            std::exchange(onQueued, nullptr)();
        }
        const std::set<const Media::File*> shared = Message::View<Media::File>().enumerateAll();
        for (const Media::File* file : old->opened) {
            lost += shared.count(file) == 0 ? 1u : 0u;
        }
    }
};

TEST_F(AnalysisRunner, KeepsTheFilesOfTheOldValueWhileAChangeIsToldOf)
{
    Host::AnalysisRunner runner;
    Client client;
    client.add(job, "a", {wav, png});
    runner.run();
    // Whoever is told first starts the run; both read the old value afterwards.
    OldValueReader first(&job, [] {});
    OldValueReader second(&job, [] {});
    const auto start = [&] {
        first.onQueued = nullptr;
        second.onQueued = nullptr;
        runner.run();
    };
    first.onQueued = start;
    second.onQueued = start;
    client.fileAnalyzerChange(&job)->setStatus(FileAnalyzer::Queued)->setFiles({wav});
    EXPECT_TRUE(job.processed());
    EXPECT_EQ(first.lost + second.lost, 0u);
    // Afterwards there are only those that the job has.
    EXPECT_THAT(Message::View<Media::File>().enumerateAll(), SizeIs(1));
}

TEST_F(AnalysisRunner, KeepsTheFilesOfTheOldValueWhenTheJobIsRemovedMeanwhile)
{
    Host::AnalysisRunner runner;
    Client client;
    client.add(job, "a", {wav});
    runner.run();
    std::size_t shared = 0;
    OldValueReader reader(&job, [&] {
        client.fileAnalyzerRemove(&job);
        shared = Message::View<Media::File>().enumerateAll().size();
    });
    client.fileAnalyzerChange(&job)->setStatus(FileAnalyzer::Queued);
    EXPECT_EQ(shared, 1u);
    EXPECT_EQ(reader.lost, 0u);
    EXPECT_THAT(Message::View<Media::File>().enumerateAll(), IsEmpty());
}

/// Calls something, once, when a file is removed.
class RemovalWatcher : public PubSub::Subscriber<Message::Types::Removed<Media::File>>
{
public:
    explicit RemovalWatcher(std::function<void()> onRemoved) : m_onRemoved(std::move(onRemoved))
    {
        subscribeAll<Media::File>();
    }
    void notify(const Message::Types::Removed<Media::File>&) override
    {
        if (m_onRemoved) {
            std::exchange(m_onRemoved, nullptr)();
        }
    }

private:
    std::function<void()> m_onRemoved;
};

TEST_F(AnalysisRunner, TakesRequestsWhileItEnds)
{
    auto runner = std::make_unique<Host::AnalysisRunner>();
    Client client;
    Job second;
    client.add(job, "a", {wav, missing});
    client.add(second, "b", {png});
    runner->run();
    const RemovalWatcher watcher([&] {
        client.fileAnalyzerRemove(&job);
        client.fileAnalyzerRemove(&second);
    });
    runner.reset();
    EXPECT_THAT(client.fileAnalyzers(), IsEmpty());
    EXPECT_THAT(Message::View<Media::File>().enumerateAll(), IsEmpty());
}

TEST_F(AnalysisRunner, LooksAtManyFilesIncludingSuchAsFail)
{
    Host::AnalysisRunner runner;
    Client client;
    QStringList files;
    std::vector<QString> opened;
    std::vector<QString> failed;
    for (int i = 0; i != 60; ++i) {
        const bool fails = i % 3 == 1;
        files << (fails ? missing + QString::number(i) : i % 2 == 0 ? wav : png);
        (fails ? failed : opened).push_back(files.back());
    }
    client.add(job, "a", files);
    client.lines.clear();
    runner.run();
    EXPECT_EQ(paths(job.opened), opened);
    EXPECT_EQ(paths(job.failed), failed);
    EXPECT_EQ(client.lines.size(), 2u + 60u + 3u);
    EXPECT_EQ(client.lines[2], "a: processing 1+0");
    EXPECT_EQ(client.lines[61], "a: processing 40+20");
}

TEST(AnalysisRunnerAlone, LetsAllFilesFailWhereNobodyOpensThem)
{
    Host::AnalysisRunner runner;
    Client client;
    Job job;
    client.add(job, "a", {sample("speech.wav"), sample("picture.png")});
    runner.run();
    EXPECT_TRUE(job.processed());
    EXPECT_THAT(job.opened, IsEmpty());
    EXPECT_THAT(paths(job.failed), ElementsAre(sample("speech.wav"), sample("picture.png")));
    EXPECT_EQ(runner.entries(&job)[0].reason, "is not opened: there is no module for that");
}

/// Writes down what a progress shows.
class ProgressReader : public Message::View<Report::Progress>
{
public:
    explicit ProgressReader(const Report::Progress* progress) { observe(progress); }

    Lines lines;

protected:
    using Message::View<Report::Progress>::changed;
    void changed(const Report::Progress* progress) override
    {
        lines.push_back(std::to_string(progress->passed) + "/" + std::to_string(progress->total) + " " +
                        progress->label.toStdString());
    }
};

TEST_F(AnalysisRunner, TellsByAProgressWhichFileComesNext)
{
    Host::AnalysisRunner runner;
    const Host::Interrupt interrupt;
    Host::AnalysisProgress analysis(&job, {png, missing}, interrupt);
    ProgressReader reader(analysis.progress());
    EXPECT_EQ(std::exchange(reader.lines, {}), Lines({"0/2 "}));
    runner.run();
    EXPECT_EQ(reader.lines, Lines({"0/2 " + png.toStdString(), "1/2 " + missing.toStdString(),
                                   "2/2 " + missing.toStdString()}));
    EXPECT_TRUE(job.processed());
}

TEST_F(AnalysisRunner, StopsBehindTheFileInWhichTheUserInterrupts)
{
    Host::AnalysisRunner runner;
    const Host::Interrupt interrupt;
    const Host::AnalysisProgress analysis(&job, {wav, png, wav, wav}, interrupt);
    const FileWatcher watcher([&](const Media::File* file) {
        if (file->path == png) {
            EXPECT_FALSE(interrupt.isRaised());
            std::raise(SIGINT);
        }
    });
    runner.run();
    EXPECT_TRUE(interrupt.isRaised());
    EXPECT_TRUE(job.canceled());
    EXPECT_THAT(paths(job.opened), ElementsAre(wav, png));
}

TEST(Interrupt, LeavesTheSignalAsItWas)
{
    const auto handler = [] {
        struct sigaction now = {};
        sigaction(SIGINT, nullptr, &now);
        return now.sa_handler;
    };
    const auto before = handler();
    {
        const Host::Interrupt interrupt;
        EXPECT_NE(handler(), before);
        std::raise(SIGINT);
        // The second one ends the process.
        EXPECT_EQ(handler(), SIG_DFL);
    }
    EXPECT_EQ(handler(), before);

    const auto ignored = std::signal(SIGINT, SIG_IGN);
    {
        const Host::Interrupt interrupt;
        EXPECT_EQ(handler(), SIG_IGN);
        std::raise(SIGINT);
        EXPECT_FALSE(interrupt.isRaised());
    }
    EXPECT_EQ(handler(), SIG_IGN);
    std::signal(SIGINT, ignored);
}

} // namespace
