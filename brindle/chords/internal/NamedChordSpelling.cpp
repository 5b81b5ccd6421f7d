// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/NamedChordSpelling.h"
#include "brindle/chords/internal/KeySpelling.h"
#include "brindle/chords/internal/SpelledOutChord.h"

#include <algorithm>
#include <cstdlib>

namespace brindle {
namespace {

/// The keys with the fewest signs, as they are most often written.
constexpr std::array<CKeyEnh, 12> kPlainKeys{CKeyEnh_C,  CKeyEnh_Db, CKeyEnh_D,   CKeyEnh_Eb,
                                             CKeyEnh_E,  CKeyEnh_F,  CKeyEnh_Fis, CKeyEnh_G,
                                             CKeyEnh_Ab, CKeyEnh_A,  CKeyEnh_Bb,  CKeyEnh_B};
/// The roots of minor chords as they are most often written.
constexpr std::array<CKeyEnh, 12> kMinorRoots{CKeyEnh_C,   CKeyEnh_Cis, CKeyEnh_D,   CKeyEnh_Eb,
                                              CKeyEnh_E,   CKeyEnh_F,   CKeyEnh_Fis, CKeyEnh_G,
                                              CKeyEnh_Gis, CKeyEnh_A,   CKeyEnh_Bb,  CKeyEnh_B};

// Where the tonics without a spelling stand on the line of fifths.
constexpr std::array<int, 12> kPlacesOfMajorTonics{0, -5, 2, -3, 4, -1, -6, 1, -4, 3, -2, 5};
constexpr std::array<int, 12> kPlacesOfMinorTonics{0, 7, 2, -3, 4, -1, 6, 1, 8, 3, -2, 5};
// How far from the tonic the roots of a family are on the average: dominants of other degrees stand
// on the sharp side. Columns: dominant, major, minor, diminished, other.
constexpr std::array<int, 5> kShiftsInMajor{0, -1, 2, 2, 0};
constexpr std::array<int, 5> kShiftsInMinor{-3, -6, -1, 1, -2};

bool IsAltered(const CChordDegree& degree) {
    constexpr std::array<CChordDegree, 5> kAltered{{{5, -1}, {5, 1}, {9, -1}, {9, 1}, {11, 1}}};
    return std::find(kAltered.begin(), kAltered.end(), degree) != kAltered.end();
}

CKeyEnh UsualRoot(int keyNr, const TDegreesOfTones& degrees) {
    const auto ix = static_cast<std::size_t>(keyNr);
    if (degrees[3] == CChordDegree{3, -1}) return kMinorRoots[ix];
    constexpr int kTritone = 6;
    const bool isAltered = std::any_of(degrees.begin(), degrees.end(), IsAltered);
    return keyNr == kTritone && !isAltered ? CKeyEnh_Gb : kPlainKeys[ix];
}

int CentreOfRoots(const CSignKeyLite& key, TNamingFamily family) {
    const bool isMinor = key.mSignKeyType == TSignKeyType_Minor;
    const CKeyEnh& tonic = key.mRootKeyEnh;
    const auto ix = static_cast<std::size_t>(FoldIntoOctave(tonic.mKeyNr));
    const int unspelled = isMinor ? kPlacesOfMinorTonics[ix] : kPlacesOfMajorTonics[ix];
    const int place = tonic.mEnh == TEnh_Undef ? unspelled : PlaceOnLineOfFifths(tonic);
    return place + (isMinor ? kShiftsInMinor : kShiftsInMajor)[family];
}

CKeyEnh RootInKey(int keyNr, int centre) {
    if (IsWhiteKey(keyNr)) return {keyNr, TEnh_n};
    const CKeyEnh sharp{keyNr, TEnh_s};
    const CKeyEnh flat{keyNr, TEnh_b};
    const int toSharp = std::abs(PlaceOnLineOfFifths(sharp) - centre);
    const int toFlat = std::abs(PlaceOnLineOfFifths(flat) - centre);
    // At a tie the letter decides: A flat comes before G sharp, the other sharps before their
    // flats.
    constexpr int kAFlat = 8;
    if (toSharp == toFlat) return keyNr == kAFlat ? flat : sharp;
    return toSharp < toFlat ? sharp : flat;
}

CKeyEnh RootOf(const CNamingCandidate& candidate, const TDegreesOfTones& degrees,
               const TGivenSpellings& given, const CSignKeyLite& key) {
    const auto agrees = [&](const CKeyEnh& root) {
        return std::all_of(degrees.begin(), degrees.end(), [&](const CChordDegree& degree) {
            if (degree.IsUndef()) return true;
            const int keyNr = FoldIntoOctave(root.mKeyNr + degree.Tone());
            const CKeyEnh& name = given[static_cast<std::size_t>(keyNr)];
            return name.IsUndef() || name == degree.KeyOver(root);
        });
    };
    const CKeyEnh& name = given[static_cast<std::size_t>(candidate.mRoot)];
    if (!name.IsUndef() && agrees(name)) return name;
    if (key.IsUndef()) return UsualRoot(candidate.mRoot, degrees);
    return RootInKey(candidate.mRoot, CentreOfRoots(key, candidate.Family()));
}

/// How a bass that the chord does not have is counted from the root.
constexpr std::array<CChordDegree, 12> kForeignBasses{{
    {1, 0},
    {2, -1},
    {2, 0},
    {3, -1},
    {3, 0},
    {4, 0},
    {4, 1},
    {5, 0},
    {6, -1},
    {6, 0},
    {7, -1},
    {7, 0},
}};

bool IsPlain(const CKeyEnh& key) {
    const bool isRare =
        key == CKeyEnh_Cb || key == CKeyEnh_Fb || key == CKeyEnh_Eis || key == CKeyEnh_Bis;
    return !key.IsUndef() && std::abs(EnhToSemitone(key.mEnh)) < 2 && !isRare;
}

}  // namespace

TGivenSpellings GivenSpellings(std::span<const CNote> notes) {
    TGivenSpellings given{};
    for (const CNote& note : notes) {
        if (note.IsUndef() || note.mEnh == TEnh_Undef) continue;
        given[static_cast<std::size_t>(note.KeyNr())] = note.KeyEnh();
    }
    return given;
}

TDegreesOfTones DegreesOfTones(const CNamingCandidate& candidate) {
    TDegreesOfTones degrees{};
    if (candidate.IsSpelledOut()) {
        const CSpelledOutChord chord(candidate.mTones);
        for (int tone = 0; tone < 12; ++tone) {
            if (!HasTone(candidate.mTones, tone)) continue;
            degrees[static_cast<std::size_t>(tone)] = chord.DegreeOf(tone);
        }
        return degrees;
    }
    for (const CChordDegree& degree :
         kNamingTypes[static_cast<std::size_t>(candidate.mType)].mDegrees) {
        if (!degree.IsUndef()) degrees[static_cast<std::size_t>(degree.Tone())] = degree;
    }
    return degrees;
}

CNamedChordSpelling::CNamedChordSpelling(const CNamingCandidate& candidate,
                                         const TGivenSpellings& given, const CSignKeyLite& key)
    : mDegrees(DegreesOfTones(candidate)),
      mTones(candidate.mTones),
      mRoot(RootOf(candidate, mDegrees, given, key)) {}

CKeyEnh CNamedChordSpelling::KeyOfTone(int tone) const {
    const auto ix = static_cast<std::size_t>(tone);
    const CKeyEnh& plain =
        kPlainKeys[static_cast<std::size_t>(FoldIntoOctave(mRoot.mKeyNr + tone))];
    const CKeyEnh ofChord = mDegrees[ix].KeyOver(mRoot);
    if (HasTone(mTones, tone)) return ofChord.IsUndef() ? plain : ofChord;
    if (!mDegrees[ix].IsUndef()) return ofChord.IsUndef() ? plain : ofChord;
    const CKeyEnh counted = kForeignBasses[ix].KeyOver(mRoot);
    return IsPlain(counted) ? counted : plain;
}

}  // namespace brindle
