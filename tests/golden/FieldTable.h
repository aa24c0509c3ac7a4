// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <map>
#include <string>
#include <vector>

namespace GoldenTests {

/// A field of a class as documents hold it.
struct StoredField
{
    std::string key;
    /// What stands under the key in the field stream, such as "time", "map of QString to pointer", "base
    /// Audio".
    std::string kind;
    /// The value in text, such as "2000 ms", "null", "empty". In the table, "default" under an object or a
    /// base is the default of its class.
    std::string value = {};
};

/// The fields of each class, by its archive name, in stored order, with the values of a default object.
using FieldTable = std::map<std::string, std::vector<StoredField>>;

/// The table that is kept beside the tests. Throws `std::runtime_error` with the number of a line that is
/// out of its order or not complete.
FieldTable storedFields();

} // namespace GoldenTests
