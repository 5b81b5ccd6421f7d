// SPDX-License-Identifier: MIT
#pragma once

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

/// The same with the input on a line of its own and a caret under its character `column`, counted
/// from 0 in bytes.
TStatus FailAt(TStatus status, std::string_view message, std::string_view input,
               std::size_t column);

/// The same with `column` counted in characters from 1, and of a long input the part around it.
TStatus FailAtCharacter(TStatus status, std::string_view message, std::string_view input,
                        std::size_t column);

/// Writes a whole result to standard output; a full disk is an error.
TStatus Print(std::string_view text);

/// The text without what would disturb a terminal or an XML file: control characters and bytes that
/// are no UTF-8 become U+FFFD.
[[nodiscard]] std::string Printable(std::string_view text);

/// The number of characters of UTF-8 text.
[[nodiscard]] std::size_t Width(std::string_view text);

/// The first `count` characters of UTF-8 text.
[[nodiscard]] std::string FirstCharacters(std::string_view text, std::size_t count);

/// The text, filled with blanks on the right (left) side to so many characters.
[[nodiscard]] std::string PadRight(std::string_view text, std::size_t width);
[[nodiscard]] std::string PadLeft(std::string_view text, std::size_t width);

/// A number with at most three digits after the point and no zeros at the end: "1", "2.5".
[[nodiscard]] std::string ShortNumber(double number);

/// How text for people is emphasised: colours on a terminal, nothing elsewhere or with NO_COLOR.
class CPaint {
public:
    /// For standard output.
    CPaint();
    explicit CPaint(bool colored) : mColored(colored) {}

    [[nodiscard]] std::string Strong(std::string_view text) const;
    [[nodiscard]] std::string Accent(std::string_view text) const;
    [[nodiscard]] std::string Faint(std::string_view text) const;

private:
    [[nodiscard]] std::string Wrapped(std::string_view code, std::string_view text) const;

    bool mColored = false;
};

}  // namespace brindle::cli
