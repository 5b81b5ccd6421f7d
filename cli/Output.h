// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CPaint.h"
#include "brindle/present/ShownText.h"

#include <string>
#include <string_view>

namespace brindle::cli {

/// The exit status of the program.
enum class TStatus : int {
    Success = 0,
    BadInput = 1,  ///< a file or a text that cannot be read
    BadUsage = 2,  ///< options that make no sense
};

/// In what form a result is printed.
enum class TFormat { Text, Json, Native, Svg, Chords };

/// Writes `brindle: message` to standard error and gives the status back.
TStatus Fail(TStatus status, std::string_view message);

/// Says that a file cannot be written, and why; to be called while errno still tells that.
TStatus FailToWrite(const std::string& path);

/// The same as Fail with the input on a line of its own and a caret under its character `column`,
/// counted from 0 in bytes.
TStatus FailAt(TStatus status, std::string_view message, std::string_view input,
               std::size_t column);

/// The same with `column` counted in characters from 1, and of a long input the part around it.
TStatus FailAtCharacter(TStatus status, std::string_view message, std::string_view input,
                        std::size_t column);

/// Shows how far a work is, on standard error in place of what was shown before. It is gone when
/// something else is printed.
void ShowProgress(std::string_view line);
void HideProgress();

/// Writes a whole result to standard output; a full disk is an error.
TStatus Print(std::string_view text);

/// Colours if standard output is a terminal, nothing elsewhere or with NO_COLOR.
[[nodiscard]] CPaint PaintOfOutput();

/// Characters of a line of the terminal, 80 if standard output is none.
[[nodiscard]] std::size_t WidthOfOutput();

}  // namespace brindle::cli
