// SPDX-License-Identifier: MIT
#include "Interface.h"

#include <climits>
#include <string>

namespace brindle::test {
namespace {

std::string TonesOf(const brindle_chord& chord) {
    brindle_tone tones[12];
    std::size_t count = 0;
    REQUIRE(brindle_chord_tones(&chord, tones, &count) == BRINDLE_OK);
    return NamesOf(tones, count);
}

TEST_CASE("A chord symbol is read as root, bass and mask, and written again") {
    struct CCase {
        const char* mSymbol;
        brindle_chord mChord;
        const char* mWritten;
        const char* mTones;
    };
    const CCase cases[] = {
        {"F#m7/C#", {{6, 1}, {1, 1}, 0x489}, "F#m7/C#", "F# A C# E"},
        {"Co7", {{0, 0}, {-1, 127}, 0x249}, "Cdim7", "C Eb Gb Bbb"},
        {"B♭m7♭5", {{10, -1}, {-1, 127}, 0x449}, "Bbm7b5", "Bb Db Fb Ab"},
        {"C7#9", {{0, 0}, {-1, 127}, 0x499}, "C7#9", "C D# E G Bb"},
        {"G7b9", {{7, 0}, {-1, 127}, 0x493}, "G7b9", "G Ab B D F"},
        {"Ab13/C", {{8, -1}, {0, 0}, 0x6B5}, "Ab13/C", "Ab Bb C Db Eb F Gb"},
        {"N.C.", {{-1, 127}, {-1, 127}, 0}, "N.C.", ""},
    };
    for (const auto& [symbol, wanted, written, tones] : cases) {
        const std::string logged(symbol);
        INFO(logged);
        brindle_chord chord;
        REQUIRE(brindle_chord_read(symbol, 0, &chord) == BRINDLE_OK);
        CHECK(std::string(brindle_last_error()).empty());
        CHECK(chord.root.pitch_class == wanted.root.pitch_class);
        CHECK(chord.root.accidental == wanted.root.accidental);
        CHECK(chord.bass.pitch_class == wanted.bass.pitch_class);
        CHECK(chord.bass.accidental == wanted.bass.accidental);
        CHECK(chord.mask == wanted.mask);
        CHECK(TextOf(brindle_chord_write, &chord, nullptr) == written);
        CHECK(TonesOf(chord) == tones);
    }
}

TEST_CASE("Every set of tones over every root is written so that it reads back, in every style") {
    struct CCase {
        brindle_naming mNaming;
        unsigned mFlags;
    };
    for (const auto& [naming, flags] : {CCase{BRINDLE_NAMING_LETTERS, 0},
                                        {BRINDLE_NAMING_GERMAN, BRINDLE_READ_B_IS_B_FLAT},
                                        {BRINDLE_NAMING_SOLFEGE, BRINDLE_READ_SOLFEGE}}) {
        const brindle_style style{naming, 1};
        for (std::uint32_t mask = 1; mask < 0x1000; mask += 14) {
            const brindle_chord chord{{10, -1}, {4, 0}, mask};
            const std::string symbol = TextOf(brindle_chord_write, &chord, &style);
            INFO(symbol);
            brindle_chord read;
            REQUIRE(brindle_chord_read(symbol.c_str(), flags, &read) == BRINDLE_OK);
            CHECK(read.mask == mask);
            CHECK(read.root.pitch_class == 10);
            CHECK(read.bass.pitch_class == 4);
        }
    }
}

TEST_CASE("What is no chord is told with its place") {
    struct CCase {
        const char* mText;
        std::size_t mPosition;
    };
    for (const auto& [text, position] :
         {CCase{"Cmajor7x", 8}, {"H\xFF", 2}, {"", 1}, {"%", 1}, {"♯♯♯", 1}}) {
        const std::string logged(text);
        INFO(logged);
        brindle_chord chord;
        CHECK(brindle_chord_read(text, 0, &chord) == BRINDLE_ERROR_INPUT);
        CHECK(chord.root.pitch_class == BRINDLE_NONE);
        CHECK(brindle_last_error_position() == position);
        CHECK_FALSE(std::string(brindle_last_error()).empty());
    }
}

TEST_CASE("Keys and scales are read and written, with their tones and signs") {
    struct CCase {
        const char* mText;
        const char* mName;
        const char* mTones;
    };
    for (const auto& [text, name, tones] :
         {CCase{"D dorian", "D Dorian", "D E F G A B C"},
          {"E♭ blues minor", "Eb Minor Blues", "Eb Gb Ab A Bb Db"},
          {"F# major", "F# Major", "F# G# A# B C# D# E#"}}) {
        const std::string logged(text);
        INFO(logged);
        brindle_scale scale;
        REQUIRE(brindle_scale_read(text, &scale) == BRINDLE_OK);
        CHECK(TextOf(brindle_scale_write, &scale) == name);
        brindle_tone spelled[12];
        std::size_t count = 0;
        REQUIRE(brindle_scale_tones(&scale, spelled, &count) == BRINDLE_OK);
        CHECK(NamesOf(spelled, count) == tones);
    }
    brindle_key key;
    REQUIRE(brindle_key_read("B♭ minor", &key) == BRINDLE_OK);
    CHECK(TextOf(brindle_key_write, &key) == "Bb Minor");
    CHECK(brindle_key_signature(&key) == -5);
    brindle_key relative;
    REQUIRE(brindle_key_relative(&key, &relative) == BRINDLE_OK);
    CHECK(TextOf(brindle_key_write, &relative) == "Db Major");
    brindle_scale scale;
    REQUIRE(brindle_key_scale(&key, &scale) == BRINDLE_OK);
    CHECK(scale.mask == 0x5AD);

    CHECK(brindle_key_read("Bb mell", &key) == BRINDLE_ERROR_INPUT);
    CHECK(brindle_last_error_position() == 4);
    CHECK(brindle_key_read("B♭ mell", &key) == BRINDLE_ERROR_INPUT);
    CHECK(brindle_last_error_position() == 4);
    CHECK(brindle_scale_read("C nothing", &scale) == BRINDLE_ERROR_INPUT);
    CHECK(TextOf(brindle_key_write, &key) == "[an undefined key]");
    CHECK(brindle_key_relative(&key, &relative) == BRINDLE_ERROR_ARGUMENT);
}

TEST_CASE("Values that were made by hand and make no sense count as undefined") {
    brindle_chord chord{{5, 40}, {99, -99}, 0xFFFFFFFF};
    CHECK(TextOf(brindle_chord_write, &chord, nullptr).front() == 'F');
    chord.root.pitch_class = 12;
    CHECK(TextOf(brindle_chord_write, &chord, nullptr) == "N.C.");
    const brindle_tone tone{-7, 0};
    CHECK(TextOf(brindle_tone_write, &tone, nullptr) == "[an undefined tone]");
    const brindle_key key{{0, 0}, 7};
    CHECK(brindle_key_signature(&key) == 0);
}

TEST_CASE("Notes are named, the likeliest name first") {
    const int notes[] = {52, 55, 57, 60};
    brindle_names* made = nullptr;
    REQUIRE(brindle_names_of_notes(notes, 4, nullptr, &made) == BRINDLE_OK);
    const TNames names(made);
    REQUIRE(brindle_names_count(made) > 1);
    brindle_name name;
    REQUIRE(brindle_names_get(made, 0, &name) == BRINDLE_OK);
    CHECK(name.symbol == std::string("Am7/E"));
    CHECK(name.chord.mask == 0x489);
    REQUIRE(brindle_names_get(made, 1, &name) == BRINDLE_OK);
    CHECK(name.symbol == std::string("C6/E"));
    CHECK(brindle_names_get(made, 99, &name) == BRINDLE_ERROR_ARGUMENT);
    CHECK(name.symbol == std::string());

    brindle_naming_options options = brindle_naming_options_default();
    options.limit = 1;
    options.bass = BRINDLE_BASS_NONE;
    REQUIRE(brindle_names_of_notes(notes, 4, &options, &made) == BRINDLE_OK);
    const TNames one(made);
    CHECK(brindle_names_count(made) == 1);

    for (const int root : {-2, 12, INT_MAX}) {
        options = brindle_naming_options_default();
        options.previous_root = root;
        CHECK(brindle_names_of_notes(notes, 4, &options, &made) == BRINDLE_ERROR_ARGUMENT);
        options = brindle_naming_options_default();
        options.next_root = root;
        CHECK(brindle_names_of_notes(notes, 4, &options, &made) == BRINDLE_ERROR_ARGUMENT);
    }

    const int none[] = {-1};
    CHECK(brindle_names_of_notes(none, 1, nullptr, &made) == BRINDLE_ERROR_ARGUMENT);
    CHECK(made == nullptr);
    REQUIRE(brindle_names_of_notes(nullptr, 0, nullptr, &made) == BRINDLE_OK);
    const TNames empty(made);
    CHECK(brindle_names_count(made) == 0);
}

}  // namespace
}  // namespace brindle::test
