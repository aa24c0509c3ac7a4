// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/TypedView.h>

#include <QStringList>

#include <deque>

namespace Media {
class File;
}

namespace FileAnalyzer {

enum Status : int
{
    Queued = 0,
    Processing = 1,
    Processed = 2,
    Canceled = 3,
};

/// A batch of files to be opened and looked at. Whoever does the work writes its progress; the intended
/// course is queued, processing, processed, and canceled from either of the first two, which nothing
/// enforces.
class EDITORMODEL_EXPORT Object : public virtual PubSub::Object
{
public:
    /// The paths to open.
    QStringList files;
    Status status = Queued;
    /// Files that some view of files owns.
    std::deque<const Media::File*> opened;
    /// Files that some view of files owns.
    std::deque<const Media::File*> failed;

    Object() = default;
    Object(const Object&) = default;
    Object(Object&&) = default;
    Object& operator=(const Object&) = default;
    Object& operator=(Object&&) = default;
    ~Object() override;

    Object* setFiles(QStringList paths);
    Object* setStatus(Status newStatus);
    Object* setOpened(std::deque<const Media::File*> newFiles);
    Object* setFailed(std::deque<const Media::File*> newFiles);

    /// Marks the job as canceled, also one that is processed already. Whoever does the work stops when it
    /// hears of it.
    Object* cancel();

    bool queued() const;
    bool processing() const;
    bool processed() const;
    bool canceled() const;
};

} // namespace FileAnalyzer

extern template class EDITORMODEL_EXPORT Message::View<FileAnalyzer::Object>;

namespace FileAnalyzer {

namespace Details {

class EDITORMODEL_EXPORT ObjectViewBase : private ::Message::View<FileAnalyzer::Object>
{
    EDITORMODEL_TYPED_VIEW(FileAnalyzer::Object, fileAnalyzer)
};

} // namespace Details

/// Starts, does or watches such jobs.
class EDITORMODEL_EXPORT View : public Details::ObjectViewBase
{
protected:
    using Details::ObjectViewBase::fileAnalyzerChanged;
    /// Makes the calls below; a replacement that wants them goes on to this one.
    void fileAnalyzerChanged(const FileAnalyzer::Object* object, const FileAnalyzer::Object* oldValue,
                             const FileAnalyzer::Object* newValue) override;

    /// Called where the status differs from `oldStatus`, in front of fileAnalyzerChanged(object); also on
    /// arrival and departure, which compare with a queued job. Where the new status is canceled or processed,
    /// the one of that name below follows.
    virtual void statusChanged(const FileAnalyzer::Object* object, FileAnalyzer::Status oldStatus);
    virtual void cancelled(const FileAnalyzer::Object* object);
    virtual void processed(const FileAnalyzer::Object* object);
};

} // namespace FileAnalyzer
