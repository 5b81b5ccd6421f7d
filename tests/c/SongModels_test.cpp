// SPDX-License-Identifier: MIT
#include "Interface.h"

#include <nlohmann/json.hpp>

#include <cmath>
#include <cstdio>
#include <string>
#include <vector>

namespace brindle::test {
namespace {

using nlohmann::json;
using TSongModel = std::unique_ptr<brindle_song_model, CFree<brindle_song_model_free>>;

/// The model that a call gives; null, and told in `status`, if it gives none.
template <class TCall, class... TArguments>
TSongModel ModelOf(brindle_status status, const TCall& call, TArguments... arguments) {
    brindle_song_model* made = nullptr;
    CHECK(call(arguments..., &made) == status);
    CHECK((made != nullptr) == (status == BRINDLE_OK));
    return TSongModel(made);
}

TSongModel BuiltIn(const char* style = nullptr) {
    return ModelOf(BRINDLE_OK, brindle_song_model_built_in, style);
}

/// What is written, as JSON; the error in brackets if nothing is.
std::string WrittenBy(const TSongModel& model, const brindle_write_options& options,
                      TSong* kept = nullptr) {
    brindle_song* song = nullptr;
    char* text = nullptr;
    if (brindle_song_model_write_song(model.get(), &options, &song, &text) != BRINDLE_OK) {
        CHECK((song == nullptr && text == nullptr));
        return std::string("[") + brindle_last_error() + "]";
    }
    const std::string result = text;
    brindle_free(text);
    TSong owned(song);
    if (kept != nullptr) *kept = std::move(owned);
    return result;
}

TEST_CASE("A model of songs is learned, written, read and joined") {
    const TSong first = ReadSongOf("{title: One}\n{key: G}\n[G]la [C]la [D7]la [G]la");
    const TSong second = ReadSongOf("Am Dm | E7 Am");
    const brindle_song* const songs[] = {first.get(), second.get()};
    const TSongModel model = ModelOf(BRINDLE_OK, brindle_song_model_learn, songs, std::size_t{2});
    CHECK(brindle_song_model_song_count(model.get()) == 2);
    CHECK(brindle_song_model_chord_count(model.get()) == 8);
    const json told = json::parse(TextOf(brindle_song_model_songs_json, model.get()));
    CHECK(told["Songs"][0] ==
          json{{"Title", "One"}, {"Makers", ""}, {"Style", ""}, {"Key", "G major"}, {"Chords", 4}});
    const std::string text = TextOf(brindle_song_model_write, model.get());
    const TSongModel again = ModelOf(BRINDLE_OK, brindle_song_model_read, text.c_str());
    CHECK(TextOf(brindle_song_model_write, again.get()) == text);

    const TSongModel builtIn = BuiltIn();
    const brindle_song_model* const one = model.get();
    const brindle_song_model* const other = builtIn.get();
    const TSongModel joined = ModelOf(BRINDLE_OK, brindle_song_model_join, one, other);
    CHECK(brindle_song_model_song_count(joined.get()) ==
          2 + brindle_song_model_song_count(builtIn.get()));
    const TSongModel hymns = ModelOf(BRINDLE_OK, brindle_song_model_of_style, other, "HYMN");
    CHECK(brindle_song_model_song_count(hymns.get()) == 22);
    (void)ModelOf(BRINDLE_ERROR_NOT_FOUND, brindle_song_model_of_style, one, "hymn");
}

TEST_CASE("A model file that is damaged anywhere is refused, and so are songs that teach nothing") {
    const TSong good = ReadSongOf("C F | G7 C");
    const TSong bad = ReadSongOf("C what");
    const TSong silent = ReadSongOf("{title: None}");
    const brindle_song* const goods[] = {good.get()};
    const TSongModel model = ModelOf(BRINDLE_OK, brindle_song_model_learn, goods, std::size_t{1});
    const std::string text = TextOf(brindle_song_model_write, model.get());
    // The end of the line counts for nothing.
    for (std::size_t at = 0; at + 1 < text.size(); ++at) {
        std::string damaged = text;
        damaged[at] = damaged[at] == '7' ? '8' : '7';
        brindle_song_model* made = nullptr;
        const brindle_status status = brindle_song_model_read(damaged.c_str(), &made);
        const TSongModel owned(made);
        INFO(damaged);
        // White space and names of members that nobody asks for carry nothing.
        if (status == BRINDLE_OK) CHECK(TextOf(brindle_song_model_write, made) == text);
        CHECK((status == BRINDLE_OK || status == BRINDLE_ERROR_INPUT));
        (void)ModelOf(BRINDLE_ERROR_INPUT, brindle_song_model_read, text.substr(0, at).c_str());
    }
    for (const brindle_song* const wrong : {bad.get(), silent.get()}) {
        const brindle_song* const songs[] = {good.get(), wrong};
        (void)ModelOf(BRINDLE_ERROR_INPUT, brindle_song_model_learn, songs, std::size_t{2});
        CHECK(std::string(brindle_last_error()).starts_with("song 1 has "));
    }
    (void)ModelOf(BRINDLE_ERROR_INPUT, brindle_song_model_learn, goods, std::size_t{0});
    const brindle_song* const none[] = {nullptr};
    (void)ModelOf(BRINDLE_ERROR_ARGUMENT, brindle_song_model_learn, none, std::size_t{1});
    (void)ModelOf(BRINDLE_ERROR_FILE, brindle_song_model_read_file, "no such file");
    CHECK(brindle_song_model_write_file(model.get(), ".") == BRINDLE_ERROR_FILE);
}

TEST_CASE("A model file keeps its model") {
    const std::string path = "song-model-of-c.json";
    const TSongModel model = BuiltIn("blues");
    REQUIRE(brindle_song_model_write_file(model.get(), path.c_str()) == BRINDLE_OK);
    const TSongModel again = ModelOf(BRINDLE_OK, brindle_song_model_read_file, path.c_str());
    std::remove(path.c_str());
    CHECK(TextOf(brindle_song_model_write, again.get()) ==
          TextOf(brindle_song_model_write, model.get()));
}

TEST_CASE("A song is written as it was asked for, and by the same seed again") {
    const TSongModel model = BuiltIn();
    brindle_write_options options = brindle_write_options_default();
    REQUIRE(brindle_key_read("Eb", &options.key) == BRINDLE_OK);
    options.form = "ABAB";
    options.bars = 16;
    options.beats_per_bar = 3;
    options.contains = "ii-V-I";
    options.never = "Bdim";
    options.seed = std::uint64_t{1} << 63;
    TSong song;
    const std::string text = WrittenBy(model, options, &song);
    CHECK(WrittenBy(model, options) == text);
    const json told = json::parse(text);
    CHECK(told["Key"] == "Eb major");
    CHECK(told["Seed"].dump() == "9223372036854775808");
    CHECK(told["Form"] == "ABAB");
    CHECK(told["Chords"].back()["Numeral"].get<std::string>().front() == 'I');
    CHECK(brindle_song_bar_count(song.get()) == 16);
    CHECK(brindle_song_section_count(song.get()) == 4);
    CHECK(brindle_song_beats_per_bar(song.get()) == 3.0);
    CHECK(brindle_song_chord_count(song.get()) == told["Chords"].size());
    options.seed = 1;
    CHECK(WrittenBy(model, options) != text);
    // The text of JSON is not asked for.
    brindle_song* plain = nullptr;
    REQUIRE(brindle_song_model_write_song(model.get(), nullptr, &plain, nullptr) == BRINDLE_OK);
    CHECK(brindle_song_bar_count(TSong(plain).get()) == 32);
}

TEST_CASE("What cannot be written is told") {
    const TSongModel model = BuiltIn();
    struct CCase {
        void (*mAsk)(brindle_write_options&);
        const char* mTold;
    };
    using TOptions = brindle_write_options;
    const std::vector<CCase> cases{
        {[](TOptions& o) { o.bars = 257; }, "[a song has 1 to 256 bars]"},
        {[](TOptions& o) { o.bars = SIZE_MAX, o.form = "blues"; }, "[a song has 1 to 256 bars]"},
        {[](TOptions& o) { o.beats_per_bar = 0; }, "[a bar has 1 to 24 beats]"},
        {[](TOptions& o) { o.beats_per_bar = 1 << 30, o.sheet = "C"; },
         "[a bar has 1 to 24 beats]"},
        {[](TOptions& o) { o.most_quoted_bars = NAN; }, "[the longest quote has 0 to 1000 bars]"},
        {[](TOptions& o) { o.order = 0; }, "[histories have 1 to 5 chords]"},
        {[](TOptions& o) { o.key.mode = 7; }, "[the key is none]"},
        {[](TOptions& o) { o.begins = "X"; }, "[begins: X is neither a chord nor a numeral]"},
        {[](TOptions& o) { o.form = "AAA", o.bars = 16; },
         "[a form is letters from A to Z that share 16 bars evenly]"},
        {[](TOptions& o) { o.begins = "C", o.never = "C", o.ends = "F"; },
         "[these wishes cannot be met together: begins C; never C]"},
    };
    for (const CCase& each : cases) {
        brindle_write_options options = brindle_write_options_default();
        each.mAsk(options);
        CHECK(WrittenBy(model, options) == each.mTold);
    }
    brindle_song* song = nullptr;
    CHECK(brindle_song_model_write_song(nullptr, nullptr, &song, nullptr) ==
          BRINDLE_ERROR_ARGUMENT);
    brindle_next_options next = brindle_next_options_default();
    next.order = 6;
    CHECK(TextOf(brindle_song_model_next_json, model.get(), nullptr, std::size_t{0}, &next) ==
          "[an order is 1 to 5]");
}

TEST_CASE("A model foretells its own songs and those of others") {
    const TSongModel model = BuiltIn("blues");
    const brindle_song* const* const own = nullptr;
    const json scores =
        json::parse(TextOf(brindle_song_model_score_json, model.get(), own, std::size_t{0}));
    CHECK(scores["Songs"] == 11);
    CHECK(scores["Orders"].size() == 5);
    const TSong song = ReadSongOf("C . . . | F . . . | G7 . . . | C . . .");
    const brindle_song* const songs[] = {song.get()};
    const brindle_song* const* const given = songs;
    CHECK(json::parse(TextOf(brindle_song_model_score_json, model.get(), given,
                             std::size_t{1}))["Chords"] == 4);
}

}  // namespace
}  // namespace brindle::test
