// SPDX-License-Identifier: MIT
#include "MarkedSongs.h"
#include "RandomChordTexts.h"

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/analysis/RomanNumeral.h"
#include "brindle/analysis/TChordStringParse.h"
#include "brindle/analysis/internal/KeyTables.h"
#include "brindle/analysis/internal/LocalKeys.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/KeyIntervals.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <sstream>

namespace brindle::test {
namespace {

constexpr double kNan = std::numeric_limits<double>::quiet_NaN();
constexpr double kInfinity = std::numeric_limits<double>::infinity();

std::string NameOf(const CSignKeyLite& key) {
    return key.NameLong(ChordNamePrefsNonUTF8);
}

CHarmAnlsChords Read(std::string_view text, double beatsPerBar, double beatsPerChord) {
    TChordStringParse parse;
    parse.mBeatsPerBar = beatsPerBar;
    parse.mBeatsPerChord = beatsPerChord;
    return {text, parse};
}

CKeyOfSong KeysOf(std::string_view text) {
    return FindKeys(Read(text, 4.0, 2.0));
}

// "C Major: ii7 V7 I^7; G Minor: ..."
std::string RegionsText(const CHarmAnlsChords& chords, const CKeyOfSong& keys) {
    const auto numerals = NumeralsOf(chords, keys);
    std::string text;
    for (const CKeyRegion& region : keys.mRegions) {
        text += (text.empty() ? "" : "; ") + NameOf(region.mKey) + ":";
        for (std::size_t i = region.mBegin; i < region.mEnd; ++i) text += " " + numerals[i];
    }
    return text;
}

TEST_CASE("Each chord keeps the spelling of its own bass, also of the same sounds in a row") {
    CHarmAnlsChords chords;
    for (const char* symbol : {"F7/Eb", "F7/D#", "F7/Eb", "E"}) {
        chords.emplace_back(CChordLite(symbol, ChordNamePrefsNonUTF8),
                            static_cast<double>(chords.size()));
    }
    CKeyOfSong keys;
    keys.mRegions.push_back(
        {.mKey = CSignKeyLite({9, TEnh_n}, TSignKeyType_Minor), .mBegin = 0, .mEnd = 4});
    CHECK(RegionsText(chords, keys) == "A Minor: subV7/V/^b5 subV7/V/^#4 subV7/V/^b5 V");
}

TEST_CASE("Three cadences in a row are three regions, and the first is the key of the song") {
    const CHarmAnlsChords chords = Read("Dm7 G7 Cmaj7 | Fm7 Bb7 Ebmaj7 | Am7b5 D7 Gm", 3.0, 1.0);
    const CKeyOfSong keys = FindKeys(chords, {.mBeatsPerBar = 3.0});
    CHECK(NameOf(keys.mKey) == "C Major");
    CHECK(fmt::format("{:.2f} {:.2f} {:.2f}", keys.mScores[0], keys.mScores[12 + 7],
                      keys.mScores[7]) == "5.64 3.72 3.39");
    CHECK(RegionsText(chords, keys) ==
          "C Major: ii7 V7 I^7; Eb Major: ii7 V7 I^7; G Minor: iih7 V7 i");
    REQUIRE(keys.mRegions.size() == 3);
    CHECK(keys.mRegions[1].mPosition == 3.0);
    CHECK(keys.mRegions[1].mEndPosition == 6.0);
    CHECK(keys.mRegions[2].mEndPosition == 9.0);
    // The winner against the two that follow and 21 that lie far below.
    CHECK(keys.mConfidence > 0.6);
    CHECK(keys.mConfidence < 0.8);
}

/// A text with the keys of its regions in brackets, taken apart.
struct CMarkedText {
    std::string mChords;
    std::vector<std::string> mKeyOfChord;
};

CMarkedText MarksOf(std::string_view marked) {
    CMarkedText marks;
    std::istringstream words{std::string(marked)};
    std::string key;
    for (std::string word; words >> word;) {
        if (word.front() == '[') {
            std::string type;
            words >> type;
            key = word.substr(1) + " " + type.substr(0, type.size() - 1);
            continue;
        }
        marks.mChords += word + " ";
        if (word != "|" && word != ".") marks.mKeyOfChord.push_back(key);
    }
    return marks;
}

std::vector<std::string> KeyOfChord(const CKeyOfSong& keys) {
    std::vector<std::string> names;
    for (const CKeyRegion& region : keys.mRegions) {
        names.resize(region.mEnd, NameOf(region.mKey));
    }
    return names;
}

// The text with the keys that were found, in the form of the marks.
std::string Marked(const CMarkedText& marks, const std::vector<std::string>& keys) {
    std::istringstream words(marks.mChords);
    std::string text;
    std::string key;
    std::size_t chord = 0;
    for (std::string word; words >> word;) {
        if (word != "|" && word != "." && keys[chord++] != key) {
            key = keys[chord - 1];
            text += "[" + key + "] ";
        }
        text += word + " ";
    }
    text.pop_back();
    return text;
}

TEST_CASE("Well-known songs pass through the keys that musicians hear in them") {
    std::size_t songs = 0;
    std::size_t chords = 0;
    std::size_t agreed = 0;
    for (const CMarkedSong& song : kMarkedSongs) {
        INFO(song.mName);
        const CMarkedText marks = MarksOf(song.mMarked);
        const CKeyOfSong keys = KeysOf(marks.mChords);
        const std::vector<std::string> found = KeyOfChord(keys);
        CHECK(NameOf(keys.mKey) == (song.mFoundKey.empty() ? song.mKey : song.mFoundKey));
        REQUIRE(found.size() == marks.mKeyOfChord.size());
        CHECK(Marked(marks, found) == (song.mFound.empty() ? song.mMarked : song.mFound));
        songs += NameOf(keys.mKey) == song.mKey ? 1U : 0U;
        chords += found.size();
        for (std::size_t i = 0; i < found.size(); ++i) {
            agreed += found[i] == marks.mKeyOfChord[i] ? 1U : 0U;
        }
    }
    // docs/reading.md quotes these.
    CHECK(fmt::format("{} of {} songs, {} of {} chords", songs, kMarkedSongs.size(), agreed,
                      chords) == "29 of 30 songs, 438 of 481 chords");
}

TEST_CASE("A song in another key has its keys there, and all else the same") {
    for (std::uint32_t seed = 1; seed <= 100; ++seed) {
        CChance chance(seed);
        const CHarmAnlsChords song = RandomChords(chance, 1 + chance.Below(40));
        const CKeyOfSong keys = FindKeys(song);
        for (int up = 1; up < 12; ++up) {
            CAPTURE(seed);
            CAPTURE(up);
            const CHarmAnlsChords other = Transposed(song, up);
            const CKeyOfSong otherKeys = FindKeys(other);
            const auto isMoved = [&](const CSignKeyLite& key, const CSignKeyLite& otherKey) {
                return otherKey.mRootKeyEnh.mKeyNr == Transposed(key.mRootKeyEnh, up).mKeyNr &&
                       otherKey.mSignKeyType == key.mSignKeyType;
            };
            CHECK(isMoved(keys.mKey, otherKeys.mKey));
            CHECK(otherKeys.mConfidence == doctest::Approx(keys.mConfidence));
            REQUIRE(otherKeys.mRegions.size() == keys.mRegions.size());
            for (std::size_t i = 0; i < keys.mRegions.size(); ++i) {
                CHECK(isMoved(keys.mRegions[i].mKey, otherKeys.mRegions[i].mKey));
                CHECK(otherKeys.mRegions[i].mBegin == keys.mRegions[i].mBegin);
            }
            CHECK(NumeralsOf(other, otherKeys) == NumeralsOf(song, keys));
        }
    }
}

TEST_CASE("Lengths count against each other, not by themselves") {
    for (std::uint32_t seed = 1; seed <= 100; ++seed) {
        CChance chance(seed);
        CHarmAnlsChords song = RandomChords(chance, 1 + chance.Below(40));
        const CKeyOfSong keys = FindKeys(song);
        for (const double factor : {3.0, 0.001, 1e6}) {
            CAPTURE(seed);
            CAPTURE(factor);
            CHarmAnlsChords other = song;
            for (CHarmAnlsChordWithPos& chord : other) chord.mPosition *= factor;
            const CKeyOfSong otherKeys = FindKeys(other);
            CHECK(otherKeys.mKey == keys.mKey);
            CHECK(otherKeys.mConfidence == doctest::Approx(keys.mConfidence));
        }
    }
}

TEST_CASE("What is written twice, or as no chord, makes the chord before longer") {
    const CKeyOfSong keys = KeysOf("Dm7 . . . | G7 . | C .");
    for (const char* text :
         {"Dm7 Dm7 . . | G7 . | C .", "Dm7 . X X | G7 . | C C", "Dm7 X Dm7 . | G7 X | C ."}) {
        INFO(text);
        const CHarmAnlsChords chords = Read(text, 4.0, 2.0);
        const CKeyOfSong same = FindKeys(chords);
        CHECK(same.mScores == keys.mScores);
        REQUIRE(same.mRegions.size() == 1);
        CHECK(same.mRegions[0].mBegin == 0);
        CHECK(same.mRegions[0].mEnd == chords.size() - 1);
        CHECK(same.mRegions[0].mEndPosition == 16.0);
    }
}

// The best path, word for word and slowly. Pivots apart.
std::vector<std::uint8_t> PlainPath(const std::vector<CKeyChord>& chords,
                                    const std::vector<TKeyChordKind>& kinds,
                                    const CSongTraits& traits, const CKeyOptions& options) {
    const auto gain = [&](std::size_t i, int k) {
        const CKeyChord& chord = chords[i];
        const double bars = std::clamp(chord.mBeats / options.mBeatsPerBar, 1.0 / 16, 4.0);
        const auto dist = static_cast<std::size_t>((chord.mRoot - k % 12 + 12) % 12);
        double points = kKeyLocalTable[static_cast<std::size_t>(k / 12)][kinds[i]][dist];
        const double weight = std::pow(bars, 0.25);
        if (k != traits.mHome) return weight * points;
        const bool isBluesChord =
            chord.mClass == TKeyChordClass_Dom && (dist == 0 || dist == 5) && traits.mIsBlues;
        if (isBluesChord) points = std::max(points, 2.7);
        return weight * points + weight * options.mHomeBonus;
    };
    const auto cost = [&](int a, int b) {
        if (a == b) return 0.0;
        if (a % 12 == b % 12) return options.mChangeCost + 1.0;
        const auto fifths = [](int k) { return (k % 12 + (k < 12 ? 0 : 3)) * 7; };
        const int up = (fifths(a) - fifths(b) + 120) % 12;
        return options.mChangeCost + 0.5 * std::min({up, 12 - up, 3});
    };
    std::vector<std::array<double, 24>> best(chords.size());
    std::vector<std::array<int, 24>> from(chords.size());
    for (std::size_t i = 0; i < chords.size(); ++i) {
        for (int k = 0; k < 24; ++k) {
            int a = k;
            const auto way = [&](int b) {
                return best[i - 1][static_cast<std::size_t>(b)] - cost(b, k);
            };
            for (int b = 0; i > 0 && b < 24; ++b) {
                if (way(b) > way(a)) a = b;
            }
            const auto ix = static_cast<std::size_t>(k);
            best[i][ix] = gain(i, k) + (i > 0 ? way(a) : 0.0);
            from[i][ix] = a;
        }
    }
    std::vector<std::uint8_t> path(chords.size());
    const auto& last = best.back();
    auto key = std::max_element(last.begin(), last.end()) - last.begin();
    for (std::size_t i = chords.size(); i-- > 0;) {
        path[i] = static_cast<std::uint8_t>(key);
        key = from[i][static_cast<std::size_t>(key)];
    }
    return path;
}

TEST_CASE(
    "The path through the keys is the best one; where two are equal it stays, or comes from the "
    "lower") {
    for (std::uint32_t seed = 1; seed <= 300; ++seed) {
        CChance chance(seed);
        CHarmAnlsChords song = RandomChords(chance, 1 + chance.Below(40));
        // Beats of one length have equal ways.
        if (chance.OneIn(2)) {
            for (std::size_t i = 0; i < song.size(); ++i)
                song[i].mPosition = static_cast<double>(i);
        }
        std::vector<CKeyChord> chords = KeyChordsOf(song);
        // No seventh on a second degree is left, so that there is no pivot.
        for (CKeyChord& chord : chords) {
            if (chord.mClass == TKeyChordClass_Min7) chord.mClass = TKeyChordClass_Min;
            if (chord.mClass == TKeyChordClass_HDim) chord.mClass = TKeyChordClass_Dim;
        }
        if (chords.empty()) continue;
        const auto kinds = KeyChordKindsOf(chords);
        CSongTraits traits;
        traits.mHome = static_cast<int>(chance.Below(24));
        traits.mIsBlues = chance.OneIn(2);
        for (const double change : {4.0, 0.0, 0.5, 1.5, 50.0}) {
            CAPTURE(seed);
            CAPTURE(change);
            const CKeyOptions options{4.0, 0.3, change};
            CHECK(LocalKeys(chords, kinds, traits, options) ==
                  PlainPath(chords, kinds, traits, options));
        }
    }
}

TEST_CASE("A song without chords has no key, and chords before the first do not count") {
    for (const char* text : {"", "| . |", "X X X"}) {
        INFO(text);
        const CKeyOfSong keys = KeysOf(text);
        CHECK(keys.mKey.IsUndef());
        CHECK(keys.mConfidence == kPosUndef);
        CHECK(keys.mRegions.empty());
    }
    const CKeyOfSong keys = KeysOf("X X G D7 G");
    CHECK(NameOf(keys.mKey) == "G Major");
    REQUIRE(keys.mRegions.size() == 1);
    CHECK(keys.mRegions[0].mBegin == 2);
    CHECK(keys.mRegions[0].mPosition == 4.0);
    CHECK(NameOf(KeysOf("Ebm").mKey) == "Eb Minor");
}

TEST_CASE("Six sharps or six flats are spelled as the song is") {
    CHECK(NameOf(KeysOf("F# C#7 F#").mKey) == "F# Major");
    CHECK(NameOf(KeysOf("Gb Db7 Gb").mKey) == "Gb Major");
    CHECK(NameOf(KeysOf("D#m A#7 D#m").mKey) == "D# Minor");
    CHECK(NameOf(KeysOf("C# G#7 C#").mKey) == "Db Major");
}

TEST_CASE("The home bonus and the cost of a change decide how many regions there are") {
    const CHarmAnlsChords chords = Read("Dm7 G7 Cmaj7 | Fm7 Bb7 Ebmaj7 | Am7b5 D7 Gm", 3.0, 1.0);
    CHECK(FindKeys(chords, {.mBeatsPerBar = 3.0, .mHomeBonus = 20.0}).mRegions.size() == 1);
    CHECK(FindKeys(chords, {.mBeatsPerBar = 3.0, .mChangeCost = 100.0}).mRegions.size() == 1);
    CHECK(FindKeys(chords, {.mBeatsPerBar = 3.0, .mChangeCost = 0.1}).mRegions.size() == 3);
    const CHarmAnlsChords wander = Read("Cmaj7 F#m7 B7 Ebmaj7 Am7 D7", 4.0, 1.0);
    CHECK(FindKeys(wander, {.mChangeCost = 0.0}).mRegions.size() > 1);
    CHECK(FindKeys(wander, {.mChangeCost = -3.0}).mRegions.size() ==
          FindKeys(wander).mRegions.size());
}

TEST_CASE("Broken positions, lengths, keys and options are survived") {
    const CChordLite c{CKeyEnh_C, CKeyEnh_Undef, CSemitones{0, 4, 7}};
    const CChordLite g7{CKeyEnh_G, CKeyEnh_Undef, CSemitones{0, 4, 7, 10}};
    const CChordLite odd{{-1234567890, static_cast<TEnh>(99)},
                         {2147483647, static_cast<TEnh>(-99)},
                         CSemitones(~std::uint64_t{0})};
    const double broken[] = {kNan, kInfinity, -kInfinity, -1.0, 0.0, kPosUndef, kPosEnd, 1e-320};
    for (const double first : broken) {
        for (const double second : broken) {
            CHarmAnlsChords chords;
            chords.emplace_back(c, first);
            chords.emplace_back(g7, second);
            chords.emplace_back(odd, 1.0);
            chords.emplace_back(c, second);
            for (const double option : broken) {
                const CKeyOfSong keys = FindKeys(chords, {option, option, option});
                CHECK(std::isfinite(keys.mConfidence));
                REQUIRE_FALSE(keys.mRegions.empty());
                CHECK(keys.mRegions.back().mEnd == 4);
                CHECK(NumeralsOf(chords, keys).size() == 4);
            }
        }
    }
    // Without any length the chords count alike.
    CHarmAnlsChords chords;
    for (const CChordLite& chord : {c, g7, c}) chords.emplace_back(chord, kPosUndef);
    CHECK(NameOf(FindKeys(chords).mKey) == "C Major");
}

}  // namespace
}  // namespace brindle::test
