// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>

#include <QString>
#include <QtGlobal>

namespace Serialize {
class Fields;
}

namespace Package::InApp {
class Pack;
}

namespace Import {

/// An item of the library whose media is a local file, a file to be downloaded, or part of an add-on pack.
class EDITORMODEL_EXPORT Object : public virtual Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Object)

public:
    /// The kinds belong to the modules that show imports; other values are reached by a cast.
    enum Kind : int
    {
        DefaultKind = 0,
    };

    /// "x-application/ImportObject-serialized", for the clipboard and for drag and drop.
    static const QString* const mimeType;

    /// The name in the library.
    QString tag;
    QString description;
    QString descriptionUrl;
    Kind kind = DefaultKind;
    QString category;
    /// Set where the item is part of a pack. Not owned, not stored.
    const Package::InApp::Pack* pack = nullptr;

    /// Where the media lies on this machine. Of an item of a pack it is the directory of the pack, which is
    /// asked for over the bus at each call, and is empty as long as nobody has the pack.
    QString location() const;
    /// Of the item itself; without effect on what an item of a pack answers.
    void setLocation(const QString& location);

    /// From where the media is downloaded: of an item of a pack, from where the pack is.
    QString remoteUrl() const;
    /// Of the item itself; without effect on what an item of a pack answers.
    void setRemoteUrl(const QString& url);

    /// In bytes; -1 if it is unknown.
    qint64 remoteSize() const;
    void setRemoteSize(qint64 bytes);

private:
    friend void fields(Serialize::Fields& f, Import::Object& object);

    QString m_location;
    QString m_remoteUrl;
    qint64 m_remoteSize = -1;
};

} // namespace Import

EDITORMODEL_ARCHIVE_NAME(Import::Object, "Import::Object")
