// SPDX-License-Identifier: Apache-2.0
#include "host/media/AnalysisProgress.h"

namespace Host {

AnalysisProgress::AnalysisProgress(FileAnalyzer::Object* job, const QStringList& files,
                                   const Interrupt& interrupt)
    : m_interrupt(interrupt)
{
    m_reporter.own(&m_progress)->setTotal(files.size());
    fileAnalyzerAdd(job)->setFiles(files);
}

AnalysisProgress::~AnalysisProgress()
{
    m_reporter.remove(&m_progress);
}

void AnalysisProgress::fileAnalyzerChanged(const FileAnalyzer::Object* job)
{
    if (!job->processing()) {
        return;
    }
    const int passed = static_cast<int>(job->opened.size() + job->failed.size());
    auto next = m_reporter.change(&m_progress);
    next->setPassed(passed);
    if (passed < job->files.size()) {
        next->setLabel(job->files[passed]);
    }
    if (m_interrupt.isRaised()) {
        fileAnalyzerChange(job)->cancel();
    }
}

} // namespace Host
