// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CPaint.h"

#include <string>
#include <string_view>
#include <vector>

namespace brindle {

/// A table in aligned columns. A column whose name begins with a blank is aligned to the right; the
/// blank is not shown.
class CTable {
public:
    /// The names of the columns.
    explicit CTable(std::vector<std::string> columns);

    /// A cell for each column; those that are missing are empty, and what are too many are left
    /// out.
    void AddRow(std::vector<std::string> cells);

    /// The line of the names, without an end of line.
    [[nodiscard]] std::string Head() const;
    /// The line of a row from 0, without an end of line.
    [[nodiscard]] std::string Row(std::size_t row) const;
    /// All lines behind a margin, the head faint.
    [[nodiscard]] std::string Text(const CPaint& paint, std::string_view margin = {}) const;

private:
    [[nodiscard]] std::string Line(const std::vector<std::string>& cells) const;

    std::vector<std::string> mColumns;
    std::vector<bool> mIsRightAligned;
    std::vector<std::size_t> mWidths;
    std::vector<std::vector<std::string>> mRows;
};

}  // namespace brindle
