// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>

#include <QList>
#include <QMap>
#include <QString>

#include <set>

namespace Package::InApp {

class Pack;

/// The catalogue of all packs that there are. It owns none of them.
class EDITORMODEL_EXPORT Object : public virtual PubSub::Object, public Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Object)

public:
    /// In the order in which they are shown.
    QList<const Pack*> packs;
    /// What findPack() looks into. addPack() and removePack() keep it; it is not stored, so it is empty after
    /// loading, whatever `packs` holds.
    QMap<QString, const Pack*> appId2pack;
    /// Not 0 once somebody has asked for an update. Not stored.
    int updateStatus = 0;

    /// Appends the pack, which is not null. Of two with one `appId` the later one is found.
    InApp::Object* addPack(const Pack* pack);
    /// Takes out every mention of this very pack, which is not null; whichever pack was found under its
    /// `appId` is not found any more.
    InApp::Object* removePack(const Pack* pack);
    /// Null if no pack with this identifier was added.
    const Pack* findPack(const QString& appId) const;
    /// The packs of this catalogue that the other does not hold, by address.
    std::set<const Pack*> packsDifference(const InApp::Object& other) const;
    /// Asks for an update: raises `updateStatus` and leaves the rest to whoever owns the catalogue.
    InApp::Object* update();
};

} // namespace Package::InApp

EDITORMODEL_ARCHIVE_NAME(Package::InApp::Object, "Package::InApp::Object")
