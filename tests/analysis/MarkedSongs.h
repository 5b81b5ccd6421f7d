// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <string_view>

namespace brindle::test {

/// A progression whose keys a musician marked by ear and score.
struct CMarkedSong {
    std::string_view mName;
    /// The key of the whole.
    std::string_view mKey;
    /// The chords, two steps a bar, each region behind its key in brackets.
    std::string_view mMarked;
    /// What the analysis finds instead, in the same form; empty where it finds the marks. The marks
    /// are not to be moved to what is found.
    std::string_view mFoundKey = {};
    std::string_view mFound = {};
};

// Textbook progressions and songs of the public domain. A passing dominant that does not cadence in
// a key of its own belongs to the key around it, and a minor second degree before the dominant of a
// new key belongs to the new key.
// clang-format off
inline constexpr auto kMarkedSongs = std::to_array<CMarkedSong>({
    // Blues
    {"Twelve-bar blues", "C Major",
     "[C Major] C7 | F7 | C7 | C7 | F7 | F7 | C7 | C7 | G7 | F7 | C7 | G7 ."},
    {"Blues with a turnaround", "F Major",
     "[F Major] F7 | Bb7 | F7 | Cm7 F7 | Bb7 | Bdim7 | F7 | D7 | Gm7 | C7 | F7 D7 | Gm7 C7"},
    {"Minor blues", "A Minor",
     "[A Minor] Am7 | Dm7 | Am7 | Am7 | Dm7 | Dm7 | Am7 | Am7 | F7 | E7 | Am7 | E7 ."},

    // Circles of fifths
    {"Rhythm changes", "Bb Major",
     "[Bb Major] Bb Gm7 | Cm7 F7 | Bb Gm7 | Cm7 F7 | Fm7 Bb7 | Eb Ebm | Bb Gm7 | Cm7 F7 "
     "| D7 | D7 | G7 | G7 | C7 | C7 | F7 | F7 "
     "| Bb Gm7 | Cm7 F7 | Bb Gm7 | Cm7 F7 | Fm7 Bb7 | Eb Ebm | Bb F7 | Bb ."},
    {"Diatonic circle in major", "C Major",
     "[C Major] Cmaj7 | Fmaj7 | Bm7b5 | Em7 | Am7 | Dm7 | G7 | Cmaj7 ."},
    {"Diatonic circle in minor", "A Minor",
     "[A Minor] Am7 | Dm7 | G7 | Cmaj7 | Fmaj7 | Bm7b5 | E7 | Am .",
     {},
     "[C Major] Am7 | Dm7 | G7 | Cmaj7 | [A Minor] Fmaj7 | Bm7b5 | E7 | Am ."},
    {"Relative keys by fifths", "G Minor",
     "[Bb Major] Cm7 | F7 | Bbmaj7 | Ebmaj7 | [G Minor] Am7b5 | D7 | Gm | Gm "
     "| [Bb Major] Cm7 | F7 | Bbmaj7 | Ebmaj7 | [G Minor] Am7b5 | D7 | Gm | Gm .",
     "Bb Major",
     "[Bb Major] Cm7 | F7 | Bbmaj7 | Ebmaj7 | Am7b5 | D7 | Gm | Gm | Cm7 | F7 | Bbmaj7 | Ebmaj7 "
     "| [G Minor] Am7b5 | D7 | Gm | Gm ."},
    {"Ragtime chain", "C Major",
     "[C Major] C | A7 | D7 | G7 | C | A7 | D7 G7 | C ."},
    {"Salty Dog", "G Major",
     "[G Major] G | E7 | A7 | A7 | D7 | D7 | G | D7 | G | E7 | A7 | A7 | D7 | D7 | G | G ."},

    // Songs that stay in major
    {"Amazing Grace", "G Major",
     "[G Major] G | G7 | C | G | G | Em | D | D7 | G | G7 | C | G | Em | D7 | G | G ."},
    {"When the Saints Go Marching In", "F Major",
     "[F Major] F | F | F | F | F | F | C7 | C7 | F | F7 | Bb | Bbm | F | C7 | F | F ."},
    {"Canon on a ground", "D Major",
     "[D Major] D A | Bm F#m | G D | G A | D A | Bm F#m | G D | G A | D ."},
    {"Silent Night", "C Major",
     "[C Major] C | C | G7 | C | F | C | F | C | G7 | C | C G7 | C ."},
    {"Old Joe Clark", "A Major",
     "[A Major] A | A | A | G | A | A | A G | A | A | A | A | G | A | A | A G | A .",
     {},
     "[D Major] A | A | A | G | A | A | A G | A | A | A | A | G | A | A | A G | A ."},
    {"The Star-Spangled Banner, first strain", "Bb Major",
     "[Bb Major] Bb F | Gm D7 | Gm C7 | F | Bb F7 | Bb Eb | Bb F7 | Bb ."},

    // Tunes in minor
    {"House of the Rising Sun", "A Minor",
     "[A Minor] Am C | D F | Am C | E E | Am C | D F | Am E | Am E | Am ."},
    {"Greensleeves", "A Minor",
     "[A Minor] Am | G | Am | E | Am | G | Am E | Am | C | G | Am | E | C | G | Am E | Am ."},
    {"God Rest Ye Merry", "E Minor",
     "[E Minor] Em | C B7 | Em | C B7 | Am G | Em D | G B7 | Em D | G B7 | Em D | Em ."},
    {"La Folia", "D Minor",
     "[D Minor] Dm | A7 | Dm | C | F | C | Dm | A7 | Dm | A7 | Dm | C | F | C | Dm A7 | Dm ."},
    {"Scarborough Fair", "A Minor",
     "[A Minor] Am | Am | G | Am | C | Am | D | Am | Am | C | C | G | Am | G | G | Am ."},
    {"Drunken Sailor", "D Minor",
     "[D Minor] Dm | Dm | C | C | Dm | Dm | C | Dm | Dm | Dm | C | C | Dm | Dm | C | Dm ."},
    {"Andalusian cadence", "A Minor",
     "[A Minor] Am | G | F | E | Am | G | F | E | Am ."},
    {"Lament with the Neapolitan chord", "C Minor",
     "[C Minor] Cm | Cm/Bb | Ab | G7 | Cm | Fm | Db/F | G7 | Cm ."},

    // Songs that modulate
    {"Hymn to the dominant and back (Nicaea)", "D Major",
     "[D Major] D Bm | A D | G | D | [A Major] A D | A/C# A | Bm E7 | A "
     "| [D Major] D Bm | A D | G | D | Bm F#m | G D | Em7 A7 | D .",
     {},
     "[D Major] D Bm | A D | G | D | A D | A/C# A | Bm E7 | A | D Bm | A D | G | D | Bm F#m | G D "
     "| Em7 A7 | D ."},
    {"Hymn by way of the relative minor", "C Major",
     "[C Major] C F | C G | Am F | C G7 | C | [A Minor] E7 Am | Dm Am | E E7 | Am "
     "| [C Major] G C | F C | Dm7 G7 | C ."},
    {"Chorale to the dominant and the second degree", "F Major",
     "[F Major] F Bb | F C | F | [C Major] C F | C G7 | C "
     "| [G Minor] D7 | Gm Cm | D7 | Gm | [F Major] C7 | F Bb | C7 | F .",
     {},
     "[F Major] F Bb | F C | F | C F | C G7 | C | D7 | Gm Cm | D7 | Gm | C7 | F Bb | C7 | F ."},
    {"Cadences down in whole tones", "D Major",
     "[D Major] Dmaj7 | Dmaj7 | [C Major] Dm7 | G7 | Cmaj7 | Cmaj7 | [Bb Major] Cm7 | F7 | Bbmaj7 "
     "| Bbmaj7 | [D Major] Em7 | A7 | Dmaj7 | Dmaj7 ."},
    {"Cycle of major thirds", "B Major",
     "[B Major] Bmaj7 [G Major] D7 | Gmaj7 [Eb Major] Bb7 | Ebmaj7 | [G Major] Am7 D7 "
     "| Gmaj7 [Eb Major] Bb7 | Ebmaj7 [B Major] F#7 | Bmaj7 ."},
    {"Last verse a semitone up", "C Major",
     "[C Major] C Am | F G | C Am | F G | C | [Db Major] Ab7 | Db Bbm | Gb Ab | Db Bbm | Gb Ab "
     "| Db ."},
    {"Minor verse, major refrain on the same tonic", "A Minor",
     "[A Minor] Am | E7 | Am | Dm | Am | E7 | Am | Am "
     "| [A Major] A | D | A | E7 | A | D | A E7 | A ."},
});
// clang-format on

}  // namespace brindle::test
