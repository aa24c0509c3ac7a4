// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>

#include <QMap>
#include <QString>

namespace Package::InApp {

/// A package that is not part of the installation: what it is called, and from where it is fetched.
class EDITORMODEL_EXPORT Pack : public virtual PubSub::Object, public Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Pack)

public:
    /// Whoever installs packs gives meaning to the other values, which are reached by a cast.
    enum InstallationStatus : int
    {
        DefaultStatus = 0,
        Installed = 1,
    };

    /// What the pack is known by.
    QString appId;
    QMap<QString, QString> locale2productName;
    QMap<QString, QString> locale2previewUrl;
    QString downloadUrl;
    /// For the owner of the catalogue. Not stored.
    QString reservedText;
    /// Not stored.
    InstallationStatus installationStatus = DefaultStatus;

    /// The text for a locale such as "de_DE"; where there is none, the one for "en_US", and an empty text
    /// where that is missing as well.
    QString productName(const QString& locale) const;
    QString previewUrl(const QString& locale) const;
    bool isInstalled() const;

    Pack* setInstallationStatus(InstallationStatus status);
};

/// Field by field, what is not stored included.
EDITORMODEL_EXPORT bool operator==(const Pack& a, const Pack& b);
EDITORMODEL_EXPORT bool operator!=(const Pack& a, const Pack& b);

} // namespace Package::InApp

EDITORMODEL_ARCHIVE_NAME(Package::InApp::Pack, "Package::InApp::Pack")
