// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>

#include <QString>

#include <tuple>

namespace Resource {

/// The kind of a resource.
enum Type : int
{
    NoType = 0, ///< also what a text of another kind is read as
    VideoType = 1,
    AudioType = 2,
    ImageType = 3,
};

} // namespace Resource

/// Names a piece of media without naming a file: the identifier, which only the engine can read, and the
/// kind. A default one has an empty identifier and no kind.
using ResourceRef = std::tuple<QString, Resource::Type>;

namespace Resource {

/// The identifier that is reserved for a stream with nothing in it. The model treats it like any other.
EDITORMODEL_EXPORT extern const QString EMPTY_STREAM;

/// Reads what serializeResource() writes. The two parts may stand in any order, the last one of a key counts,
/// and parts that are not understood are passed over: what cannot be read is empty in the result.
EDITORMODEL_EXPORT ResourceRef parseResource(const QString& text);

/// "resource_id=abc:resource_type=video", with no text for a kind that has no name. Nothing is escaped: an
/// identifier with ':' or '=' does not come back, nor does one with a place marker such as "%2", which is
/// filled with the kind.
EDITORMODEL_EXPORT QString serializeResource(const ResourceRef& resource);

} // namespace Resource
