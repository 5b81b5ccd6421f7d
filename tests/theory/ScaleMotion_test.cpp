// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include "brindle/theory/KeyIntervals.h"

#include <doctest/doctest.h>

#include <limits>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

/// An answer about the scale in front of the arguments.
template <class Question>
Answer Asking(Question question) {
    return [question](const json& in) -> json { return question(ScaleOf(in.at(0)), in); };
}

int IntOf(const json& in, std::size_t n = 1) {
    return in.at(n).get<int>();
}

TQuantizeToScaleDirection DirectionOf(const json& in) {
    return static_cast<TQuantizeToScaleDirection>(IntOf(in, 2));
}

/// A note number with `fold`, or a whole note
json Moved(const CScaleHeavy& scale, const json& in) {
    if (in.at(1).is_array()) return FormOf(scale.MoveInScale(NoteOf(in.at(1)), IntOf(in, 2)));
    return scale.MoveInScale(in.at(1).get<std::int64_t>(), IntOf(in, 2), in.at(3).get<bool>());
}

json Quantized(const CScaleHeavy& scale, const json& in) {
    int octave = 0;
    const int degree = scale.QuantizeToScaleDegreeNr(IntOf(in), DirectionOf(in), octave);
    return {{"degree", degree}, {"octave", octave}};
}

constexpr auto kTieRight = TQuantizeToScaleDirection_ClosestTieRight;
constexpr auto kTieLeft = TQuantizeToScaleDirection_ClosestTieLeft;

}  // namespace

TEST_CASE("Notes move along a scale by its steps, and foreign ones are quantized to it") {
    CheckExpected(
        "theory-scale-motion",
        {
            {"CScaleHeavy::MoveInScale", Asking(Moved)},
            {"CScaleHeavy::QuantizeToScaleDegreeNr", Asking(Quantized)},
            {"CScaleHeavy::QuantizeToScaleKeyEnh",
             Asking([](const CScaleHeavy& scale, const json& in) {
                 return FormOf(scale.QuantizeToScaleKeyEnh(KeyEnhOf(in.at(1)), DirectionOf(in)));
             })},
            {"CScaleHeavy::NoteQuantizeToScaleNote",
             Asking([](const CScaleHeavy& scale, const json& in) {
                 return FormOf(scale.NoteQuantizeToScaleNote(NoteOf(in.at(1)), DirectionOf(in)));
             })},
            {"CScaleHeavy::KeyNrToDegreeNr", Asking([](const CScaleHeavy& scale, const json& in) {
                 return scale.KeyNrToDegreeNr(IntOf(in));
             })},
            {"CScaleHeavy::IntvlToDegreeNr", Asking([](const CScaleHeavy& scale, const json& in) {
                 return scale.IntvlToDegreeNr(IntOf(in));
             })},
            {"CScaleHeavy::NoteNrToDegreeNr", Asking([](const CScaleHeavy& scale, const json& in) {
                 return scale.NoteNrToDegreeNr(IntOf(in));
             })},
            {"CScaleHeavy::EnhForNote", Asking([](const CScaleHeavy& scale, const json& in) {
                 return scale.EnhForNote(NoteOf(in.at(1)));
             })},
            {"CScaleHeavy::EnhForChromStep", Asking([](const CScaleHeavy& scale, const json& in) {
                 return scale.EnhForChromStep(IntOf(in));
             })},
            {"CScaleHeavy::DegreeNrToKeyNr", Asking([](const CScaleHeavy& scale, const json& in) {
                 return scale.DegreeNrToKeyNr(IntOf(in));
             })},
        });
}

TEST_CASE("Degrees stand in the octave that is asked for") {
    const CScaleHeavy cMajor(CKeyEnh_C, st_maj);
    const CScaleHeavy eFlatMajor(CKeyEnh_Eb, st_maj);
    CHECK(cMajor.DegreeNrToNoteNr(0, 4) == 60);
    CHECK(eFlatMajor.DegreeNrToNote(3, 4) == CNote(68, TEnh_b));
    CHECK(eFlatMajor.DegreeNrToNoteInLowestOctave(7) == CNote(3, TEnh_b));
    CHECK(eFlatMajor.DegreeNrToKeyEnh(-4) == CKeyEnh_Eb);
}

