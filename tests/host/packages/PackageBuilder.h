// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tests/host/shared/Samples.h"

#include <EditorModel/library/CollectionIds.h>
#include <EditorModel/library/InApp.h>
#include <EditorModel/library/Package.h>
#include <EditorModel/library/PersistentItem.h>
#include <EditorModel/persistence/Document.h>

#include <QDir>
#include <QFileInfo>
#include <QString>

#include <deque>

namespace HostTests {

/// A package in the making: what is added is written at once, the description at the end.
class PackageBuilder
{
public:
    explicit PackageBuilder(const QString& folder, const QString& appId = QString()) : m_folder(folder)
    {
        QDir().mkpath(folder);
        pack.appId = appId;
    }

    static Package::Resource resource(const QString& id, const QString& file, int type = 0)
    {
        Package::Resource made;
        made.id = id;
        made.file = file;
        made.type = static_cast<Package::Resource::Type>(type);
        return made;
    }

    static Package::CollectionAddOn addOn(const std::map<QString, QString>& category2collection,
                                          const std::deque<Package::Resource>& resources,
                                          const QString& contentPath = QString())
    {
        Package::CollectionAddOn made;
        made.contentPath = contentPath;
        made.category2collection = category2collection;
        made.resources = resources;
        return made;
    }

    QString path(const QString& name) const { return m_folder + '/' + name; }

    void write(const QString& name, const Serialize::ISerializable& root) const
    {
        QDir().mkpath(QFileInfo(path(name)).path());
        Document::saveFile(path(name), {&root}, Document::Json, Document::Stream);
    }

    void writeEffect(const QString& name, const QString& tag) const
    {
        Effect::Object effect("Sepia", "one");
        effect.tag = tag;
        write(name, effect);
    }

    /// An import whose media file has some bytes.
    void writeImport(const QString& name, const QString& tag, const QString& media) const
    {
        Import::Object import;
        import.tag = tag;
        import.setLocation(media);
        write(name, import);
    }

    void writeDescription() const
    {
        std::deque<const Serialize::ISerializable*> roots{&description};
        if (!pack.appId.isEmpty()) {
            roots.push_back(&pack);
        }
        Document::saveFile(path("package.json"), roots, Document::Json, Document::Stream);
    }

    Package::Object description;
    Package::InApp::Pack pack;

private:
    const QString m_folder;
};

/// A package with one effect, "Warm", in the collection of video effects, under "looks".
inline void writeEffectPackage(const QString& folder, const QString& id, const QString& appId = QString())
{
    PackageBuilder package(folder, appId);
    package.writeEffect("warm.json", "Warm");
    package.description.effects = {
        PackageBuilder::addOn({{"looks", EditorCollection::CollectionID::EFFECTS_VIDEO}},
                              {PackageBuilder::resource(id, "warm.json")})};
    package.writeDescription();
}

} // namespace HostTests
