// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/Views.h>

template class Message::View<Media::File>;
template class Message::View<Media::Audio>;
template class Message::View<Media::Video>;

namespace Media {

void View<Media::File>::fileOpened(const Media::File*) {}
void View<Media::File>::fileClosed(const Media::File*) {}
void View<Media::File>::fileFailed(const Media::File*) {}

void View<Media::File>::fileOpen(const Media::File* file, const QString& path)
{
    fileChange(file)->toDefaults()->setPath(path)->setOpening(true);
}

void View<Media::File>::fileOpen(const QString& path)
{
    fileOpen(file(), path);
}

void View<Media::File>::fileClose(const Media::File* file)
{
    fileChange(file)->toDefaults();
}

void View<Media::File>::fileClose()
{
    fileClose(file());
}

std::set<const Media::File*> View<Media::File>::filesOpening() const
{
    return filesFiltered([](const Media::File* file) { return file->isOpening; });
}

std::set<const Media::File*> View<Media::File>::filesOpened() const
{
    return filesFiltered([](const Media::File* file) { return file->isOpened; });
}

std::set<const Media::File*> View<Media::File>::filesFailed() const
{
    return filesFiltered([](const Media::File* file) { return file->isFailed; });
}

std::set<const Media::File*>
View<Media::File>::filesFiltered(const std::function<bool(const Media::File*)>& filter) const
{
    std::set<const Media::File*> filtered;
    for (const Media::File* file : files()) {
        if (filter(file)) {
            filtered.insert(file);
        }
    }
    return filtered;
}

void View<Media::File>::fileChanged(const Media::File* file, const Media::File* oldValue,
                                    const Media::File* newValue)
{
    const bool isOpenNow = newValue->isOpened && !newValue->isOpening;
    const bool wasOther = !oldValue->isOpened || oldValue->isOpening;
    if (isOpenNow && wasOther) {
        fileOpened(file);
    }
    if (oldValue->isOpened && !newValue->isOpened) {
        fileClosed(file);
    }
    if (!oldValue->isFailed && newValue->isFailed) {
        fileFailed(file);
    }
}

} // namespace Media
