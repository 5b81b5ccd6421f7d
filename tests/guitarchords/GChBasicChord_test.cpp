// SPDX-License-Identifier: MIT
#include "tests/guitarchords/GridForms.h"
#include "tests/support/Expected.h"

#include "brindle/guitarchords/GChDisplayOptions.h"
#include "brindle/guitarchords/GChFilterParameter.h"
#include "brindle/guitarchords/GChLibrary.h"
#include "brindle/guitarchords/GChTuning.h"
#include "brindle/theory/Trace.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <array>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

std::shared_ptr<GChBasicChord> GuitarChord(const json& elems) {
    auto chord = std::make_shared<GChBasicChord>(kGChStandardGuitar);
    AddElems(*chord, elems);
    return chord;
}

template <class TAnswer>
json ForStrings(int count, TAnswer answer) {
    json list = json::array();
    for (int i = 0; i < count; ++i) list.push_back(answer(i));
    return list;
}

// What a grid shows and sounds, see the heading of the file.
json GridOf(const json& in) {
    const auto basic = BasicChordOf(in.at(0), in.at(1).get<int>(), in.at(2));
    const GChChord chord = ViewOf(basic);
    const int strings = chord.numberOfStrings();
    json pitches = json::array();
    for (int capo = 0; capo < 4; ++capo) {
        pitches.push_back(
            ForStrings(strings, [&](int i) { return chord.pitchForStringIndex(i, capo); }));
    }
    return {
        {"maxAbsFretIndexPlusOneForStringIndex",
         ForStrings(17, [&](int i) { return chord.maxAbsFretIndexPlusOneForStringIndex(i); })},
        {"pitchForStringIndex", pitches},
        {"firstShownFretForNumberOfFrets",
         ForStrings(8, [&](int frets) { return chord.firstShownFretForNumberOfFrets(frets); })},
        {"lowestFingeredFret", chord.lowestFingeredFret()},
        {"isMutedForStringIndex",
         ForStrings(16, [&](int i) { return chord.isMutedForStringIndex(i) ? 1 : 0; })},
        {"isOpenForStringIndex",
         ForStrings(strings, [&](int i) { return chord.isOpenForStringIndex(i) ? 1 : 0; })},
        {"hasOpenStrings", chord.hasOpenStrings()},
        {"numberOfRealSpotsForStringIndex",
         ForStrings(strings, [&](int i) { return basic->numberOfRealSpotsForStringIndex(i); })},
        {"numberOfOptionalSpotsForStringIndex",
         ForStrings(strings, [&](int i) { return basic->numberOfOptionalSpotsForStringIndex(i); })},
        {"sortedChordElems", FormOf(basic->sortedChordElems())},
        {"stringFromPitches", chord.stringFromPitches(0)}};
}

json FingerOf(const GChChordElem* elem) {
    return elem == nullptr ? json(nullptr) : json(elem->fingerNumber());
}

json Found(const json& in) {
    const auto chord = GuitarChord(in.at(0));
    const int fret = in.at(1);
    const int string = in.at(2);
    return {{"elemAtAbsFretIndex", FingerOf(chord->elemAtAbsFretIndex(fret, string))},
            {"spotAtAbsFretIndex", FingerOf(chord->spotAtAbsFretIndex(fret, string))},
            {"hasSingleSpot", chord->hasSingleSpot(nullptr, string, fret)},
            {"liesInBarreShadow",
             chord->liesInBarreShadow(nullptr, fret, string, std::min(string + 1, 5))}};
}

using TRemove = void (GChBasicChord::*)(int, bool);

Answer Removing(TRemove remove) {
    return [remove](const json& in) {
        const auto chord = GuitarChord(in.at(0));
        (*chord.*remove)(in.at(1), in.at(2));
        return FormOf(chord->chordElems());
    };
}

json PropertyListOf(const json& in) {
    const json& fields = in.at(0);
    const auto chord = GuitarChord(fields.at("chordElems"));
    chord->setIsMutedMask(fields.at("isMutedMask"));
    chord->setRootNote(fields.at("rootNote"));
    chord->setBassNote(fields.at("bassNote"));
    chord->setChordType(fields.at("chordType"));
    chord->setDifficultyLevel(fields.at("difficultyLevel"));
    chord->setIsFavoriteMask(fields.at("isFavoriteMask"));
    return chord->propertyList();
}

