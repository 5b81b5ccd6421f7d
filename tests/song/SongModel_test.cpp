// SPDX-License-Identifier: MIT
#include "brindle/song/CSongModel.h"

#include "brindle/analysis/RomanNumeral.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/song/BuiltInSongs.h"
#include "brindle/song/NextChords.h"
#include "brindle/song/ReadSong.h"
#include "brindle/song/ScoreSongs.h"
#include "brindle/song/SongModelFile.h"

#include <doctest/doctest.h>

#include <numeric>
#include <string>
#include <vector>

namespace {

using namespace brindle;

CChordLite Chord(const char* symbol) {
    return ReadChordText(symbol).mChord;
}

CTaughtSong Taught(const std::string& text) {
    CSongOptions options;
    options.mEven = true;
    return TeachSong(ReadSong(text, options));
}

}  // namespace

TEST_CASE("The same song in two keys is learned as one") {
    const CTaughtSong inC = Taught("C | Am | Dm7 | G7 | C | Am | F Fm | C");
    const CTaughtSong inEb = Taught("Eb | Cm | Fm7 | Bb7 | Eb | Cm | Ab Abm | Eb");
    REQUIRE(inC.mChords.size() == 9);
    CHECK(inC.mChords == inEb.mChords);
    CHECK(inC.mChords[7].mBegin == 6 * kTicksPerBar + kTicksPerBar / 2);
    CHECK(inC.mChords[7].mLength == kTicksPerBar / 2);
    CHECK(inC.mChords.back().mEndsSection);
}

TEST_CASE("The upbeat of a song that is learned ends at the first bar line") {
    const CTaughtSong song =
        TeachSong(ReadSong("Time Signature: 3/4\nm0 b3 C: V\nm1 I\nm2 V\nm3 I"));
    REQUIRE(song.mChords.size() == 4);
    CHECK(song.mChords[0].mBegin == -kTicksPerBar / 3);
    CHECK(song.mChords[1].mBegin == 0);
}

TEST_CASE("A taught song is written again as it was, with its changes of key") {
    const std::string text = "C | Am | Dm7 G7 | C | Fm7 | Bb7 | Ebmaj7 | Abmaj7 | Dm7b5 G7 | C";
    CSongOptions options;
    options.mEven = true;
    const CSong song = ReadSong(text, options);
    const std::vector<CChordLite> written = WrittenChordsOf(TeachSong(song));
    REQUIRE(written.size() + 1 == song.mChords.size());
    for (std::size_t ix = 0; ix < written.size(); ++ix) {
        CHECK(WriteChordSymbol(written[ix]) == song.mSymbols[ix]);
    }
}

TEST_CASE("Codes of chords read back, and what is no code is none") {
    const CSongModel model = BuiltInSongModel();
    for (const CTaughtSong& song : model.Songs()) {
        for (const CTaughtChord& chord : song.mChords) {
            CHECK(CRelativeChord::FromCode(chord.mChord.Code()) == chord.mChord);
        }
    }
    for (const std::uint32_t code : {0U, 0x1000U, 0xC0091U, 0xC00091U, 0xD091U, 0x2000091U}) {
        CHECK_FALSE(CRelativeChord::FromCode(code));
    }
}

TEST_CASE("Probabilities behind any history leave little and never too much") {
    const CSongModel model = BuiltInSongModel();
    const auto size = static_cast<std::int32_t>(model.VocabularySize());
    std::vector<double> probabilities;
    for (std::int32_t id = 0; id < size; ++id) {
        const std::vector<std::int32_t> history = {CSongModel::StartId(false), 0, id % 7, id};
        for (std::size_t order = 0; order <= CSongModel::kLongestHistory; ++order) {
            model.Predict(history, static_cast<TBarPlace>(id % 6), order, probabilities);
            const double sum = std::accumulate(probabilities.begin(), probabilities.end(), 0.0);
            CHECK(sum <= 1.0 + 1e-9);
            CHECK(sum > 0.8);
        }
    }
}

TEST_CASE("What followed in the songs is the likeliest") {
    const CSongModel model({Taught("C | F | G7 | C | C | F | G7 | C | C | Am | G7 | C")});
    const CNextChords next =
        NextChords(model, std::vector{Chord("Ab"), Chord("Bb7")}, {CSignKeyLite("Eb major"), 3});
    REQUIRE(next.mChords.size() == 3);
    CHECK(WriteChordSymbol(next.mChords[0].mChord) == "Eb");
    CHECK(next.mChords[0].mNumeral == "I");
    CHECK(next.mChords[0].mFunction == THarmFunction_Tonic);
    CHECK(next.mChords[0].mProbability > 0.5);
    CHECK(next.mChords[1].mProbability < next.mChords[0].mProbability);
}

