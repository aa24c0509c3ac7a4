// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/TypedView.h>
#include <EditorModel/media/Audio.h>
#include <EditorModel/media/File.h>
#include <EditorModel/media/Video.h>

#include <QString>

#include <functional>
#include <set>

extern template class EDITORMODEL_EXPORT Message::View<Media::File>;
extern template class EDITORMODEL_EXPORT Message::View<Media::Audio>;
extern template class EDITORMODEL_EXPORT Message::View<Media::Video>;

namespace Media {

namespace Details {

class EDITORMODEL_EXPORT FileViewBase : private ::Message::View<Media::File>
{
    EDITORMODEL_TYPED_VIEW(Media::File, file)
};

class EDITORMODEL_EXPORT AudioViewBase : private ::Message::View<Media::Audio>
{
    EDITORMODEL_TYPED_VIEW(Media::Audio, audio)
};

class EDITORMODEL_EXPORT VideoViewBase : private ::Message::View<Media::Video>
{
    EDITORMODEL_TYPED_VIEW(Media::Video, video)
};

class EDITORMODEL_EXPORT TAudioViewBase : private ::Message::View<Media::Audio>
{
    EDITORMODEL_TYPED_VIEW(Media::Audio, tAudio)
};

class EDITORMODEL_EXPORT TVideoViewBase : private ::Message::View<Media::Video>
{
    EDITORMODEL_TYPED_VIEW(Media::Video, tVideo)
};

} // namespace Details

/// The typed view of a module that deals with files or formats.
template <typename T>
class View;

/// A second typed view of the same formats, for a module that needs both side by side.
template <typename T>
class TView;

/// Opens, closes and watches files.
template <>
class EDITORMODEL_EXPORT View<Media::File> : public Details::FileViewBase
{
protected:
    using Details::FileViewBase::fileChanged;
    /// Makes the three calls below; a replacement that wants them goes on to this one.
    void fileChanged(const Media::File* file, const Media::File* oldValue,
                     const Media::File* newValue) override;

    /// Called, before fileChanged(file), for what a change, an arrival or a departure means for the file's
    /// state; a file that arrives or departs is compared with a closed one.
    virtual void fileOpened(const Media::File* file);
    virtual void fileClosed(const Media::File* file);
    virtual void fileFailed(const Media::File* file);

    /// Forgets all that was known of the file and marks it, with its new path, as opening. Whoever owns it is
    /// to open it. Null, or no file, stands for the first one. On an empty view it is a change(nullptr): a
    /// temporary is added, whose address ends with the call.
    void fileOpen(const Media::File* file, const QString& path);
    void fileOpen(const QString& path);
    /// Forgets all that was known of the file, its path included. Null and no file are as in fileOpen().
    void fileClose(const Media::File* file);
    void fileClose();

    /// Those of the view's files that are in this state now.
    std::set<const Media::File*> filesOpening() const;
    std::set<const Media::File*> filesOpened() const;
    std::set<const Media::File*> filesFailed() const;
    std::set<const Media::File*> filesFiltered(const std::function<bool(const Media::File*)>& filter) const;
};

template <>
class EDITORMODEL_EXPORT View<Media::Audio> : public Details::AudioViewBase
{};

template <>
class EDITORMODEL_EXPORT View<Media::Video> : public Details::VideoViewBase
{};

template <>
class EDITORMODEL_EXPORT TView<Media::Audio> : public Details::TAudioViewBase
{};

template <>
class EDITORMODEL_EXPORT TView<Media::Video> : public Details::TVideoViewBase
{};

} // namespace Media
