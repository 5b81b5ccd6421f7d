// SPDX-License-Identifier: MIT
#include "brindle/present/CTable.h"

#include "brindle/present/ShownText.h"

#include <fmt/format.h>

#include <algorithm>
#include <utility>

namespace brindle {

CTable::CTable(std::vector<std::string> columns) : mColumns(std::move(columns)) {
    for (std::string& column : mColumns) {
        mIsRightAligned.push_back(column.starts_with(' '));
        if (mIsRightAligned.back()) column.erase(0, 1);
        mWidths.push_back(CountCharacters(column));
    }
}

void CTable::AddRow(std::vector<std::string> cells) {
    cells.resize(mColumns.size());
    for (std::size_t i = 0; i < mWidths.size(); ++i) {
        mWidths[i] = std::max(mWidths[i], CountCharacters(cells[i]));
    }
    mRows.push_back(std::move(cells));
}

std::string CTable::Head() const {
    return Line(mColumns);
}

std::string CTable::Row(std::size_t row) const {
    return Line(mRows[row]);
}

std::string CTable::Text(const CPaint& paint, std::string_view margin) const {
    std::string text = fmt::format("{}{}\n", margin, paint.Faint(Head()));
    for (const auto& cells : mRows) text += fmt::format("{}{}\n", margin, Line(cells));
    return text;
}

std::string CTable::Line(const std::vector<std::string>& cells) const {
    std::string line;
    for (std::size_t i = 0; i < cells.size(); ++i) {
        if (i > 0) line += "  ";
        line += mIsRightAligned[i] ? PadLeft(cells[i], mWidths[i]) : PadRight(cells[i], mWidths[i]);
    }
    line.erase(line.find_last_not_of(' ') + 1);
    return line;
}

}  // namespace brindle
