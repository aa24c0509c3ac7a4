// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <string>
#include <vector>

namespace Host {

/// Lays rows of UTF-8 cells out in columns, as wide as a terminal shows them.
class Table
{
public:
    enum Alignment : int
    {
        Left,
        Right,
    };

    /// One alignment a column.
    explicit Table(std::vector<Alignment> columns);

    /// The cells that a row lacks are empty; it has none beyond the columns.
    void addRow(std::vector<std::string> cells);
    /// One line a row, without line ends and blanks before them. A column without content takes no room.
    std::vector<std::string> lines() const;

private:
    std::vector<int> columnWidths() const;

    std::vector<Alignment> m_columns;
    std::vector<std::vector<std::string>> m_rows;
};

} // namespace Host
