// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/packages/PackageContent.h"

#include <QString>

#include <deque>
#include <map>
#include <memory>
#include <set>

namespace Host {

/// A package that was read, and what was wrong with it.
struct PackageReading
{
    /// Null if the description could not be read. Elements with faults are missing in it.
    std::unique_ptr<PackageContent> content;
    std::deque<PackageFault> faults;
    /// The identifiers of elements that are missing since elements of other packages have them.
    std::set<QString> takenIds;
};

/// Reads the package in a folder.
///
/// Its description is the document "package.json": a Package::Object, and behind it, as the second object, a
/// Package::InApp::Pack if the package tells its own identifier, names and address; the identifier is the
/// folder's name otherwise. The resources of an add-on lie in its content path. An element's document holds
/// the element itself, or an item of a collection with the element, its picture and its categories; an item
/// without categories is listed under all of the add-on's. The categories lead to collections by the add-on's
/// map, and the element gets an item in each of these, which is known by the resource's identifier, or by the
/// document's where the resource has none. The location of an import is the name of its media file from the
/// content path on.
///
/// `id2package` has the identifiers that are taken already, and whose they are.
PackageReading readPackage(const QString& folder, const std::map<QString, QString>& id2package);

} // namespace Host
