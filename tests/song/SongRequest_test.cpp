// SPDX-License-Identifier: MIT
#include "brindle/song/SongRequest.h"

#include "brindle/song/BuiltInSongs.h"
#include "brindle/song/SongStyles.h"

#include <doctest/doctest.h>

#include <string>
#include <vector>

namespace {

using namespace brindle;

CSongRequest RequestOf(const char* form, std::size_t bars, const char* sheet) {
    CSongRequest request;
    request.mForm = form;
    request.mBars = bars;
    request.mSheet = sheet;
    return request;
}

}  // namespace

TEST_CASE("A request has the form and the bars that people mean") {
    struct CRow {
        const char* mForm;
        std::size_t mAsked;
        const char* mSheet;
        const char* mLetters;
        std::size_t mBars;
        const char* mStyle;
        const char* mFault;
    };
    const CRow rows[] = {
        {"", 0, "", "AABA", 32, "", ""},
        {"", 16, "", "", 16, "", ""},
        {"", 0, "C | _ | G7", "", 3, "", ""},
        {"a b a b", 0, "C | _", "ABAB", 32, "", ""},
        {"AAXA", 16, "", "AAXA", 16, "", ""},
        {"verse", 40, "", "vErsE", 40, "", ""},
        {"blues", 0, "", "", 12, "blues", ""},
        {" Blues", 36, "", "", 36, "blues", ""},
        {"blues", 32, "", "", 32, "blues", "form: a blues has 12 bars, or 24, 36 and so on"},
        {"", 2, "C | F | G", "", 2, "", "sheet: 3 bars are more than the 2 of the song"},
        {"", 0, "C | X", "", 2, "", "sheet: bar 2: X is no chord; a gap is _"},
    };
    for (const CRow& row : rows) {
        INFO(std::string(row.mForm), " ", row.mAsked, " ", std::string(row.mSheet));
        const CSongRequestReading read =
            ReadSongRequest(RequestOf(row.mForm, row.mAsked, row.mSheet));
        CHECK(read.mFault == row.mFault);
        CHECK(read.mOptions.mForm == row.mLetters);
        CHECK(read.mOptions.mBars == row.mBars);
        CHECK(read.mStyle == row.mStyle);
    }
}

TEST_CASE("No wish of a request is dropped: all are there, or the request is refused") {
    CSongRequest request = RequestOf("", 8, "C | _ | _ | G7");
    request.mBegins = "C";
    request.mEnds = "V7";
    request.mContains = "ii-V-I of F;IV iv I";
    request.mNever = "Bdim Eb";
    const CSongRequestReading read = ReadSongRequest(request);
    REQUIRE(read.mFault == "");
    std::vector<std::string> texts;
    for (const CSongWish& wish : read.mOptions.mWishes) texts.push_back(wish.mText);
    CHECK(texts == std::vector<std::string>{"sheet C in bar 1", "sheet G7 in bar 4", "begins C",
                                            "ends V7", "contains ii-V-I of F", "contains IV iv I",
                                            "never Bdim Eb"});
    request.mEnds = "G7 C";
    CHECK(ReadSongRequest(request).mFault ==
          "ends: one chord is wanted here; a sheet takes several");
    request.mBegins = "Am F";
    CHECK(ReadSongRequest(request).mFault ==
          "begins: one chord is wanted here; a sheet takes several");
    request.mBeatsPerBar = 0;
    CHECK(WriteSong(BuiltInSongModel("hymn"), ReadSongRequest(request).mOptions).mFault ==
          "a bar has 1 to 24 beats");
}

TEST_CASE("Each chorus of a blues has its chords") {
    const auto model = ModelOfStyle(BuiltInSongModel(), "Blues");
    REQUIRE(model);
    for (const bool isMinor : {false, true}) {
        CSongRequest request = RequestOf("blues", 24, "");
        request.mKey = CSignKeyLite(isMinor ? "G minor" : "G major");
        const CWrittenSong written = WriteSong(*model, ReadSongRequest(request).mOptions);
        REQUIRE(written.mFault == "");
        const auto rootAt = [&](double beat) {
            std::size_t ix = 0;
            while (written.mSong.mChords[ix + 1].mPosition <= beat) ++ix;
            return written.mSong.mChords[ix].mRootKeyEnh.mKeyNr;
        };
        for (const double chorus : {0.0, 48.0}) {
            CHECK(rootAt(chorus) == 7);
            CHECK(rootAt(chorus + 16.0) == 0);
            CHECK(rootAt(chorus + 24.0) == 7);
            CHECK(rootAt(chorus + 32.0) == 2);
            CHECK(rootAt(chorus + 40.0) == 7);
        }
    }
}
