// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QString>

#include <string>

namespace Serialize::Details {

/// Well-formed by RFC 3629: no overlong forms, no surrogates, nothing above U+10FFFF.
bool isUtf8(const std::string& text);

/// Throws `std::runtime_error` for what is not UTF-8.
void requireUtf8(const std::string& text);

/// The text, with a byte order mark at its start kept as the character that it is; throws as `requireUtf8`.
QString textOfUtf8(const std::string& utf8);

} // namespace Serialize::Details
