// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"

#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/ScaleMasks.h"
#include "brindle/theory/Trace.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

int IndexOf(const json& in) {
    return in.at(0).get<int>();
}

TScaleType TypeOf(const json& in) {
    return static_cast<TScaleType>(IndexOf(in));
}

/// An answer about the scale type that is the only argument.
template <class Question>
Answer AboutType(Question question) {
    return [question](const json& in) -> json { return question(TypeOf(in)); };
}

json RowForm(const json& in) {
    const CScaleRow& row = CScaleHeavy::mScaleData.at(in.at(0).get<std::size_t>());
    return {{"mType", static_cast<int>(row.mType)},
            {"mName", row.mName},
            {"mDegreesPerOctave", row.mDegreesPerOctave},
            {"mDegreeToRootOffsetIntvl", row.mDegreeToRootOffsetIntvl},
            {"mDegreeEnh", row.mDegreeEnh},
            {"mMode", static_cast<int>(row.mMode)}};
}

json LocalizedName(TScaleType type) {
    const auto name = CScaleHeavy::LocalizedNameForScaleType(type);
    return name ? json(*name) : json(nullptr);
}

}  // namespace

TEST_CASE("The table of scales tells steps, mode and spelling of each type") {
    CheckExpected(
        "theory-scale-catalogue",
        {
            {"CScaleHeavy::mScaleData", RowForm},
            {"CScaleHeavy::NumAvailableScales",
             [](const json&) { return CScaleHeavy::NumAvailableScales(); }},
            {"CScaleHeavy::GetTypeForScaleAtIndex",
             [](const json& in) { return CScaleHeavy::GetTypeForScaleAtIndex(IndexOf(in)); }},
            {"CScaleHeavy::GetNameForScaleAtIndex",
             [](const json& in) { return CScaleHeavy::GetNameForScaleAtIndex(IndexOf(in)); }},
            {"CScaleHeavy::ScaleIndexFromType", AboutType(CScaleHeavy::ScaleIndexFromType)},
            {"CScaleHeavy::GetNameForScaleType", AboutType(CScaleHeavy::GetNameForScaleType)},
            {"CScaleHeavy::GetModeForScaleType", AboutType(CScaleHeavy::GetModeForScaleType)},
            {"CScaleHeavy::GetDegreesPerOctaveForScaleType",
             AboutType(CScaleHeavy::GetDegreesPerOctaveForScaleType)},
            {"CScaleHeavy::GetDegreeToRootOffsetIntvlArrayForScaleType",
             AboutType(CScaleHeavy::GetDegreeToRootOffsetIntvlArrayForScaleType)},
            {"CScaleHeavy::GetDegreeEnhForScaleType",
             AboutType(CScaleHeavy::GetDegreeEnhForScaleType)},
            {"CScaleHeavy::LocalizedNameForScaleType", AboutType(LocalizedName)},
            {"IsScaleTypeModal", AboutType(IsScaleTypeModal)},
            {"SemitonesFromScaleType",
             AboutType([](TScaleType type) { return SemitonesFromScaleType(type).Mask(); })},
            {"ScaleTypeFromSemitones",
             [](const json& in) {
                 return ScaleTypeFromSemitones(CSemitones(in.at(0).get<std::uint64_t>()));
             }},
            {"ToJSONString", AboutType(ToJSONString)},
            {"ScaleTypeFromJSONString",
             [](const json& in) { return ScaleTypeFromJSONString(in.at(0).get<std::string>()); }},
            {"operator<<",
             [](const json& in) {
                 return TraceString(static_cast<TScaleType>(in.at(0).at("TScaleType").get<int>()));
             }},
        });
}

TEST_CASE("Scales that are shown to people have fuller names than the table") {
    CHECK(CScaleHeavy::LocalizedNameForScaleType(st_min) == "Natural Minor (Aeolian)");
    CHECK(CScaleHeavy::LocalizedNameForScaleType(st_hm5) == "Phrygian Dominant");
    CHECK(CScaleHeavy::LocalizedNameForScaleType(st_custom) == "Custom");
    CHECK(CScaleHeavy::LocalizedNameForScaleType(DoubleHarmonic) == "Double Harmonic (Byzantine)");
}

TEST_CASE("Indices and types without a row read as major") {
    for (const int index : {-1, 30, 1000}) {
        CHECK(CScaleHeavy::GetTypeForScaleAtIndex(index) == st_maj);
        CHECK(CScaleHeavy::GetNameForScaleAtIndex(index) == "Major");
    }
    CHECK(CScaleHeavy::GetNameForScaleType(static_cast<TScaleType>(-5)) == "Major");
    CHECK(ToJSONString(static_cast<TScaleType>(-5)) == "undef");
}

TEST_CASE("Scale types step by number") {
    TScaleType type = st_locrian;
    CHECK(++type == st_hm5);
    CHECK(type++ == st_hm5);
    CHECK(type-- == st_japanese);
    CHECK(--type == st_locrian);
}
