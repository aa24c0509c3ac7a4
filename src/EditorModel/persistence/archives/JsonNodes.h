// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Json.h>

#include <nlohmann/json.hpp>

#include <optional>
#include <string>

namespace Serialize::Json {

constexpr const char* countKey = "count";
constexpr const char* itemVersionKey = "item_version";
constexpr const char* bytesKey = "bytes";

/// A collection's items and a tuple's elements share one key, whose node is an array of them. Elsewhere
/// "item" is a key like any other.
bool sharesKey(const nlohmann::json& node, const char* key);

/// Throws unless a collection's node holds as many items as are counted.
void requireItems(const nlohmann::json& collection, std::size_t count);

/// Throws for more bytes than a QByteArray takes.
void requireByteCount(std::size_t count);

/// The number under one key of a node's meta node, if it is there.
std::optional<std::size_t> identityIn(const nlohmann::json& node, const std::string& key);

} // namespace Serialize::Json
