// SPDX-License-Identifier: Apache-2.0
#pragma once

/// Keys of the Json form beside those of the fields. Stored data.
namespace Serialize::Details::JsonNames {

constexpr const char* root = "EditorModel";
constexpr const char* stream = "stream";
constexpr const char* version = "version";
constexpr int currentVersion = 1;

/// What a node says of its object, with these members.
constexpr const char* meta = "$meta";
constexpr const char* className = "class";
constexpr const char* id = "id";
constexpr const char* reference = "ref";

constexpr const char* png = "png";
constexpr const char* x = "x";
constexpr const char* y = "y";

} // namespace Serialize::Details::JsonNames
