// SPDX-License-Identifier: MIT
#include "tests/analysis/PlainHarmony.h"
#include "tests/analysis/PlainRoutes.h"
#include "tests/analysis/RandomChordTexts.h"
#include "tests/support/Forms.h"

#include "brindle/analysis/CAnalyseHarmCenterAlternatives.h"
#include "brindle/analysis/CHarmonicAnalyse.h"
#include "brindle/analysis/ModalCenters.h"
#include "brindle/analysis/ScaleLite.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;

namespace {

constexpr int kTextCount = 250;
constexpr TAnalyse kRoutes[] = {TAnalyse_None, TAnalyse_TonicProgressions,
                                TAnalyse_CadenceProgressions, TAnalyse_CenterWeights};

template <class TAnalysis>
std::string JSONOf(const TAnalysis& analysis) {
    return JSONStringOf(analysis.mSignKeys);
}

bool ProbabilitiesAgree(const CHarmAnlsSignKeys& a, const CHarmAnlsSignKeys& b) {
    for (std::size_t n = 0; n < a.size(); ++n) {
        for (std::size_t i = 0; i < a[n].mHarmCenters.size(); ++i) {
            if (a[n].mHarmCenters[i].mProbability != b[n].mHarmCenters[i].mProbability) {
                return false;
            }
        }
    }
    return true;
}

CHarmAnlsChords RandomChords(CChance& chance) {
    CHarmAnlsChords chords(RandomChordText(chance), RandomBeats(chance));
    if (!chords.empty() && chance.OneIn(4)) chords.pop_back();  // without the end marker
    return chords;
}

}  // namespace

TEST_CASE("Random chord texts come out as by the plain steps on every route") {
    for (int seed = 1; seed <= kTextCount; ++seed) {
        CChance chance(static_cast<std::uint32_t>(seed));
        const CHarmAnlsChords chords = RandomChords(chance);
        const CHarmAnlsSignKeys signKeys = RandomSignKeys(chance);
        for (const TAnalyse route : kRoutes) {
            CAPTURE(seed);
            CAPTURE(route);
            CHarmonicAnalyse fast;
            CPlainAnalysis plain;
            fast.AnalyseFromChords(chords, signKeys, route);
            plain.AnalyseFromChords(chords, signKeys, route);
            REQUIRE(JSONOf(fast) == JSONOf(plain));
            REQUIRE(ProbabilitiesAgree(fast.mSignKeys, plain.mSignKeys));
        }
    }
}

TEST_CASE("Centers filled by hand come out as by the plain steps on every route") {
    int endlessCount = 0;
    for (int seed = 1; seed <= kTextCount; ++seed) {
        CChance chance(static_cast<std::uint32_t>(seed));
        const CHarmAnlsChords chords = RandomChords(chance);
        const CHarmAnlsSignKeys signKeys = RandomFilledSignKeys(chance, chords);
        for (const TAnalyse route : kRoutes) {
            CAPTURE(seed);
            CAPTURE(route);
            CHarmonicAnalyse fast;
            CPlainAnalysis plain;
            fast.mSignKeys = plain.mSignKeys = signKeys;
            fast.Analyse(route);
            plain.Analyse(route);
            endlessCount += plain.mIsEndless;
            if (!plain.mIsEndless) REQUIRE(JSONOf(fast) == JSONOf(plain));
        }
    }
    CHECK(endlessCount < kTextCount / 10);
}

TEST_CASE("Random readings come out as by the plain steps") {
    for (int seed = 1; seed <= kTextCount; ++seed) {
        CChance chance(static_cast<std::uint32_t>(seed));
        const CHarmAnlsChords chords = RandomChords(chance);
        const CHarmAnlsCenters fast = CAnalyseHarmCenterAlternatives(chords).BestResults();
        const CHarmAnlsCenters plain = PlainBestResults(chords);
        CAPTURE(seed);
        REQUIRE(JSONStringOf(fast) == JSONStringOf(plain));
        for (std::size_t n = 0; n < fast.size(); ++n) {
            REQUIRE(fast[n].mProbability == plain[n].mProbability);
        }
    }
}

TEST_CASE("Chords are tried on all keys at once as on each full scale") {
    CChance chance(1);
    for (int n = 0; n < 800; ++n) {
        const CKeyEnh root{static_cast<int>(chance.Below(12)), TEnh_n};
        CKeyEnh bass{static_cast<int>(chance.Below(12)), TEnh_n};
        if (chance.OneIn(2)) bass = CKeyEnh_Undef;
        const CChordLite chord(root, bass, CSemitones(chance.Below(4096)));
        CAPTURE(chord);
        for (int key = 0; key < 12; ++key) {
            for (const CSemitones mode : {kSemitonesMajor, kSemitonesNaturalMinor}) {
                const CHarmCenterLite center({key, TEnh_n}, mode);
                const CSignKeyLite signKey({key, TEnh_n}, SignKeyTypeFromSemitones(mode));
                const auto bit = ModalCenters::TCenters{1} << ModalCenters::PlaceOf(center);
                const bool isCompatible = PlainIsCompatible(chord, center);
                REQUIRE(((ModalCenters::CentersTolerating(chord) & bit) != 0) == isCompatible);
                REQUIRE(ScaleLite::ChordIsCompatibleWithScale(chord, center.ToScaleLite()) ==
                        isCompatible);
                REQUIRE(((ModalCenters::CentersOwning(chord) & bit) != 0) ==
                        PlainIsInSignKey(chord, signKey));
            }
        }
    }
}