GChChord NamedChord(const json& root, const json& name) {
    const auto chord = GuitarChord(json::array());
    chord->setRootNote(root);
    chord->setUserName(name.get<std::string>());
    return ViewOf(chord);
}

GChChord ChordWithNotes(int root, int bass) {
    const auto chord = GuitarChord(json::array());
    chord->setRootNote(root);
    chord->setBassNote(bass);
    return ViewOf(chord);
}

}  // namespace

TEST_CASE("A grid sounds the fretted and the open strings and is silent on the muted ones") {
    CheckExpected("guitar_grids", {{"GChChord", GridOf}});
}

TEST_CASE("A fingering knows its fingers, its barres and what lies in their shadow") {
    CheckExpected(
        "guitar_chord_model",
        {{"addChordElem",
          [](const json& in) -> json {
              const auto elem =
                  GChChordElem::make(in.at(0), in.at(1), in.at(2), in.at(3), in.at(4));
              if (!elem) return nullptr;
              return {{"propertyList", elem->propertyList()},
                      {"singleStringIndex", elem->singleStringIndex()}};
          }},
         {"GChBasicChord", Found},
         {"hasBarreSpot",
          [](const json& in) {
              return GuitarChord(in.at(0))->hasBarreSpot(nullptr, in.at(1), in.at(2), in.at(3));
          }},
         {"fretIndexForBarreSpot",
          [](const json& in) {
              return GuitarChord(in.at(0))->fretIndexForBarreSpot(nullptr, in.at(1), in.at(2));
          }},
         {"removeSpotsForStringIndex", Removing(&GChBasicChord::removeSpotsForStringIndex)},
         {"removeRealSpotsForStringIndex", Removing(&GChBasicChord::removeRealSpotsForStringIndex)},
         {"removeOptionalSpotsForStringIndex",
          Removing(&GChBasicChord::removeOptionalSpotsForStringIndex)},
         {"propertyList", PropertyListOf},
         {"GChChord::chordName",
          [](const json& in) { return NamedChord(in.at(0), in.at(1)).chordName(in.at(2)); }},
         {"chordNameWithIndex",
          [](const json& in) {
              return NamedChord(in.at(0), in.at(1)).chordNameWithIndex(in.at(2), in.at(3));
          }},
         {"rootNote",
          [](const json& in) { return ChordWithNotes(in.at(0), -1).rootNote(in.at(1)); }},
         {"bassNote",
          [](const json& in) { return ChordWithNotes(-1, in.at(0)).bassNote(in.at(1)); }}});
}

TEST_CASE("What is put down last on a string sounds") {
    const json barre = {1, 1, 0, 5, 0};
    const json spot = {3, 3, 2, 2, 0};
    const GChChord after = ViewOf(GuitarChord({barre, spot}));
    const GChChord before = ViewOf(GuitarChord({spot, barre}));
    for (int i = 0; i < 6; ++i) {
        CHECK(after.maxAbsFretIndexPlusOneForStringIndex(i) == (i == 2 ? 4 : 2));
        CHECK(before.maxAbsFretIndexPlusOneForStringIndex(i) == 2);
    }
}

TEST_CASE("The mute mask is one signed byte") {
    const auto chord = GuitarChord(json::array());
    chord->setMuted(true, 8);
    CHECK(chord->isMutedMask() == 0);
    chord->setMuted(true, 7);
    CHECK(chord->isMutedMask() == -128);
    for (int i = 0; i < 16; ++i) CHECK(chord->isMutedForStringIndex(i) == (i >= 7));
    CHECK(chord->propertyList().at("isMutedMask") == 65408);
    chord->setMuted(false, 7);
    CHECK(chord->isEmpty());
}

