// SPDX-License-Identifier: Apache-2.0
#include "host/media/ResourceText.h"

#include "host/media/MediaText.h"
#include "host/text/DisplayText.h"
#include "host/text/Table.h"

#include <fmt/format.h>

namespace Host {
namespace {

std::string kindText(Resource::Type type)
{
    switch (type) {
    case Resource::VideoType:
        return "video";
    case Resource::AudioType:
        return "audio";
    case Resource::ImageType:
        return "picture";
    default:
        return "-";
    }
}

} // namespace

std::string resourceText(const ResourceTable::Object& table)
{
    Table lines({Table::Left, Table::Left, Table::Left, Table::Right, Table::Left});
    lines.addRow({"Resource", "Kind", "Track", "Length", "File"});
    for (const auto& [resource, entry] : table.resource2fileInfo) {
        const auto& [id, type] = resource;
        const Resource::FileInfo& info = entry.info;
        lines.addRow({printable(id), kindText(type), fmt::format("#{}", info.track),
                      info.duration == MTime() ? "-" : lengthText(info.duration), printable(info.path)});
    }
    std::string text;
    for (const std::string& line : lines.lines()) {
        text += line + '\n';
    }
    return text;
}

} // namespace Host
