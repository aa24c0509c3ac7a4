// SPDX-License-Identifier: Apache-2.0
#include "FieldTable.h"

#include <fstream>
#include <sstream>
#include <stdexcept>

namespace GoldenTests {
namespace {

/// A class without fields has one row, with this order.
const std::string noFields = "0";

[[noreturn]] void refuse(int number, const std::string& line)
{
    throw std::runtime_error("line " + std::to_string(number) + " of the table of fields: " + line);
}

std::vector<std::string> columnsOf(const std::string& line)
{
    std::vector<std::string> columns;
    std::istringstream stream(line);
    for (std::string column; std::getline(stream, column, '\t');)
        columns.push_back(column);
    return columns;
}

} // namespace

FieldTable storedFields()
{
    std::ifstream file(GOLDEN_FIELDS);
    FieldTable table;
    int number = 0;
    for (std::string line; std::getline(file, line);) {
        ++number;
        if (line.rfind('#', 0) == 0 || line.rfind("class\t", 0) == 0)
            continue;
        const std::vector<std::string> columns = columnsOf(line);
        if (columns.size() != 5)
            refuse(number, line);
        const auto [entry, isNew] = table.try_emplace(columns[0]);
        std::vector<StoredField>& fields = entry->second;
        if (columns[1] == noFields) {
            if (!isNew)
                refuse(number, line);
            continue;
        }
        fields.push_back({columns[2], columns[3], columns[4]});
        if (columns[1] != std::to_string(fields.size()))
            refuse(number, line);
    }
    return table;
}

} // namespace GoldenTests
