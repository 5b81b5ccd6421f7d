// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/RomanTextWords.h"

#include "brindle/platform/Ascii.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/ReadKeyText.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>

namespace brindle {
namespace {

// No music is longer, no bar has more beats.
constexpr int kLastMeasureNr = 999'999;
constexpr int kLastBeatNr = 99;

// A whole number up to a limit; nothing, and nothing taken, otherwise.
std::optional<int> TakeWhole(std::string_view& text, int most) {
    int number = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
    if (text.empty() || !Ascii::IsDigit(text.front()) || error != std::errc() || number > most) {
        return std::nullopt;
    }
    text.remove_prefix(static_cast<std::size_t>(end - text.data()));
    return number;
}

/// A part of a beat: so many whole parts of it, of mParts; 0 parts if it is no usual one.
struct CPartOfBeat {
    double mValue = 0.0;
    int mParts = 0;
};

// The fraction that was meant: .33 is a third. One digit is exact but for thirds.
CPartOfBeat PartOfBeat(std::string_view digits) {
    double fraction = 0.0;
    double unit = 0.1;
    for (const char c : digits) {
        fraction += unit * (c - '0');
        unit /= 10.0;
    }
    if (digits == "3") return {1.0 / 3.0, 3};
    if (digits == "6" || digits == "7") return {2.0 / 3.0, 3};
    const double tolerance = digits.size() < 2 ? 1e-9 : 0.0075;
    for (const int parts : {1, 2, 4, 3, 8, 6, 16, 12}) {
        const double near = std::round(fraction * parts) / parts;
        if (std::abs(fraction - near) < tolerance) return {near, parts};
    }
    return {fraction, 0};
}

// Digits behind a point; nothing, and nothing taken, if there are none or too many.
std::optional<CPartOfBeat> TakePart(std::string_view& text) {
    constexpr std::size_t mostDigits = 9;
    std::string_view rest = text;
    if (!Ascii::TakePrefix(rest, ".")) return std::nullopt;
    const std::string_view digits = rest.substr(0, rest.find('.'));
    const bool isNumber = !digits.empty() && digits.size() <= mostDigits &&
                          std::all_of(digits.begin(), digits.end(), Ascii::IsDigit);
    if (!isNumber) return std::nullopt;
    text = rest.substr(digits.size());
    return PartOfBeat(digits);
}

// "E flat", "f# minor", "fis": a word for the mode, or else the size of the letter, as in all of
// RomanText.
std::optional<CSignKeyLite> KeyInWords(std::string_view name) {
    const CKeyText read = ReadKeyText(name);
    if (!read.mError.empty()) return std::nullopt;
    CSignKeyLite key = read.mSignKey;
    const bool saysMajor = name.find("maj") != name.npos || name.find("dur") != name.npos;
    if (Ascii::IsSmallLetter(name.front()) && !saysMajor) key.mSignKeyType = TSignKeyType_Minor;
    return key;
}

std::string_view TakePlainWord(std::string_view& text) {
    text = Ascii::TrimmedInFront(text);
    const std::string_view word = text.substr(0, text.find_first_of(Ascii::kWhiteSpace));
    text.remove_prefix(word.size());
    return word;
}

// "E flat minor:" at the beginning of a text; empty if no key of several words stands there.
std::string_view WordsOfKey(std::string_view text) {
    constexpr int most = 3;
    const char* const begin = text.data();
    for (int count = 1; count <= most; ++count) {
        const std::string_view word = TakePlainWord(text);
        if (word.empty() || BeatOf(word)) return {};
        const std::string_view words(begin, static_cast<std::size_t>(text.data() - begin));
        if (word.find(':') != word.npos) return count > 1 && KeyOf(words) ? words : "";
    }
    return {};
}

bool IsCompound(const CTimeSignature& time) {
    if (time.mIsSlow || time.mBeats % 3 != 0) return false;
    return time.mBeats > 3 || time.mBeatValue >= 8;
}

}  // namespace

bool LooksLikeMeasure(std::string_view line) {
    const bool hasLetter = line.starts_with('m') || line.starts_with('M');
    return hasLetter && line.size() > 1 && Ascii::IsDigit(line[1]);
}

std::optional<CMeasureRange> TakeMeasures(std::string_view& text) {
    std::string_view rest = text;
    if (!Ascii::TakePrefix(rest, "m")) return std::nullopt;
    const auto first = TakeWhole(rest, kLastMeasureNr);
    if (!first) return std::nullopt;
    CMeasureRange range{*first, *first};
    if (Ascii::TakePrefix(rest, "var")) {
        range.mIsVariant = true;
        while (!rest.empty() && Ascii::IsDigit(rest.front())) rest.remove_prefix(1);
    } else if (!rest.empty() && Ascii::IsSmallLetter(rest.front())) {
        range.mHasLetter = true;
        rest.remove_prefix(1);
    }
    if (Ascii::TakePrefix(rest, "-")) {
        Ascii::TakePrefix(rest, "m");
        const auto last = TakeWhole(rest, kLastMeasureNr);
        if (!last || *last < *first) return std::nullopt;
        range.mLast = *last;
    }
    const bool isWhole = rest.empty() || rest.front() == '=' || rest.front() == ':' ||
                         Ascii::IsWhiteSpace(rest.front());
    if (!isWhole) return std::nullopt;
    text = rest;
    return range;
}

std::optional<double> BeatOf(std::string_view word) {
    if (!Ascii::TakePrefix(word, "b")) return std::nullopt;
    const auto beat = TakeWhole(word, kLastBeatNr);
    if (!beat || *beat < 1) return std::nullopt;
    if (word.empty()) return *beat;
    const auto part = TakePart(word);
    if (!part) return std::nullopt;
    const double place = *beat + part->mValue;
    if (word.empty()) return place;
    const auto partOfPart = TakePart(word);
    if (!partOfPart || !word.empty() || part->mParts == 0) return std::nullopt;
    return place + partOfPart->mValue / part->mParts;
}

std::optional<CSignKeyLite> KeyOf(std::string_view word) {
    if (word.size() < 2 || word.back() != ':') return std::nullopt;
    word.remove_suffix(1);
    const bool isMinor = word.front() >= 'a' && word.front() <= 'g';
    constexpr std::size_t longest = 24;
    if (word.size() > longest) return std::nullopt;
    std::string name(word);
    if (isMinor) name.front() = static_cast<char>(name.front() - 'a' + 'A');
    std::replace(name.begin() + 1, name.end(), '-', 'b');
    CKeyEnh root;
    int consumed = 0;
    root.SetFromString(name, &consumed, ChordNamePrefsNonUTF8);
    if (static_cast<std::size_t>(consumed) != name.size()) return KeyInWords(word);
    return CSignKeyLite(root, isMinor ? TSignKeyType_Minor : TSignKeyType_Major);
}

double CTimeSignature::BeatLength() const {
    return (IsCompound(*this) ? 12.0 : 4.0) / mBeatValue;
}

std::optional<CTimeSignature> TimeSignatureOf(std::string_view text) {
    CTimeSignature time;
    text = Ascii::Trimmed(text);
    if (text == "C") return time;
    if (text == "Cut" || text == "cut" || text == "C|") return CTimeSignature{2, 2};
    time.mIsSlow = Ascii::TakePrefix(text, "slow");
    if (!time.mIsSlow) (void)Ascii::TakePrefix(text, "fast");
    text = Ascii::Trimmed(text);
    const auto beats = TakeWhole(text, kLastBeatNr);
    if (!beats || *beats < 1 || !Ascii::TakePrefix(text, "/")) return std::nullopt;
    const auto value = TakeWhole(text, 64);
    constexpr std::array<int, 7> values{1, 2, 4, 8, 16, 32, 64};
    if (!value || !text.empty()) return std::nullopt;
    if (std::find(values.begin(), values.end(), *value) == values.end()) return std::nullopt;
    time.mBeats = *beats;
    time.mBeatValue = *value;
    return time;
}

std::string_view TakeWord(std::string_view& text) {
    text = Ascii::TrimmedInFront(text);
    const std::string_view key = WordsOfKey(text);
    if (key.empty()) return TakePlainWord(text);
    text.remove_prefix(key.size());
    return key;
}

}  // namespace brindle
