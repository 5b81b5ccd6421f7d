// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsChordForMetro.h"

#include "brindle/chords/CChordHeavy.h"
#include "brindle/platform/PlainText.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <algorithm>
#include <array>
#include <string_view>

namespace brindle {

namespace {

constexpr std::uint64_t kMaskOfAllSemitones = 4095;
constexpr int kKeyC = 0;
constexpr int kKeyE = 4;

// By key number.
constexpr std::array<std::string_view, 12> kKeyNames = {"C",  "C#", "D",  "D#", "E",  "F",
                                                        "F#", "G",  "G#", "A",  "A#", "B"};

std::string_view NameOfMetroKey(int keyNr) {
    return kKeyNames[static_cast<std::size_t>(FoldIntoOctave(keyNr))];
}

std::string_view NameOf(TBasicChord basicChord) {
    switch (basicChord) {
        case TBasicChord::Major:
            return "";
        case TBasicChord::Minor:
            return "m";
        case TBasicChord::Augmented:
            return "aug";
        case TBasicChord::Diminished:
            return "dim";
        case TBasicChord::Sus4:
            return "sus4";
        case TBasicChord::Sus2:
            return "sus2";
        case TBasicChord::Drone:
            return "5";
        case TBasicChord::None:
            break;
    }
    return "no 3";
}

template <std::size_t N>
bool Contains(const std::array<std::uint64_t, N>& vocabulary, CSemitones semitones) {
    return std::find(vocabulary.begin(), vocabulary.end(), semitones.Mask()) != vocabulary.end();
}

}  // namespace

bool CHarmAnlsChordForMetro::IsEADGBE() const {
    return mRootKeyEnh.mKeyNr == kKeyE && mSemitones.Mask() == kMaskOfAllSemitones;
}

bool CHarmAnlsChordForMetro::IsWildcard() const {
    return mRootKeyEnh.mKeyNr == kKeyC && mSemitones.Mask() == kMaskOfAllSemitones;
}

bool CHarmAnlsChordForMetro::IsSlashChord() const {
    return !IsWildcard() && !IsEADGBE() && CChordLite::IsSlashChord();
}

std::string CHarmAnlsChordForMetro::NameForMetroExport(bool flag) const {
    if (IsWildcard()) return "*";
    if (IsEADGBE()) return "EADGBE";
    if (IsUndef()) {
        if (IsNoChordForce()) return "No Chord Force";
        return IsNoChordYield() ? "No Chord Yield" : "Undef ('No Chord')";
    }
    const CChordHeavy chord = ToChordHeavy(CChordHeavy::DefaultWrapIntvl);
    if (!flag) return chord.Name(CurrentChordNamePrefs);

    const CChordNamePrefs prefs;
    std::string name(NameOfMetroKey(mRootKeyEnh.mKeyNr));
    name += NameOf(chord.BasicChord());
    name += chord.OptionsNameFromMap(chord.OptionsMap(prefs), prefs);
    if (HasBassNote() && mBassKeyEnh.mKeyNr != mRootKeyEnh.mKeyNr) {
        name.append(" / ").append(NameOfMetroKey(mBassKeyEnh.mKeyNr));
    }
    return name;
}

bool CHarmAnlsChordForMetro::IsMajorOrMinor(bool withoutBass) const {
    return !(withoutBass && HasBassNote()) &&
           Contains(CSemitones::_sSemitones_Chords_MajorMinorMode, mSemitones);
}

bool CHarmAnlsChordForMetro::IsRecognizedMetroChord(bool withoutBass) const {
    return !(withoutBass && HasBassNote()) &&
           Contains(CSemitones::_sSemitones_Chords_MetroRecognizedMode, mSemitones);
}

bool CHarmAnlsChordForMetro::IsCommonChord(bool withoutBass) const {
    return !(withoutBass && HasBassNote()) &&
           Contains(CSemitones::_sSemitones_Chords_CommonMode, mSemitones);
}

void CHarmAnlsChordForMetro::GetChromaVector(std::span<float, 12> chroma, bool withBass) const {
    if (IsUndef()) return;
    const auto setPlace = [&](int keyNr) {
        chroma[static_cast<std::size_t>(FoldIntoOctave(keyNr))] = 1.0F;
    };
    const int root = FoldIntoOctave(mRootKeyEnh.mKeyNr);
    setPlace(root);
    if (withBass && HasBassNote()) setPlace(mBassKeyEnh.mKeyNr);
    for (int semitone = 0; semitone < 12; ++semitone) {
        if (mSemitones.HasIntvl(semitone)) setPlace(root + semitone);
    }
}

std::ostream& operator<<(std::ostream& stream, const CHarmAnlsChordForMetro& chord) {
    chord.AppendJSONString(stream);
    return stream;
}

}  // namespace brindle
