// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/Pack.h>

#include <EditorModel/persistence/Fields.h>

namespace Package::InApp {
namespace {

QString textFor(const QMap<QString, QString>& locale2text, const QString& locale)
{
    static const QString fallback = QStringLiteral("en_US");
    return locale2text.value(locale2text.contains(locale) ? locale : fallback);
}

} // namespace

QString Pack::productName(const QString& locale) const
{
    return textFor(locale2productName, locale);
}

QString Pack::previewUrl(const QString& locale) const
{
    return textFor(locale2previewUrl, locale);
}

bool Pack::isInstalled() const
{
    return installationStatus == Installed;
}

Pack* Pack::setInstallationStatus(InstallationStatus status)
{
    installationStatus = status;
    return this;
}

bool operator==(const Pack& a, const Pack& b)
{
    return &a == &b ||
           (a.appId == b.appId && a.downloadUrl == b.downloadUrl && a.reservedText == b.reservedText &&
            a.installationStatus == b.installationStatus && a.locale2productName == b.locale2productName &&
            a.locale2previewUrl == b.locale2previewUrl);
}

bool operator!=(const Pack& a, const Pack& b)
{
    return !(a == b);
}

void fields(Serialize::Fields& f, Pack& pack)
{
    f("appId", pack.appId)("locale2productName", pack.locale2productName);
    f("locale2previewUrl", pack.locale2previewUrl)("downloadUrl", pack.downloadUrl);
}

} // namespace Package::InApp

EDITORMODEL_PERSISTENT_CLASS(Package::InApp::Pack)
