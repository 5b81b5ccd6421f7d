// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include "brindle/theory/CSignKeyHeavy.h"
#include "brindle/theory/CSignKeyNoEnh.h"
#include "brindle/theory/Trace.h"

#include <doctest/doctest.h>

#include <iomanip>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

CChordLite ChordOf(const json& in) {
    return {KeyEnhOf(in.at(0)), KeyEnhOf(in.at(1)), SemitonesOf(in.at(2))};
}

std::string Substring(const CChordLite& chord) {
    std::ostringstream stream;
    chord.AppendJSONClassSubstring(stream);
    return stream.str();
}

json NonChord(const CChordLite& chord) {
    json form = FormOf(chord);
    form["IsUndef"] = chord.IsUndef();
    form["IsNoChordYield"] = chord.IsNoChordYield();
    form["IsNoChordForce"] = chord.IsNoChordForce();
    return form;
}

/// The JSON text on a stream that pads to 40 places and writes its own numbers in hexadecimal.
template <class T>
std::string JSONStringOnPaddedStream(const T& value) {
    std::ostringstream stream;
    stream << std::hex << std::showbase << std::setfill('*') << std::setw(40);
    value.AppendJSONString(stream);
    return stream.str();
}

/// {"TEnh": n} or {"TSignKeyType": n}
std::string Printed(const json& in) {
    if (in.contains("TEnh")) return TraceString(EnhOf(in.at("TEnh")));
    return TraceString(static_cast<TSignKeyType>(in.at("TSignKeyType").get<int>()));
}

}  // namespace

TEST_CASE("Records print, have an order, and read back") {
    test::CheckExpected(
        "theory-records",
        {
            {"CKeyEnh::AppendJSONString",
             [](const json& in) { return JSONStringOf(KeyEnhOf(in.at(0))); }},
            {"CKeyEnh::JSONDeserializer_Helper::CKeyEnhFromJSONDictionary",
             [](const json& in) {
                 return test::FormOf(
                     CKeyEnh::JSONDeserializer_Helper::CKeyEnhFromJSONDictionary(in.at(0)));
             }},
            {"CKeyEnh::operator<",
             [](const json& in) { return KeyEnhOf(in.at(0)) < KeyEnhOf(in.at(1)); }},
            {"CSemitones::AppendJSONString",
             [](const json& in) { return JSONStringOf(SemitonesOf(in.at(0))); }},
            {"CScaleLite::AppendJSONString",
             [](const json& in) { return JSONStringOf(ScaleLiteOf(in.at(0))); }},
            {"CScaleLite::operator<",
             [](const json& in) { return ScaleLiteOf(in.at(0)) < ScaleLiteOf(in.at(1)); }},
            {"CSignKeyLite::AppendJSONString",
             [](const json& in) { return JSONStringOf(SignKeyLiteOf(in.at(0))); }},
            {"CSignKeyLite::operator<",
             [](const json& in) { return SignKeyLiteOf(in.at(0)) < SignKeyLiteOf(in.at(1)); }},
            {"CChordLite::AppendJSONString",
             [](const json& in) { return JSONStringOf(ChordOf(in)); }},
            {"CChordLite::AppendJSONClassSubstring",
             [](const json& in) { return Substring(ChordOf(in)); }},
            {"CChordLite_Undef", [](const json&) { return NonChord(CChordLite_Undef); }},
            {"CChordLite_NoChordYield",
             [](const json&) { return NonChord(CChordLite_NoChordYield); }},
            {"CChordLite_NoChordForce",
             [](const json&) { return NonChord(CChordLite_NoChordForce); }},
            {"EnhFromStdString",
             [](const json& in) {
                 return static_cast<int>(EnhFromStdString(in.at(0).get<std::string>()));
             }},
            {"EnhFromString",
             [](const json& in) {
                 return static_cast<int>(in.at(0).is_null()
                                             ? EnhFromString(nullptr)
                                             : EnhFromString(in.at(0).get<std::string>().c_str()));
             }},
            {"operator<<", [](const json& in) { return Printed(in.at(0)); }},
        });
}

TEST_CASE("The JSON text of a record does not depend on how the stream writes other things") {
    const auto isPlain = [](const auto& value) {
        return JSONStringOnPaddedStream(value) == JSONStringOf(value);
    };
    CHECK(isPlain(CKeyEnh{11, TEnh{6}}));
    CHECK(isPlain(kSemitonesMajor));
    CHECK(isPlain(CNote(60, TEnh_n)));
    CHECK(isPlain(CScaleLite(CKeyEnh_B, kSemitonesMajor)));
    CHECK(isPlain(CScaleHeavy(CKeyEnh_B, st_dorian)));
    CHECK(isPlain(CSignKeyLite(CKeyEnh_B, TSignKeyType_Major)));
    CHECK(isPlain(CSignKeyHeavy(CKeyEnh_B, TSignKeyTypeNoUndef_Minor)));
    CHECK(isPlain(CSignKeyNoEnh(11, TSignKeyType_Major)));
    CHECK(isPlain(CChordLite(CKeyEnh_B, CKeyEnh_Undef, CSemitones{0, 4, 7})));
}

TEST_CASE("A record prints as one text under all names, a brief one where it has one") {
    const CKeyEnh key = CKeyEnh_Fis;
    CHECK(TraceStr(key) == TraceString(key));
    CHECK(TraceBriefString(key) == TraceString(key));
    struct CBoth {
        void TraceBriefTo(std::ostream& stream) const { stream << "F#"; }
    };
    CHECK(TraceBriefString(CBoth()) == "F#");
}

TEST_CASE("A key keeps its root when its type changes") {
    CSignKeyHeavy key(CKeyEnh_Fis, TSignKeyTypeNoUndef_Major);
    key.SetSignKeyType(TSignKeyTypeNoUndef_Minor);
    CHECK(key.ToSignKeyLite() == CSignKeyLite("F# minor"));
}
