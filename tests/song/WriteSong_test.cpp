// SPDX-License-Identifier: MIT
#include "brindle/song/WriteSong.h"

#include "brindle/analysis/RomanNumeral.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/song/BuiltInSongs.h"
#include "brindle/song/ReadSong.h"
#include "brindle/theory/KeyIntervals.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <array>
#include <map>
#include <span>
#include <string>
#include <vector>

namespace {

using namespace brindle;

const CSongModel& BuiltIn() {
    static const CSongModel model = BuiltInSongModel();
    return model;
}

CSignKeyLite KeyOf(const char* name) {
    return CSignKeyLite(name);
}

CWriteSongOptions OptionsOf(const char* form, std::size_t bars, std::uint64_t seed) {
    CWriteSongOptions options;
    options.mForm = form;
    options.mBars = bars;
    options.mSeed = seed;
    return options;
}

void Wish(CWriteSongOptions& options, TSongWishKind kind, const char* text) {
    const CSongWishReading reading = ReadChordsWish(kind, text, options.mKey);
    REQUIRE_MESSAGE(reading.mFault.empty(), reading.mFault);
    options.mWishes.insert(options.mWishes.end(), reading.mWishes.begin(), reading.mWishes.end());
}

void WishSheet(CWriteSongOptions& options, const char* text) {
    const CSongWishReading reading = ReadSheetWishes(text, options.mBeatsPerBar);
    REQUIRE_MESSAGE(reading.mFault.empty(), reading.mFault);
    options.mWishes.insert(options.mWishes.end(), reading.mWishes.begin(), reading.mWishes.end());
}

/// The symbol that sounds on each beat.
std::vector<std::string> BeatsOf(const CSong& song) {
    std::vector<std::string> beats;
    for (std::size_t ix = 0; ix + 1 < song.mChords.size(); ++ix) {
        const double length = song.mChords[ix + 1].mPosition - song.mChords[ix].mPosition;
        beats.insert(beats.end(), static_cast<std::size_t>(length), song.mSymbols[ix]);
    }
    return beats;
}

int RootAboveTonic(const CSong& song, std::size_t chord) {
    return FoldIntoOctave(song.mChords[chord].mRootKeyEnh.mKeyNr -
                          song.mStatedKey->mRootKeyEnh.mKeyNr);
}

/// A chord as it sounds: its root, tones, bass above the root, and length in ticks.
using TSound = std::array<int, 4>;

std::vector<TSound> SoundsOf(const std::vector<CChordLite>& chords,
                             const std::vector<std::int32_t>& lengths) {
    std::vector<TSound> sounds;
    for (std::size_t ix = 0; ix < chords.size(); ++ix) {
        const int root = chords[ix].mRootKeyEnh.mKeyNr;
        const int bass = chords[ix].HasBassNote() ? chords[ix].mBassKeyEnh.mKeyNr - root : 0;
        const TSound sound = {FoldIntoOctave(root),
                              static_cast<int>(chords[ix].mSemitones.Mask() & 0xFFFU),
                              FoldIntoOctave(bass), lengths[ix]};
        const bool isHeld =
            !sounds.empty() && std::equal(sound.begin(), sound.begin() + 3, sounds.back().begin());
        if (isHeld) {
            sounds.back()[3] += lengths[ix];
        } else {
            sounds.push_back(sound);
        }
    }
    return sounds;
}

std::vector<TSound> SoundsOf(const CTaughtSong& song) {
    std::vector<std::int32_t> lengths;
    for (const CTaughtChord& chord : song.mChords) lengths.push_back(chord.mLength);
    return SoundsOf(WrittenChordsOf(song), lengths);
}

std::vector<TSound> SoundsOf(const CSong& song) {
    std::vector<std::int32_t> lengths;
    for (std::size_t ix = 0; ix + 1 < song.mChords.size(); ++ix) {
        const double beats = song.mChords[ix + 1].mPosition - song.mChords[ix].mPosition;
        lengths.push_back(static_cast<std::int32_t>(beats * kTicksPerBar / song.mBeatsPerBar));
    }
    return SoundsOf({song.mChords.begin(), song.mChords.end() - 1}, lengths);
}

/// How many ticks two rows sound alike from two places on, one of them transposed; 0 for one chord.
std::int32_t TicksAlike(std::span<const TSound> a, std::span<const TSound> b) {
    std::int32_t ticks = 0;
    std::size_t ix = 0;
    for (; ix < std::min(a.size(), b.size()); ++ix) {
        const bool isAlike =
            FoldIntoOctave(a[ix][0] - a[0][0]) == FoldIntoOctave(b[ix][0] - b[0][0]);
        if (!isAlike || !std::equal(a[ix].begin() + 1, a[ix].end(), b[ix].begin() + 1)) break;
        ticks += a[ix][3];
    }
    return ix > 1 ? ticks : 0;
}

/// The longest passage that sounds as one in a learned song, found by comparing all places.
double LongestQuoteByHand(const CSongModel& model, const CSong& song) {
    const std::vector<TSound> row = SoundsOf(song);
    std::int32_t longest = 0;
    for (const CTaughtSong& learned : model.Songs()) {
        const std::vector<TSound> source = SoundsOf(learned);
        for (std::size_t from = 0; from < source.size(); ++from) {
            for (std::size_t at = 0; at < row.size(); ++at) {
                longest = std::max(longest, TicksAlike(std::span(row).subspan(at),
                                                       std::span(source).subspan(from)));
            }
        }
    }
    return static_cast<double>(longest) / kTicksPerBar;
}

/// The names of roots and basses by key number; a second one for a key is an error.
void CheckOneNameForEachKey(const CSong& song) {
    std::map<int, CKeyEnh> names;
    for (std::size_t ix = 0; ix + 1 < song.mChords.size(); ++ix) {
        const CChordLite& chord = song.mChords[ix];
        CAPTURE(song.mSymbols[ix]);
        for (const CKeyEnh& key : {chord.mRootKeyEnh, chord.mBassKeyEnh}) {
            if (key.IsUndef()) continue;
            CHECK(names.try_emplace(key.mKeyNr, key).first->second == key);
        }
        const CChordTextReading read = ReadChordText(song.mSymbols[ix]);
        REQUIRE(read.mKind == TChordText_Chord);
        CHECK(read.mChord.mRootKeyEnh == chord.mRootKeyEnh);
        CHECK(read.mChord.mBassKeyEnh == chord.mBassKeyEnh);
        CHECK(read.mChord.mSemitones.Mask() % 4096 == chord.mSemitones.Mask() % 4096);
    }
}

/// All twelve roots, and basses of all kinds, in songs that change between far keys.
CSongModel ChromaticModel() {
    std::vector<CTaughtSong> songs;
    for (const char* const text :
         {"C | Dbmaj7 | C#dim7 | Dm | A7/C# | Abm | E7/G# | F7/Ab | G7 | C",
          "C | Ebm7 | Ab7 | F#7 | Db | Dbmaj7 | F# | B7 | E | A | D#dim7 | Em | G7 | C",
          "Db | C#m9 | F#7b9 | B6 | G#m | C#m | Ab7 | Db | Db/Cb | Gb | Cb | Ab7 | Db"}) {
        songs.push_back(TeachSong(ReadSong(text)));
    }
    return CSongModel(std::move(songs));
}

}  // namespace

