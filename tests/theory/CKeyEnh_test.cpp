// SPDX-License-Identifier: MIT
#include "brindle/theory/CKeyEnh.h"

#include "brindle/theory/CKeyEnhUtil.h"
#include "brindle/theory/KeyIntervals.h"
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include <doctest/doctest.h>

#include <limits>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

TEST_CASE("A spelled key moved by an interval keeps to its side of flats or sharps") {
    test::CheckExpected(
        "theory-adding-intervals",
        {
            {"CKeyEnh::AddToThis",
             [](const json& in) {
                 CKeyEnh keyEnh = KeyEnhOf(in.at(0));
                 keyEnh.AddToThis(in.at(1).get<int>());
                 return test::FormOf(keyEnh);
             }},
            {"CKeyEnhUtil::RelatedIonianScaleRootKeyEnh",
             [](const json& in) {
                 return test::FormOf(CKeyEnhUtil::RelatedIonianScaleRootKeyEnh(
                     KeyEnhOf(in.at(0)), static_cast<TScaleType>(in.at(1).get<int>())));
             }},
        });
}

TEST_CASE("A mode given by its semitones has the major scale of its notes") {
    constexpr CSemitones dorian{0, 2, 3, 5, 7, 9, 10};
    constexpr CSemitones wholeTone{0, 2, 4, 6, 8, 10};
    CHECK(CKeyEnhUtil::RelatedIonianScaleRootKeyEnh(CKeyEnh_D, dorian) == CKeyEnh_C);
    CHECK(CKeyEnhUtil::RelatedIonianScaleRootKeyEnh(CKeyEnh_F, dorian) == CKeyEnh_Eb);
    CHECK(CKeyEnhUtil::RelatedIonianScaleRootKeyEnh(CKeyEnh_C, wholeTone) == CKeyEnh_Undef);
}

TEST_CASE("Adding and subtracting an interval agree for every interval there is") {
    constexpr int kLowest = std::numeric_limits<int>::min();
    CHECK(CKeyEnh_C - 3 == CKeyEnh_C.Add(-3));
    CHECK(CKeyEnh_Cis + 2 == CKeyEnh_Dis);
    // -129 stands for undefined elsewhere; here it is nine semitones down, like any other number.
    CHECK(CKeyEnh_C + kIntvlUndef == CKeyEnh_C.Add(-9));
    CHECK(CKeyEnh_C + kLowest == CKeyEnh_C.Add(-8));
    CHECK(CKeyEnh_C - kLowest == CKeyEnh_C.Add(8));
}

TEST_CASE("A key number that is none moves like the key it would be, and stays in the octave") {
    for (const int keyNr : {-13, 12, 27, std::numeric_limits<int>::max()}) {
        CAPTURE(keyNr);
        const CKeyEnh moved = CKeyEnh{keyNr, TEnh_n} + 5;
        CHECK(moved.mKeyNr == FoldIntoOctave(std::int64_t{keyNr} + 5));
    }
}

TEST_CASE("A key of a dictionary tolerates what others have written into it") {
    const auto read = [](const char* text) {
        return CKeyEnh::JSONDeserializer_Helper::CKeyEnhFromJSONDictionary(json::parse(text));
    };
    struct CCase {
        const char* mDictionary;
        CKeyEnh mKeyEnh;
    };
    const CCase cases[] = {
        {R"({"KeyNr":" 3","Enh":"flat"})", CKeyEnh_Eb},
        {R"({"KeyNr":3,"Enh":"flat"})", CKeyEnh_Eb},
        {R"({"KeyNr":3.9,"Enh":"flat"})", CKeyEnh_Eb},
        {R"({"KeyNr":"   +7 is G","Enh":"neutral"})", CKeyEnh_G},
        {R"({"KeyNr":"G","Enh":"neutral"})", CKeyEnh_C},
        {R"({"KeyNr":"99999999999999999999","Enh":"neutral"})", {15, TEnh_n}},
        {R"({"KeyNr":"-3","Enh":"neutral"})", {15, TEnh_n}},
        {R"({"KeyNr":18446744073709551615,"Enh":"neutral"})", {15, TEnh_n}},
        {R"({"KeyNr":-1e300,"Enh":"neutral"})", {15, TEnh_n}},
        {R"({"KeyNr":true,"Enh":2})", CKeyEnh_Undef},
        {R"({"KeyNr":[3],"Enh":{"flat":1}})", CKeyEnh_Undef},
        {R"({"Enh":"sharp"})", {15, TEnh_s}},
        {R"(["KeyNr","Enh"])", CKeyEnh_Undef},
        {"null", CKeyEnh_Undef},
        {"3", CKeyEnh_Undef},
    };
    for (const CCase& test : cases) {
        CAPTURE(test.mDictionary);
        CHECK(read(test.mDictionary) == test.mKeyEnh);
    }
}
