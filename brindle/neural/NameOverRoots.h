// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/TSingleChordAnalysisAlgo.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CMySet.h"
#include "brindle/theory/CNote.h"
#include "brindle/theory/TBasicChord.h"

#include <string>
#include <vector>

namespace brindle {

/// The name that some notes have over one root, whether or not anybody would call them so.
struct CChordOverRoot {
    CKeyEnh mRoot;  ///< spelled for its name
    /// Where it is not the root; else undefined.
    CKeyEnh mBass;
    std::string mName;                  ///< root, kind and options: "C7(b9)"
    std::vector<std::string> mOptions;  ///< "b9", "no5" and so on, in the order of the name
    TBasicChord mBasicChord = TBasicChord::None;  ///< the triad or seventh chord below them
    /// Whether the root is one of the notes.
    bool mIsSounding = false;
};

/// How names over roots are searched.
struct CNameOverRootOptions {
    /// Undefined to search it.
    CKeyEnh mRoot;
    /// What hears the root.
    TSingleChordAnalysisAlgo mSearch = TSingleChordAnalysisAlgo_NeuronalNet;
    /// Also the other eleven roots, those that sound first.
    bool mAllRoots = false;
    /// How the names are written.
    CChordNamePrefs mPrefs = ChordNamePrefsNonUTF8;
};

/// Names notes by a search for the root and what lies above it. NameNotes is what players want;
/// this always has a name, over any root. A third or a fifth in the bass belongs to the triad, so
/// that E G C is C/E; any other bass is foreign to it, as in C/Bb. Undefined notes are not looked
/// for.
[[nodiscard]] std::vector<CChordOverRoot> NameOverRoots(const CMySet<CNote>& notes,
                                                        const CNameOverRootOptions& options = {});

}  // namespace brindle
