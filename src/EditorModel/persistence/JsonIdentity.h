// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <nlohmann/json.hpp>

#include <optional>
#include <string>

namespace Serialize::Json {

/// The number under one key of a node's meta node, if it is there.
std::optional<std::size_t> identityIn(const nlohmann::json& node, const std::string& key);

} // namespace Serialize::Json
