// SPDX-License-Identifier: Apache-2.0
#include "host/media/AnalysisRunner.h"

#include <algorithm>
#include <utility>

namespace Host {
namespace {

/// Sets a value back when it ends, also where a handler throws.
template <class T>
class Restored
{
public:
    Restored(T& variable, T value) : m_variable(variable), m_before(variable) { variable = value; }
    Restored(const Restored&) = delete;
    Restored& operator=(const Restored&) = delete;
    ~Restored() { m_variable = m_before; }

private:
    T& m_variable;
    const T m_before;
};

} // namespace

AnalysisRunner::AnalysisRunner()
{
    processAddRequests();
}

AnalysisRunner::~AnalysisRunner()
{
    // Those who hear that the files are removed may have jobs removed: all of the runner must be there.
    while (!m_files.empty()) {
        retireFiles(m_files.begin()->first);
        freeRetired();
    }
}

void AnalysisRunner::run()
{
    if (m_isRunning) {
        return;
    }
    {
        const Restored<bool> running(m_isRunning, true);
        const Restored<int> deeper(m_depth, m_depth + 1);
        while (const Job* const job = nextJob()) {
            process(job);
        }
    }
    freeRetired();
}

const std::deque<MediaDescriber::Entry>& AnalysisRunner::entries(const FileAnalyzer::Object* job) const
{
    static const std::deque<MediaDescriber::Entry> none;
    const auto files = m_files.find(job);
    return files == m_files.end() ? none : files->second->entries();
}

void AnalysisRunner::changeRequested(Job* job, Job* value)
{
    {
        // An observer may start a run while others have yet to hear of the old value.
        const Restored<int> deeper(m_depth, m_depth + 1);
        JobView::changeRequested(job, value);
    }
    freeRetired();
}

void AnalysisRunner::removeRequested(Job* job)
{
    {
        const Restored<int> deeper(m_depth, m_depth + 1);
        JobView::removeRequested(job);
    }
    freeRetired();
}

void AnalysisRunner::changed(const Job* job)
{
    const bool isWaiting = std::find(m_queue.begin(), m_queue.end(), job) != m_queue.end();
    if (job->queued() && !isWaiting) {
        m_queue.push_back(job);
    }
}

void AnalysisRunner::removed(const Job* job)
{
    m_queue.erase(std::remove(m_queue.begin(), m_queue.end(), job), m_queue.end());
    if (m_current == job) {
        m_current = nullptr;
    }
    retireFiles(job);
}

const FileAnalyzer::Object* AnalysisRunner::nextJob()
{
    while (!m_queue.empty()) {
        const Job* const job = m_queue.front();
        m_queue.pop_front();
        // It may have been cancelled while it waited.
        if (job->queued()) {
            return job;
        }
    }
    return nullptr;
}

void AnalysisRunner::process(const Job* job)
{
    const Restored<const Job*> current(m_current, job);
    retireFiles(job);
    m_files[job] = std::make_unique<MediaDescriber>();
    change(job)->setStatus(FileAnalyzer::Processing)->setOpened({})->setFailed({});
    for (int i = 0; isGoingOn(job) && i < job->files.size(); ++i) {
        analyse(job, QString(job->files[i]));
    }
    if (isGoingOn(job)) {
        change(job)->setStatus(FileAnalyzer::Processed);
    }
}

void AnalysisRunner::analyse(const Job* job, const QString& path)
{
    const Media::File& file = m_files[job]->describe(path).file;
    if (!isGoingOn(job)) {
        return;
    }
    auto next = change(job);
    std::deque<const Media::File*>& list = file.isOpened ? next->opened : next->failed;
    list.push_back(&file);
}

bool AnalysisRunner::isGoingOn(const Job* job) const
{
    return m_current == job && job->processing();
}

void AnalysisRunner::retireFiles(const Job* job)
{
    const auto files = m_files.find(job);
    if (files != m_files.end()) {
        m_retired.push_back(std::move(files->second));
        m_files.erase(files);
    }
}

void AnalysisRunner::freeRetired()
{
    if (m_depth != 0) {
        return;
    }
    // Those who hear that the files are removed may retire others.
    std::deque<std::unique_ptr<MediaDescriber>> freed;
    freed.swap(m_retired);
}

} // namespace Host