TEST_CASE("A written song has one name for each key, and its symbols read back") {
    const CSongModel chromatic = ChromaticModel();
    std::map<const CSongModel*, int> songs;
    for (const char* const key :
         {"C major",  "G major",  "D major",  "A major",  "E major",  "B major",
          "F# major", "C# major", "F major",  "Bb major", "Eb major", "Ab major",
          "Db major", "Gb major", "Cb major", "A minor",  "E minor",  "C# minor",
          "D# minor", "D minor",  "F minor",  "Bb minor", "Ab minor"}) {
        for (std::uint64_t seed = 1; seed <= 2; ++seed) {
            CAPTURE(key);
            CAPTURE(seed);
            CWriteSongOptions options = OptionsOf("", 16, seed);
            options.mKey = KeyOf(key);
            options.mMostQuotedBars = 0.0;
            for (const CSongModel* const model : {&BuiltIn(), &chromatic}) {
                const CWrittenSong written = WriteSong(*model, options);
                if (!written.mFault.empty()) continue;
                CheckOneNameForEachKey(written.mSong);
                ++songs[model];
            }
        }
    }
    // Few songs of the small model come to an end in sixteen bars.
    CHECK(songs[&BuiltIn()] == 46);
    CHECK(songs[&chromatic] >= 15);
}

