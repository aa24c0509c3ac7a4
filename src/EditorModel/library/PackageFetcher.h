// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/Messages.h>
#include <EditorModel/library/PackageContent.h>

#include <QMap>
#include <QSet>
#include <QString>

#include <utility>

namespace Package {

/// Asks where the packs lie. Answered, before the publication ends, by a GetPackagesNotification.
class EDITORMODEL_EXPORT GetPackagesRequest : public ::Message::Types::Request<Package::Object>
{
public:
    explicit GetPackagesRequest(const Package::Object* about = nullptr) : Request(about) {}
};

/// The answer to GetPackagesRequest. The sender may be null.
class EDITORMODEL_EXPORT GetPackagesNotification : public ::Message::Types::Notification<Package::Object>
{
public:
    GetPackagesNotification(const Package::Object* about, QMap<QString, QString> directories,
                            QSet<QString> others)
        : Notification(about), appId2directory(std::move(directories)), reservedTexts(std::move(others))
    {}

    /// The directory of each pack that there is, by the pack's `appId`.
    QMap<QString, QString> appId2directory;
    /// Passed on unread.
    QSet<QString> reservedTexts;
};

/// Asks, while it is constructed, where the packs lie, and holds the answer. It stays empty if nobody
/// answers; where several do, it has what the last one told. Later changes don't reach it.
class EDITORMODEL_EXPORT PackageFetcher : public PubSub::Subscriber<GetPackagesNotification>
{
public:
    PackageFetcher();

    void notify(const GetPackagesNotification& message) override;

    QSet<QString> reservedTexts;
    QMap<QString, QString> appId2directory;
};

} // namespace Package
