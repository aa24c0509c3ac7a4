// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/Messages.h>
#include <EditorModel/bus/TypedView.h>
#include <EditorModel/media/ResourceInfo.h>
#include <EditorModel/media/ResourceRef.h>
#include <EditorModel/persistence/Persistent.h>

#include <QStringList>

#include <map>

namespace ResourceTable {

/// What a project knows of one of its resources.
class EDITORMODEL_EXPORT FileResourceInfo : public virtual Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(FileResourceInfo)

public:
    Resource::FileInfo info;
    Resource::Timing timing;

    FileResourceInfo() = default;
    FileResourceInfo(const FileResourceInfo&) = default;
    FileResourceInfo(FileResourceInfo&&) = default;
    FileResourceInfo& operator=(const FileResourceInfo&) = default;
    FileResourceInfo& operator=(FileResourceInfo&&) = default;
    ~FileResourceInfo() override;

    bool operator==(const FileResourceInfo& other) const;
};

/// The resources that a project uses: which file lies behind each, and how it behaves in time. One identifier
/// may stand under several kinds. The model itself takes no entry out but by clear().
class EDITORMODEL_EXPORT Object : public virtual PubSub::Object, public virtual Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Object)

public:
    /// Read through the field stream, it keeps the entries that it has, and those that are read take the
    /// place of entries with their key; the archives replace it whole.
    std::map<ResourceRef, FileResourceInfo> resource2fileInfo;

    Object() = default;
    Object(const Object&) = default;
    Object(Object&&) = default;
    Object& operator=(const Object&) = default;
    Object& operator=(Object&&) = default;
    ~Object() override;

    bool operator==(const Object& other) const;

    Object* clear();
};

/// Asks whoever can open media to add files to the table that is the sender. Nothing tells how it went but
/// the change of the table.
class EDITORMODEL_EXPORT AddFilesToTableRequest : public Message::Types::Request<ResourceTable::Object>
{
public:
    AddFilesToTableRequest(const ResourceTable::Object* table, const QStringList& paths);
    AddFilesToTableRequest(const AddFilesToTableRequest&) = default;
    AddFilesToTableRequest(AddFilesToTableRequest&&) = default;
    AddFilesToTableRequest& operator=(const AddFilesToTableRequest&) = default;
    AddFilesToTableRequest& operator=(AddFilesToTableRequest&&) = default;
    ~AddFilesToTableRequest() override;

    /// Paths.
    QStringList files;
};

} // namespace ResourceTable

extern template class EDITORMODEL_EXPORT Message::View<ResourceTable::Object>;

namespace ResourceTable {

namespace Details {

class EDITORMODEL_EXPORT ObjectViewBase : private ::Message::View<ResourceTable::Object>
{
    EDITORMODEL_TYPED_VIEW(ResourceTable::Object, resourceTable)
};

} // namespace Details

/// The view of a module that deals with the tables of resources.
class EDITORMODEL_EXPORT View : public Details::ObjectViewBase
{};

} // namespace ResourceTable

EDITORMODEL_ARCHIVE_NAME(ResourceTable::FileResourceInfo, "ResourceTable::FileResourceInfo")
EDITORMODEL_ARCHIVE_NAME(ResourceTable::Object, "ResourceTable::Object")