TEST_CASE("A written song fills its bars, ends on its tonic and is the same for the same seed") {
    for (const char* const key : {"C major", "Eb major", "F# minor", "A minor"}) {
        for (std::uint64_t seed = 1; seed <= 5; ++seed) {
            CAPTURE(key);
            CAPTURE(seed);
            CWriteSongOptions options = OptionsOf("AABA", 32, seed);
            options.mKey = KeyOf(key);
            const CWrittenSong written = WriteSong(BuiltIn(), options);
            REQUIRE(written.mFault == "");
            CHECK(BeatsOf(written.mSong).size() == 32 * 4);
            CHECK(RootAboveTonic(written.mSong, written.mSong.mChords.size() - 2) == 0);
            CHECK(WriteSong(BuiltIn(), options).mSong.mSymbols == written.mSong.mSymbols);
        }
    }
}

TEST_CASE("Parts of one letter are the same up to their last two bars") {
    for (std::uint64_t seed = 1; seed <= 5; ++seed) {
        const CWrittenSong written = WriteSong(BuiltIn(), OptionsOf("AABA", 32, seed));
        REQUIRE(written.mFault == "");
        const std::vector<std::string> beats = BeatsOf(written.mSong);
        const auto part = [&](std::size_t index, std::size_t bars) {
            const auto begin = beats.begin() + static_cast<std::ptrdiff_t>(index * 32);
            return std::vector<std::string>(begin, begin + static_cast<std::ptrdiff_t>(bars * 4));
        };
        CHECK(part(0, 6) == part(1, 6));
        CHECK(part(1, 8) == part(3, 8));
        CHECK(part(0, 6) != part(2, 6));
    }
}

TEST_CASE("A sheet with gaps is filled and its chords stay where they are") {
    CWriteSongOptions options = OptionsOf("", 8, 3);
    // A chord that no song of the model has, in the middle of a bar.
    WishSheet(options, "C | _ | _ F#m7b5/A | G7 | _ | Abmaj7 . . Db7 | _ | C");
    const CWrittenSong written = WriteSong(BuiltIn(), options);
    REQUIRE(written.mFault == "");
    const std::vector<std::string> beats = BeatsOf(written.mSong);
    REQUIRE(beats.size() == 32);
    const std::map<std::size_t, std::string> wanted = {
        {0, "C"},       {3, "C"},       {10, "F#m7b5/A"}, {11, "F#m7b5/A"}, {12, "G7"}, {15, "G7"},
        {20, "Abmaj7"}, {22, "Abmaj7"}, {23, "Db7"},      {28, "C"},        {31, "C"}};
    for (const auto& [beat, symbol] : wanted) {
        const auto& logged = beat;
        CAPTURE(logged);
        CHECK(beats[beat] == symbol);
    }
}

TEST_CASE("Wishes are met in every key") {
    for (const char* const name : {"C major", "Ab major", "B major", "D minor"}) {
        for (std::uint64_t seed = 1; seed <= 3; ++seed) {
            CAPTURE(name);
            CAPTURE(seed);
            CWriteSongOptions options = OptionsOf("AABA", 32, seed);
            options.mKey = KeyOf(name);
            Wish(options, TSongWish_Begin, "IV");
            Wish(options, TSongWish_End, "V7");
            Wish(options, TSongWish_Contains, "ii-V-I of E");
            Wish(options, TSongWish_Never, "vi");
            const CWrittenSong written = WriteSong(BuiltIn(), options);
            REQUIRE(written.mFault == "");
            const CSong& song = written.mSong;
            CHECK(RootAboveTonic(song, 0) == 5);
            CHECK(song.mSymbols.back() == WriteChordSymbol(*ChordFromNumeral("V7", options.mKey)));
            bool isThere = false;
            for (std::size_t ix = 0; ix + 3 < song.mChords.size(); ++ix) {
                isThere = isThere || (song.mChords[ix].mRootKeyEnh.mKeyNr == 6 &&
                                      song.mChords[ix + 1].mRootKeyEnh.mKeyNr == 11 &&
                                      song.mChords[ix + 2].mRootKeyEnh.mKeyNr == 4);
            }
            CHECK(isThere);
        }
    }
}

