// SPDX-License-Identifier: Apache-2.0
#include "host/text/Table.h"

#include "host/text/DisplayText.h"

#include <algorithm>
#include <utility>

namespace Host {
namespace {

const std::string gap = "  ";

std::string padded(const std::string& text, int width, Table::Alignment alignment)
{
    const std::string blanks(static_cast<std::size_t>(std::max(0, width - displayWidth(text))), ' ');
    return alignment == Table::Left ? text + blanks : blanks + text;
}

} // namespace

Table::Table(std::vector<Alignment> columns) : m_columns(std::move(columns)) {}

void Table::addRow(std::vector<std::string> cells)
{
    cells.resize(m_columns.size());
    m_rows.push_back(std::move(cells));
}

std::vector<std::string> Table::lines() const
{
    const std::vector<int> widths = columnWidths();
    std::vector<std::string> lines;
    for (const std::vector<std::string>& row : m_rows) {
        std::string line;
        for (std::size_t column = 0; column != row.size(); ++column) {
            if (widths[column] != 0) {
                line += padded(row[column], widths[column], m_columns[column]) + gap;
            }
        }
        line.erase(line.find_last_not_of(' ') + 1);
        lines.push_back(line);
    }
    return lines;
}

std::vector<int> Table::columnWidths() const
{
    std::vector<int> widths(m_columns.size(), 0);
    for (const std::vector<std::string>& row : m_rows) {
        for (std::size_t column = 0; column != row.size(); ++column) {
            widths[column] = std::max(widths[column], displayWidth(row[column]));
        }
    }
    return widths;
}

} // namespace Host
