// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FullProject.h"

#include <EditorModel/library/Pack.h>

namespace Testing {

FullProject::FullProject()
{
    addImports();
    addResources();
    content.timeline = &full.timeline;
    content.userCollection = &collection;
    content.resourceTable = &table;
    content.portable = true;
}

void FullProject::setFieldsThatAreNotStored()
{
    static const Package::InApp::Pack pack;
    full.setFieldsThatAreNotStored();
    for (Import::Object& import : imports)
        import.pack = &pack;
}

std::size_t FullProject::objectCount() const
{
    const std::size_t roots = 3; // The content, the collection and the table.
    return roots + full.objectCount() + imports.size();
}

void FullProject::addImports()
{
    imports.resize(4);
    Import::Object& song = imports[0];
    song.tag = QStringLiteral("Song");
    song.description = QString::fromUtf8("Ein Lied für \"alle\" <laut>");
    song.descriptionUrl = QStringLiteral("https://example.org/song?a=1&b=2");
    song.kind = Import::Object::Kind(2);
    song.category = QStringLiteral("sample_music");
    song.setLocation(QStringLiteral("music/song.flac"));
    song.setRemoteUrl(QStringLiteral("https://example.org/song.flac"));
    song.setRemoteSize(qint64(5) << 32);
    imports[1].tag = imports[2].tag = QStringLiteral("Equal");
    collection.items = {&imports[1], &song, &imports[2], &song, nullptr, &imports[3]};
}

void FullProject::addResources()
{
    const auto add = [this](const char* id, Resource::Type type, int number) {
        ResourceTable::FileResourceInfo& entry =
            table.resource2fileInfo[ResourceRef(QString::fromUtf8(id), type)];
        entry.info.path = QStringLiteral("media/%1.mov").arg(number);
        entry.info.track = number;
        entry.info.duration = 1000 * number + 1;
        entry.timing.mode = Resource::Timing::Mode(number % 4);
        entry.timing.intro = 10 * number;
        entry.timing.outro = 20 * number;
        entry.timing.loopMinCount = number;
    };
    add("clip", Resource::VideoType, 1);
    add("clip", Resource::AudioType, 2);
    add("Möwe:still=1", Resource::ImageType, 3);
    add("", Resource::NoType, 4);
    table.resource2fileInfo[ResourceRef(QStringLiteral("plain"), Resource::VideoType)];
    // Too long for the archives, which keep 32 bits.
    table.resource2fileInfo[ResourceRef(QStringLiteral("long"), Resource::VideoType)].info.duration =
        (qint64(1) << 33) + 7;
}

} // namespace Testing
