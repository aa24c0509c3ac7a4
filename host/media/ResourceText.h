// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/media/ResourceTable.h>

#include <string>

namespace Host {

/// The resources of a table for the terminal, a line for each, in the order of the table. It ends in a line
/// end.
std::string resourceText(const ResourceTable::Object& table);

} // namespace Host
