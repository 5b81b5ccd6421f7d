// SPDX-License-Identifier: MIT
#include "brindle/song/SplitSongs.h"

#include <doctest/doctest.h>

#include <string>
#include <vector>

namespace brindle::test {
namespace {

TEST_CASE("A split source gives the songs that reading all of it gives") {
    const std::string page =
        "<html>\n<a href=\"irealbook://One=Me=Swing=C=n=T44C |G7 |C Z=Two=You=Swing=F=n=T44F |Q? "
        "Z\">"
        "\n<a href=\"irealbook://Three=We=Waltz=G=n=T34G |D7 |G Z\">";
    struct CCase {
        std::string mBytes;
        TSongFormat mFormat;
        std::size_t mSongs;
    };
    const std::vector<CCase> cases{
        {page, TSongFormat_Auto, 3},
        {page, TSongFormat_ChartPage, 3},
        {"irealbook://One=Me=Swing=C=n=T44C |G7 |C Z", TSongFormat_Auto, 1},
        {"{t: One}\n[C]x\n{NS}\n{t: Two}\n[F]x\n[Q]", TSongFormat_Auto, 2},
        {"<html>none", TSongFormat_Auto, 1},
        {"Dm7 G7 | C", TSongFormat_Auto, 1},
        {"<score", TSongFormat_Auto, 1},
        {"", TSongFormat_Auto, 1},
    };
    for (const auto& [bytes, format, count] : cases) {
        const auto& logged = bytes;
        CAPTURE(logged);
        CSongOptions prefs;
        prefs.mFormat = format;
        const std::vector<CSong> whole = ReadSongs(bytes, prefs);
        std::vector<CUnreadSong> split = SplitSongs(bytes, prefs);
        REQUIRE(whole.size() == count);
        REQUIRE(split.size() == count);
        for (std::size_t i = count; i-- > 0;) {
            const CSong song = split[i].mRead();
            CHECK(song.mTitle == whole[i].mTitle);
            CHECK(song.mSymbols == whole[i].mSymbols);
            CHECK(song.mChords.size() == whole[i].mChords.size());
            CHECK(song.mFormat == whole[i].mFormat);
            REQUIRE(song.mFaults.size() == whole[i].mFaults.size());
            for (std::size_t f = 0; f < song.mFaults.size(); ++f) {
                CHECK(song.mFaults[f].mText == whole[i].mFaults[f].mText);
                CHECK(song.mFaults[f].mLine == whole[i].mFaults[f].mLine);
            }
        }
    }
}

}  // namespace
}  // namespace brindle::test
