// SPDX-License-Identifier: MIT
// Frets and tunings as people type them.

#include "brindle/present/ChordGrid.h"

#include "brindle/guitarchords/GChPitches.h"
#include "brindle/guitarchords/Tunings.h"
#include "brindle/platform/Ascii.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/KeyNames.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle {
namespace {

constexpr int kMutedString = -1;
// Where letters without octaves begin, C2.
constexpr int kLowestOpenString = 48;

bool IsFretsText(std::string_view text) {
    return text.find_first_not_of("0123456789xX-,. ") == text.npos &&
           text.find_first_of("0123456789xX") != text.npos;
}

std::optional<int> ReadFret(std::string_view word) {
    if (word == "x" || word == "X") return kMutedString;
    if (word.empty() || word.size() > 2) return std::nullopt;
    int fret = 0;
    for (const char c : word) {
        if (!Ascii::IsDigit(c)) return std::nullopt;
        fret = fret * 10 + (c - '0');
    }
    return fret <= kGChFrets ? std::optional(fret) : std::nullopt;
}

/// Whether a letter is followed by a sign. Behind small letters in a row b is a note, as in
/// "eadgbe", but not in "eb ab db" and "eb2ab2".
bool IsSigned(std::string_view text, bool beginsPiece) {
    if (text.size() < 2 || (text[1] != '#' && text[1] != 'b')) return false;
    if (text[1] == '#' || Ascii::IsCapital(text[0])) return true;
    const std::string_view behind = text.substr(2);
    const bool endsPiece = behind.empty() || behind[0] == ' ' || behind[0] == ',';
    return endsPiece ? beginsPiece : behind[0] == '-' || Ascii::IsDigit(behind[0]);
}

/// Takes a letter with its sign from the start of a text.
std::string_view TakeKeyName(std::string_view& text, bool beginsPiece) {
    const std::string_view name = text.substr(0, IsSigned(text, beginsPiece) ? 2 : 1);
    text.remove_prefix(name.size());
    return name;
}

/// Takes "2" or "-1" from the start of a text; empty if there is none.
std::string_view TakeOctave(std::string_view& text) {
    const std::size_t sign = !text.empty() && text[0] == '-' ? 1 : 0;
    const bool isOctave = text.size() > sign && Ascii::IsDigit(text[sign]);
    const std::string_view octave = text.substr(0, isOctave ? sign + 1 : 0);
    text.remove_prefix(octave.size());
    return octave;
}

/// The pitch of a key that lies nearest to another pitch, below it if two do.
int NearestPitch(int keyNr, int pitch) {
    return pitch + FoldIntoOctave(keyNr - pitch + 6) - 6;
}

/// Pitches of keys without octaves.
std::vector<int> PitchesOfKeys(const std::vector<int>& keyNrs) {
    std::vector<int> pitches;
    for (std::size_t i = 0; i < keyNrs.size(); ++i) {
        const int standard = GChStandardGuitarOpenStringPitch(static_cast<int>(i));
        if (keyNrs.size() == 6) {
            pitches.push_back(NearestPitch(keyNrs[i], standard));
        } else {
            const int from = pitches.empty() ? kLowestOpenString : pitches.back() + 1;
            pitches.push_back(from + FoldIntoOctave(keyNrs[i] - from));
        }
    }
    return pitches;
}

/// The strings of a tuning in letters, as far as they are read: with octaves all of them, or none.
struct CTypedStrings {
    std::vector<int> mKeyNrs;
    std::vector<int> mPitches;

    /// Takes a string from the start of a text. False for what is none, and for one with an octave
    /// behind one without or the other way round.
    bool Take(std::string_view& text, bool beginsPiece) {
        const std::string name(TakeKeyName(text, beginsPiece));
        const std::string octave(TakeOctave(text));
        // An octave that is missing may be any: the key is the same in all.
        const int pitch = GChMidiPitchForPitchString(name + (octave.empty() ? "0" : octave));
        if (pitch < 0 || !(octave.empty() ? mPitches : mKeyNrs).empty()) return false;
        octave.empty() ? mKeyNrs.push_back(pitch % 12) : mPitches.push_back(pitch);
        return true;
    }
    [[nodiscard]] std::vector<int> Pitches() const {
        return mPitches.empty() ? PitchesOfKeys(mKeyNrs) : mPitches;
    }
};

std::optional<GChShortTuning> TuningOfPitches(const std::vector<int>& pitches) {
    if (pitches.size() > kGChMaxStrings) return std::nullopt;
    const bool areStrings = std::all_of(pitches.begin(), pitches.end(),
                                        [](int pitch) { return pitch >= 1 && pitch <= 127; });
    if (!areStrings) return std::nullopt;
    GChShortTuning tuning{};
    GChPitchArrayToShortTuning(pitches, tuning);
    return GChIsValidShortTuning(tuning) ? std::optional(tuning) : std::nullopt;
}

}  // namespace

std::optional<std::vector<int>> ReadFrets(std::string_view text) {
    constexpr std::string_view kBetween = "-,. ";
    text = Ascii::Trimmed(text);
    if (!IsFretsText(text)) return std::nullopt;
    const bool isLong = text.find_first_of(kBetween) != text.npos;
    std::vector<int> frets;
    while (!text.empty()) {
        const std::size_t length = isLong ? std::min(text.find_first_of(kBetween), text.size()) : 1;
        const auto fret = ReadFret(text.substr(0, length));
        if (!fret) return std::nullopt;
        frets.push_back(*fret);
        text.remove_prefix(std::min(isLong ? length + 1 : length, text.size()));
    }
    return frets;
}

std::optional<GChShortTuning> ReadTuning(std::string_view text) {
    if (const auto named = TuningOfName(text)) return named;
    std::string folded(text);
    ConvertUtf8SharpAndFlatToAscii(folded);
    CTypedStrings strings;
    for (std::string_view rest = folded;;) {
        const std::size_t gap = std::min(rest.find_first_not_of(" ,"), rest.size());
        const bool beginsPiece = gap > 0 || rest.size() == folded.size();
        rest.remove_prefix(gap);
        if (rest.empty()) break;
        if (!strings.Take(rest, beginsPiece)) return std::nullopt;
    }
    return TuningOfPitches(strings.Pitches());
}

std::string TuningText(const GChShortTuning& tuning) {
    std::vector<std::string> names;
    for (const int pitch : GChPitchArrayFromShortTuning(tuning)) {
        names.push_back(GChMidiPitchDefaultName(pitch));
    }
    return fmt::format("{}", fmt::join(names, " "));
}

}  // namespace brindle
