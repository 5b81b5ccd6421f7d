// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/chords/ChordDegree.h"
#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CNote.h"
#include "brindle/theory/CSignKeyLite.h"

#include <array>
#include <cstddef>
#include <span>
#include <string>
#include <vector>

namespace brindle {

struct CChordNamePrefs;

/// What the lowest of some notes means for their chord.
enum class TBassUse {
    Usual,  ///< it is the bass, of the chord or foreign to it
    Only,   ///< it is only the bass, the chord is above it, as a left hand plays it: a chord over
            ///< its own root that nobody else plays is one without root, "C7b9(no1)"
    None,   ///< it says nothing, as on a ukulele, and no name has a slash
};

/// What is known about some notes besides themselves.
struct CNamingOptions {
    /// The key of the piece; undefined if it is not known. A tonic without spelling (`TEnh_Undef`)
    /// is spelled with the fewest signs.
    CSignKeyLite mKey;
    /// Root key of the chord before, 0 to 11; `kKeyNrUndef` if it is not known.
    int mPreviousRoot = kKeyNrUndef;
    /// The same of the chord behind.
    int mNextRoot = kKeyNrUndef;
    TBassUse mBass = TBassUse::Usual;  ///< what the lowest note means
    /// What another judge adds for each root key, in tenths of a bit and not negative: see
    /// RootCostsByNet.
    std::array<int, 12> mRootCosts{};
    /// Most names that are wanted.
    std::size_t mLimit = 12;
};

/// A name of some notes.
struct CNamedChord {
    /// Root, bass behind the slash (if there is one) and the tones that sound above the root. A
    /// bass that is foreign to the chord is none of its tones.
    CChordLite mChord;
    CKeyEnh mRoot;  ///< its root, with the spelling of the name
    /// What stands behind the slash; undefined without one.
    CKeyEnh mBass;
    /// What stands behind the root as people write it, "m7b5": of what is left out only a missing
    /// third is said.
    std::string mSuffix;
    /// The same with all that is left out: "7(no5)".
    std::string mExactSuffix;
    /// The whole symbol in ASCII with mSuffix, "Dm7/C".
    std::string mSymbol;
    /// The same with mExactSuffix: ReadChordText reads exactly the notes from it.
    std::string mExactSymbol;
    /// The notes from the lowest one up, each once, spelled as tones of this chord.
    std::vector<CNote> mNotes;
    /// Degrees of the chord type that do not sound.
    std::vector<CChordDegree> mOmitted;
    /// Degrees beyond the chord type.
    std::vector<CChordDegree> mAdded;
    /// How unusual the name is, in tenths of a bit.
    int mCost = 0;
};

/// Names notes as players say them, the likeliest name first, at most one for each root; their
/// order and doubled notes do not matter. C E G A is C6 with C in the bass and Am7 with A in the
/// bass, as these are common over their roots, and C/E is likelier than Em#5.
///
/// The spelling of a note (`TEnh_Undef` if it has none) decides how the chord is spelled, if it can
/// be, else the key does. Notes that are undefined are left out; without notes there is no name.
/// Each name weighs how common its chord type is over that bass, what is left out, and how usual
/// the chord is in the key and beside its neighbours, as counted by us in about 240,000 chords of
/// three annotated corpora.
[[nodiscard]] std::vector<CNamedChord> NameNotes(std::span<const CNote> notes,
                                                 const CNamingOptions& options = {});

/// Names the notes of a whole progression, so that an ambiguous chord is named by where it comes
/// from and where it goes: of the five likeliest names of each set the path is taken that is
/// likeliest as a whole. For each set its name on that path comes first, the others follow as
/// NameNotes has them. A set without notes has no name and takes the next to the one before. The
/// neighbours in `options` are those of the first and of the last set.
[[nodiscard]] std::vector<std::vector<CNamedChord>> NameProgression(
    std::span<const std::vector<CNote>> sets, const CNamingOptions& options = {});

/// Moves the name over a root, a key number, to the front; the others stay in their order. False if
/// there is none.
bool PutRootFirst(std::vector<CNamedChord>& names, int root);

/// The symbol of a named chord in a style: letters or syllables, German names, signs, the way of
/// writing a major seventh, small roots of minor chords, and the text of the slash. `isExact` also
/// tells what is left out.
[[nodiscard]] std::string NamedChordSymbol(const CNamedChord& chord, const CChordNamePrefs& prefs,
                                           bool isExact = false);

/// The symbol of a chord as people type it, that of WriteChordSymbol, in such a style. Empty for an
/// undefined root.
[[nodiscard]] std::string ChordSymbolInStyle(const CChordLite& chord, const CChordNamePrefs& prefs);

}  // namespace brindle