TEST_CASE("Chords that are never wanted do not come") {
    for (std::uint64_t seed = 1; seed <= 10; ++seed) {
        CWriteSongOptions options = OptionsOf("AABA", 32, seed);
        Wish(options, TSongWish_Never, "G7 F");
        const CWrittenSong written = WriteSong(BuiltIn(), options);
        REQUIRE(written.mFault == "");
        for (const std::string& symbol : written.mSong.mSymbols) {
            CHECK(symbol.substr(0, symbol.find('/')) != "G7");
            CHECK(symbol.substr(0, symbol.find('/')) != "F");
        }
    }
}

TEST_CASE("The smallest set of wishes that contradict is told") {
    CWriteSongOptions options = OptionsOf("", 8, 1);
    WishSheet(options, "_ | Am | _ | G7");
    Wish(options, TSongWish_Begin, "F");
    Wish(options, TSongWish_Never, "G7 E7");
    CHECK(WriteSong(BuiltIn(), options).mContradiction ==
          std::vector<std::string>{"G7 in bar 4", "G7 E7"});

    options.mWishes.clear();
    WishSheet(options, "C | _ | _ | _");
    Wish(options, TSongWish_Begin, "F");
    CHECK(WriteSong(BuiltIn(), options).mContradiction ==
          std::vector<std::string>{"C in bar 1", "F"});

    // The first two parts of AABA begin alike.
    options.mForm = "AABA";
    options.mBars = 16;
    options.mWishes.clear();
    WishSheet(options, "C | _ | _ | _ | F | _ | _ | _");
    CHECK(WriteSong(BuiltIn(), options).mContradiction ==
          std::vector<std::string>{"C in bar 1", "F in bar 5"});
}

TEST_CASE("No passage longer than the limit sounds as in one song, whatever is wished for") {
    struct CRow {
        const char* mForm;
        std::size_t mBars;
        double mLimit;
        const char* mContains;
        const char* mNever;
    };
    const CRow rows[] = {
        {"", 16, 1.0, "", ""},
        {"AAAA", 16, 4.0, "", ""},
        {"AABA", 32, 4.0, "ii-V-I of F", ""},
        {"", 12, 2.0, "", "Bdim F"},
        {"ABAB", 32, 3.0, "", "Eb"},
        {"", 8, 0.3, "", "Bdim"},
    };
    int written = 0;
    for (const CRow& row : rows) {
        for (std::uint64_t seed = 1; seed <= 5; ++seed) {
            CWriteSongOptions options = OptionsOf(row.mForm, row.mBars, seed);
            options.mMostQuotedBars = row.mLimit;
            if (*row.mContains != 0) Wish(options, TSongWish_Contains, row.mContains);
            if (*row.mNever != 0) Wish(options, TSongWish_Never, row.mNever);
            const CWrittenSong song = WriteSong(BuiltIn(), options);
            if (!song.mFault.empty()) continue;
            ++written;
            INFO(std::string(row.mForm), " ", row.mLimit, " ", seed);
            CHECK(LongestQuoteByHand(BuiltIn(), song.mSong) <= row.mLimit);
            CHECK(LongestQuoteByHand(BuiltIn(), song.mSong) ==
                  doctest::Approx(song.mLongestQuote.mBars));
        }
    }
    CHECK(written >= 22);
}

TEST_CASE("A quote is found in whatever key it is read, and what was wished for is none of ours") {
    // Read in C, and in the middle of a song in F.
    const CSongModel model(
        {TeachSong(ReadSong("C | C | G7 | G7 | C | C | F | G7 | C | C")),
         TeachSong(ReadSong("F | Bb | C7 | F | F | F | C7 | C7 | F | F | Bb | F"))});
    for (const char* const sheet :
         {"C | C | G7 | G7 | C | C | _ | _", "_ | _ | D | D | A7 | A7 | D | D"}) {
        CWriteSongOptions options = OptionsOf("", 8, 1);
        WishSheet(options, sheet);
        options.mMostQuotedBars = 0.0;
        options.mEndsOnTonic = false;
        const CWrittenSong free = WriteSong(model, options);
        REQUIRE(free.mFault == "");
        CHECK(free.mLongestQuote.mBars >= 6.0);
        CHECK(free.mLongestQuote.mBars == LongestQuoteByHand(model, free.mSong));
        options.mMostQuotedBars = 5.0;
        const CWrittenSong song = WriteSong(BuiltIn(), options);
        REQUIRE(song.mFault == "");
        CHECK(song.mLongestQuote.mBars == LongestQuoteByHand(BuiltIn(), song.mSong));
    }
    CWriteSongOptions options = OptionsOf("", 8, 1);
    options.mMostQuotedBars = 2.0;
    options.mEndsOnTonic = false;
    WishSheet(options, "F | Bb | C7 | F | F | F | C7 | F");
    const CWrittenSong wished = WriteSong(model, options);
    CHECK(wished.mFault == "");
    CHECK(wished.mLongestQuote.mBars == 6.0);
}

