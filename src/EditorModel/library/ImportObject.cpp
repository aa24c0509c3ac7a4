// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/ImportObject.h>

#include <EditorModel/library/Pack.h>
#include <EditorModel/library/PackageFetcher.h>
#include <EditorModel/persistence/Fields.h>

namespace Import {

QString Object::location() const
{
    return pack ? Package::PackageFetcher().appId2directory.value(pack->appId) : m_location;
}

void Object::setLocation(const QString& location)
{
    m_location = location;
}

QString Object::remoteUrl() const
{
    return pack ? pack->downloadUrl : m_remoteUrl;
}

void Object::setRemoteUrl(const QString& url)
{
    m_remoteUrl = url;
}

qint64 Object::remoteSize() const
{
    return m_remoteSize;
}

void Object::setRemoteSize(qint64 bytes)
{
    m_remoteSize = bytes;
}

void fields(Serialize::Fields& f, Import::Object& object)
{
    f("tag", object.tag)("description", object.description)("descriptionUrl", object.descriptionUrl);
    f("location", object.m_location)("remoteUrl", object.m_remoteUrl)("remoteSize", object.m_remoteSize);
    f("kind", object.kind)("category", object.category);
}

} // namespace Import

EDITORMODEL_PERSISTENT_CLASS(Import::Object)
