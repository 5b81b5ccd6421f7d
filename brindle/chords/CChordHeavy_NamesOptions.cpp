// SPDX-License-Identifier: MIT
// Which options a chord has beyond its basic chord, and how they are written.
#include "brindle/chords/CChordHeavy.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/KeyNames.h"

#include <array>
#include <cstddef>
#include <optional>

namespace brindle {

namespace {

/// What decides how an interval is named.
struct CChordToName {
    const CIntvlSet& intvls;
    CSemitones semitones;
    TBasicChord basicChord;
    std::int32_t majorSeventhPref;
};

using TCondition = bool (*)(const CChordToName&);

/// The chord is a plain triad apart from the interval in question.
template <int... Intvls>
bool OnlyAmong(const CChordToName& chord) {
    constexpr CSemitones allowed{Intvls...};
    return (chord.semitones.Mask() & ~allowed.Mask()) == 0;
}

template <int... Intvls>
bool HasAnyOf(const CChordToName& chord) {
    return (chord.intvls.HasIntvlInAnyOctave(Intvls) || ...);
}

template <TBasicChord... BasicChords>
bool Is(const CChordToName& chord) {
    return ((chord.basicChord == BasicChords) || ...);
}

template <std::int32_t Pref>
bool MajorSeventhPrefIs(const CChordToName& chord) {
    return chord.majorSeventhPref == Pref;
}

/// A sixth above a seventh is a thirteenth, unless an altered fifth stands beside it.
bool IsThirteenth(const CChordToName& chord) {
    return !HasAnyOf<8>(chord) && HasAnyOf<10, 11>(chord);
}

bool Otherwise(const CChordToName&) {
    return true;
}

/// What an interval adds to the name. The first row of the interval that fits decides.
struct COptionRule {
    int intvl;
    TCondition fits;
    int key = 0;
    std::optional<TChordOption> option = std::nullopt;
    bool goesOn = false;
};

using enum TBasicChord;
constexpr bool kGoesOn = true;

// clang-format off
constexpr auto kOptionRules = std::to_array<COptionRule>({
    // interval, condition, key, option
    { 1, OnlyAmong<0, 1, 3, 4, 7>,       13, TChordOption_add_b9},
    { 1, Otherwise,                      13, TChordOption_b9},
    { 2, Is<Sus2>},
    { 2, OnlyAmong<0, 2, 3, 4, 7>,       14, TChordOption_add_9},
    { 2, Otherwise,                      14, TChordOption_9},
    { 3, HasAnyOf<4>,                    15, TChordOption_s9},
    { 3, Is<Minor, Diminished>},
    { 3, Otherwise,                       3, TChordOption_b3},
    { 4, Is<Major, Augmented>},
    { 4, Otherwise,                       4, TChordOption_3},
    { 5, Is<Sus4>},
    { 5, OnlyAmong<0, 3, 4, 5, 7>,       17, TChordOption_add_11},
    { 5, Otherwise,                      17, TChordOption_11},
    { 6, Is<Diminished>},
    { 6, HasAnyOf<7, 8>,                 18, TChordOption_s11},
    { 6, Otherwise,                      99, TChordOption_b5},
    { 7, Is<Diminished, Augmented, None>, 7, TChordOption_5},
    { 8, Is<Augmented>},
    { 8, HasAnyOf<7>,                    20, TChordOption_b13},
    { 8, Otherwise,                      99, TChordOption_s5},
    { 9, IsThirteenth,                   21, TChordOption_13},
    { 9, Is<Diminished>,                  9, TChordOption_7},
    { 9, Otherwise,                       9, TChordOption_6},
    {10, Is<Diminished>,                 99, TChordOption_b5, kGoesOn},
    {10, Otherwise,                      10, TChordOption_7},
    {11, MajorSeventhPrefIs<1>,          11, TChordOption_j7},
    {11, MajorSeventhPrefIs<2>,          11, TChordOption_maj7},
    {11, Otherwise,                      11, TChordOption_ma7},
});
// clang-format on

void AddOptionsOfIntvl(int intvl, const CChordToName& chord, TChordOptionsMap& options) {
    for (const COptionRule& rule : kOptionRules) {
        if (rule.intvl != intvl || !rule.fits(chord)) continue;
        if (rule.option) options.emplace(rule.key, *rule.option);
        if (!rule.goesOn) return;
    }
}

enum class TSign { None, Flat, Sharp };

struct COptionText {
    TChordOption option;
    std::string_view before;
    TSign sign;
    std::string_view after;
};

// clang-format off
constexpr auto kOptionTexts = std::to_array<COptionText>({
    {TChordOption_b9,     "",     TSign::Flat,  "9"},
    {TChordOption_add_b9, "add ", TSign::Flat,  "9"},
    {TChordOption_9,      "",     TSign::None,  "9"},
    {TChordOption_add_9,  "add ", TSign::None,  "9"},
    {TChordOption_s9,     "",     TSign::Sharp, "9"},
    {TChordOption_b3,     "",     TSign::Flat,  "3"},
    {TChordOption_3,      "",     TSign::None,  "3"},
    {TChordOption_11,     "",     TSign::None,  "11"},
    {TChordOption_add_11, "add ", TSign::None,  "11"},
    {TChordOption_s11,    "",     TSign::Sharp, "11"},
    {TChordOption_b5,     "",     TSign::Flat,  "5"},
    {TChordOption_5,      "",     TSign::None,  "5"},
    {TChordOption_b13,    "",     TSign::Flat,  "13"},
    {TChordOption_s5,     "",     TSign::Sharp, "5"},
    {TChordOption_13,     "",     TSign::None,  "13"},
    {TChordOption_7,      "",     TSign::None,  "7"},
    {TChordOption_6,      "",     TSign::None,  "6"},
    {TChordOption_ma7,    "",     TSign::None,  "ma7"},
    {TChordOption_j7,     "",     TSign::None,  "j7"},
    {TChordOption_maj7,   "",     TSign::None,  "maj7"},
});
// clang-format on

constexpr bool EachRowStandsAtItsOption() {
    for (std::size_t ix = 0; ix < kOptionTexts.size(); ++ix) {
        if (static_cast<std::size_t>(kOptionTexts[ix].option) != ix) return false;
    }
    return true;
}
static_assert(EachRowStandsAtItsOption());

void AppendOptionName(std::string& name, TChordOption option, const CChordNamePrefs& prefs) {
    const auto ix = static_cast<std::size_t>(option);
    if (ix >= kOptionTexts.size()) return;
    const COptionText& text = kOptionTexts[ix];
    name += text.before;
    if (text.sign == TSign::Flat) name += FlatAsUTF8OrNot(prefs);
    if (text.sign == TSign::Sharp) name += SharpAsUTF8OrNot(prefs);
    name += text.after;
}

void AppendOptionInBrackets(std::string& name, TChordOption option, const CChordNamePrefs& prefs) {
    name += '(';
    AppendOptionName(name, option, prefs);
    name += ')';
}

void AppendOptionBehindSlash(std::string& name, TChordOption option, const CChordNamePrefs& prefs) {
    name += '/';
    AppendOptionName(name, option, prefs);
}

}  // namespace

TChordOptionsMap CChordHeavy::OptionsMap(const CChordNamePrefs& prefs) const {
    TChordOptionsMap options;
    const CIntvlSet& intvls = IntvlSet();
    if (intvls.empty()) return options;
    const CChordToName chord{intvls, Semitones(), BasicChord(), prefs.mChordPrefC};
    // Behind the slash the bass is named already. Kept: only a bass above the root is found, since
    // one in octave -1 with a key below the root's stands an octave higher in the set.
    const bool omitBass = prefs.mOmitBassOption && !IsNarrowChord();
    for (const int intvl : intvls) {
        if (omitBass && BassNoteHasThisIntvlAlone(intvl)) continue;
        AddOptionsOfIntvl(FoldIntoOctave(intvl), chord, options);
    }
    return options;
}

std::string CChordHeavy::OptionName(TChordOption option, const CChordNamePrefs& prefs) {
    std::string name;
    AppendOptionName(name, option, prefs);
    return name;
}

std::string CChordHeavy::OptionsNameFromMap(const TChordOptionsMap& options,
                                            const CChordNamePrefs& prefs) const {
    std::string name;
    if (mRootNote.IsUndef() || options.empty()) return name;
    const auto append =
        prefs.mOptionBrackets == 1 ? AppendOptionInBrackets : AppendOptionBehindSlash;
    AppendOptionName(name, options.begin()->second, prefs);
    for (auto it = options.begin() + 1; it != options.end(); ++it) append(name, it->second, prefs);
    return name;
}

std::string CChordHeavy::OptionsName(const CChordNamePrefs& prefs) const {
    return OptionsNameFromMap(OptionsMap(prefs), prefs);
}

std::string CChordHeavy::OptionsNameWithPreceedingOptionalSpace(
    const CChordNamePrefs& prefs) const {
    const TChordOptionsMap options = OptionsMap(prefs);
    std::string name;
    if (options.empty()) return name;
    name += OptionalSpaceBetweenNameParts(prefs);
    name += OptionsNameFromMap(options, prefs);
    return name;
}

std::vector<std::string> CChordHeavy::OptionsStringVector(const CChordNamePrefs& prefs) const {
    std::vector<std::string> names;
    for (const auto& [key, option] : OptionsMap(prefs)) names.push_back(OptionName(option, prefs));
    return names;
}

}  // namespace brindle
