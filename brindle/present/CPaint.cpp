// SPDX-License-Identifier: MIT
#include "brindle/present/CPaint.h"

#include <fmt/format.h>

namespace brindle {

std::string CPaint::Strong(std::string_view text) const {
    return Wrapped("1", text);
}

std::string CPaint::Accent(std::string_view text) const {
    return Wrapped("36", text);
}

std::string CPaint::Faint(std::string_view text) const {
    return Wrapped("2", text);
}

std::string CPaint::Wrapped(std::string_view code, std::string_view text) const {
    if (!mColored) return std::string(text);
    return fmt::format("\x1B[{}m{}\x1B[0m", code, text);
}

}  // namespace brindle