TEST_CASE("Moving stays on the keys of the scale beyond both ends of the keyboard") {
    const CScaleHeavy cMajor(CKeyEnh_C, st_maj);
    CHECK(cMajor.MoveInScale(0, -1) == -1);
    CHECK(cMajor.MoveInScale(0, -1, true) == 11);
    CHECK(cMajor.MoveInScale(127, 1) == 129);
    CHECK(cMajor.MoveInScale(127, 1, true) == 117);
    CHECK(cMajor.MoveInScale(255, 1) == kNoteNrUndef);
    CHECK(cMajor.MoveInScale(CNote_Undef, 1) == CNote_Undef);
}

TEST_CASE("A moved note is spelled by the scale, also where that is no usual spelling") {
    const CScaleHeavy scale(CKeyEnh{9, TEnh_ss}, st_maj);  // G double sharp
    CHECK(scale.DegreeNrToNote(6, 4).mEnh == TEnh_sss);
    CHECK(scale.MoveInScale(CNote(57, TEnh_ss), 6) == scale.DegreeNrToNote(6, 4));

    int different = 0;
    for (int keyNr = 0; keyNr < 12; ++keyNr) {
        for (const TEnh enh : {TEnh_bb, TEnh_b, TEnh_n, TEnh_s, TEnh_ss}) {
            for (const CScaleRow& row : kScaleCatalogue) {
                const CScaleHeavy any(CKeyEnh{keyNr, enh}, row.mType);
                for (int step = 0; step < any.DegreesPerOctave(); ++step) {
                    const CNote start = any.DegreeNrToNote(0, 4);
                    const CKeyEnh moved = any.MoveInScale(start, step).KeyEnh();
                    different += moved != any.DegreeNrToKeyEnh(step);
                }
            }
        }
    }
    CHECK(different == 0);
}

TEST_CASE("Huge steps, notes and keys stay on the scale and end at once") {
    constexpr int least = std::numeric_limits<int>::min();
    constexpr int largest = std::numeric_limits<int>::max();
    const CScaleHeavy cMajor(CKeyEnh_C, st_maj);
    for (const int steps : {least, largest}) {
        for (const std::int64_t noteNr : {std::int64_t{60}, std::int64_t{largest}}) {
            CHECK(cMajor.HasNoteNr(cMajor.MoveInScale(noteNr, steps, true)));
        }
        int octave = 0;
        CHECK(cMajor.QuantizeToScaleDegreeNr(steps, kTieRight, octave) >= 0);
        CHECK(cMajor.EnhForChromStep(steps) != TEnh_sss);
    }
    CHECK(cMajor.MoveInScale(std::numeric_limits<std::int64_t>::max(), largest, true) >= 0);
}

TEST_CASE("Without degrees there is nothing to quantize to") {
    const CScaleHeavy noSteps(CKeyEnh_C, CSemitones_Undef);
    int octave = 1;
    CHECK(noSteps.QuantizeToScaleDegreeNr(3, kTieRight, octave) == -1);
    CHECK(octave == 0);
    CHECK(noSteps.QuantizeToScaleKeyEnh(CKeyEnh_E, kTieLeft) == CKeyEnh_Undef);
    CHECK(noSteps.NoteQuantizeToScaleNote(CNote(60, TEnh_n), kTieLeft) == CNote_Undef);
    const CScaleHeavy cMajor(CKeyEnh_C, st_maj);
    CHECK(cMajor.QuantizeToScaleDegreeNr(kKeyNrUndef, kTieRight, octave) == -1);
    CHECK(cMajor.NoteQuantizeToScaleNote(CNote_Undef, kTieRight) == CNote_Undef);
}
