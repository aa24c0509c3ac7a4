// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/media/ResourceRef.h>

#include <QStringList>

namespace Resource {
namespace {

struct TypeText
{
    Type type;
    const char* text;
};

constexpr TypeText TYPE_TEXTS[] = {
    {VideoType, "video"},
    {ImageType, "image"},
    {AudioType, "audio"},
};

QString textOf(Type type)
{
    for (const TypeText& entry : TYPE_TEXTS) {
        if (entry.type == type)
            return QLatin1String(entry.text);
    }
    return {};
}

Type typeOf(const QString& text)
{
    for (const TypeText& entry : TYPE_TEXTS) {
        if (QLatin1String(entry.text) == text)
            return entry.type;
    }
    return NoType;
}

} // namespace

const QString EMPTY_STREAM = QStringLiteral("RESOURCE##EMPTY_STREAM");

ResourceRef parseResource(const QString& text)
{
    ResourceRef resource;
    for (const QString& part : text.split(QLatin1Char(':'), Qt::KeepEmptyParts)) {
        const QStringList pieces = part.split(QLatin1Char('='), Qt::KeepEmptyParts);
        if (pieces.size() != 2)
            continue;
        if (pieces.first() == QLatin1String("resource_id"))
            std::get<QString>(resource) = pieces.last();
        else if (pieces.first() == QLatin1String("resource_type"))
            std::get<Type>(resource) = typeOf(pieces.last());
    }
    return resource;
}

QString serializeResource(const ResourceRef& resource)
{
    // One marker after the other: stored texts tell of markers in identifiers that were filled along.
    return QStringLiteral("resource_id=%1:resource_type=%2")
        .arg(std::get<QString>(resource))
        .arg(textOf(std::get<Type>(resource)));
}

} // namespace Resource
