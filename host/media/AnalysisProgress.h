// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/Interrupt.h"

#include <EditorModel/bus/View.h>
#include <EditorModel/media/FileAnalyzer.h>
#include <EditorModel/services/Report.h>

#include <QStringList>

namespace Host {

/// The module that starts one analysis job, tells by a progress how far it is, and cancels it between two
/// files when the user interrupts the process. The label of the progress is the path of the file that comes
/// next.
class AnalysisProgress : private FileAnalyzer::View
{
public:
    /// The job outlives the module and whoever takes it; `interrupt` outlives the module.
    AnalysisProgress(FileAnalyzer::Object* job, const QStringList& files, const Interrupt& interrupt);
    AnalysisProgress(const AnalysisProgress&) = delete;
    ~AnalysisProgress() override;

    /// Owned by this module, which ends its sharing when it ends.
    const Report::Progress* progress() const { return &m_progress; }

private:
    using FileAnalyzer::View::fileAnalyzerChanged;
    void fileAnalyzerChanged(const FileAnalyzer::Object* job) override;

    const Interrupt& m_interrupt;
    Report::Progress m_progress;
    Message::View<Report::Progress> m_reporter;
};

} // namespace Host
