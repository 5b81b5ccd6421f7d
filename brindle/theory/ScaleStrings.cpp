// SPDX-License-Identifier: MIT
#include "brindle/theory/ScaleStrings.h"

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/CScaleLite.h"
#include "brindle/theory/KeyNames.h"
#include "brindle/theory/SetFromStringHelper.h"

#include <string>

namespace brindle {

namespace {

// The words of each scale, its name and its mask, in the order in which they are tried.
// clang-format off
const CKeywordsAndNames& ScaleWords() {
    static const CKeywordsAndNames rows = {
        {{"chromatic", "chrom"}, "chromatic", 4095},
        {{"pentamajor", "penta major", "majorpenta", "major penta", "pentama", "penta ma",
          "mapenta", "ma penta", "pentma", "pent ma", "mapent", "ma pent", "pentatonicmajor",
          "pentatonic major", "majorpentatonic", "major pentatonic"}, "major pentatonic", 661},
        {{"pentaminor", "penta minor", "minorpenta", "minor penta", "pentami", "penta mi",
          "mipenta", "mi penta", "pentmi", "pent mi", "mipent", "mi pent", "pentatonicminor",
          "pentatonic minor", "minorpentatonic", "minor pentatonic"}, "minor pentatonic", 1193},
        {{"bluesmajor", "blues major", "major blues", "majorblues", "bluesma", "blues ma",
          "mablues", "ma blues"}, "major blues", 669},
        {{"bluesminor", "blues minor", "minor blues", "minorblues", "bluesmi", "blues mi",
          "miblues", "mi blues"}, "minor blues", 1257},
        {{"major", "maj", "ma"}, "major", 2741},
        {{"minor", "min", "mi", "m"}, "minor", 1453},

        {{"ionian", "ion"}, "ionian", 2741},
        {{"dorian", "dor"}, "dorian", 1709},
        {{"phrygian", "phry"}, "phrygian", 1451},
        {{"lydian", "lyd"}, "lydian", 2773},
        {{"lydianaug", "lydaug"}, "lydian augmented", 2901},
        {{"mixolydian", "mixo"}, "mixolydian", 1717},
        {{"aeolian", "aeol"}, "aeolian", 1453},
        {{"locrian", "loc"}, "locrian", 1387},

        // The modes of melodic minor.
        {{"mm1", "minormelodic", "minor melodic", "melodicminor", "melodic minor"},
         "melodic minor", 2733},
        {{"mm2"}, "mode 2 of melodic minor", 1707},
        {{"mm3"}, "mode 3 of melodic minor", 2901},
        {{"mm4"}, "mode 4 of melodic minor", 1749},
        {{"mm5"}, "mode 5 of melodic minor", 1461},
        {{"mm6"}, "mode 6 of melodic minor", 1389},
        {{"mm7"}, "mode 7 of melodic minor", 1371},

        // The modes of harmonic minor. Kept: mode 7 has no root.
        {{"hm1", "minorharmonic", "minor harmonic", "harmonicminor", "harmonic minor"},
         "harmonic minor", 2477},
        {{"hm2"}, "mode 2 of harmonic minor", 1643},
        {{"hm3"}, "mode 3 of harmonic minor", 2869},
        {{"hm4"}, "mode 4 of harmonic minor", 1741},
        {{"hm5", "mixo b9 b13", "mixob9b13", "klezmer"}, "mode 5 of harmonic minor", 1459},
        {{"hm6"}, "mode 6 of harmonic minor", 2777},
        {{"hm7"}, "mode 7 of harmonic minor", 1718},

        {{"wholetone", "wt"}, "whole tone", 1365},
        {{"diminishedhalfwhole", "diminishedhw", "dimhalfwhole", "dimhw"},
         "diminished half whole", 1755},
        {{"diminishedwholehalf", "diminishedwh", "dimwholehalf", "dimwh"},
         "diminished whole half", 2925},
        {{"majorminor"}, "major and minor", 3773},
        {{"majoraddb7", "major addb7", "major add b7"}, "major with flat seventh", 3765},
        {{"japanese"}, "japanese", 419},
        {{"southeastasian", "southeast asian"}, "southeast asian", 395},
    };
    return rows;
}
// clang-format on

CScaleLite ReadScale(std::string_view text, const CChordNamePrefs& prefs) {
    // The signs are folded once, before both readers: what the first consumes counts for the
    // second too.
    std::string folded(text);
    ConvertUtf8SharpAndFlatToAscii(folded);
    int pos = 0;
    CKeyEnh root;
    root.SetFromString(folded, &pos, prefs);
    return {root, _SemitonesScaleFromString(folded, pos)};
}

}  // namespace

void SetFromString(std::string_view text, CScaleLite& scale, const CChordNamePrefs& prefs) {
    scale = ReadScale(text, prefs);
}

void SetFromString(std::string_view text, CScaleHeavy& scale, const CChordNamePrefs& prefs) {
    const CScaleLite read = ReadScale(text, prefs);
    scale.SetFromRootKeyEnhAndCustomScaleSemitones_ResetCustomScaleData(read.mRootKeyEnh,
                                                                        read.mSemitones);
}

CScaleHeavy::CScaleHeavy(std::string_view text, const CChordNamePrefs& prefs) : CScaleHeavy() {
    SetFromString(text, prefs);
}

CScaleHeavy::CScaleHeavy(const char* text, const CChordNamePrefs& prefs) : CScaleHeavy() {
    if (text != nullptr) SetFromString(text, prefs);
}

void CScaleHeavy::SetFromString(std::string_view text, const CChordNamePrefs& prefs) {
    brindle::SetFromString(text, *this, prefs);
}

CSemitones _SemitonesScaleFromString(std::string_view text, int& pos) {
    const auto row = ScaleWords().FindWholeRemainderAndAdvance(text, pos);
    if (row == ScaleWords().end()) return kSemitonesMajor;
    return CSemitones(static_cast<std::uint64_t>(row->mPayload));
}

}  // namespace brindle
