// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include "brindle/theory/CIntvlSet.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/Trace.h"

#include <doctest/doctest.h>

#include <limits>
#include <vector>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

/// {"mWrapIntvl": wrap, "members": [...]}
CIntvlSet WrappedSetOf(const json& form) {
    return CIntvlSet(IntvlSetOf(form.at("members")), form.at("mWrapIntvl").get<int>());
}

template <class Question>
Answer Asking(Question question) {
    return [question](const json& in) -> json { return question(WrappedSetOf(in.at(0)), in); };
}

template <class Change>
Answer Changing(Change change) {
    return [change](const json& in) -> json {
        CIntvlSet set = WrappedSetOf(in.at(0));
        change(set, in);
        return set;
    };
}

int IntOf(const json& in) {
    return in.at(1).get<int>();
}

std::vector<int> ListOf(const json& in) {
    return in.at(1).get<std::vector<int>>();
}

}  // namespace

TEST_CASE("An interval set holds intervals beyond the octave and wraps where it is told") {
    CheckExpected(
        "theory-interval-sets",
        {
            {"CIntvlSet",
             [](const json& in) { return json(CIntvlSet(in.at(0).get<std::vector<int>>())); }},
            {"CIntvlSet::Inversion", Asking([](const CIntvlSet& set, const json& in) {
                 const CIntvlSet inversion = set.Inversion(IntOf(in));
                 return json{{"mWrapIntvl", inversion.WrapIntvl()}, {"members", inversion}};
             })},
            {"CIntvlSet::Invert", Changing([](CIntvlSet& set, const json&) { set.Invert(); })},
            {"CIntvlSet::ToSemitones",
             Asking([](const CIntvlSet& set, const json&) { return set.ToSemitones().Mask(); })},
            {"CIntvlSet::SetWrapIntvl",
             Changing([](CIntvlSet& set, const json& in) { set.SetWrapIntvl(IntOf(in)); })},
            {"CIntvlSet::HasOtherStackedThirdsOptionThan",
             Asking([](const CIntvlSet& set, const json& in) {
                 return set.HasOtherStackedThirdsOptionThan(IntOf(in));
             })},
            {"CIntvlSet::HasIntvl",
             Asking([](const CIntvlSet& set, const json& in) { return set.HasIntvl(IntOf(in)); })},
            {"CIntvlSet::HasIntvlInAnyOctave", Asking([](const CIntvlSet& set, const json& in) {
                 return set.HasIntvlInAnyOctave(IntOf(in));
             })},
            {"CIntvlSet::EraseIntvlInAnyOct",
             Changing([](CIntvlSet& set, const json& in) { set.EraseIntvlInAnyOct(IntOf(in)); })},
            {"CIntvlSet::HasIntvls", Asking([](const CIntvlSet& set, const json& in) {
                 return set.HasIntvls(ListOf(in));
             })},
            {"CIntvlSet::HasExactTheseIntvls", Asking([](const CIntvlSet& set, const json& in) {
                 return set.HasExactTheseIntvls(ListOf(in));
             })},
            {"CIntvlSet::HasExactlyTheseIntvlsInAnyOctave",
             Asking([](const CIntvlSet& set, const json& in) {
                 return set.HasExactlyTheseIntvlsInAnyOctave(ListOf(in));
             })},
            {"ConvertKeyNrSetToIntvlSet",
             [](const json& in) {
                 return json(ConvertKeyNrSetToIntvlSet(IntvlSetOf(in.at(0)), IntOf(in)));
             }},
            {"ConvertIntvlSetToKeyNrSet",
             [](const json& in) {
                 return json(ConvertIntvlSetToKeyNrSet(IntvlSetOf(in.at(0)), IntOf(in)));
             }},
        });
}

TEST_CASE("Intervals written out make the set that a list makes") {
    CHECK(CIntvlSet(0, 4, 7) == CIntvlSet(std::vector<int>{7, 4, 0}));
    CHECK(CIntvlSet(0, 4, -1, 7) == CIntvlSet(0, 4));
    CHECK(CIntvlSet(0, 4, 7, 10).HasIntvls(4, 10, -1, 11));
    CHECK(CIntvlSet(0, 4, 7).HasExactTheseIntvls(0, 4, 7));
    CHECK(CIntvlSet(0, 4, 16).HasExactlyTheseIntvlsInAnyOctave(4, 12));
}

TEST_CASE("The wrap interval reduces members and does not make sets different") {
    CIntvlSet ninth(0, 4, 7, 14);
    ninth.SetWrapIntvl(12);
    CHECK(ninth == CIntvlSet(0, 2, 4, 7));
    CHECK_FALSE(ninth.HasExactTheseIntvls(0, 4, 7, 14));
    CHECK(ninth.HasExactlyTheseIntvlsInAnyOctave(0, 4, 7, 14));

    const CMySet<int> belowTheRoot{-1, 5};
    CIntvlSet set(belowTheRoot);
    set.SetWrapIntvl(0);
    CHECK(set == CIntvlSet(belowTheRoot));
    set.SetWrapIntvl(12);
    CHECK(set == CIntvlSet(5, 11));
}

TEST_CASE("Erasing an interval takes its octaves up to the wrap interval, and always itself") {
    CIntvlSet set(CMySet<int>{2, 14, 24, 26, 38}, 24);
    set.EraseIntvlInAnyOct(26);
    CHECK(set == CIntvlSet(CMySet<int>{2, 14, 24, 38}));
    set.EraseIntvlInAnyOct(2);
    CHECK(set == CIntvlSet(CMySet<int>{24, 38}));
    set.EraseIntvlInAnyOct(12);
    CHECK(set == CIntvlSet(CMySet<int>{38}));
}

TEST_CASE("Intervals far out are answered without overflow") {
    constexpr int least = std::numeric_limits<int>::min();
    constexpr int largest = std::numeric_limits<int>::max();
    CIntvlSet set(CMySet<int>{least, 0, largest}, largest);
    CHECK(set.HasIntvlInAnyOctave(12));
    CHECK_FALSE(set.HasIntvlInAnyOctave(1));
    CHECK(set.Inversion(-1).size() >= 2);
    CHECK(ConvertIntvlSetToKeyNrSet(set, 11).size() == 3);
    set.EraseIntvlInAnyOct(least);
    CHECK(set == CIntvlSet(CMySet<int>{0, largest}));
    CHECK(set.Intvl(2) == kIntvlUndef);
    CHECK_FALSE(set.HasIntvl(kIntvlUndef));
}

TEST_CASE("Sets unite, subtract and intersect") {
    const CMySet<int> cMajor{0, 4, 7};
    const CMySet<int> aMinor{9, 0, 4};
    CHECK(cMajor + aMinor == CMySet<int>{0, 4, 7, 9});
    CHECK(cMajor - aMinor == CMySet<int>{7});
    CHECK((cMajor & aMinor) == CMySet<int>{0, 4});
    CHECK(cMajor.Includes({0, 7}));
    CHECK_FALSE(cMajor.Includes(aMinor));
}

TEST_CASE("Sets print their members as numbers or as the records they are") {
    CHECK(TraceString(CIntvlSet(7, 4, 0)) == "{0, 4, 7}");
    CHECK(TraceString(CMySet<unsigned char>{64, 60}) == "{60, 64}");
    CHECK(TraceString(CMySet<CNote>{CNote(61, TEnh_b)}) == "{61 flat}");
}
