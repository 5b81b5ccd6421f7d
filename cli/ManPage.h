// SPDX-License-Identifier: MIT
#pragma once

#include "cli/CommandPage.h"

#include <string>
#include <string_view>

namespace brindle::cli {

/// The man page of a command of the program, in the language of man(7).
[[nodiscard]] std::string ManPage(const CCommandPage& page, const CCommandPage& program,
                                  std::string_view version);

/// The name of its file, "brindle-markov-learn.1".
[[nodiscard]] std::string ManPageFile(const CCommandPage& page);

}  // namespace brindle::cli