TEST_CASE("What may come is told in the key, and in minor it is what songs in minor have") {
    const CSongModel model = BuiltInSongModel();
    struct CRow {
        const char* mKey;
        std::vector<const char*> mChords;
    };
    const CRow rows[] = {{"A minor", {"Am", "F"}},    {"C minor", {}},
                         {"A minor", {"Dm7", "G7"}},  {"C minor", {"G7sus4", "Ebmaj7#11"}},
                         {"Bb major", {"Dm7", "G7"}}, {"C major", {}},
                         {"C major", {"Dm7", "G7"}},  {"F# minor", {"C#7"}},
                         {"Eb minor", {"Abm", "Bb7"}}};
    for (const CRow& row : rows) {
        std::vector<CChordLite> chords;
        for (const char* const symbol : row.mChords) chords.push_back(Chord(symbol));
        const CSignKeyLite key(row.mKey);
        const CNextChords next = NextChords(model, chords, {key, 8});
        REQUIRE(next.mChords.size() == 8);
        CHECK(next.mKey == key);
        const bool isMinor = key.mSignKeyType == TSignKeyType_Minor;
        // A tonic in the mode of the key is likelier than the other one.
        double inMode = 0.0;
        double inOther = 0.0;
        for (const CNextChord& chord : next.mChords) {
            INFO(std::string(row.mKey), " ", chord.mNumeral);
            const auto read = ChordFromNumeral(chord.mNumeral, key);
            REQUIRE(read);
            CHECK(read->mRootKeyEnh.mKeyNr == chord.mChord.mRootKeyEnh.mKeyNr);
            if (chord.mChord.mRootKeyEnh.mKeyNr != key.mRootKeyEnh.mKeyNr) continue;
            const bool isMinorChord = (chord.mChord.mSemitones.Mask() & 0b11000U) == 0b1000U;
            (isMinorChord == isMinor ? inMode : inOther) += chord.mProbability;
        }
        INFO(std::string(row.mKey));
        CHECK(inMode > inOther);
    }
}

TEST_CASE("A file of a model reads back, and a damaged one is refused") {
    const CSongModel model = BuiltInSongModel("hymn");
    const std::string text = SongModelText(model);
    const CSongModelReading read = ReadSongModel(text);
    REQUIRE(read.mFault == "");
    CHECK(read.mModel.Songs() == model.Songs());
    CHECK(SongModelText(read.mModel) == text);
    // Any byte that is another one, and any end that is missing.
    for (std::size_t at = 0; at + 1 < text.size(); at += 41) {
        std::string damaged = text;
        damaged[at] = damaged[at] == '1' ? '2' : '1';
        const CSongModelReading other = ReadSongModel(damaged);
        CHECK_MESSAGE((!other.mFault.empty() || other.mModel.Songs() == model.Songs()), at);
        CHECK_FALSE(ReadSongModel(text.substr(0, at)).mFault.empty());
    }
    CHECK(ReadSongModel(R"({"BrindleSongModel":2,"Sum":"","Songs":[]})").mFault ==
          "is a song model of version 2, and this program reads version 1");
    CHECK(ReadSongModel("{}").mFault == "is no song model");
}

TEST_CASE("Songs are foretold better by their keys than without, and by longer histories") {
    const CSongModel model = BuiltInSongModel();
    std::vector<CTaughtSong> inAllKeys = model.Songs();
    for (std::size_t ix = 0; ix < inAllKeys.size(); ++ix) {
        CSignKeyLite& key = inAllKeys[ix].mKey;
        key = KeyAbove(key, static_cast<int>(ix % 12), key.mSignKeyType == TSignKeyType_Minor);
    }
    const CSongModel moved(inAllKeys);
    double shorter = 7.0;
    for (std::size_t order = 1; order <= CSongModel::kLongestHistory; ++order) {
        const auto bits = [order](const CSongModel& of, bool withKeys) {
            return SumOfScores(ScoreSongs(of, of.Songs(), order, withKeys)).BitsPerChord();
        };
        const double relative = bits(model, true);
        CAPTURE(order);
        CHECK(relative < 0.88 * bits(model, false));
        CHECK(relative < 0.8 * bits(moved, false));
        CHECK(bits(moved, true) == doctest::Approx(relative));
        CHECK(relative < shorter + 0.01);
        shorter = relative;
    }
    CHECK(shorter < 5.0);
}

TEST_CASE("A song that was learned is foretold as if it had not been") {
    const std::string text = "C | E7 | Am | D7 | G7 | Bb | A7 | Dm | G7 | C";
    const std::vector<CTaughtSong> song = {Taught(text)};
    std::vector<CTaughtSong> songs = BuiltInSongModel().Songs();
    const double without = SumOfScores(ScoreSongs(CSongModel(songs), song, 3)).mBits;
    songs.push_back(song.front());
    CHECK(SumOfScores(ScoreSongs(CSongModel(songs), song, 3)).mBits == doctest::Approx(without));
}
