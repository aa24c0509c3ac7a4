// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/media/Object.h>

#include <QString>

namespace Media {

/// A file with one of its video tracks and one of its audio tracks.
class EDITORMODEL_EXPORT FileTarget : public Media::Object
{
public:
    QString path;
    int videoTrack = 0; ///< the number of the track within the file
    int audioTrack = 0; ///< the number of the track within the file

    FileTarget() = default;
    FileTarget(const FileTarget&) = default;
    FileTarget(FileTarget&&) = default;
    FileTarget& operator=(const FileTarget&) = default;
    FileTarget& operator=(FileTarget&&) = default;
    ~FileTarget() override;

    FileTarget* setPath(const QString& newPath);
    FileTarget* setVideoTrack(int track);
    FileTarget* setAudioTrack(int track);
};

} // namespace Media
