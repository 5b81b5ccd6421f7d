// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/FaultsOfChordText.h"

#include "brindle/chords/internal/CTextScan.h"
#include "brindle/chords/internal/CUnifiedText.h"
#include "brindle/platform/Utf8.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <limits>

namespace brindle::ChordText {
namespace {

struct CFaultRow {
    TFault mFault;
    /// {0} is what stands there, {1} its place.
    std::string_view mText;
    /// What belongs together with a character like it: its run of letters, or of digits too.
    bool mShowsDigits = false;
};

// clang-format off
constexpr auto kFaultRows = std::to_array<CFaultRow>({
    {TFault::NotUnderstood,        R"("{0}" at {1} is not understood)"},
    {TFault::NoNote,               R"(a chord begins with a note A to H, "{0}" at {1} is none)", true},
    {TFault::Empty,                R"(the text is empty)"},
    {TFault::NoDegree,             R"("{0}" at {1} is no degree of a chord (2 3 4 5 6 7 9 11 13))", true},
    {TFault::OneAccidentalTooMany, R"("{0}" at {1} is one accidental too many)"},
    {TFault::CapitalFlat,          R"("{0}" at {1} is not understood; a flat is a small b)"},
    {TFault::SignWithoutNumber,    R"("{0}" at {1} needs a number behind it)"},
    {TFault::WordWithoutDegree,    R"("{0}" at {1} needs a degree behind it)"},
    {TFault::BracketTooMany,       R"("{0}" at {1} closes no bracket)"},
    {TFault::SlashWithoutBass,     R"(the slash at {1} has no bass note behind it)"},
    {TFault::NoBassNote,           R"("{0}" at {1} is no bass note)"},
    {TFault::TwoBassNotes,         R"("{0}" at {1}: a chord has one bass note, behind the last slash)"},
    {TFault::SecondChord,          R"("{0}" at {1} begins a second chord)"},
});
// clang-format on

/// Nobody reads more of a text that went wrong.
constexpr std::size_t kLongestShown = 40;

std::size_t LengthOfCharacter(std::string_view text) {
    std::size_t length = 1;
    while (length < text.size() && !BeginsUtf8Character(text[length])) ++length;
    return length;
}

/// What stands at the start of `text`, as it was typed: a run, else one character.
std::string_view Shown(std::string_view text, bool withDigits) {
    const auto belongs = [&](char c) { return IsLetter(c) || (withDigits && IsDigit(c)); };
    std::size_t length = 0;
    while (length < std::min(text.size(), kLongestShown) && belongs(text[length])) ++length;
    if (length == 0 && !text.empty()) length = LengthOfCharacter(text.substr(0, kLongestShown));
    return text.substr(0, length);
}

}  // namespace

int CharacterPos(std::string_view input, std::size_t offset) {
    constexpr std::size_t kLast = std::numeric_limits<int>::max() - 1;
    return static_cast<int>(std::min(CountUtf8Characters(input.substr(0, offset)), kLast)) + 1;
}

std::string FaultText(const CFaultAt& fault, const CUnifiedText& text) {
    const auto* const row =
        std::find_if(kFaultRows.begin(), kFaultRows.end(),
                     [&](const CFaultRow& candidate) { return candidate.mFault == fault.mFault; });
    if (row == kFaultRows.end()) return {};
    const std::size_t offset = text.InputOffset(fault.mPos);
    std::string_view shown = text.Input().substr(offset);
    if (fault.mLength > 0) {
        shown = shown.substr(0, text.InputOffset(fault.mPos + fault.mLength) - offset);
    } else {
        shown = Shown(shown, row->mShowsDigits);
    }
    return fmt::format(fmt::runtime(row->mText), shown, CharacterPos(text.Input(), offset));
}

}  // namespace brindle::ChordText
