// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QByteArray>

#include <nlohmann/json.hpp>

#include <string>

namespace Document::Details {

/// The whole document; throws `std::runtime_error` with the place where it is no Json.
nlohmann::json parsedJson(const QByteArray& document);

/// The text under a key at the top of a Json document, or an empty one. Reads no further than to the key, and
/// takes what is no Json for a document without the key.
std::string jsonRoute(const QByteArray& document, const char* key);

} // namespace Document::Details