TEST_CASE("A fingering that was shifted off the neck wraps in its byte") {
    const auto chord = GuitarChord({{1, 0, 0, 0, 0}, {2, 2, 1, 1, 0}});
    chord->shiftFretIndexesBy(-1);
    CHECK(FormOf(chord->chordElems()) == json{{1, -1, 0, 0, 0}, {2, 1, 1, 1, 0}});
    CHECK(chord->lowestFingeredFret() == 1);
    CHECK(chord->chordElems().front().propertyList().at("absFretIndex") == 255);
    chord->shiftFretIndexesBy(257);
    CHECK(FormOf(chord->chordElems()) == json{{1, 0, 0, 0, 0}, {2, 2, 1, 1, 0}});
}

TEST_CASE("Elements are removed by their address") {
    const auto chord = GuitarChord({{1, 0, 0, 0, 0}, {1, 0, 0, 0, 0}, {2, 1, 1, 1, 0}});
    const auto foreign = *GChChordElem::make(1, 0, 0, 0);
    chord->removeChordElem(&foreign);
    CHECK(chord->chordElemCount() == 3);
    const std::array<const GChChordElem*, 2> two{&chord->chordElems()[2], &chord->chordElems()[0]};
    chord->removeChordElems(two);
    CHECK(FormOf(chord->chordElems()) == json{{1, 0, 0, 0, 0}});
}

TEST_CASE("Fingerings are equal whatever the order of their elements") {
    const auto a = GuitarChord({{1, 0, 0, 5, 0}, {3, 2, 1, 1, 0}});
    const auto b = GuitarChord({{3, 2, 1, 1, 0}, {1, 0, 0, 5, 0}});
    b->setIsFavorite(true, 32);
    CHECK(b->isFavoriteMask() == 1);
    CHECK(a->isEqualToChordRange(*b, false));
    CHECK_FALSE(a->isEqualToChordRange(*b, true));
    b->clearFavoriteMask();
    CHECK(a->isEqualToChordRange(*b, true));
    b->setRootNote(5);
    CHECK_FALSE(a->isEqualToChordRange(*b, false));
    b->setUserName("mine");
    b->clearAll();
    CHECK(b->isEmpty());
    CHECK(b->userName() == "mine");
}

TEST_CASE("Fingerings that sound the same are similar, in libraries of equal tunings") {
    const auto tuning = std::make_shared<GChTuning>(kGChStandardGuitar);
    const auto library = tuning->createLibraryWithPath({});
    const auto asBarre = GuitarChord({{1, 0, 0, 5, 0}});
    const auto asSpots = GuitarChord({{1, 0, 0, 0, 0},
                                      {1, 0, 1, 1, 0},
                                      {2, 0, 2, 2, 0},
                                      {2, 0, 3, 3, 0},
                                      {3, 0, 4, 4, 0},
                                      {3, 0, 5, 5, 0}});
    CHECK_FALSE(ViewOf(asBarre).isSimilarToChord(ViewOf(asSpots)));
    library->addBasicChord(asBarre);
    library->addBasicChord(asSpots);
    CHECK(ViewOf(asBarre).isSimilarToChord(ViewOf(asSpots)));
    asSpots->setMuted(true, 0);
    CHECK_FALSE(ViewOf(asBarre).isSimilarToChord(ViewOf(asSpots)));
}

TEST_CASE("Under a capodaster the view and the fingering name another root") {
    const auto chord = GuitarChord(json::array());
    chord->setRootNote(4);
    chord->setUserName("open");
    CHECK(ViewOf(chord).chordName(1) == "F open");
    CHECK(chord->chordName(-1, 1) == "E open");
    chord->setRootNote(12);
    CHECK(chord->chordName(-1, 0) == " open");
    CHECK(ViewOf(chord).chordName(0) == "C open");
    chord->setUserName("");
    CHECK_FALSE(chord->chordName(-1, 0).has_value());
    CHECK_FALSE(GChChord::make(nullptr, 0).has_value());
}

TEST_CASE("A fingering prints its property list") {
    const auto chord = GuitarChord({{1, 0, 0, 5, 0}});
    chord->setUserName("\xFF");
    CHECK(
        TraceString(chord->chordElems()[0]) ==
        R"({"absFretIndex":0,"coveredMaxStr":5,"coveredMinStr":0,"fingerNumber":1,"fingerPointType":0})");
    CHECK(TraceString(ViewOf(chord)).find(TraceString(*chord)) != std::string::npos);
}

