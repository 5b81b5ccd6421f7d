// SPDX-License-Identifier: MIT
#include "brindle/chords/CProgressionSpelling.h"

#include "brindle/chords/ChordTones.h"
#include "brindle/chords/internal/KeySpelling.h"

#include <cstdlib>

namespace brindle {
namespace {

// Places on the line of fifths.
constexpr int kFlattestTyped = -6;  // Gb
constexpr int kSharpestTyped = 10;  // A#

using TNamesOfKeys = std::array<CKeyEnh, 12>;

std::size_t SlotOfName(const CKeyEnh& key) {
    return static_cast<std::size_t>(FoldIntoOctave(key.mKeyNr));
}

CKeyEnh NameAtPlace(int place) {
    // F C G D A E B are -1 to 5; seven places more are a sharp more.
    const int signs = (place + 1 + 70) / 7 - 10;
    return {FoldIntoOctave(place * 7), static_cast<TEnh>(TEnh_n + signs)};
}

/// Names of roots in a key.
class CRootNames {
public:
    explicit CRootNames(CSignKeyLite key) {
        if (key.mRootKeyEnh.mEnh == TEnh_Undef) key.SetRootNoteEnhWithLeastSigns();
        const bool isMinor = key.mSignKeyType == TSignKeyType_Minor;
        const int tonic = PlaceOnLineOfFifths(key.mRootKeyEnh);
        // A minor key has its leading tone, and a major key the leading tone of its fifth.
        mFirst = tonic - (isMinor ? 6 : 5);
        mFirstOfKey = tonic - (isMinor ? 4 : 1);
    }

    [[nodiscard]] CKeyEnh NameOf(int keyNr) const { return NameAtPlace(Typed(PlaceOf(keyNr))); }
    /// The name of a root that leads upwards: C# for Db in C.
    [[nodiscard]] CKeyEnh RaisedNameOf(int keyNr) const {
        const int place = PlaceOf(keyNr);
        return NameAtPlace(Typed(place < mFirstOfKey ? place + 12 : place));
    }

private:
    [[nodiscard]] int PlaceOf(int keyNr) const {
        return mFirst + FoldIntoOctave(keyNr * 7 - mFirst);
    }
    [[nodiscard]] int Typed(int place) const {
        constexpr int kFlattestOfKeys = -8;  // Fb
        constexpr int kSharpestOfKeys = 12;  // B#
        const bool isOfKey = place >= mFirstOfKey && place < mFirstOfKey + 7;
        if (place < (isOfKey ? kFlattestOfKeys : kFlattestTyped)) return place + 12;
        if (place > (isOfKey ? kSharpestOfKeys : kSharpestTyped)) return place - 12;
        return place;
    }

    int mFirst;
    int mFirstOfKey;
};

bool LeadsUpByTones(const CChordLite& chord) {
    constexpr std::uint64_t kThirdAndFifth = 0b11111000;
    constexpr std::uint64_t kDiminished = 0b1001000;
    return (chord.mSemitones.Mask() & kThirdAndFifth) == kDiminished;
}

TNamesOfKeys NamesOfRoots(std::span<const CChordLite> chords, const CRootNames& roots) {
    TNamesOfKeys names{};
    for (const bool leads : {true, false}) {
        for (const CChordLite& chord : chords) {
            if (chord.mRootKeyEnh.IsUndef() || LeadsUpByTones(chord) != leads) continue;
            const int keyNr = chord.mRootKeyEnh.mKeyNr;
            names[SlotOfName(chord.mRootKeyEnh)] =
                leads ? roots.RaisedNameOf(keyNr) : roots.NameOf(keyNr);
        }
    }
    return names;
}

/// The name that a chord has for its bass; undefined for one that is foreign to it, as only the key
/// can tell how the fourth of F7/Bb or the minor third of F7/Ab is written.
CKeyEnh BassByChord(const CChordLite& chord, const CKeyEnh& root) {
    constexpr int kMinorSeventh = 10;
    const int intvl = FoldIntoOctave(chord.mBassKeyEnh.mKeyNr - root.mKeyNr);
    if (intvl < kMinorSeventh && !chord.mSemitones.HasIntvl(intvl)) return CKeyEnh_Undef;
    CChordLite named = chord;
    named.mRootKeyEnh = root;
    const CKeyEnh bass = ToneAboveRoot(named, intvl);
    return std::abs(EnhToSemitone(bass.mEnh)) > 1 ? CKeyEnh_Undef : bass;
}

/// Adds the names of basses; those that are named in two ways get the name of the key.
void AddNamesOfBasses(std::span<const CChordLite> chords, const CRootNames& roots,
                      TNamesOfKeys& names) {
    const TNamesOfKeys ofRoots = names;
    for (const CChordLite& chord : chords) {
        if (chord.mRootKeyEnh.IsUndef() || !chord.HasBassNote()) continue;
        const CKeyEnh byChord = BassByChord(chord, ofRoots[SlotOfName(chord.mRootKeyEnh)]);
        const CKeyEnh byKey = roots.NameOf(chord.mBassKeyEnh.mKeyNr);
        const CKeyEnh& bass = byChord.IsUndef() ? byKey : byChord;
        CKeyEnh& name = names[SlotOfName(chord.mBassKeyEnh)];
        name = name.IsUndef() || name == bass ? bass : byKey;
    }
}

}  // namespace

CProgressionSpelling::CProgressionSpelling(const CSignKeyLite& key,
                                           std::span<const CChordLite> chords) {
    if (key.IsUndef()) return;
    const CRootNames roots(key);
    mNames = NamesOfRoots(chords, roots);
    AddNamesOfBasses(chords, roots, mNames);
    for (int keyNr = 0; keyNr < 12; ++keyNr) {
        CKeyEnh& name = mNames[static_cast<std::size_t>(keyNr)];
        if (name.IsUndef()) name = roots.NameOf(keyNr);
    }
}

CChordLite CProgressionSpelling::Spelled(const CChordLite& chord) const {
    if (chord.mRootKeyEnh.IsUndef() || mNames[0].IsUndef()) return chord;
    CChordLite spelled = chord;
    spelled.mRootKeyEnh = mNames[SlotOfName(chord.mRootKeyEnh)];
    if (chord.HasBassNote()) spelled.mBassKeyEnh = mNames[SlotOfName(chord.mBassKeyEnh)];
    return spelled;
}

}  // namespace brindle
