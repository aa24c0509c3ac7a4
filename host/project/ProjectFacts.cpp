// SPDX-License-Identifier: Apache-2.0
#include "host/project/ProjectFacts.h"

#include "host/media/MediaTable.h"
#include "host/media/MediaText.h"
#include "host/media/ResourceText.h"
#include "host/text/DisplayText.h"
#include "host/text/Table.h"
#include "host/timeline/TimelineOutline.h"
#include "host/timeline/TimelineTable.h"

#include <EditorModel/library/Import.h>
#include <EditorModel/library/UserObject.h>
#include <EditorModel/media/ResourceTable.h>

#include <fmt/format.h>

#include <algorithm>
#include <deque>
#include <set>

namespace Host {
namespace {

using Files = std::deque<const Media::File*>;
using Items = std::deque<const Import::Object*>;

/// The files of the clips, those of nested timelines too, by their paths.
Files filesOf(const Timeline::Object* timeline)
{
    std::set<const Timeline::Object*> seen{timeline, nullptr};
    std::deque<const Timeline::Object*> open{timeline};
    std::set<const Media::File*> files;
    while (timeline && !open.empty()) {
        for (const auto& entry : open.front()->clips) {
            const Timeline::Clip* const clip = entry.first;
            if (clip && clip->file) {
                files.insert(clip->file);
            }
            if (clip && seen.insert(clip->nestedTimeline).second) {
                open.push_back(clip->nestedTimeline);
            }
        }
        open.pop_front();
    }
    Files sorted(files.begin(), files.end());
    std::sort(sorted.begin(), sorted.end(), [](const Media::File* a, const Media::File* b) {
        return a->path != b->path ? a->path < b->path : a->size < b->size;
    });
    return sorted;
}

Items itemsOf(const EditorCollection::UserObject* collection)
{
    Items items = collection ? collection->items : Items();
    items.erase(std::remove(items.begin(), items.end(), nullptr), items.end());
    return items;
}

std::string counted(std::size_t count, const char* what)
{
    return fmt::format("{} {}{}", count, what, count == 1 ? "" : "s");
}

std::string timelineFact(const Timeline::Object* timeline)
{
    if (!timeline) {
        return "none";
    }
    const TimelineOutline outline(*timeline);
    return counted(outline.clips().size(), "clip") + " on " + counted(outline.tracks().size(), "track") +
           ", " + lengthText(lengthOf(*timeline));
}

std::string textOf(const Table& table)
{
    std::string text;
    for (const std::string& line : table.lines()) {
        text += line + '\n';
    }
    return text;
}

std::string facts(const Project::Content& project, const Files& files, const Items& items)
{
    Table table({Table::Left, Table::Left});
    table.addRow({"Timeline", timelineFact(project.timeline)});
    table.addRow({"Media", counted(files.size(), "file")});
    table.addRow({"Collection", project.userCollection ? counted(items.size(), "item") : "none"});
    table.addRow({"Resources", project.resourceTable
                                   ? std::to_string(project.resourceTable->resource2fileInfo.size())
                                   : "none"});
    table.addRow({"Portable", project.portable ? "yes" : "no"});
    return textOf(table);
}

std::string itemTable(const Items& items)
{
    Table table({Table::Left, Table::Left, Table::Right, Table::Left});
    table.addRow({"Item", "Category", "Size", "From"});
    for (const Import::Object* item : items) {
        const QString place = item->location().isEmpty() ? item->remoteUrl() : item->location();
        table.addRow({printable(item->tag), printable(item->category),
                      item->remoteSize() < 0 ? "-" : sizeText(item->remoteSize()), printable(place)});
    }
    return textOf(table);
}

} // namespace

std::string projectText(const Project::Content& project)
{
    const Files files = filesOf(project.timeline);
    const Items items = itemsOf(project.userCollection);
    std::string text = facts(project, files, items);
    if (project.timeline) {
        text += '\n' + timelineTable(*project.timeline);
    }
    if (!files.empty()) {
        text += '\n' + mediaTable(files);
    }
    if (!items.empty()) {
        text += '\n' + itemTable(items);
    }
    if (project.resourceTable && !project.resourceTable->resource2fileInfo.empty()) {
        text += '\n' + resourceText(*project.resourceTable);
    }
    return text;
}

} // namespace Host
