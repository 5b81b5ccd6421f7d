// SPDX-License-Identifier: MIT
#include "brindle/present/internal/SheetText.h"

#include "brindle/platform/Ascii.h"
#include "brindle/platform/Utf8.h"
#include "brindle/present/ShownText.h"
#include "brindle/theory/KeyNames.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <utility>

namespace brindle::LeadSheet {
namespace {

// Hundredths of an em of U+0020 to U+007E: of each the widest of DejaVu Sans Bold and DejaVu Serif,
// which are wider than the other fonts in use. Measured from their tables of advance widths.
constexpr auto kWidths = std::to_array<std::uint8_t>({
    35, 46,  53, 84, 70, 101, 90, 31,  46, 46, 53, 84, 38, 42,  38, 37, 70, 70,  70,
    70, 70,  70, 70, 70, 70,  70, 40,  40, 84, 84, 84, 59, 100, 78, 78, 77, 84,  73,
    70, 83,  88, 40, 41, 78,  67, 111, 88, 86, 74, 86, 78, 73,  69, 85, 78, 111, 78,
    73, 73,  46, 37, 46, 84,  50, 50,  68, 72, 60, 72, 68, 44,  72, 72, 35, 35,  67,
    35, 105, 72, 69, 72, 72,  51, 60,  48, 72, 66, 93, 65, 66,  59, 72, 37, 72,  84,
});
static_assert(kWidths.size() == 95);

constexpr std::string_view kEllipsis = "\xE2\x80\xA6";
constexpr std::string_view kTriangle = "\xE2\x96\xB3";
constexpr std::string_view kDegree = "\xC2\xB0";
constexpr std::string_view kSlashedO = "\xC3\xB8";
constexpr std::string_view kMinus = "\xE2\x88\x92";

// Nobody reads a longer symbol.
constexpr std::size_t kMostCharacters = 24;

constexpr double kAccidentalSize = 0.95;
constexpr double kAccidentalRaise = 0.1;
constexpr double kMarkSize = 0.82;
constexpr double kFigureSize = 0.66;
constexpr double kFigureRaise = 0.3;
constexpr double kBassSize = 0.82;

double WidthOfCharacter(std::string_view character) {
    const auto lead = static_cast<unsigned char>(character[0]);
    if (character.size() == 1)
        return lead < 0x20 || lead > 0x7E ? 1.0 : kWidths[lead - 0x20] / 100.0;
    if (character == kUtf8Flat || character == kUtf8Sharp) return 0.5;
    if (character.size() == 2) return 0.85;
    return character.size() == 3 ? 1.0 : 1.4;
}

std::string_view FirstCharacter(std::string_view text) {
    return text.substr(0, std::max<std::size_t>(1, Utf8Length(text)));
}

bool TakeWord(std::string_view& text, std::string_view word) {
    if (!text.starts_with(word)) return false;
    text.remove_prefix(word.size());
    return true;
}

// A sharp or a flat at the begin of the text, taken from it.
std::string_view TakeAccidental(std::string_view& text) {
    if (TakeWord(text, "#") || TakeWord(text, kUtf8Sharp)) return kUtf8Sharp;
    if (TakeWord(text, "b") || TakeWord(text, kUtf8Flat)) return kUtf8Flat;
    return {};
}

std::string TakeSigns(std::string_view& text) {
    std::string signs;
    for (auto sign = TakeAccidental(text); !sign.empty(); sign = TakeAccidental(text))
        signs += sign;
    return signs;
}

void Add(CTextRuns& runs, std::string text, double size = 1.0, double raise = 0.0) {
    if (!text.empty()) runs.push_back({std::move(text), size, raise});
}

bool IsEndOfMark(std::string_view rest) {
    return rest.empty() || Ascii::IsDigit(rest[0]) || rest[0] == '/' || rest[0] == '(' ||
           rest[0] == 'M' || rest[0] == '^' || rest.starts_with("maj");
}

// The sign of a diminished, half-diminished or major seventh chord that the text begins with.
std::string_view TakeQualitySign(std::string_view& text) {
    constexpr std::pair<std::string_view, std::string_view> kSigns[] = {
        {"^", kTriangle}, {"o", kDegree}, {"h", kSlashedO}, {"%", kSlashedO}};
    for (const auto& [typed, shown] : kSigns) {
        if (text.starts_with(typed) && IsEndOfMark(text.substr(typed.size()))) {
            text.remove_prefix(typed.size());
            return shown;
        }
    }
    return {};
}

// Figures and words, with accidentals before figures as signs.
std::string Figures(std::string_view text) {
    std::string figures(TakeQualitySign(text));
    while (!text.empty()) {
        const bool isSign = text.size() > 1 && Ascii::IsDigit(text[1]);
        std::string_view rest = text;
        const std::string_view sign = isSign ? TakeAccidental(rest) : std::string_view();
        const std::string_view taken = sign.empty() ? FirstCharacter(text) : sign;
        figures += taken;
        text.remove_prefix(sign.empty() ? taken.size() : 1);
    }
    return figures;
}

// How long the name of the note is that the text begins with, without its accidentals: "C", "Fis",
// "Es", "Sol". 0 if there is none.
std::size_t LengthOfNote(std::string_view text) {
    for (const std::string_view syllable : {"Do", "Re", "Mi", "Sol", "La", "Si"}) {
        if (text.starts_with(syllable)) return syllable.size();
    }
    // Fa7, but Fadd9 and Faug are on F.
    if (text.starts_with("Fa") && !text.starts_with("Fadd") && !text.starts_with("Faug")) return 2;
    if (text.empty() || text[0] < 'A' || text[0] > 'H') return 0;
    const std::string_view rest = text.substr(1);
    if (rest.starts_with("is") || rest.starts_with("es")) return 3;
    const bool isShortFlat = (text[0] == 'A' || text[0] == 'E') && rest.starts_with("s");
    return isShortFlat && !rest.starts_with("su") ? 2 : 1;
}

void AddNote(CTextRuns& runs, std::string_view& text, double size) {
    const std::size_t length = LengthOfNote(text);
    Add(runs, std::string(text.substr(0, length)), size);
    text.remove_prefix(length);
    Add(runs, TakeSigns(text), size * kAccidentalSize, kAccidentalRaise);
}

// The small m of a minor chord, taken from the text.
std::string TakeMinorMark(std::string_view& text) {
    if (TakeWord(text, "-")) return std::string(kMinus);
    if (text.starts_with("maj") || text.starts_with("ma7")) return {};
    for (const std::string_view word : {"min", "mi", "m"}) {
        if (TakeWord(text, word)) return std::string(word);
    }
    return {};
}

// Where the bass begins: behind the last slash that a note follows.
std::size_t BassPlace(std::string_view text) {
    const std::size_t slash = text.rfind('/');
    if (slash == text.npos || LengthOfNote(text.substr(slash + 1)) == 0) return text.size();
    return slash;
}

std::string Shortened(std::string_view text) {
    const std::string printable = Printable(FirstCharacters(text, kMostCharacters + 1));
    if (CountCharacters(printable) <= kMostCharacters) return printable;
    return FirstCharacters(printable, kMostCharacters - 1) + std::string(kEllipsis);
}

// The figures of a numeral: a major seventh is written in words.
std::string NumeralFigures(std::string_view text) {
    if (TakeWord(text, "^")) return "maj" + Figures(text);
    return Figures(text);
}

// The letters of a degree, its number in Nashville, or the name of a sixth chord.
std::string TakeDegree(std::string_view& text) {
    for (const std::string_view name : {"Ger", "It", "Fr", "Cad", "N"}) {
        if (TakeWord(text, name)) return std::string(name);
    }
    std::string degree = TakeWord(text, "sub") ? "sub" : "";
    const std::size_t length = std::min(text.find_first_not_of("IViv"), text.size());
    degree += text.substr(0, length);
    text.remove_prefix(length);
    if (!degree.empty() || text.empty() || text[0] < '1' || text[0] > '7') return degree;
    degree = text[0];
    text.remove_prefix(1);
    return degree;
}

// Whether a text without the name of a note is a degree that stands for a chord, bVII7 or 2-7, and
// no word.
bool IsDegree(std::string_view text) {
    TakeSigns(text);
    if (TakeDegree(text).empty()) return false;
    constexpr std::string_view kFigures = "0123456789^+-/(#b";
    if (text.empty() || kFigures.find(text[0]) != kFigures.npos) return true;
    if (!TakeQualitySign(text).empty()) return true;
    return text.starts_with("sus") || text.starts_with("add") || text.starts_with("no");
}

// One part of a numeral with slashes.
void AddNumeralPart(CTextRuns& runs, std::string_view part) {
    Add(runs, TakeSigns(part), kAccidentalSize, kAccidentalRaise / 2);
    const std::string degree = TakeDegree(part);
    Add(runs, degree);
    const bool isFigures = !degree.empty();
    if (isFigures && Ascii::IsDigit(degree[0])) Add(runs, TakeMinorMark(part), kMarkSize);
    Add(runs, NumeralFigures(part), isFigures ? kFigureSize : 1.0, isFigures ? kFigureRaise : 0.0);
}

}  // namespace

CTextRuns SetSymbol(std::string_view symbol) {
    const std::string text = Shortened(symbol);
    if (text.starts_with("N.C")) return {{text}};
    if (LengthOfNote(text) == 0) return IsDegree(text) ? SetNumeral(text) : CTextRuns{{text}};
    CTextRuns runs;
    std::string_view rest = std::string_view(text).substr(0, BassPlace(text));
    std::string_view bass = std::string_view(text).substr(rest.size());
    AddNote(runs, rest, 1.0);
    Add(runs, TakeMinorMark(rest), kMarkSize);
    Add(runs, Figures(rest), kFigureSize, kFigureRaise);
    if (TakeWord(bass, "/")) {
        Add(runs, "/", kBassSize);
        AddNote(runs, bass, kBassSize);
        Add(runs, std::string(bass), kBassSize);
    }
    return runs;
}

CTextRuns SetNumeral(std::string_view numeral) {
    const std::string text = Shortened(numeral);
    std::string_view rest = text;
    CTextRuns runs;
    while (true) {
        const std::size_t slash = std::min(rest.find('/'), rest.size());
        AddNumeralPart(runs, rest.substr(0, slash));
        if (slash == rest.size()) return runs;
        Add(runs, "/");
        rest.remove_prefix(slash + 1);
    }
}

double WidthOf(std::string_view text) {
    double width = 0.0;
    while (!text.empty()) {
        const std::string_view character = FirstCharacter(text);
        width += WidthOfCharacter(character);
        text.remove_prefix(character.size());
    }
    return width;
}

double WidthOf(const CTextRuns& runs) {
    double width = 0.0;
    for (const CTextRun& run : runs) width += run.mSize * WidthOf(run.mText);
    return width;
}

std::string CutToWidth(std::string_view text, double width) {
    double used = 0.0;
    std::size_t fitting = 0;  // bytes that leave room for the ellipsis
    for (std::size_t i = 0; i < text.size();) {
        const std::string_view character = FirstCharacter(text.substr(i));
        used += WidthOfCharacter(character);
        if (used > width) return std::string(text.substr(0, fitting)) + std::string(kEllipsis);
        i += character.size();
        if (used + WidthOf(kEllipsis) <= width) fitting = i;
    }
    return std::string(text);
}

std::string JoinRuns(const CTextRuns& runs) {
    std::string text;
    for (const CTextRun& run : runs) text += run.mText;
    return text;
}

}  // namespace brindle::LeadSheet
