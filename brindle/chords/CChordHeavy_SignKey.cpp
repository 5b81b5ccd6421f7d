// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordHeavy.h"
#include "brindle/theory/CSignKeyHeavy.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <array>

namespace brindle {

namespace {

/// The scale types of minor colour, type 2 at bit 0.
constexpr std::uint32_t kMinorTypes = 225969;

bool IsMinorType(TScaleType type) {
    const auto bit = static_cast<std::uint32_t>(type) - 2;
    return bit < 18 && (kMinorTypes >> bit & 1) != 0;
}

/// What a basic chord gains by its root's distance to the root of the key, 0 to 11.
struct CBonusRow {
    TBasicChord basicChord;
    std::array<int, 12> inMinor;
    std::array<int, 12> inMajor;
};

// clang-format off
constexpr auto kBonusRows = std::to_array<CBonusRow>({
    {TBasicChord::Major,      {0, 0, 0, 2, 0, 1, 0, 2, 2, 0, 2, 0}, {2, 0, 0, 0, 2, 2, 0, 2, 0, 0, 0, 0}},
    {TBasicChord::Minor,      {2, 0, 0, 0, 0, 2, 0, 2, 0, 2, 0, 0}, {0, 0, 2, 0, 2, 0, 0, 0, 0, 2, 0, 0}},
    {TBasicChord::Augmented,  {1, 1, 1, 1, 1, 1, 0, 2, 0, 0, 0, 0}, {2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2}},
    {TBasicChord::Diminished, {0, 0, 2, 0, 0, 0, 0, 0, 0, 0, 0, 2}, {2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2}},
    {TBasicChord::Sus4,       {1, 0, 0, 1, 0, 1, 0, 2, 0, 0, 1, 0}, {2, 0, 2, 0, 2, 0, 0, 2, 0, 2, 0, 0}},
    {TBasicChord::Sus2,       {1, 0, 0, 1, 0, 1, 0, 1, 1, 0, 1, 0}, {2, 0, 2, 0, 0, 2, 0, 2, 0, 2, 0, 0}},
    {TBasicChord::Drone,      {1, 0, 0, 1, 0, 1, 0, 1, 1, 0, 1, 0}, {2, 0, 2, 0, 2, 2, 0, 2, 0, 2, 0, 0}},
});
// clang-format on

int Bonus(TBasicChord basicChord, int distance, bool minor) {
    const auto row = std::find_if(kBonusRows.begin(), kBonusRows.end(),
                                  [=](const CBonusRow& r) { return r.basicChord == basicChord; });
    if (row == kBonusRows.end() || distance == kIntvlUndef) return 0;
    return (minor ? row->inMinor : row->inMajor)[static_cast<std::size_t>(distance)];
}

}  // namespace

bool CChordHeavy::IsInSignKeyRegardlessOfEnh(const CSignKeyHeavy& signKey) const {
    // The fifth degree of a minor key wants the leading tone, which its scale does not hold.
    constexpr int fifthDegree = 4;
    const bool dominant = signKey.KeyNrToDegreeNr(mRootNote.KeyNr()) == fifthDegree;
    if (dominant && IsMinorType(signKey.ScaleType())) return HasIntvl(4);
    return CountIntvlsNotInSignKey(signKey) == 0;
}

int CChordHeavy::CountIntvlsInSignKey(const CSignKeyHeavy& signKey) const {
    int count = 0;
    CMySet<int> counted;
    for (const CNote& note : mNotes) {
        if (counted.insert(_IntvlOfNote(note)).second && signKey.HasKeyNr(note.KeyNr())) ++count;
    }
    return count;
}

int CChordHeavy::CountIntvlsNotInSignKey(const CSignKeyHeavy& signKey) const {
    return static_cast<int>(IntvlSet().size()) - CountIntvlsInSignKey(signKey);
}

int CChordHeavy::CountNotesNotInSignKey(const CSignKeyHeavy& signKey) const {
    return static_cast<int>(std::count_if(mNotes.begin(), mNotes.end(), [&](const CNote& note) {
        return !signKey.HasKeyNr(note.KeyNr());
    }));
}

int CChordHeavy::ClosenessToSignKey(const CSignKeyHeavy& signKey) const {
    const int distance = AbsKeyIntvlFromTo(signKey.RootKeyEnh().mKeyNr, mRootNote.KeyNr());
    return CountIntvlsInSignKey(signKey) - CountIntvlsNotInSignKey(signKey) +
           Bonus(BasicChord(), distance, IsMinorType(signKey.ScaleType()));
}

}  // namespace brindle