TEST_CASE("Any change of a fingering is seen, that of its bass, too") {
    struct CChange {
        const char* mWhat;
        void (*mChange)(GChBasicChord& chord);
    };
    const CChange changes[] = {
        {"root", [](GChBasicChord& chord) { chord.setRootNote(2); }},
        {"bass", [](GChBasicChord& chord) { chord.setBassNote(7); }},
        {"type", [](GChBasicChord& chord) { chord.setChordType(3); }},
        {"difficulty", [](GChBasicChord& chord) { chord.setDifficultyLevel(2); }},
        {"muted string", [](GChBasicChord& chord) { chord.setMuted(true, 5); }},
        {"finger", [](GChBasicChord& chord) { chord.addChordElem(nullptr, 4, 3, 4); }},
    };
    const auto original = GuitarChord({{3, 3, 1, 1, 0}, {2, 2, 2, 2, 0}, {1, 1, 4, 4, 0}});
    original->setRootNote(0);
    original->setBassNote(4);
    CHECK(GChBasicChord(*original).isEqualToChordRange(*original, true));
    for (const CChange& change : changes) {
        CAPTURE(change.mWhat);
        GChBasicChord changed(*original);
        change.mChange(changed);
        CHECK_FALSE(changed.isEqualToChordRange(*original, false));
        CHECK_FALSE(original->isEqualToChordRange(changed, false));
    }
    GChBasicChord favorite(*original);
    favorite.setIsFavorite(true, 0);
    CHECK(favorite.isEqualToChordRange(*original, false));
    CHECK_FALSE(favorite.isEqualToChordRange(*original, true));
}

TEST_CASE("The single spots of a string are counted, and the highest of each kind is found") {
    // On string 1: two fingers to press and one that may be left out.
    const auto chord =
        GuitarChord({{1, 2, 1, 1, 0}, {3, 5, 1, 1, 0}, {4, 7, 1, 1, 1}, {2, 3, 0, 4, 0}});
    CHECK(chord->numberOfSpotsForStringIndex(1) ==
          chord->numberOfRealSpotsForStringIndex(1) +
              chord->numberOfOptionalSpotsForStringIndex(1));
    CHECK(chord->numberOfSpotsForStringIndex(1) == 3);
    CHECK(chord->numberOfSpotsForStringIndex(2) == 0);
    REQUIRE(chord->realSpotAtMaxIndexForStringIndex(1) != nullptr);
    CHECK(chord->realSpotAtMaxIndexForStringIndex(2) == nullptr);
    CHECK(chord->optionalSpotAtMaxIndexForStringIndex(2) == nullptr);
}

TEST_CASE("What a host sets on a view, an element, a filter and a drawing is kept in its bytes") {
    const auto basic = GuitarChord({{1, 0, 0, 5, 0}});
    GChChord chord = ViewOf(basic);
    chord.setRootEnhType(1);
    chord.setBassEnhType(258);
    chord.setTransposeIndex(7);
    CHECK(chord.rootEnhType() == 1);
    CHECK(chord.bassEnhType() == 2);
    CHECK(chord.transposeIndex() == 0);

    GChChordElem elem = basic->chordElems()[0];
    elem.setCoveredMinStr(4, 2);
    CHECK(elem.coveredMinStr() == 4);
    CHECK(elem.coveredMaxStr() == 2);

    GChFilterParameter filter;
    filter.setRootNoteToFilter(3, 2);
    filter.setBassNoteToFilter(4, 1);
    CHECK(filter.rootEnhType() == 2);
    CHECK(filter.bassEnhType() == 1);

    GChDisplayOptions options;
    CHECK(options.numberOfFrets() == -1);
    options.setNumberOfFrets(5);
    options.setBarreType(true);
    CHECK(options.numberOfFrets() == 5);
    CHECK(options.barreType() == 1);

    GChShortTuning tuning{};
    GChCopyShortTuning(kGChStandardGuitar, tuning);
    CHECK(tuning == kGChStandardGuitar);
    GChClearShortTuning(tuning);
    CHECK(GChNumberOfStringsInShortTuning(tuning) == 0);
}
