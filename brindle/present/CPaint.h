// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

namespace brindle {

/// How text for people is emphasised: by the colours of a terminal (ANSI escape sequences), or not
/// at all.
class CPaint {
public:
    explicit CPaint(bool colored) : mColored(colored) {}

    [[nodiscard]] std::string Strong(std::string_view text) const;
    [[nodiscard]] std::string Accent(std::string_view text) const;
    [[nodiscard]] std::string Faint(std::string_view text) const;

private:
    [[nodiscard]] std::string Wrapped(std::string_view code, std::string_view text) const;

    bool mColored = false;
};

}  // namespace brindle
