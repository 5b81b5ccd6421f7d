// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include "brindle/theory/CIntvlSet.h"
#include "brindle/theory/CSemitones.h"

#include <doctest/doctest.h>

#include <vector>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

TQuantizeSemitonesOptions OptionsOf(const json& form) {
    return {static_cast<TQuantizeDirection>(form.at("mDirection").get<int>()),
            static_cast<TWrapAtOctave>(form.at("mWrapAtOctave").get<int>())};
}

/// An answer that asks the mask in front of the arguments.
template <class Question>
Answer Asking(Question question) {
    return [question](const json& in) -> json { return question(SemitonesOf(in.at(0)), in); };
}

/// An answer that changes the mask in front of the arguments and gives the mask that results.
template <class Change>
Answer Changing(Change change) {
    return [change](const json& in) -> json {
        CSemitones semitones = SemitonesOf(in.at(0));
        change(semitones, in);
        return semitones.Mask();
    };
}

int IntOf(const json& in, std::size_t n) {
    return in.at(n).get<int>();
}

TBasicChord BasicChordOf(const json& in) {
    return static_cast<TBasicChord>(IntOf(in, 1));
}

json FromList(const json& in) {
    CSemitones semitones;
    for (const json& semitone : in.at(0)) {
        semitones = semitones + CSemitones{semitone.get<unsigned>()};
    }
    return semitones.Mask();
}

}  // namespace

TEST_CASE("A set of semitones holds, moves and turns over its intervals") {
    CheckExpected(
        "theory-semitones",
        {
            {"CSemitones", FromList},
            {"CSemitones::QuantizeToActiveSemitonesAsIntvl",
             Asking([](CSemitones s, const json& in) {
                 return s.QuantizeToActiveSemitonesAsIntvl(IntOf(in, 1), OptionsOf(in.at(2)));
             })},
            {"CSemitones::QuantizeToActiveSemitonwAsIndex",
             Asking([](CSemitones s, const json& in) {
                 return s.QuantizeToActiveSemitonwAsIndex(
                     IntOf(in, 1), static_cast<TQuantizeDirection>(IntOf(in, 2)));
             })},
            {"CSemitones::size", Asking([](CSemitones s, const json&) { return s.size(); })},
            {"CSemitones::IsEmpty", Asking([](CSemitones s, const json&) { return s.IsEmpty(); })},
            {"CSemitones::IntvlSet",
             Asking([](CSemitones s, const json&) { return json(s.IntvlSet()); })},
            {"CSemitones::IsModalScale",
             Asking([](CSemitones s, const json&) { return s.IsModalScale(); })},
            {"CSemitones::IsModalScaleMajor",
             Asking([](CSemitones s, const json&) { return s.IsModalScaleMajor(); })},
            {"CSemitones::IsModalScaleMinor",
             Asking([](CSemitones s, const json&) { return s.IsModalScaleMinor(); })},
            {"CSemitones::AppendJSONString",
             Asking([](CSemitones s, const json&) { return JSONStringOf(s); })},
            {"CSemitones::HasIntvl",
             Asking([](CSemitones s, const json& in) { return s.HasIntvl(IntOf(in, 1)); })},
            {"CSemitones::HasTheseOrMoreIntvls", Asking([](CSemitones s, const json& in) {
                 return s.HasTheseOrMoreIntvls(IntvlSetOf(in.at(1)));
             })},
            {"CSemitones::HasExactlyTheseIntvls", Asking([](CSemitones s, const json& in) {
                 return s.HasExactlyTheseIntvls(IntvlSetOf(in.at(1)));
             })},
            {"CSemitones::operator+", Asking([](CSemitones s, const json& in) {
                 return (s + SemitonesOf(in.at(1))).Mask();
             })},
            {"CSemitones::operator-", Asking([](CSemitones s, const json& in) {
                 return (s - SemitonesOf(in.at(1))).Mask();
             })},
            {"CSemitones::RotateRootToIx",
             Changing([](CSemitones& s, const json& in) { s.RotateRootToIx(IntOf(in, 1)); })},
            {"CSemitones::AddIntvl",
             Changing([](CSemitones& s, const json& in) { s.AddIntvl(IntOf(in, 1)); })},
            {"CSemitones::EraseIntvl",
             Changing([](CSemitones& s, const json& in) { s.EraseIntvl(IntOf(in, 1)); })},
            {"CSemitones::SetSemitone", Changing([](CSemitones& s, const json& in) {
                 s.SetSemitone(IntOf(in, 1), in.at(2).get<bool>());
             })},
            {"CSemitones::AddSemitonesFromBasicChord", Changing([](CSemitones& s, const json& in) {
                 s.AddSemitonesFromBasicChord(BasicChordOf(in));
             })},
            {"CSemitones::SetFromBasicChord", Changing([](CSemitones& s, const json& in) {
                 s.SetFromBasicChord(BasicChordOf(in));
             })},
            {"CSemitones::AddIntvls",
             Changing([](CSemitones& s, const json& in) { s.AddIntvls(IntvlSetOf(in.at(1))); })},
            {"CSemitones::EraseIntvls",
             Changing([](CSemitones& s, const json& in) { s.EraseIntvls(IntvlSetOf(in.at(1))); })},
            {"CSemitones::SetFromIntvlSet", Changing([](CSemitones& s, const json& in) {
                 s.SetFromIntvlSet(IntvlSetOf(in.at(1)));
             })},
            {"CSemitones::SemitoneIxFromIntvl",
             [](const json& in) { return CSemitones::SemitoneIxFromIntvl(IntOf(in, 0)); }},
            {"CSemitones::VectorBoolToInt",
             [](const json& in) {
                 return CSemitones::VectorBoolToInt(in.at(0).get<std::vector<bool>>());
             }},
            {"CSemitones::ToVectorBool", Asking([](CSemitones s, const json&) {
                 std::vector<bool> bits;
                 s.ToVectorBool(bits);
                 return bits;
             })},
        });
}

