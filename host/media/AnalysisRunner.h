// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/media/MediaDescriber.h"

#include <EditorModel/bus/View.h>
#include <EditorModel/media/FileAnalyzer.h>

#include <deque>
#include <map>
#include <memory>

namespace Host {

/// The module that works off analysis jobs. It takes every job that is added on the bus, and every job that
/// is queued waits until run() comes to it.
///
/// Whichever module opens media files is asked for the files of a job, one after another; where there is none
/// they all fail. After each file the job's `opened` or `failed` grows by it, through a change that everybody
/// hears of. A job that is cancelled, or is given any other status than processing, is left alone from then
/// on: it keeps what it has, and the file that was being opened is in neither list. Files that are added to
/// the list of a job while it is processed are looked at as well. A job that is queued again starts from the
/// beginning.
///
/// The files in a job belong to the runner. They live until the job is started anew or removed, and then to
/// the end of the outermost request or run in which that happens, or until the runner ends.
class AnalysisRunner : private Message::View<FileAnalyzer::Object>
{
public:
    AnalysisRunner();
    AnalysisRunner(const AnalysisRunner&) = delete;
    ~AnalysisRunner() override;

    /// Processes the queued jobs in the order in which they were queued, also those that are queued
    /// meanwhile, and returns when none is left. Called from within itself it does nothing: the outer call
    /// goes on.
    void run();

    /// What became of the files of a job so far, in their order; empty for a job that was not started.
    const std::deque<MediaDescriber::Entry>& entries(const FileAnalyzer::Object* job) const;

private:
    using Job = FileAnalyzer::Object;
    using JobView = Message::View<Job>;

    void changeRequested(Job* job, Job* value) override;
    void removeRequested(Job* job) override;
    using JobView::changed;
    void changed(const Job* job) override;
    void removed(const Job* job) override;

    const Job* nextJob();
    void process(const Job* job);
    void analyse(const Job* job, const QString& path);
    /// Other modules may do anything with the job while they are told of it.
    bool isGoingOn(const Job* job) const;
    void retireFiles(const Job* job);
    /// Does nothing as long as a request or a run is going on.
    void freeRetired();

    std::deque<const Job*> m_queue;
    const Job* m_current = nullptr;
    bool m_isRunning = false;
    /// The requests and runs that are going on, one within another.
    int m_depth = 0;
    std::map<const Job*, std::unique_ptr<MediaDescriber>> m_files;
    /// No job has them any more, but a message that is still going round may.
    std::deque<std::unique_ptr<MediaDescriber>> m_retired;
};

} // namespace Host
