// SPDX-License-Identifier: MIT
#include "Arguments.h"
#include "Bind.h"
#include "SourceSong.h"

#include "brindle/present/ChordProText.h"
#include "brindle/present/WrittenSongText.h"
#include "brindle/song/BuiltInSongs.h"
#include "brindle/song/NextChords.h"
#include "brindle/song/ScoreSongs.h"
#include "brindle/song/SongModelFile.h"
#include "brindle/song/SongRequest.h"
#include "brindle/song/SongStyles.h"

#include <nanobind/stl/shared_ptr.h>
#include <nanobind/stl/string.h>
#include <nanobind/stl/string_view.h>

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace brindle::python {
namespace {

// A model never changes, so that threads share it.
using CModelPtr = std::shared_ptr<CSongModel>;
// What a song told; it is not seen by users.
using CTaughtPtr = std::shared_ptr<CTaughtSong>;

constexpr CWord<TBarPlace> kPlaces[] = {
    {"bar 1", TBarPlace_Bar1}, {"bar 2", TBarPlace_Bar2},    {"bar 3", TBarPlace_Bar3},
    {"bar 4", TBarPlace_Bar4}, {"middle", TBarPlace_Middle}, {"weak", TBarPlace_Weak},
};

CTaughtPtr Teach(const CSourceSong& source) {
    CheckUnderstood(source);
    CTaughtPtr taught;
    {
        const nb::gil_scoped_release released;
        taught = std::make_shared<CTaughtSong>(TeachSong(source.mSong));
    }
    if (taught->mChords.empty()) throw CFault("SongError", "the song has no chords");
    return taught;
}

std::vector<CTaughtSong> ValuesOf(const nb::list& taught) {
    std::vector<CTaughtSong> songs;
    for (const nb::handle song : taught) songs.push_back(*nb::cast<CTaughtPtr>(song));
    return songs;
}

CModelPtr ModelOfSongs(std::vector<CTaughtSong> songs) {
    const nb::gil_scoped_release released;
    return std::make_shared<CSongModel>(std::move(songs));
}

CModelPtr Learned(const nb::list& taught) {
    return ModelOfSongs(ValuesOf(taught));
}

CModelPtr Joined(const CSongModel& model, const CSongModel& other) {
    std::vector<CTaughtSong> songs = model.Songs();
    songs.insert(songs.end(), other.Songs().begin(), other.Songs().end());
    return ModelOfSongs(std::move(songs));
}

CModelPtr BuiltIn() {
    const nb::gil_scoped_release released;
    return std::make_shared<CSongModel>(BuiltInSongModel());
}

CModelPtr OfStyle(const CSongModel& model, std::string_view style) {
    auto made = ModelOfStyle(model, style);
    if (made) return std::make_shared<CSongModel>(std::move(*made));
    throw CFault("ModelError", "no song of the model has this style", std::string(style));
}

CModelPtr OfText(std::string_view text) {
    CSongModelReading reading;
    {
        const nb::gil_scoped_release released;
        reading = ReadSongModel(text);
    }
    if (!reading.mFault.empty()) throw CFault("ModelError", "the text " + reading.mFault);
    return std::make_shared<CSongModel>(std::move(reading.mModel));
}

std::string SongModelTextOf(const CSongModel& model) {
    const nb::gil_scoped_release released;
    return SongModelText(model);
}

nb::tuple ModelSongsOf(const CSongModel& model) {
    const nb::object record = RecordType("ModelSong");
    return TupleOf(model.Songs(), [&](const CTaughtSong& song) {
        return record(song.mTitle, std::string(BuiltInMakersOf(song.mTitle, song.mStyle)),
                      song.mStyle, song.mKey, song.mChords.size());
    });
}

nb::tuple NextOf(const CSongModel& model, const nb::list& chords, const nb::object& key,
                 std::size_t limit, std::string_view place, std::size_t order) {
    CNextChordOptions options;
    options.mKey = KeyOf(key);
    options.mCount = limit;
    options.mPlace = ValueOfWord("place", place, kPlaces);
    options.mOrder = order;
    if (order < 1 || order > CSongModel::kLongestHistory) {
        throw nb::value_error("an order is 1 to 5");
    }
    std::vector<CChordLite> before;
    for (const nb::handle chord : chords) before.push_back(ChordOf(nb::borrow(chord)));
    CNextChords next;
    {
        const nb::gil_scoped_release released;
        next = NextChords(model, before, options);
    }
    const nb::object record = RecordType("NextChord");
    return TupleOf(next.mChords, [&](const CNextChord& each) {
        return record(each.mChord, each.mProbability, each.mNumeral,
                      std::string(NameOf(each.mFunction)), next.mKey);
    });
}

CSongRequestReading RequestOf(const nb::object& key, std::size_t bars, int beatsPerBar,
                              const std::vector<std::string>& words) {
    return ReadSongRequest({KeyOf(key), words[0], bars, beatsPerBar, words[1], words[2], words[3],
                            words[4], words[5]});
}

// The song in a form that is read again, in this process or in another one, with what that form
// does not hold.
CSourceSongPtr SongOfParts(const nb::bytes& source, const nb::list& repeats) {
    auto song = std::make_shared<CSourceSong>();
    song->mOptions.mFormat = TSongFormat_ChordPro;
    song->mSource.assign(source.c_str(), source.size());
    song->mSong = ReadSong(song->mSource, song->mOptions);
    for (const nb::handle each : repeats) {
        const auto parts = nb::cast<nb::tuple>(each);
        song->mSong.mRepeats.push_back({nb::cast<double>(parts[0]), nb::cast<double>(parts[1]),
                                        nb::cast<std::size_t>(parts[2])});
    }
    song->mIsWritten = true;
    return song;
}

nb::object QuoteOf(const CWrittenQuote& quote) {
    if (quote.mBars <= 0.0) return nb::none();
    return RecordType("Quote")(quote.mTitle, quote.mSourceBar, quote.mBar, quote.mBars);
}

nb::object WrittenOf(const CSongModel& model, const nb::object& key, std::size_t bars,
                     int beatsPerBar, const nb::list& wishes, double mostQuoted, std::size_t order,
                     std::uint64_t seed) {
    std::vector<std::string> words;
    for (const nb::handle wish : wishes) words.push_back(nb::cast<std::string>(wish));
    CSongRequestReading request = RequestOf(key, bars, beatsPerBar, words);
    request.mOptions.mMostQuotedBars = mostQuoted;
    request.mOptions.mOrder = order;
    request.mOptions.mSeed = seed;
    const std::string range = RangeFaultOf(request.mOptions);
    if (!range.empty()) throw nb::value_error(range.c_str());
    CWrittenSong written;
    std::string json;
    {
        const nb::gil_scoped_release released;
        written = WriteRequestedSong(model, request);
        if (written.mFault.empty()) {
            json = WrittenSongJson(written, request.mOptions.mForm, seed);
        }
    }
    if (!written.mFault.empty()) throw CFault("ModelError", WrittenSongFault(written));
    const std::string source = ChordProText(written.mSong);
    const auto song =
        SongOfParts(nb::bytes(source.data(), source.size()), RepeatsOf(written.mSong));
    return RecordType("WrittenSong")(song, WrittenSongText(written.mSong),
                                     QuoteOf(written.mLongestQuote), json);
}

nb::tuple ScoresOf(const CSongModel& model, const nb::list& taught) {
    std::vector<CTaughtSong> songs = ValuesOf(taught);
    std::vector<COrderScores> scores;
    {
        const nb::gil_scoped_release released;
        scores = ScoresByOrder(model, songs.empty() ? model.Songs() : songs);
    }
    const nb::object record = RecordType("OrderScore");
    return TupleOf(scores, [&](const COrderScores& score) {
        return record(score.mOrder, score.mWithKeys.BitsPerChord(),
                      score.mWithoutKeys.BitsPerChord());
    });
}

}  // namespace

void BindSongModels(nb::module_& module) {
    nb::class_<CTaughtSong>(module, "_TaughtSong", "What a song tells a model.");
    nb::class_<CSongModel> model(module, "_SongModel", "The model behind SongModel.");
    model.def_static("built_in", BuiltIn);
    model.def_static("learned", Learned, nb::arg("taught"));
    model.def_static("of_text", OfText, nb::arg("text"));
    model.def("joined", Joined, nb::arg("other"));
    model.def("of_style", OfStyle, nb::arg("style"));
    model.def("text", SongModelTextOf);
    model.def_prop_ro("songs", ModelSongsOf,
                      nb::sig("def songs(self, /) -> tuple[brindle._records.ModelSong, ...]"));
    model.def_prop_ro("chord_count", &CSongModel::ChordCount);
    model.def("next_chords", NextOf, nb::arg("chords"), nb::arg("key").none(), nb::arg("limit"),
              nb::arg("place"), nb::arg("order"),
              nb::sig("def next_chords(self, chords: list[Chord | str], key: Key | str | None, "
                      "limit: int, place: str, order: int) -> "
                      "tuple[brindle._records.NextChord, ...]"));
    model.def("write_song", WrittenOf, nb::arg("key").none(), nb::arg("bars"),
              nb::arg("beats_per_bar"), nb::arg("wishes"), nb::arg("most_quoted_bars"),
              nb::arg("order"), nb::arg("seed"),
              nb::sig("def write_song(self, key: Key | str | None, bars: int, beats_per_bar: int, "
                      "wishes: list[str], most_quoted_bars: float, order: int, seed: int) -> "
                      "brindle._records.WrittenSong"));
    model.def("scores", ScoresOf, nb::arg("taught"),
              nb::sig("def scores(self, taught: list[_TaughtSong]) -> "
                      "tuple[brindle._records.OrderScore, ...]"));
    module.def("_teach", Teach, nb::arg("song"), "What a song tells a model.");
    module.def("_written", SongOfParts, nb::arg("source"), nb::arg("repeats"),
               "A written song, of what it was sent as.");
}

}  // namespace brindle::python
