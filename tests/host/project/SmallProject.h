// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/project/ProjectStore.h"

#include <EditorModel/library/Import.h>
#include <EditorModel/library/UserObject.h>
#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/timeline/Timeline.h>

#include <QDir>
#include <QString>
#include <QStringList>

namespace HostTests {

/// A project that is told apart from others by a number.
class SmallProject
{
public:
    explicit SmallProject(int number = 0)
    {
        content.timeline = &timeline;
        content.userCollection = &collection;
        content.resourceTable = &table;
        collection.addItem(&item);
        setNumber(number);
    }
    SmallProject(const SmallProject&) = delete;

    void setNumber(int number) { item.tag = QString::number(number); }

    void save(const QString& path) const { Host::ProjectStore::save(content, path); }

    Timeline::Object timeline;
    Import::Object item;
    EditorCollection::UserObject collection;
    ResourceTable::Object table;
    Project::Content content;
};

inline int numberOf(const Host::OpenedProject& project)
{
    return project.content().userCollection->items.at(0)->tag.toInt();
}

inline int numberIn(const QString& path)
{
    return numberOf(Host::ProjectStore::open(path));
}

inline int numberInBackup(const QString& path)
{
    return numberOf(Host::ProjectStore::openBackup(path));
}

/// The names of all that is in a folder, the hidden ones too, in the order of the alphabet.
inline std::string namesIn(const QString& folder)
{
    return QDir(folder)
        .entryList(QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot, QDir::Name)
        .join(' ')
        .toStdString();
}

} // namespace HostTests
