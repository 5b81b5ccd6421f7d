// SPDX-License-Identifier: MIT
#include "brindle/neural/ChordAnalysisNeuronalNet.h"
#include "brindle/neural/ChordRootPatterns.h"
#include "brindle/neural/NeuronalNet.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "tests/chords/ChordForms.h"
#include "tests/support/Expected.h"

#include <doctest/doctest.h>

#include <limits>
#include <thread>
#include <vector>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

constexpr auto kByScore = TSingleChordAnalysisAlgo_Score;
constexpr auto kByNet = TSingleChordAnalysisAlgo_NeuronalNet;

/// All nets calculate as the net for roots does, whatever another test has built before.
void CalculateAsRootNet() {
    const NeuronalNet net(ChordAnalysisNeuronalNet);
}

CChordHeavy Of(const CMySet<unsigned char>& noteNrs) {
    CChordHeavy chord;
    chord.SetFromNoteNrSet(noteNrs);
    return chord;
}

int RootKeyNr(CChordHeavy chord, TSingleChordAnalysisAlgo algo) {
    chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(algo);
    return chord.RootNote().KeyNr();
}

json LikeliestRoot(const json& in) {
    CChordHeavy chord = ChordHeavyOf(in.at(0));
    chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(
        static_cast<TSingleChordAnalysisAlgo>(in.at(1).get<int>()));
    json form = test::FormOf(chord);
    form["BasicChord"] = static_cast<int>(chord.BasicChord());
    form["Name"] = chord.Name(CChordNamePrefs());
    return form;
}

}  // namespace

TEST_CASE("Each tone of a chord gives points to the keys that could be its root") {
    CheckExpected("root_scores", {{"CChordHeavy::ProbThatNoteIsRootNote", [](const json& in) {
                                       const CChordHeavy chord = ChordHeavyOf(in.at(0));
                                       return ForEachKeyNr([&](int keyNr) {
                                           return chord.ProbThatNoteIsRootNote({keyNr, TEnh_n});
                                       });
                                   }}});
}

TEST_CASE("The score finds the likeliest root, and with it spelling and name") {
    CheckExpected("root_by_score",
                  {{"CChordHeavy::SetRootNoteAndEnh_ToLikeliestRegardingNoteSet", LikeliestRoot}});
}

TEST_CASE("Both methods hear the root of plain chords in every key and inversion") {
    CalculateAsRootNet();
    const CIntvlSet shapes[] = {
        CIntvlSet(0, 4, 7),     CIntvlSet(0, 3, 7),     CIntvlSet(0, 3, 6),
        CIntvlSet(0, 4, 7, 10), CIntvlSet(0, 4, 7, 11), CIntvlSet(0, 4, 7, 14),
    };
    for (const CIntvlSet& shape : shapes) {
        CAPTURE(shape);
        for (int root = 48; root < 60; ++root) {
            CMySet<unsigned char> noteNrs;
            for (const int intvl : shape) noteNrs.insert(static_cast<unsigned char>(root + intvl));
            CChordHeavy chord = Of(noteNrs);
            for (std::size_t inversion = 0; inversion < shape.size(); ++inversion) {
                CAPTURE(inversion);
                CHECK(RootKeyNr(chord, kByNet) == root % 12);
                if (inversion == 0) CHECK(RootKeyNr(chord, kByScore) == root % 12);
                chord.Invert();
            }
        }
    }
}

TEST_CASE("The net hears the same root in every octave and key") {
    CalculateAsRootNet();
    for (const CChordRootPattern& pattern : ChordRootPatterns()) {
        if (pattern.mOmission != TOmission_None || (pattern.mInputs & (1U << 12U)) != 0) continue;
        const int lowest = static_cast<int>(pattern.mInputs % 67U) + 12;
        CMySet<unsigned char> noteNrs;
        for (int intvl = 0; intvl < kChordRootInputCount; ++intvl) {
            if ((pattern.mInputs >> static_cast<unsigned>(intvl) & 1U) == 0) continue;
            noteNrs.insert(static_cast<unsigned char>(lowest + intvl));
        }
        const int wanted = (lowest + pattern.mRootIntvl) % 12;
        if (RootKeyNr(Of(noteNrs), kByNet) != wanted) FAIL_CHECK(lowest << " " << pattern.mInputs);
    }
}

