// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CChordSetFromMusicXml.h"

#include "brindle/chords/CChordHeavy.h"
#include "brindle/musicxml/HarmonyKinds.h"
#include "brindle/musicxml/TMusicXMLHarmony.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <limits>
#include <set>
#include <string_view>

namespace brindle {

namespace {

constexpr int kNoAlteredTone = -1;

/// What a degree adds: tones that come with it, and the tone that its alteration moves.
struct CDegreeRow {
    std::string_view mWord;
    std::size_t mCount;
    std::array<int, 3> mPlain;
    int mAltered = kNoAlteredTone;
};

// Word, number of plain semitones, these semitones, semitone to which the alteration is added.
// A plain extension brings the lower ones with it: a 13 is a full thirteenth.
// clang-format off
constexpr auto kDegreeRows = std::to_array<CDegreeRow>({
    {"7",      0, {},           10},
    {"ma7",    1, {11}},
    {"j7",     1, {11}},
    {"maj7",   1, {11}},
    {"b9",     2, {10, 13}},
    {"add b9", 1, {13}},
    {"9",      1, {10},         14},
    {"add 9",  0, {},           14},
    {"#9",     2, {10, 15}},
    {"b3",     1, {3}},
    {"3",      1, {4}},
    {"11",     2, {10, 14},     17},
    {"add 11", 0, {},           17},
    {"#11",    3, {10, 14, 18}},
    {"5",      1, {7}},
    {"b5",     1, {6}},
    {"#5",     1, {8}},
    {"6",      1, {9}},
    {"b13",    1, {8}},
    {"13",     3, {10, 14, 17}, 21},
});
// clang-format on

constexpr std::string_view kDegreeOfFifth = "5";
static_assert(kDegreeRows[14].mWord == kDegreeOfFifth);

int AlteredTone(int tone, std::int32_t alter) {
    using Limits = std::numeric_limits<int>;
    const std::int64_t sum = std::int64_t{tone} + alter;
    return static_cast<int>(std::clamp<std::int64_t>(sum, Limits::min(), Limits::max()));
}

void Add(const TMusicXMLDegree& degree, std::set<int>& intvls) {
    for (const CDegreeRow& row : kDegreeRows) {
        if (row.mWord != degree.mValue) continue;
        intvls.insert(row.mPlain.data(), row.mPlain.data() + row.mCount);
        if (row.mAltered != kNoAlteredTone) {
            intvls.insert(AlteredTone(row.mAltered, degree.mAlter));
        }
    }
}

void Apply(const TMusicXMLDegree& degree, std::set<int>& intvls) {
    if (degree.mType == "add") {
        Add(degree, intvls);
    } else if (degree.mType == "subtract" && degree.mValue == kDegreeOfFifth) {
        intvls.erase(7);
    } else if (degree.mType == "alter" && degree.mValue == kDegreeOfFifth) {
        intvls.erase(7);
        intvls.insert(AlteredTone(7, degree.mAlter));
    }
}

}  // namespace

CChordHeavy CChordSetFromMusicXml(const TMusicXMLHarmony& harmony, int wrapIntvl,
                                  const CChordNamePrefs&) {
    const CKeyEnh root = harmony.mRoot.ToKeyEnh(CurrentChordNamePrefs);
    const CIntvlSet ofKind = XMLHarmonyKindToIntvlSetExceptRoot(harmony.mKind);
    std::set<int> intvls(ofKind.begin(), ofKind.end());
    for (const TMusicXMLDegree& degree : harmony.mDegrees) Apply(degree, intvls);
    const CKeyEnh bass = harmony.mBass.ToKeyEnh(CurrentChordNamePrefs);
    const CIntvlSet all(CMySet<int>(intvls.begin(), intvls.end()));
    return CChordHeavy(root, all, bass, wrapIntvl);
}

void CChordSetFromMusicXml(const TMusicXMLHarmony& harmony, CChordHeavy& chord,
                           const CChordNamePrefs& prefs) {
    chord = CChordSetFromMusicXml(harmony, chord.WrapIntvl(), prefs);
}

}  // namespace brindle
