// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/ResourceTable.h>

#include <EditorModel/persistence/Fields.h>

template class Message::View<ResourceTable::Object>;

namespace ResourceTable {

FileResourceInfo::~FileResourceInfo() = default;
Object::~Object() = default;
AddFilesToTableRequest::~AddFilesToTableRequest() = default;

bool FileResourceInfo::operator==(const FileResourceInfo& other) const
{
    return info == other.info && timing == other.timing;
}

bool Object::operator==(const Object& other) const
{
    return resource2fileInfo == other.resource2fileInfo;
}

Object* Object::clear()
{
    resource2fileInfo.clear();
    return this;
}

AddFilesToTableRequest::AddFilesToTableRequest(const ResourceTable::Object* table, const QStringList& paths)
    : Request(table), files(paths)
{}

void fields(Serialize::Fields& f, FileResourceInfo& info)
{
    f("info", info.info)("timing", info.timing);
}

void fields(Serialize::Fields& f, Object& table)
{
    f("resource2fileInfo", table.resource2fileInfo);
}

} // namespace ResourceTable

EDITORMODEL_PERSISTENT_CLASS(ResourceTable::FileResourceInfo)
EDITORMODEL_PERSISTENT_CLASS(ResourceTable::Object)
