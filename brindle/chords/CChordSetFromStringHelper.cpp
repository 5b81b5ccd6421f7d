// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordSetFromStringHelper.h"

#include "brindle/chords/CChordLite.h"
#include "brindle/chords/ChordSymbolKeywords.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/KeyNames.h"
#include "brindle/theory/SetFromStringHelper.h"

#include <algorithm>
#include <array>
#include <bit>
#include <boost/container/small_vector.hpp>
#include <limits>

namespace brindle {

using namespace ChordSymbol;
using namespace SetFromStringHelper;

namespace {

/// Usual symbols are lowered on the stack.
constexpr std::size_t kUsualSymbolLength = 64;
/// Positions are ints; nobody types what lies behind this.
constexpr std::size_t kLongestSymbol = std::numeric_limits<int>::max();

/// For each byte the option rows that have a keyword beginning with it, row n as bit n, so that the
/// scan steps over all else at once.
constexpr auto kOptionRowsByFirstByte = [] {
    static_assert(kOptionRows.size() <= 32);
    std::array<std::uint32_t, 256> rowsByByte{};
    for (std::size_t row = 0; row < kOptionRows.size(); ++row) {
        for (const std::string_view keyword : kOptionRows[row].mKeywords) {
            rowsByByte[static_cast<unsigned char>(keyword.front())] |= std::uint32_t{1} << row;
        }
    }
    return rowsByByte;
}();

bool Matches(const CKeywords& keywords, std::string_view text, int pos) {
    return CompareLowercaseStrs(TSpaces_AnyRemainder, keywords, text, pos).first;
}

bool MatchesAndAdvances(const CKeywords& keywords, std::string_view text, int& pos) {
    return CompareLowercaseStrsAndOnMatchAdvanceStringPos(TSpaces_AnyRemainder, keywords, text,
                                                          pos);
}

/// The intervals reduced into the octave: the ninth is a second here.
CSemitones Reduced(TIntvls intvls) {
    constexpr TIntvls kOctave = 0xFFF;
    return CSemitones((intvls | intvls >> 12) & kOctave);
}

}  // namespace

void CChordSetFromStringHelper::SetFromString(std::string_view symbol, CChordLite& chord,
                                              const CChordNamePrefs& prefs) {
    symbol = symbol.substr(0, kLongestSymbol);
    boost::container::small_vector<char, kUsualSymbolLength> lowercase(symbol.begin(),
                                                                       symbol.end());
    std::transform(lowercase.begin(), lowercase.end(), lowercase.begin(), ToLower);
    CChordSetFromStringHelper helper({lowercase.data(), lowercase.size()});

    chord = CChordLite_Undef;
    if (helper._StringShouldSetUndefOrNoChord(chord)) return;
    // `pos` counts a UTF-8 accidental of the root as one byte, in a text where it has three. Kept:
    // the sign hides what stands behind it from the next step, so C♯m is a major chord.
    int pos = 0;
    chord.mRootKeyEnh.SetFromString(symbol, &pos, prefs);
    const CSemitones basicChord = helper._BasicChordSemitonesFromString(pos);
    chord.mBassKeyEnh = helper._BassKeyNrAndEnhFromString(prefs);
    const CIntvlsOfOptions options = helper._AddAndEraseIntvlsForOptionsFromString(pos);
    chord.mSemitones = basicChord + Reduced(options.mAdd) - Reduced(options.mErase);
}

bool CChordSetFromStringHelper::_StringShouldSetUndefOrNoChord(CChordLite& chord) {
    if (Matches(kUndefKeywords, LowercaseText(), 0)) {
        chord = CChordLite_Undef;
        mBasicChord = TBasicChord::None;
        return true;
    }
    if (Matches(kNoChordForceKeywords, LowercaseText(), 0)) {
        chord = CChordLite_NoChordForce;
        return true;
    }
    if (Matches(kNoChordYieldKeywords, LowercaseText(), 0)) {
        chord = CChordLite_NoChordYield;
        return true;
    }
    return false;
}

CSemitones CChordSetFromStringHelper::_BasicChordSemitonesFromString(int& pos) {
    CSemitones semitones;
    semitones.SetFromBasicChord(TBasicChord::Major);
    SkipLeadingBlanks(LowercaseText(), pos);
    if (RemainderFrom(LowercaseText(), pos).empty()) return semitones;

    // The "m" of "maj 7" is not minor. The option itself is read later.
    const bool isMajorOption = Matches(kMaj7Keywords, LowercaseText(), pos) ||
                               Matches(kMaj9Keywords, LowercaseText(), pos);
    for (const CBasicChordRow& row : kBasicChordRows) {
        if (isMajorOption && row.mBasicChord == TBasicChord::Minor) continue;
        if (!MatchesAndAdvances(row.mKeywords, LowercaseText(), pos)) continue;
        mBasicChord = row.mBasicChord;
        semitones.SetFromBasicChord(row.mBasicChord);
        return semitones;
    }
    return semitones;
}

CKeyEnh CChordSetFromStringHelper::_BassKeyNrAndEnhFromString(const CChordNamePrefs& prefs) const {
    CKeyEnh bass;
    const std::size_t slash = LowercaseText().find_last_of(prefs.mSlashText);
    if (slash == std::string_view::npos) return bass;
    bass.SetFromString(LowercaseText().substr(slash + 1), nullptr, prefs);
    return bass;
}

CChordSetFromStringHelper::CIntvlsOfOptions
CChordSetFromStringHelper::_AddAndEraseIntvlsForOptionsFromString(int pos) {
    mLowercaseText = ConvertUtf8SharpAndFlatToAscii(mLowercaseText);
    const std::string_view text = LowercaseText();
    CIntvlsOfOptions options;
    SkipLeadingBlanks(text, pos);
    while (static_cast<std::size_t>(pos) < text.size()) {
        _AddAndEraseIntvlsForSingleOptionFromString(text, pos, options);
    }
    return options;
}

void CChordSetFromStringHelper::_AddAndEraseIntvlsForSingleOptionFromString(
    std::string_view text, int& pos, CIntvlsOfOptions& options) const {
    const auto first = static_cast<unsigned char>(text[static_cast<std::size_t>(pos)]);
    for (std::uint32_t rows = kOptionRowsByFirstByte[first]; rows != 0; rows &= rows - 1) {
        const COptionRow& row = kOptionRows[static_cast<std::size_t>(std::countr_zero(rows))];
        if (!MatchesAndAdvances(row.mKeywords, text, pos)) continue;
        const bool isFirst = options.mAdd == 0;
        options.mAdd |= mBasicChord == TBasicChord::Diminished ? row.mAddIfDiminished : row.mAdd;
        if (isFirst) options.mAdd |= row.mAddIfFirst;
        options.mErase |= row.mErase;
        return;
    }
    ++pos;
}

}  // namespace brindle
