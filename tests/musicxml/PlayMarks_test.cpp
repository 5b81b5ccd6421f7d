// SPDX-License-Identifier: MIT
// What signs of scores mean for their playing, each with the smallest score that shows it.

#include "brindle/musicxml/TMusicXMLDoc.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <string>
#include <vector>

using namespace brindle;

namespace {

/// A score of these measures, each with the chord and the note of its letter behind what it holds.
TMusicXMLDoc Played(const std::vector<std::string>& measures, int quarters = 4) {
    std::string text = "<score-partwise><part id=\"P\">";
    for (std::size_t i = 0; i < measures.size(); ++i) {
        text += fmt::format(
            "<measure number=\"{}\">{}<harmony><root><root-step>{}</root-step></root>"
            "<kind>major</kind></harmony>{}</measure>",
            i + 1, measures[i], static_cast<char>('A' + i % 7),
            quarters > 0 ? fmt::format("<note><duration>{}</duration></note>", quarters) : "");
    }
    TMusicXMLDoc doc;
    CHECK(doc.LoadAsPlayedFromBytes(text + "</part></score-partwise>"));
    return doc;
}

std::string Roots(const TMusicXMLDoc& doc) {
    std::string roots;
    for (const TMusicXMLHarmony& harmony : doc.Harmonies) roots += harmony.mRoot.mStep;
    return roots;
}

std::string Line(const char* location, const std::string& content) {
    return fmt::format("<barline location=\"{}\">{}</barline>", location, content);
}
std::string Ending(const char* number, const std::string& rest = {}) {
    return Line("left", fmt::format("<ending number=\"{}\" type=\"start\"/>", number)) + rest;
}

const std::string kForward = Line("left", "<repeat direction=\"forward\"/>");
const std::string kBack = Line("right", "<repeat direction=\"backward\"/>");

}  // namespace

TEST_CASE("A key that begins later leaves the beginning without one, a key at beat 0 does not") {
    const std::string key =
        "<attributes><key number=\"1\"><fifths>2</fifths><mode>ionian</mode></key></attributes>";
    const TMusicXMLDoc later = Played({"", key});
    REQUIRE(later.HarmSignKeys.size() == 2);
    CHECK(later.HarmSignKeys[0].IsUndef());
    CHECK(later.HarmSignKeys[0].mPosition == 0.0);
    CHECK(later.HarmSignKeys[1].mPosition == 4.0);
    const TMusicXMLDoc first = Played({key, ""});
    REQUIRE(first.HarmSignKeys.size() == 1);
    CHECK(first.HarmSignKeys[0].mPosition == 0.0);
    CHECK(first.HarmSignKeys[0].mSignKey == CSignKeyLite(CKeyEnh_D, TSignKeyType_Major));
}

TEST_CASE("A bar of 3/8 and 2/4 has three and a half quarters") {
    const auto time = [](const char* content) {
        return fmt::format("<attributes><time>{}</time></attributes>", content);
    };
    const char* const eighthsFirst =
        "<beats>3</beats><beat-type>8</beat-type><beats>2</beats>"
        "<beat-type>4</beat-type>";
    const char* const quartersFirst =
        "<beats>2</beats><beat-type>4</beat-type><beats>3</beats>"
        "<beat-type>8</beat-type>";
    for (const char* const content : {eighthsFirst, quartersFirst}) {
        const TMusicXMLDoc doc = Played({time(content), ""}, 0);
        CHECK(doc.Harmonies[1].mPosition == 3.5);
        CHECK(doc.TimeSignatures[0].mNumerator == 7);
        CHECK(doc.TimeSignatures[0].mDenominator == 8);
    }
    CHECK(Played({time("<beats>3+2</beats><beat-type>8</beat-type>"), ""}, 0)
              .Harmonies[1]
              .mPosition == 2.5);
}

TEST_CASE("Signs of repeats and endings are obeyed where they stand") {
    const std::string backAtLeft = Line("left", "<repeat direction=\"backward\"/>");
    const std::string three = Line("right", "<repeat direction=\"backward\" times=\"3\"/>");
    struct CRow {
        std::vector<std::string> mMeasures;
        const char* mRoots;
    };
    const CRow rows[] = {
        // A sign to go back in front of a measure belongs to the one before.
        {{"", "", backAtLeft}, "ABABC"},
        {{backAtLeft, ""}, "AAB"},
        // A sign to begin behind a measure belongs to the next one.
        {{Line("right", "<repeat direction=\"forward\"/>"), kBack, ""}, "ABBC"},
        {{kForward, Line("right", "<repeat direction=\"backward\" after-jump=\"yes\"/>"),
          "<sound dacapo=\"yes\"/>"},
         "ABABCABABC"},
        // The last ending is for all passes that have none.
        {{"", Ending("1", kBack), Ending("2", three), ""}, "ABACACD"},
        // Twice the same number.
        {{"", Ending("2", kBack), Ending("2"), ""}, "ABACD"},
        {{"", Ending("1", kBack), Ending("1"), ""}, "ABACD"},
        {{"", Ending("1", kBack), Ending("2", kBack), Ending("2"), ""}, "ABACADE"},
        // The second of two repeats is no ending of the first.
        {{"", Ending("1", kBack), kForward, kBack, ""}, "ABACDCDE"},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mRoots);
        CHECK(Roots(Played(row.mMeasures)) == row.mRoots);
    }
}