TEST_CASE("The root becomes the only note of the lowest octave and the chord is spelled by it") {
    CalculateAsRootNet();
    for (const TSingleChordAnalysisAlgo algo : {kByScore, kByNet}) {
        // D flat over its fifth, given in sharps.
        CChordHeavy chord({}, CMySet<CNote>{{56, TEnh_s}, {61, TEnh_s}, {65, TEnh_n}});
        chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(algo);
        CHECK(chord.RootNote() == CNote(1, TEnh_b));
        CHECK(chord.RootNoteSpecified());
        CHECK(chord.Notes() ==
              CMySet<CNote>{{1, TEnh_b}, {56, TEnh_b}, {61, TEnh_b}, {65, TEnh_n}});
    }
}

TEST_CASE("Chords of one note have it as their root, chords of none become undefined") {
    CalculateAsRootNet();
    for (const TSingleChordAnalysisAlgo algo : {kByScore, kByNet, TSingleChordAnalysisAlgo{-7}}) {
        for (unsigned char noteNr = 0; noteNr < 128; ++noteNr) {
            CHECK(RootKeyNr(Of({noteNr}), algo) == noteNr % 12);
        }
        CChordHeavy none(CNote(60, TEnh_n), CMySet<CNote>{});
        none.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(algo);
        CHECK(none == CChordHeavy_Undef());
    }
}

TEST_CASE("Notes without a key and odd wrap intervals do no harm") {
    CalculateAsRootNet();
    CNote high;
    high.mNoteNr = std::numeric_limits<std::int64_t>::max();
    CNote low;
    low.mNoteNr = std::numeric_limits<std::int64_t>::min();
    for (const TSingleChordAnalysisAlgo algo : {kByScore, kByNet}) {
        for (const int wrapIntvl : {0, 1, 12, 24, 1000}) {
            for (const CMySet<CNote>& notes : {CMySet<CNote>{CNote_Undef},
                                               {CNote_Undef, {60, TEnh_n}},
                                               {low, high},
                                               {{255, TEnh_n}, {11, TEnh_n}}}) {
                CChordHeavy chord({}, notes, wrapIntvl);
                chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(algo);
                CHECK(chord.RootNoteSpecified());
                (void)chord.ProbThatNoteIsRootNote(CNote_Undef);
            }
        }
    }
    CChordHeavy undefined({}, CMySet<CNote>{CNote_Undef});
    undefined.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(kByScore);
    CHECK(undefined.RootNote().mNoteNr == kNoteNrUndef);
    CHECK(undefined.RootNote().mEnh == TEnh_n);
}

TEST_CASE("The wrap interval of the net is two octaves") {
    CChordHeavy chord({60, TEnh_n}, CMySet<unsigned char>{60, 64, 79}, 12);
    CHECK(chord.HasIntvl(7));
    chord.SetWrapIntvlToNeuronalNetInputCount();
    CHECK(chord.WrapIntvl() == 24);
    CHECK(chord.HasIntvl(19));
}

TEST_CASE("Several threads may search for roots at once") {
    CalculateAsRootNet();
    std::vector<int> found(4, 0);
    std::vector<std::thread> threads;
    for (int& count : found) {
        threads.emplace_back([&count] {
            for (unsigned char noteNr = 36; noteNr < 84; ++noteNr) {
                const auto third = static_cast<unsigned char>(noteNr + 4);
                const auto fifth = static_cast<unsigned char>(noteNr + 7);
                count += RootKeyNr(Of({noteNr, third, fifth}), kByNet) == noteNr % 12;
            }
        });
    }
    for (std::thread& thread : threads) thread.join();
    CHECK(found == std::vector<int>(4, 48));
}