TEST_CASE("A song ends at rest on a strong beat, and the first of two parts leads on") {
    int late = 0;
    for (const char* const name : {"C major", "D minor"}) {
        for (std::uint64_t seed = 1; seed <= 12; ++seed) {
            CAPTURE(name);
            CAPTURE(seed);
            CWriteSongOptions options = OptionsOf("AABA", 32, seed);
            options.mKey = KeyOf(name);
            // A limit spares late ends, which few songs have.
            options.mMostQuotedBars = 0.0;
            const CSong song = WriteSong(BuiltIn(), options).mSong;
            REQUIRE(!song.mSymbols.empty());
            const std::string tonic = BeatsOf(song).back();
            CHECK(tonic.substr(0, 2) != "C7");
            const CHarmAnlsChordWithPos& last = *(song.mChords.end() - 2);
            late += last.mPosition > 124.0 ? 1 : 0;
            std::size_t ofFirst = 0;
            while (song.mChords[ofFirst + 1].mPosition < 32.0) ++ofFirst;
            const bool isSeventh = song.mSymbols[ofFirst].find('7') != std::string::npos;
            CHECK((RootAboveTonic(song, ofFirst) != 0 || isSeventh));
        }
    }
    CHECK(late <= 5);
}

TEST_CASE("A wished-for numeral takes the sevenths of its key, and a forbidden one all") {
    struct CRow {
        TSongWishKind mKind;
        const char* mText;
        const char* mFitting;
        const char* mUnfit;
    };
    const CRow rows[] = {
        {TSongWish_Contains, "ii-V-I of Bb", "Cm9 F13 Bbmaj7", "C Fmaj7 Bb7"},
        {TSongWish_Contains, "iv V i of A minor", "Dm6 E7b9 Am(maj7)", "D Emaj7 A"},
        {TSongWish_Contains, "I bVII of C", "C6 Bb7", "C7 Bbm"},
        {TSongWish_Contains, "ii7 V7 of C", "Dm7 G7", "Dm G9"},
        {TSongWish_Never, "I of C", "C7", "Cm"},
    };
    for (const CRow& row : rows) {
        INFO(std::string(row.mText));
        const auto read = ReadChordsWish(row.mKind, row.mText, KeyOf("C major"));
        REQUIRE(read.mFault == "");
        const auto fits = [&](const char* chords) {
            std::string answer;
            const CSong song = ReadSong(chords);
            for (std::size_t i = 0; i < read.mWishes[0].mChords.size(); ++i) {
                const CChordLite& chord = song.mChords[i];
                const int root = chord.mRootKeyEnh.mKeyNr;
                const std::uint64_t mask = chord.mSemitones.Mask();
                answer += read.mWishes[0].mChords[i].Fits(root, root, mask) ? 'y' : 'n';
            }
            return answer;
        };
        CHECK(fits(row.mFitting).find('n') == std::string::npos);
        CHECK(fits(row.mUnfit).find('y') == std::string::npos);
    }
}

TEST_CASE("What cannot be written says why") {
    CHECK(WriteSong(CSongModel{}, OptionsOf("", 8, 1)).mFault == "the model has learned nothing");
    CHECK(WriteSong(BuiltIn(), OptionsOf("AAB", 32, 1)).mFault ==
          "a form is letters from A to Z that share 32 bars evenly");
    CHECK(WriteSong(BuiltIn(), OptionsOf("", 0, 1)).mFault == "a song has 1 to 256 bars");
    CHECK(ReadSheetWishes("C | X", 4).mFault == "bar 2: X is no chord; a gap is _");
    CHECK(ReadSheetWishes("C F G", 4).mFault == "bar 1: 3 words do not share its 4 beats evenly");
    CHECK(ReadChordsWish(TSongWish_Contains, "ii-V-I of X", KeyOf("C major")).mFault ==
          "ii-V-I of X: there is no such key");
}
