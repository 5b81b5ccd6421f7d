// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

namespace brindle {

/// How text for people is emphasised: by the colours of a terminal (ANSI escape sequences), or not
/// at all.
class CPaint {
public:
    /// Without colours all texts stay as they are.
    explicit CPaint(bool colored) : mColored(colored) {}

    /// Bold.
    [[nodiscard]] std::string Strong(std::string_view text) const;
    /// Cyan.
    [[nodiscard]] std::string Accent(std::string_view text) const;
    /// Dim, for what is beside the matter.
    [[nodiscard]] std::string Faint(std::string_view text) const;

private:
    [[nodiscard]] std::string Wrapped(std::string_view code, std::string_view text) const;

    bool mColored = false;
};

}  // namespace brindle
