// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/library/Project.h>

#include <QString>

namespace Host {

/// Which project was read or written, for modules that keep data of their own beside it.
struct ProjectPlace
{
    /// As the user gave it; a backup that was opened is named by the project's name.
    QString path;
    /// Lives as long as the message; longer only as its owner says.
    const Project::Content* content;

    /// The folder for what modules keep beside the project, each a file or a folder under a name of its own.
    /// It need not be there. Links to the project lead to the same folder.
    QString sideFolder() const;
};

} // namespace Host

namespace ProjectExtraInfo {

/// Goes out with ProjectContentLoaded: the project is read, and nobody has seen it yet.
class LoadContext : public Host::ProjectPlace
{
public:
    LoadContext(const Host::ProjectPlace& place, bool fromBackup) : ProjectPlace(place), isBackup(fromBackup)
    {}

    /// The content is that of the backup; the side folder may be newer.
    bool isBackup;
};

/// Goes out with ProjectContentSaved: the project is on the disk.
class SaveContext : public Host::ProjectPlace
{
public:
    explicit SaveContext(const Host::ProjectPlace& place) : ProjectPlace(place) {}
};

} // namespace ProjectExtraInfo
