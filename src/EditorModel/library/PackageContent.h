// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/media/ResourceInfo.h>
#include <EditorModel/persistence/Persistent.h>

#include <QString>

#include <deque>
#include <map>

namespace Package {

/// A resource of a package: a file, and what it is known by.
class EDITORMODEL_EXPORT Resource : public Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Resource)

public:
    /// The types belong to the modules that read packages; other values are reached by a cast.
    enum Type : int
    {
        DefaultType = 0,
    };

    Type type = DefaultType;
    QString id;
    QString file;
    /// Its `mode` is not stored.
    ::Resource::Timing timing;
};

/// What a package adds to the collections of one kind. Whoever reads it knows from where its paths go.
class EDITORMODEL_EXPORT CollectionAddOn : public Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(CollectionAddOn)

public:
    QString contentPath;
    QString translationDir;
    /// For each category of the add-on, the collection that takes it.
    std::map<QString, QString> category2collection;
    std::deque<Package::Resource> resources;
};

/// What a package brings, by kind of content.
class EDITORMODEL_EXPORT Object : public virtual PubSub::Object, public virtual Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Object)

public:
    /// For whoever reads packages, as the two below. Not stored.
    QString reservedFirst;
    QString reservedSecond;
    QString reservedThird;
    std::deque<CollectionAddOn> overlays;
    std::deque<CollectionAddOn> transitions;
    std::deque<CollectionAddOn> effects;
    std::deque<CollectionAddOn> imports;
    std::deque<CollectionAddOn> quizzes;
    QString fontsDir;
};

} // namespace Package

EDITORMODEL_ARCHIVE_NAME(Package::Resource, "Package::Resource")
EDITORMODEL_ARCHIVE_NAME(Package::CollectionAddOn, "Package::CollectionAddOn")
EDITORMODEL_ARCHIVE_NAME(Package::Object, "Package::Object")
