// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <iosfwd>
#include <string>

namespace brindle {

/// What is wrong in a text that somebody wrote, or was left out of it, and where.
struct CTextFault {
    /// From 1; 0 where the fault is that of the whole text.
    std::size_t mLine = 0;
    /// In characters (not bytes) from 1.
    std::size_t mColumn = 0;
    /// What is wrong, for people, in one line.
    std::string mText;
    /// All else is there and what stands here was left out, such as the other songs of a list. Any
    /// other fault takes the whole result, unless the reading is lenient.
    bool mIsNote = false;

    friend bool operator==(const CTextFault&, const CTextFault&) = default;
};

/// "3:12: no chord symbol", line and column in front; without them where the fault is that of the
/// whole text.
[[nodiscard]] std::string FaultWithPlace(const CTextFault& fault);

/// The same.
std::ostream& operator<<(std::ostream& stream, const CTextFault& fault);

}  // namespace brindle
