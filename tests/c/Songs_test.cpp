// SPDX-License-Identifier: MIT
#include "Interface.h"
#include "tests/support/ScratchFolder.h"

#include <fmt/format.h>
#include <nlohmann/json.hpp>

#include <cmath>
#include <fstream>
#include <string>

namespace brindle::test {
namespace {

constexpr std::string_view kSong =
    "{title: Two Keys}\n{key: C}\n[Dm7]one [G7]two [C]three [A7]four [Dm]five";

/// "Dm7 ii7 subdominant>1; ..."
std::string ReadingOf(const TAnalysis& analysis) {
    std::string text;
    for (std::size_t i = 0; i < brindle_analysis_chord_count(analysis.get()); ++i) {
        brindle_chord_reading chord;
        REQUIRE(brindle_analysis_chord(analysis.get(), i, &chord) == BRINDLE_OK);
        text +=
            fmt::format("{}{}@{} {} {}>{}", i > 0 ? "; " : "", chord.symbol, chord.position,
                        chord.numeral, brindle_function_name(chord.function), chord.resolves_to);
    }
    return text;
}

TEST_CASE("A song tells its chords, bars and what it states") {
    const TSong song = ReadSongOf(kSong);
    CHECK(brindle_song_has_fault(song.get()) == 0);
    CHECK(brindle_song_format(song.get()) == BRINDLE_FORMAT_CHORD_PRO);
    CHECK(brindle_song_title(song.get()) == std::string("Two Keys"));
    REQUIRE(brindle_song_chord_count(song.get()) == 5);
    brindle_song_chord chord;
    REQUIRE(brindle_song_chord_at(song.get(), 1, &chord) == BRINDLE_OK);
    CHECK(chord.symbol == std::string("G7"));
    CHECK(chord.position == 1.0);
    CHECK(chord.length == 1.0);
    CHECK(chord.chord.mask == 0x491);
    CHECK(brindle_song_chord_at(song.get(), 5, &chord) == BRINDLE_ERROR_ARGUMENT);
    CHECK(std::string(brindle_last_error()) == "there is no element 5 of 5");
    brindle_key key;
    REQUIRE(brindle_song_stated_key(song.get(), &key) == BRINDLE_OK);
    CHECK(key.mode == BRINDLE_MODE_MAJOR);

    const TSong barred = ReadSongOf("Dm7 G7 | C . . . | F");
    REQUIRE(brindle_song_bar_count(barred.get()) == 3);
    brindle_bar bar;
    REQUIRE(brindle_song_bar(barred.get(), 1, &bar) == BRINDLE_OK);
    CHECK(bar.position == 4.0);
    CHECK(bar.length == 4.0);
    CHECK(brindle_song_stated_key(barred.get(), &key) == BRINDLE_ERROR_NOT_FOUND);
}

TEST_CASE("Faults are told with their places, and a lenient reading goes on") {
    const TSong song = ReadSongOf("C F\nG xyz C");
    CHECK(brindle_song_has_fault(song.get()) == 1);
    CHECK(brindle_song_chord_count(song.get()) == 0);
    brindle_fault fault;
    REQUIRE(brindle_song_fault_count(song.get()) == 1);
    REQUIRE(brindle_song_fault(song.get(), 0, &fault) == BRINDLE_OK);
    CHECK(fault.line == 2);
    CHECK(fault.column == 3);
    CHECK(fault.is_note == 0);

    brindle_song_options options = brindle_song_options_default();
    options.lenient = 1;
    CHECK(brindle_song_chord_count(ReadSongOf("C F\nG xyz C", &options).get()) == 5);
    brindle_song* made = nullptr;
    // The largest is a number, but twice as many beats are none.
    for (const double beats : {0.0, -1.0, 1e-300, 1e308, std::nan("")}) {
        options = brindle_song_options_default();
        options.beats_per_bar = beats;
        CHECK(brindle_song_read("C", 1, &options, &made) == BRINDLE_ERROR_ARGUMENT);
        options = brindle_song_options_default();
        options.beats_per_chord = beats;
        CHECK(brindle_song_read("C", 1, &options, &made) == BRINDLE_ERROR_ARGUMENT);
    }
    options = brindle_song_options_default();
    options.format = 99;
    CHECK(brindle_song_read("C", 1, &options, &made) == BRINDLE_ERROR_ARGUMENT);
    CHECK(made == nullptr);
}

TEST_CASE("Texts of hostile songs leave the library as UTF-8 and whole") {
    using namespace std::string_view_literals;
    const TSong song = ReadSongOf("{title: A\0B\xFF}\n[C]x"sv);
    CHECK(brindle_song_title(song.get()) == std::string("A\uFFFDB\uFFFD"));
    const TSong nothing = ReadSongOf("");
    const TAnalysis analysis = AnalysisOf(nothing);
    brindle_key key;
    CHECK(brindle_analysis_key(analysis.get(), &key) == BRINDLE_ERROR_NOT_FOUND);
    CHECK(brindle_analysis_confidence(analysis.get()) == -1.0);
    CHECK(nlohmann::json::accept(TextOf(brindle_analysis_json, analysis.get())));
}

TEST_CASE("A song is read from a file, and one that is missing is a fault") {
    const CScratchFolder folder;
    const std::string path = folder.File("song.txt");
    std::ofstream(path) << "C F | G";
    brindle_song* made = nullptr;
    REQUIRE(brindle_song_read_file(path.c_str(), nullptr, &made) == BRINDLE_OK);
    CHECK(brindle_song_chord_count(TSong(made).get()) == 3);
    REQUIRE(brindle_song_read_file((path + "x").c_str(), nullptr, &made) == BRINDLE_OK);
    CHECK(brindle_song_has_fault(TSong(made).get()) == 1);
}

TEST_CASE("An analysis outlives its song and tells each chord as a teacher reads it") {
    TSong song = ReadSongOf("Dm7 G7 | C A7 | Dm7 G7 | C");
    const brindle_analysis_options options{{{-1, 127}, BRINDLE_MODE_NONE}, BRINDLE_ANALYSE_EXPLAIN};
    const TAnalysis analysis = AnalysisOf(song, &options);
    song.reset();
    CHECK(ReadingOf(analysis) ==
          "Dm7@0 ii7 subdominant>1; G7@1 V7 dominant>2; C@4 I tonic>-1; "
          "A7@5 V7/ii dominant>4; Dm7@8 ii7 subdominant>5; G7@9 V7 dominant>6; C@12 I tonic>-1");
    brindle_chord_reading chord;
    CHECK(brindle_analysis_chord(analysis.get(), 9999, &chord) == BRINDLE_ERROR_ARGUMENT);
    CHECK(chord.chord.root.pitch_class == BRINDLE_NONE);
    CHECK(chord.resolves_to == -1);
    brindle_center center;
    CHECK(brindle_analysis_center(analysis.get(), 9999, &center) == BRINDLE_ERROR_ARGUMENT);
    CHECK(center.scale.root.pitch_class == BRINDLE_NONE);
    REQUIRE(brindle_analysis_chord(analysis.get(), 0, &chord) == BRINDLE_OK);
    CHECK(chord.relation == BRINDLE_RELATION_RELATED_SECOND);
    CHECK(brindle_relation_name(chord.relation) == std::string("related second"));
    CHECK(chord.explanation ==
          std::string("Dm7 is the second degree of C major and prepares the dominant G7."));
    brindle_key key;
    REQUIRE(brindle_analysis_key(analysis.get(), &key) == BRINDLE_OK);
    CHECK(TextOf(brindle_key_write, &key) == "C Major");
    CHECK(brindle_analysis_confidence(analysis.get()) > 0.5);
    brindle_region region;
    REQUIRE(brindle_analysis_region_count(analysis.get()) == 1);
    REQUIRE(brindle_analysis_region(analysis.get(), 0, &region) == BRINDLE_OK);
    CHECK(region.chord_count == 7);
    CHECK(region.end == 16.0);
    REQUIRE(brindle_analysis_center_count(analysis.get()) > 0);
    REQUIRE(brindle_analysis_center(analysis.get(), 0, &center) == BRINDLE_OK);
    CHECK(TextOf(brindle_scale_write, &center.scale).substr(0, 1) == "C");
}

TEST_CASE("A stated key decides the numerals") {
    brindle_analysis_options options{{{9, 0}, BRINDLE_MODE_MINOR}, 0};
    CHECK(ReadingOf(AnalysisOf(ReadSongOf("Am Dm | E7 Am"), &options)) ==
          "Am@0 i tonic>-1; Dm@1 iv subdominant>2; E7@4 V7 dominant>3; Am@5 i tonic>-1");
    options.stated_key = {{0, 0}, BRINDLE_MODE_MAJOR};
    const TAnalysis inMajor = AnalysisOf(ReadSongOf("Am Dm | E7 Am"), &options);
    brindle_key key;
    REQUIRE(brindle_analysis_key(inMajor.get(), &key) == BRINDLE_OK);
    CHECK(TextOf(brindle_key_write, &key) == "C Major");
}

TEST_CASE("JSON, text and pictures of an analysis are whole") {
    const brindle_analysis_options options{{{-1, 127}, BRINDLE_MODE_NONE},
                                           BRINDLE_ANALYSE_ALTERNATIVES | BRINDLE_ANALYSE_COPIES};
    const TAnalysis analysis = AnalysisOf(ReadSongOf(kSong), &options);
    const auto json = nlohmann::json::parse(TextOf(brindle_analysis_json, analysis.get()));
    CHECK(json.at("Reading").at("Chords").size() == 5);
    CHECK(json.at("Reading").at("Chords").at(1).at("Numeral") == "V7");
    CHECK(TextOf(brindle_analysis_text, analysis.get()).find("Two Keys") != std::string::npos);
    for (const brindle_picture picture : {BRINDLE_PICTURE_LEAD_SHEET, BRINDLE_PICTURE_TIME_AXIS}) {
        const std::string svg = TextOf(brindle_analysis_svg, analysis.get(), picture);
        CHECK(svg.find("<svg") != std::string::npos);
        CHECK(svg.find("</svg>") != std::string::npos);
    }
}

}  // namespace
}  // namespace brindle::test
