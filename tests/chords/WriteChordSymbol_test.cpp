// SPDX-License-Identifier: MIT
#include "brindle/chords/WriteChordSymbol.h"

#include "brindle/chords/CChordTypes.h"

#include <doctest/doctest.h>

#include <set>
#include <string>
#include <vector>

namespace brindle::test {
namespace {

// All notes that can be written with two signs at most.
std::vector<CKeyEnh> AllNotes() {
    std::vector<CKeyEnh> notes;
    for (const int natural : {0, 2, 4, 5, 7, 9, 11}) {
        for (int signs = -2; signs <= 2; ++signs) {
            notes.push_back({(natural + signs + 12) % 12, static_cast<TEnh>(TEnh_n + signs)});
        }
    }
    return notes;
}

std::vector<CChordSymbolStyle> AllStyles() {
    std::vector<CChordSymbolStyle> styles;
    for (const auto notes : {TNoteNaming_Letters, TNoteNaming_German, TNoteNaming_Solfege}) {
        for (const bool isUnicode : {false, true}) styles.push_back({notes, isUnicode});
    }
    return styles;
}

// Empty if the chord comes back, else what was written.
std::string Lost(const CChordLite& chord, const CChordSymbolStyle& style) {
    const std::string text = WriteChordSymbol(chord, style);
    const CChordTextReading reading = ReadChordText(text, ReadingPrefsOf(style));
    const CChordLite& read = reading.mChord;
    const bool isBack =
        reading.mKind == TChordText_Chord && read.mRootKeyEnh == chord.mRootKeyEnh &&
        read.mBassKeyEnh == chord.mBassKeyEnh && read.mSemitones == chord.mSemitones;
    return isBack ? "" : text;
}

TEST_CASE("Chords are written as people type them") {
    struct CCase {
        CKeyEnh mRoot;
        CSemitones mTones;
        const char* mText;
    };
    const CKeyEnh c{0, TEnh_n};
    const CKeyEnh e{4, TEnh_n};
    const CKeyEnh g{7, TEnh_n};
    const CKeyEnh b{11, TEnh_n};
    const CCase cases[] = {
        {c, {0, 4, 7}, "C"},
        {c, {0, 3, 7}, "Cm"},
        {c, {0, 3, 6}, "Cdim"},
        {c, {0, 3, 6, 9}, "Cdim7"},
        {c, {0, 4, 8}, "Caug"},
        {c, {0, 7}, "C5"},
        {c, {0, 5, 7}, "Csus4"},
        {c, {0, 2, 7}, "Csus2"},
        {c, {0, 2, 4, 7}, "Cadd9"},
        {c, {0, 2, 4, 7, 9}, "C69"},
        {c, {0, 2, 3, 7, 9}, "Cm69"},
        {c, {0, 2, 4, 9}, "C69no5"},
        {c, {0, 4, 7, 11}, "Cmaj7"},
        {c, {0, 2, 4, 6, 7, 11}, "Cmaj9#11"},
        {c, {0, 4, 8, 10}, "C7#5"},
        {c, {0, 2, 4, 8, 10}, "C9#5"},
        {c, {0, 3, 4, 7, 8, 10}, "C7#9b13"},
        {c, {0, 2, 4, 5, 7, 9, 10}, "C13"},
        {c, {0, 1, 4, 7}, "C(b9)"},
        {c, {0, 4, 10}, "C7no5"},
        {c, {0, 4, 7, 10, 11}, "C7(maj7)"},
        {c, {0, 1, 4, 5, 7, 9, 10}, "C13b9"},
        {g, {0, 3, 4, 5, 7, 9, 10}, "G13#9"},
        {e, {0, 1, 4, 7, 10}, "E7b9"},
        {e, {0, 2, 5, 7, 10}, "E9sus4"},
        {e, {0, 2, 4, 7, 9, 10}, "E9add13"},
        {g, {0, 3, 7, 11}, "Gm(maj7)"},
        {b, {0, 3, 6, 10}, "Bm7b5"},
        {{1, TEnh_b}, {0, 4, 7, 10}, "Db7"},
        {{0, TEnh_bb}, {0, 4, 7, 9}, "Dbb 6"},
    };
    for (const auto& [root, tones, text] : cases) {
        CHECK(WriteChordSymbol({root, CKeyEnh_Undef, tones}) == text);
    }
    CHECK(WriteChordSymbol({b, {9, TEnh_n}, {0, 3, 6, 10}}) == "Bm7b5/A");
    CHECK(WriteChordSymbol(CChordLite_Undef) == "N.C.");
}

TEST_CASE("A B flat is a B for Germans, and signs and syllables are those of the style") {
    const CChordLite chord({10, TEnh_b}, {11, TEnh_n}, {0, 3, 6, 10});
    CHECK(WriteChordSymbol(chord) == "Bbm7b5/B");
    CHECK(WriteChordSymbol(chord, {TNoteNaming_German}) == "Bm7b5/H");
    CHECK(WriteChordSymbol(chord, {TNoteNaming_Solfege}) == "Sibm7b5/Si");
    CHECK(WriteChordSymbol(chord, {TNoteNaming_Letters, true}) == "B\u266Dm7\u266D5/B");
}

TEST_CASE("Every set of tones has a symbol of its own, and reads back on all roots in all styles") {
    std::set<std::string> suffixes;
    for (std::uint64_t mask = 0; mask < 4096; ++mask) {
        suffixes.insert(ChordSymbolSuffix(CSemitones(mask)));
    }
    CHECK(suffixes.size() == 4096);
    std::size_t count = 0;
    for (const CChordSymbolStyle& style : AllStyles()) {
        const bool isPlain = style.mNotes == TNoteNaming_Letters && !style.mUnicodeSigns;
        for (const CKeyEnh& root : AllNotes()) {
            for (std::uint64_t mask = 0; mask < 4096; mask += isPlain ? 1 : 7) {
                const std::string lost = Lost({root, CKeyEnh_Undef, CSemitones(mask)}, style);
                if (!lost.empty()) FAIL_CHECK(lost << " for the tones " << mask);
                ++count;
            }
        }
    }
    CHECK(count > 35 * 4096);
}

TEST_CASE("Every type of the catalogue reads back over every bass") {
    for (const CChordType& type : _s_chordTypes().BuiltIn()) {
        CSemitones tones;
        for (const int intvl : type.mIntvls) tones.AddIntvl(intvl);
        for (const CKeyEnh& root : AllNotes()) {
            for (const CKeyEnh& bass : AllNotes()) {
                if (bass.mKeyNr == root.mKeyNr) continue;
                const std::string lost = Lost({root, bass, tones}, {});
                if (!lost.empty()) FAIL_CHECK(lost << " for " << type.mName);
            }
        }
    }
}

TEST_CASE("A bass on the root's key is left out, and no note has three signs") {
    CHECK(WriteChordSymbol({{0, TEnh_n}, {0, TEnh_s}, {0, 4, 7}}) == "C");
    CHECK(WriteNoteName({9, TEnh_bbb}) == "A");
    CHECK(WriteNoteName({1, TEnh_bbb}) == "Db");
    CHECK(WriteNoteName(CKeyEnh_Undef).empty());
}

}  // namespace
}  // namespace brindle::test
