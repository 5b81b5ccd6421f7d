// SPDX-License-Identifier: MIT
#include "tests/analysis/RandomChordTexts.h"

#include "brindle/analysis/CHarmAnlsProgressions.h"
#include "brindle/theory/KeyIntervals.h"

#include <array>
#include <string_view>
#include <vector>

namespace brindle::test {

namespace {

using std::string_view_literals::operator""sv;

constexpr std::array kRoots = {"C"sv,  "Db"sv, "D"sv,  "Eb"sv, "E"sv,  "F"sv,
                               "F#"sv, "G"sv,  "Ab"sv, "A"sv,  "Bb"sv, "B"sv};
constexpr std::array kOtherRoots = {"B#"sv, "C#"sv,  "Ebb"sv, "D#"sv,  "Fb"sv, "E#"sv,
                                    "Gb"sv, "F##"sv, "G#"sv,  "Bbb"sv, "A#"sv, "Cb"sv};
constexpr std::array kQualities = {
    ""sv,   "m"sv, "7"sv,   "m7"sv, "maj7"sv, "m7b5"sv, "dim"sv,   "dim7"sv, "sus4"sv,  "6"sv,
    "m6"sv, "9"sv, "7b9"sv, "5"sv,  "aug"sv,  "add9"sv, "mmaj7"sv, "13"sv,   "7sus4"sv, "sus2"sv};
constexpr std::array kNoChords = {"?"sv,    "nochord"sv, "nochordforce"sv, "undef"sv,
                                  "maj7"sv, "X"sv,       "X7"sv,           "/E"sv};

struct CDegree {
    std::size_t mIntvl;
    std::string_view mQuality;
};
constexpr std::array kMajorDegrees = {CDegree{0, ""},  CDegree{2, "m7"},    CDegree{4, "m"},
                                      CDegree{5, ""},  CDegree{7, "7"},     CDegree{7, ""},
                                      CDegree{9, "m"}, CDegree{11, "m7b5"}, CDegree{3, ""},
                                      CDegree{10, ""}, CDegree{5, "m"}};
constexpr std::array kMinorDegrees = {CDegree{0, "m"}, CDegree{2, "m7b5"}, CDegree{3, ""},
                                      CDegree{5, "m"}, CDegree{7, "7"},    CDegree{7, "m"},
                                      CDegree{8, ""},  CDegree{10, "7"}};

std::string Symbol(CChance& chance, std::size_t keyNr, std::string_view quality) {
    const auto& roots = chance.OneIn(12) ? kOtherRoots : kRoots;
    std::string symbol(roots[keyNr % 12]);
    symbol += quality;
    if (chance.OneIn(10)) symbol.append("/").append(chance.Of<std::string_view>(kRoots));
    return symbol;
}

std::string AnySymbol(CChance& chance) {
    return Symbol(chance, chance.Below(12), chance.Of<std::string_view>(kQualities));
}

void AddDiatonicChords(CChance& chance, std::vector<std::string>& symbols) {
    const std::size_t key = chance.Below(12);
    const bool isMinor = chance.OneIn(3);
    for (std::size_t count = 1 + chance.Below(10); count > 0; --count) {
        const CDegree& degree =
            isMinor ? chance.Of<CDegree>(kMinorDegrees) : chance.Of<CDegree>(kMajorDegrees);
        symbols.push_back(Symbol(chance, key + degree.mIntvl, degree.mQuality));
    }
}

std::string_view QualityOf(CChance& chance, const CSemitonesMatch& pattern) {
    if (pattern == ChordPattern::Dominant7) return "7";
    if (pattern == ChordPattern::Minor) return chance.OneIn(2) ? "m" : "m7";
    if (pattern == ChordPattern::Diminished) return chance.OneIn(2) ? "dim" : "dim7";
    if (pattern == ChordPattern::HalfDiminished) return "m7b5";
    return chance.OneIn(3) ? "7" : "";
}

void AddProgression(CChance& chance, std::vector<std::string>& symbols) {
    const auto& table = chance.OneIn(2) ? CHarmAnlsProgressions::TonicProgressions()
                                        : CHarmAnlsProgressions::CadenceProgressions();
    const std::size_t key = chance.Below(12);
    for (const auto& element : chance.Of<CHarmAnlsProgression>(table)) {
        symbols.push_back(Symbol(chance,
                                 key + static_cast<std::size_t>(element.mRootDistToHarmCenter),
                                 QualityOf(chance, element.mSemitonesMatch)));
    }
}

std::vector<std::string> RandomSymbols(CChance& chance) {
    const std::size_t kind = chance.Below(5);
    const std::size_t count = chance.OneIn(10) ? chance.Below(4) : 1 + chance.Below(60);
    std::vector<std::string> few;
    for (std::size_t n = 1 + chance.Below(4); n > 0; --n) few.push_back(AnySymbol(chance));
    std::vector<std::string> symbols;
    while (symbols.size() < count) {
        if (kind == 0) AddDiatonicChords(chance, symbols);
        if (kind == 1) symbols.push_back(AnySymbol(chance));
        if (kind == 2) symbols.push_back(chance.Of<std::string>(few));
        if (kind == 3) AddProgression(chance, symbols);
        if (kind == 4) symbols.push_back(few[symbols.size() % few.size()]);
    }
    symbols.resize(count);
    return symbols;
}

constexpr auto kKindsOfChords = std::to_array<std::uint64_t>({
    0x091,  // major
    0x089,  // minor
    0x491,  // dominant seventh
    0x891,  // major seventh
    0x489,  // minor seventh
    0x449,  // half-diminished
    0x249,  // diminished seventh
    0x049,  // diminished
    0x111,  // augmented
    0x0A1,  // sus4
});

}  // namespace

std::string RandomChordText(CChance& chance) {
    const bool hasNoChords = chance.OneIn(2);
    const bool hasBars = chance.OneIn(3);
    std::string text;
    for (const std::string& symbol : RandomSymbols(chance)) {
        if (hasNoChords && chance.OneIn(4)) {
            text.append(chance.Of<std::string_view>(kNoChords)).append(" ");
        }
        text.append(symbol).append(" ");
        if (hasBars && chance.OneIn(5)) text.append(chance.OneIn(2) ? "| " : ". ");
    }
    return text;
}

TChordStringParse RandomBeats(CChance& chance) {
    constexpr std::array beatsPerChord = {1.0, 2.0, 0.5, 0.1, 0.3, 0.0, -1.0};
    TChordStringParse parse;
    if (chance.OneIn(2)) parse.mBeatsPerChord = chance.Of<double>(beatsPerChord);
    if (chance.OneIn(30)) parse.mBeatsPerBar = 0.0;
    return parse;
}

CHarmAnlsSignKeys RandomSignKeys(CChance& chance) {
    constexpr std::array positions = {0.0, kPosUndef, 4.0, -2.0, 1.5};
    CHarmAnlsSignKeys signKeys;
    for (std::size_t count = chance.Below(3); count > 0; --count) {
        CHarmAnlsSignKey& signKey = signKeys.emplace_back();
        signKey.mPosition = chance.Of<double>(positions);
        if (chance.OneIn(3)) continue;
        const auto enh = static_cast<TEnh>(TEnh_b + static_cast<int>(chance.Below(3)));
        signKey.mSignKey = {{static_cast<int>(chance.Below(12)), enh},
                            static_cast<TSignKeyType>(chance.Below(3))};
    }
    return signKeys;
}

CHarmAnlsSignKeys RandomFilledSignKeys(CChance& chance, const CHarmAnlsChords& chords) {
    const bool isOdd = chance.OneIn(3);
    CHarmAnlsSignKeys signKeys = RandomSignKeys(chance);
    if (signKeys.empty()) signKeys.emplace_back();
    signKeys.back().mHarmCenters.emplace_back();
    for (const CHarmAnlsChordWithPos& chord : chords) {
        if (chance.OneIn(40)) signKeys.emplace_back().mHarmCenters.emplace_back();
        CHarmAnlsCenters& centers = signKeys.back().mHarmCenters;
        if (chance.OneIn(15)) centers.emplace_back();
        CHarmAnlsCenter& center = centers.back();
        if (center.mChords.empty() && chance.OneIn(2)) center.mPosition = chord.mPosition;
        if (isOdd && chance.OneIn(6)) center.mPosition = static_cast<double>(chance.Below(60));
        if (isOdd && chance.OneIn(6)) center.mHarmCenter.mRootKeyEnh = chord.mRootKeyEnh;
        center.mChords.push_back(chord);
        if (isOdd && chance.OneIn(8)) center.mChords.back().mPosition += 2.0;
    }
    return signKeys;
}

CHarmAnlsChords RandomChords(CChance& chance, std::size_t count) {
    CHarmAnlsChords song;
    double position = 0.0;
    for (std::size_t i = 0; i < count; ++i) {
        CChordLite chord;
        if (!chance.OneIn(12)) {
            chord.mRootKeyEnh = {static_cast<int>(chance.Below(12)), TEnh_Undef};
            chord.mSemitones = CSemitones(chance.Of<std::uint64_t>(kKindsOfChords));
            if (chance.OneIn(5)) {
                chord.mBassKeyEnh = {static_cast<int>(chance.Below(12)), TEnh_Undef};
            }
        }
        song.emplace_back(chord, position);
        position += 0.5 + static_cast<double>(chance.Below(100000)) / 12347.0;
    }
    song.emplace_back(CChordLite_Undef, position);
    return song;
}

CKeyEnh Transposed(const CKeyEnh& keyEnh, int up) {
    return keyEnh.IsUndef() ? keyEnh : CKeyEnh{FoldIntoOctave(keyEnh.mKeyNr + up), keyEnh.mEnh};
}

CHarmAnlsChords Transposed(CHarmAnlsChords chords, int up) {
    for (CHarmAnlsChordWithPos& chord : chords) {
        chord.mRootKeyEnh = Transposed(chord.mRootKeyEnh, up);
        chord.mBassKeyEnh = Transposed(chord.mBassKeyEnh, up);
    }
    return chords;
}

}  // namespace brindle::test
