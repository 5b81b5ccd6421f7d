// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/Positions.h"
#include "brindle/theory/CKeyEnh.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

struct CChordNamePrefs;

/// A tone of a lead-sheet chord as it is written: a letter and how far it is altered.
struct TMusicXMLPitch {
    std::string mStep;  ///< "A" to "G", or "N.C." for no chord; empty where nothing is told
    /// Semitones, negative for flats.
    std::int32_t mAlter = 0;

    /// Something is told, be it a letter or not.
    [[nodiscard]] bool IsDefined() const { return !mStep.empty(); }
    /// The spelled key; the alteration is limited to double flat and double sharp. Undefined when
    /// the step is no letter of a note.
    [[nodiscard]] CKeyEnh ToKeyEnh(const CChordNamePrefs& prefs) const;
    /// The same as ToKeyEnh.
    [[nodiscard]] CKeyEnh ToKeyNrAndEnh(const CChordNamePrefs& prefs) const {
        return ToKeyEnh(prefs);
    }
    /// Its key alone, 0 (C) to 11; kKeyNrUndef when undefined.
    [[nodiscard]] int ToKeyNr(const CChordNamePrefs& prefs) const { return ToKeyEnh(prefs).mKeyNr; }

    friend bool operator==(const TMusicXMLPitch&, const TMusicXMLPitch&) = default;
};

/// A tone that is added to a chord, altered in it or left out.
struct TMusicXMLDegree {
    std::string mValue;  ///< the degree above the root as a number, "9"
    /// Semitones from the degree as it is in the chord; from that of a dominant chord where it is
    /// added.
    std::int32_t mAlter = 0;
    /// "add", "alter" or "subtract".
    std::string mType;

    friend bool operator==(const TMusicXMLDegree&, const TMusicXMLDegree&) = default;
};

/// Whether TMusicXMLHarmony::CompareAllMembers looks at the position.
enum TComparePos : std::int32_t {
    TComparePos_Yes = 0,
    TComparePos_No = 1,
};

/// The symbol of no chord.
inline constexpr std::string_view kNoChordSymbol = "N.C.";

/// One chord symbol of a lead sheet where it is played. Positions and lengths are quarter notes.
struct TMusicXMLHarmony {
    double mPosition = kPosUndef;  ///< from the start of the song
    double mDuration = kPosUndef;  ///< as long as it holds; undefined if the file tells none
    TMusicXMLPitch mRoot;          ///< what the symbol begins with
    std::string mExtraText1;       ///< for hosts; no reader here fills it
    /// A word such as "major-seventh", see HarmonyKinds.h.
    std::string mKind;
    TMusicXMLPitch mBass;                   ///< what stands behind the slash; undefined without one
    std::vector<TMusicXMLDegree> mDegrees;  ///< in the order of the file
    std::string mExtraText2;                ///< for hosts; no reader here fills it
    /// The kind is written as an augmented sixth, "Italian", "French" or "German": what sounds as a
    /// minor seventh is a raised sixth.
    bool mHasAugmentedSixth = false;

    /// Whether this is the sign that no chord sounds.
    [[nodiscard]] bool IsNoChord() const {
        return mRoot.mStep == kNoChordSymbol || mKind == "none";
    }

    /// Equality of position (if asked for), kind, root, bass, duration and first text. The degrees
    /// are not compared.
    [[nodiscard]] bool CompareAllMembers(const TMusicXMLHarmony& other, TComparePos mode) const;
};

}  // namespace brindle