TEST_CASE("Braces list semitones or bits, parentheses hold a mask") {
    constexpr bool on = true;
    constexpr bool off = false;
    static_assert(CSemitones{0, 4, 7} == CSemitones(145));
    static_assert(CSemitones{145}.IsEmpty());
    static_assert(CSemitones{on, off, off, off, on, off, off, on, off, off, off, off} ==
                  CSemitones(145));
    CHECK(CSemitones{0, 12, 4, -1} == CSemitones(17));
}

TEST_CASE("Out-of-range indices and options quantize to nothing") {
    constexpr CSemitones root{0};
    constexpr auto unknownDirection = static_cast<TQuantizeDirection>(9);
    constexpr auto unknownWrap = static_cast<TWrapAtOctave>(2);
    CHECK(root.QuantizeToActiveSemitonesAsIntvl(-1, {}) == kIntvlUndef);
    CHECK(root.QuantizeToActiveSemitonesAsIntvl(12, {}) == kIntvlUndef);
    CHECK(root.QuantizeToActiveSemitonesAsIntvl(4, {unknownDirection, TWrapAtOctave_No}) ==
          kIntvlUndef);
    CHECK(root.QuantizeToActiveSemitonesAsIntvl(4, {TQuantizeDirection_Left, unknownWrap}) ==
          kIntvlUndef);
    CHECK(root.QuantizeToActiveSemitonesAsIntvl(0, {unknownDirection, unknownWrap}) == 0);
    CHECK(root.QuantizeToActiveSemitonwAsIndex(99, TQuantizeDirection_Left) == 99);
}

TEST_CASE("A mask above 4096 leaves the vector of bits alone") {
    std::vector<bool> bits{true};
    CSemitones(4097).ToVectorBool(bits);
    CHECK(bits.size() == 1);
    CSemitones(4096).ToVectorBool(bits);
    CHECK(bits == std::vector<bool>(12, false));
}

TEST_CASE("The bits of a chord are packed from the root up") {
    CHECK(CSemitones::VectorBoolToInt({}) == 0);
    CHECK(CSemitones::VectorBoolToInt({true, false, false, false, true, false, false, true}) ==
          0b1001'0001);
    std::vector<bool> bits(70, true);
    CHECK(CSemitones::VectorBoolToInt(bits) == ~std::uint64_t{0});
}
