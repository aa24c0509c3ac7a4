// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/FileAnalyzer.h>

#include <utility>

template class Message::View<FileAnalyzer::Object>;

namespace FileAnalyzer {

Object::~Object() = default;

Object* Object::setFiles(QStringList paths)
{
    files = std::move(paths);
    return this;
}

Object* Object::setStatus(Status newStatus)
{
    status = newStatus;
    return this;
}

Object* Object::setOpened(std::deque<const Media::File*> newFiles)
{
    opened = std::move(newFiles);
    return this;
}

Object* Object::setFailed(std::deque<const Media::File*> newFiles)
{
    failed = std::move(newFiles);
    return this;
}

Object* Object::cancel()
{
    return setStatus(Canceled);
}

bool Object::queued() const
{
    return status == Queued;
}

bool Object::processing() const
{
    return status == Processing;
}

bool Object::processed() const
{
    return status == Processed;
}

bool Object::canceled() const
{
    return status == Canceled;
}

void View::statusChanged(const FileAnalyzer::Object*, FileAnalyzer::Status) {}
void View::cancelled(const FileAnalyzer::Object*) {}
void View::processed(const FileAnalyzer::Object*) {}

void View::fileAnalyzerChanged(const FileAnalyzer::Object* object, const FileAnalyzer::Object* oldValue,
                               const FileAnalyzer::Object* newValue)
{
    const Status status = newValue->status;
    if (oldValue->status == status)
        return;
    statusChanged(object, oldValue->status);
    if (status == Canceled)
        cancelled(object);
    if (status == Processed)
        processed(object);
}

} // namespace FileAnalyzer
