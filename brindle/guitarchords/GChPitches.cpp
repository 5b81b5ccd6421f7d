// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/GChPitches.h"

#include "brindle/platform/Ascii.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/KeyNames.h"
#include "brindle/theory/MakeSensefulEnh.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <optional>

namespace brindle {

namespace {

// The one flat is meant.
constexpr auto kOctPitchDefaultNames = std::to_array<std::string_view>(
    {"C", "C#", "D", "D#", "E", "F", "F#", "G", "G#", "A", "Bb", "B"});

// clang-format off
constexpr auto kEnhPitches = std::to_array<CKeyEnh>({
    { 0, TEnh_n}, { 1, TEnh_s}, { 1, TEnh_b}, { 2, TEnh_n}, { 3, TEnh_s}, { 3, TEnh_b},
    { 4, TEnh_n}, { 5, TEnh_n}, { 6, TEnh_s}, { 6, TEnh_b}, { 7, TEnh_n}, { 8, TEnh_s},
    { 8, TEnh_b}, { 9, TEnh_n}, {10, TEnh_s}, {10, TEnh_b}, {11, TEnh_n},
});

// clang-format on

std::optional<int> ReadKeyNr(std::string_view& text) {
    if (text.empty()) return std::nullopt;
    int keyNr = KeyNrOfLetter(text[0]);
    if (keyNr == kKeyNrUndef) return std::nullopt;
    text.remove_prefix(1);
    if (!text.empty() && (text[0] == 'b' || text[0] == '#')) {
        keyNr = (keyNr + (text[0] == 'b' ? 11 : 1)) % 12;
        text.remove_prefix(1);
    }
    return keyNr;
}

/// The pitch of the C that an octave begins with; "-2" is the lowest octave.
std::optional<int> ReadOctave(std::string_view text) {
    if (text.empty()) return std::nullopt;
    if (Ascii::IsDigit(text[0])) return (text[0] - '0' + 2) * 12;
    if (text.substr(0, 2) == "-1") return 12;
    if (text.substr(0, 2) == "-2") return 0;
    return std::nullopt;
}

std::string ReplaceAll(std::string_view text, char letter, std::string_view sign) {
    std::string replaced;
    replaced.reserve(text.size());
    for (const char c : text) {
        if (c == letter) {
            replaced += sign;
        } else {
            replaced += c;
        }
    }
    return replaced;
}

}  // namespace

std::string GChMidiPitchDefaultName(int pitch) {
    return std::string(GChOctPitchDefaultName(FoldIntoOctave(pitch))) +
           std::to_string(pitch / 12 - 2);
}

std::string_view GChOctPitchDefaultName(int index) {
    if (index < 0 || index >= static_cast<int>(kOctPitchDefaultNames.size())) return {};
    return kOctPitchDefaultNames[static_cast<std::size_t>(index)];
}

std::string GChEnhPitchName(int index) {
    if (index < 0 || index >= static_cast<int>(kEnhPitches.size())) return {};
    const CKeyEnh& key = kEnhPitches[static_cast<std::size_t>(index)];
    return KeyNrAndEnhToName(key.mKeyNr,
                             MakeSensefulEnhForKeyNrAssumingCMajor(key.mKeyNr, key.mEnh),
                             CurrentChordNamePrefs);
}

int GChMidiPitchForPitchString(std::string_view text) {
    text.remove_prefix(std::min(text.find_first_not_of(' '), text.size()));
    const std::optional<int> keyNr = ReadKeyNr(text);
    const std::optional<int> octave = keyNr ? ReadOctave(text) : std::nullopt;
    if (!octave || *keyNr + *octave > 127) return -1;
    return *keyNr + *octave;
}

std::string stringByConvertingMusicalSymbols(std::string_view text) {
    return ReplaceAll(ReplaceAll(text, 'b', kUtf8Flat), '#', kUtf8Sharp);
}

}  // namespace brindle
