// SPDX-License-Identifier: MIT
#include "tests/chords/ChordForms.h"

#include "brindle/theory/KeyIntervals.h"

#include <doctest/doctest.h>

#include <functional>
#include <limits>
#include <string>
#include <vector>

using namespace brindle;
using namespace brindle::test;

namespace {

constexpr CKeyEnh kC{0, TEnh_n};
constexpr CKeyEnh kD{2, TEnh_n};
constexpr CKeyEnh kFSharp{6, TEnh_s};
constexpr int kIntMax = std::numeric_limits<int>::max();
constexpr int kIntMin = std::numeric_limits<int>::min();

/// The notes from `noteNrs`, over a root that is given by its number.
CChordHeavy Over(int root, const CMySet<unsigned char>& noteNrs) {
    return {CNote(root, TEnh_n), noteNrs};
}

/// From notes alone, so that the root follows the lowest.
CChordHeavy Of(const CMySet<unsigned char>& noteNrs) {
    CChordHeavy chord;
    chord.SetFromNoteNrSet(noteNrs);
    return chord;
}

std::vector<int> NoteNrs(const CChordHeavy& chord) {
    return NoteNrsOf(chord).get<std::vector<int>>();
}

std::vector<int> Intvls(const CChordHeavy& chord) {
    return {chord.IntvlSet().begin(), chord.IntvlSet().end()};
}

using TNumbers = std::vector<int>;

}  // namespace

TEST_CASE("Tones keep their interval above the root, root or bass stand in the lowest octave") {
    struct CRow {
        const char* mSymbol;
        CChordHeavy mChord;
        TNumbers mNoteNrs;
        TNumbers mIntvls;
    };
    const CRow rows[] = {
        {"C7", {kC, CSemitones{0, 4, 7, 10}, {}}, {0, 55, 58, 72, 76}, {0, 4, 7, 10}},
        {"D/F#", {kD, CSemitones{0, 4, 7}, kFSharp}, {6, 54, 57, 74}, {0, 4, 7}},
        {"D/C", {kD, CSemitones{0, 4, 7}, kC}, {0, 54, 57, 74}, {0, 4, 7, 22}},
        {"D9", {kD, CIntvlSet(0, 4, 7, 10, 14), {}}, {2, 54, 57, 60, 64, 74}, {0, 4, 7, 10, 14}},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mSymbol);
        CHECK(NoteNrs(row.mChord) == row.mNoteNrs);
        CHECK(Intvls(row.mChord) == row.mIntvls);
    }
}

TEST_CASE("The skeleton is heard without a bass that stands on a tone of its own") {
    struct CRow {
        const char* mWhat;
        CChordHeavy mChord;
        TBasicChord mBasicChord;
        int mXGChordIx;
    };
    const CRow rows[] = {
        {"half-diminished", Of({60, 63, 66, 70}), TBasicChord::Minor, 11},
        {"diminished seventh", Of({60, 63, 66, 69}), TBasicChord::Diminished, 18},
        {"minor over its major third", Over(60, {4, 60, 63, 67}), TBasicChord::Minor, 8},
        {"major with an added minor third", Of({60, 63, 64, 67}), TBasicChord::Major, 0},
        {"augmented over its fifth", Over(0, {7, 60, 64, 68}), TBasicChord::Augmented, 7},
        {"fifth over its root's fifth", Over(0, {7, 60}), TBasicChord::Drone, 31},
        {"no notes", CChordHeavy(), TBasicChord::None, 34},
        {"a single note", Of({60}), TBasicChord::None, 30},
        {"a ninth at 14 is not the second", Of({60, 64, 67, 74}), TBasicChord::Major, 0},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mWhat);
        CHECK(row.mChord.BasicChord() == row.mBasicChord);
        CHECK(row.mChord.XGChordIx() == row.mXGChordIx);
    }
}

TEST_CASE("Tones set on a chord without a root leave it so, and the next note is its root") {
    const auto withSemitones = [](CChordHeavy& chord) { chord.SetSemitones({0, 4, 7}); };
    const auto withBasicChord = [](CChordHeavy& chord) { chord.SetBasicChord(TBasicChord::Minor); };
    for (const std::function<void(CChordHeavy&)>& set :
         {std::function<void(CChordHeavy&)>(withSemitones),
          std::function<void(CChordHeavy&)>(withBasicChord)}) {
        CChordHeavy following = Of({60, 64, 67});
        set(following);
        CHECK_FALSE(following.RootNoteSpecified());
        CHECK(following.RootNote() == CNote(60, TEnh_n));
        following.AddNote(CNote(50, TEnh_n));
        CHECK(following.RootNote() == following.LowestNote());

        CChordHeavy empty;
        set(empty);
        CHECK_FALSE(empty.RootNoteSpecified());
        CHECK(empty.RootNote().IsUndef());
        empty.AddNote(CNote(62, TEnh_n));
        CHECK(empty.RootNote() == empty.LowestNote());
    }
}

TEST_CASE("Every compact chord comes back from its notes") {
    // Some keys in two spellings, so that root and bass also meet on one key.
    const CKeyEnh keys[] = {{0, TEnh_n},  {0, TEnh_s}, {1, TEnh_s}, {1, TEnh_b},  {2, TEnh_n},
                            {3, TEnh_b},  {4, TEnh_b}, {5, TEnh_n}, {6, TEnh_s},  {6, TEnh_b},
                            {7, TEnh_ss}, {8, TEnh_b}, {9, TEnh_n}, {10, TEnh_b}, {11, TEnh_b}};
    int differing = 0;
    for (const CKeyEnh& root : keys) {
        for (std::uint64_t mask = 1; mask < 4096; mask += 2) {
            const CKeyEnh& bass = keys[mask * 7 / 2 % std::size(keys)];
            const CChordLite chord(root, root == bass ? CKeyEnh_Undef : bass, CSemitones(mask));
            if (LiteOf(chord.ToChordHeavy(24)) != chord) ++differing;
        }
    }
    CHECK(differing == 0);
}

TEST_CASE("A bass on an interval of its own is no chord tone") {
    CHECK(LiteOf({kC, CSemitones{0, 4, 7}, kD}) == CChordLite(kC, kD, CSemitones{0, 4, 7}));
    // Kept: exact intervals are compared with the bass in one octave, so the ninth at 14 does not
    // double the D in the bass, and goes with it.
    CHECK(LiteOf({kC, CIntvlSet(0, 4, 7, 10, 14), kD}) ==
          CChordLite(kC, kD, CSemitones{0, 4, 7, 10}));
    // Above octave -1 the lowest note is no bass.
    CHECK(LiteOf(Over(0, {16, 55, 60})) == CChordLite(kC, {}, CSemitones{0, 4, 7}));

    const CChordHeavy sus(kC, CSemitones{0, 5, 7}, CKeyEnh{5, TEnh_n});
    CHECK_FALSE(sus.BassNoteHasIntvlAlone());
    const CChordHeavy overD(kC, CSemitones{0, 4, 7}, kD);
    CHECK(overD.HasIntvlInAnyOctave(2));
    CHECK_FALSE(overD.HasIntvlInAnyOctaveButNotInBassNoteAlone(2));
    CHECK(overD.HasIntvlInAnyOctaveOrRootButNotInBassNoteAlone(12));
}

TEST_CASE("A root that was not set follows the lowest note") {
    CChordHeavy chord = Of({60, 64, 67});
    CHECK(chord.RootNote().mNoteNr == 60);
    chord.AddNote(CNote(57, TEnh_n));
    CHECK(chord.RootNote().mNoteNr == 57);
    CHECK(chord.BasicChord() == TBasicChord::Minor);
    chord.DelNote(std::size_t{0});
    CHECK(chord.RootNote().mNoteNr == 60);
    CHECK_FALSE(chord.RootNoteSpecified());

    // Tones are counted from the root, so it stays where it is.
    chord.SetSemitones(CSemitones{0, 3, 7});
    CHECK(chord.RootNote().mNoteNr == 60);
    CHECK(NoteNrs(chord) == TNumbers{0, 60, 63, 67});

    chord.SetRootNoteWithoutSpecify(CNote(63, TEnh_b));
    CHECK(Intvls(chord) == TNumbers{0, 4, 9, 21});
    CHECK(chord.IntvlIxToNote(1).mNoteNr == 67);
    CHECK(chord.IntvlIxToKeyName(2) == "C");
    CHECK(chord.IntvlIxToNote(4).IsUndef());
    chord.SetRootNoteInCompingRange(CNote(75, TEnh_b));
    CHECK(chord.RootNoteSpecified());
    CHECK(NoteNrs(chord) == TNumbers{60, 63, 67});
}

TEST_CASE("A bass can replace all notes of its key") {
    CChordHeavy chord = Over(48, {52, 60, 64, 76});
    chord.SetBassNoteAloneInOctave(4, 1, TEnh_n);
    CHECK(NoteNrs(chord) == TNumbers{28, 60});
    CHECK(chord.BassNoteHasThisIntvlAlone(4));
    CHECK(chord.IsSlashChord());
}

TEST_CASE("Keys are asked for in lists") {
    const CChordHeavy chord = Of({48, 64, 67, 76});
    CHECK(chord.HasKeyNrs(0, 7));
    CHECK_FALSE(chord.HasKeyNrs(0, 2));
    CHECK(chord.HasExactTheseKeyNrs(7, 4, 0, -1));
    CHECK_FALSE(chord.HasExactTheseKeyNrs(0, 4));
    CHECK(chord.CountNotesInOctave(4) == 2);
    CHECK(chord.HasOtherStackedThirdsOptionThan(2) == false);
}

TEST_CASE("The spelling with the fewest signs is chosen for root and bass") {
    const CSemitones major(2741);
    const CSemitones minor(1453);
    struct CRow {
        CSemitones mScale;
        int mKeyNr;
        TEnh mGiven;
        TEnh mChosen;
    };
    const CRow rows[] = {
        {major, 1, TEnh_Undef, TEnh_b},
        {major, 3, TEnh_Undef, TEnh_b},
        {major, 6, TEnh_Undef, TEnh_s},
        {major, 8, TEnh_Undef, TEnh_b},
        {major, 10, TEnh_Undef, TEnh_b},
        {minor, 1, TEnh_Undef, TEnh_s},
        {minor, 3, TEnh_Undef, TEnh_b},
        {minor, 6, TEnh_Undef, TEnh_s},
        {minor, 8, TEnh_Undef, TEnh_s},
        {minor, 10, TEnh_Undef, TEnh_b},
        // At six signs the given spelling wins.
        {major, 6, TEnh_b, TEnh_b},
        {minor, 3, TEnh_s, TEnh_s},
        {major, 8, TEnh_s, TEnh_b},
        {major, 0, TEnh_s, TEnh_n},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mScale);
        CAPTURE(row.mKeyNr);
        CChordHeavy chord(CKeyEnh{row.mKeyNr, row.mGiven}, row.mScale, {});
        const std::vector<int> noteNrs = NoteNrs(chord);
        chord.SetRootNoteEnhWithLeastSigns();
        CHECK(chord.RootNote().mEnh == row.mChosen);
        CHECK(chord.BassKeyEnh() == chord.RootKeyEnh());
        CHECK(NoteNrs(chord) == noteNrs);
    }
    CChordHeavy overBass(CKeyEnh{8, TEnh_s}, CSemitones{0, 4, 7}, CKeyEnh{3, TEnh_s});
    overBass.SetRootNoteEnhWithLeastSigns();
    CHECK(overBass.RootKeyEnh() == CKeyEnh{8, TEnh_b});
    CHECK(overBass.BassKeyEnh() == CKeyEnh{3, TEnh_s});
}

TEST_CASE("Chords that are none have no notes and are told apart by the root's spelling") {
    CChordHeavy chord(kC, CSemitones{0, 4, 7}, kD, 12);
    chord.SetNoChordForce();
    CHECK(chord == CChordHeavy_NoChordForce());
    CHECK(chord.WrapIntvl() == 12);
    CHECK(LiteOf(chord) == CChordLite_NoChordForce);
    CHECK(LiteOf(CChordHeavy_NoChordYield()) == CChordLite_NoChordYield);
    // Kept: the undefined chord comes back with a natural spelling.
    CHECK(LiteOf(CChordHeavy_Undef()).mRootKeyEnh == CKeyEnh{15, TEnh_n});
    CHECK(CChordHeavy_Undef().IsNarrowChord());
    CHECK(CChordHeavy_Undef().LowestNote().IsUndef());

    // Semitones of a compact chord stay when the full chord has no root.
    CChordLite compact(kC, {}, CSemitones{0, 4, 7});
    compact.SetFromChordHeavy(CChordHeavy(CKeyEnh_Undef, CSemitones{0, 3, 7}, kD));
    CHECK(compact == CChordLite({15, TEnh_Undef}, kD, CSemitones{0, 4, 7}));
}

TEST_CASE("Undefined roots, notes and intervals add the undefined note once") {
    CChordHeavy noRoot(CKeyEnh_Undef, CSemitones{0, 4, 7}, CKeyEnh_Undef);
    CHECK(NoteNrs(noRoot) == TNumbers{-1});
    CHECK(noRoot.RootNoteSpecified());

    CChordHeavy chord(kC, CSemitones{0, 4, 7}, {});
    chord.AddIntvl(kIntvlUndef);
    chord.AddIntvlInCompingRange(kIntvlUndef);
    chord.AddIntvlInCompingPlusWrapIntvlRange(kIntvlUndef);
    CHECK(NoteNrs(chord) == TNumbers{-1, 0, 55, 72, 76});
    chord.Invert();
    chord.Transpose(2);
    chord.ChangeAllNotesWithinIntvlRange(0, 11, 3);
    CHECK(chord.LowestNote().IsUndef());
    chord.SetBassKeyEnh(kC);
    CHECK(chord.LowestNote().mNoteNr == 0);

    CChordHeavy fromBytes = Of({255, 60});
    CHECK(NoteNrs(fromBytes) == TNumbers{-1, 60});
}

TEST_CASE("Numbers at the edges neither overflow nor leave the keyboard") {
    for (const int amount : {kIntMax, kIntMin, 127, -127}) {
        CAPTURE(amount);
        CChordHeavy chord(kC, CSemitones{0, 4, 7, 11}, kFSharp);
        chord.Transpose(amount);
        CHECK(chord.LowestNote().mNoteNr == (amount > 0 ? 127 : 0));
        CHECK(chord.HighestNote().mNoteNr == (amount > 0 ? 127 : 0));
        CHECK(chord.RootNote().mNoteNr == (amount > 0 ? 127 : 0));
    }
    for (const int number : {kIntMax, kIntMin}) {
        CAPTURE(number);
        CChordHeavy chord(kC, CSemitones{0, 4, 7}, {}, 12);
        chord.AddIntvl(number);
        chord.AddIntvlInCompingRange(number);
        chord.AddIntvlInCompingPlusWrapIntvlRange(number);
        chord.SetBassNoteInOctave(number, number, TEnh_s);
        chord.ChangeAllNotesWithinIntvlRange(0, 11, number);
        chord.DeleteAllNotesInOctave(number);
        chord.SetRootKeyNr(number);
        chord.IntvlSet_SetWrapIntvl(number);
        CHECK(chord.HasIntvlInAnyOctave(number) == chord.HasIntvlInAnyOctave(number));
        chord.SetSemitones(CSemitones{0, 4, 7});
        CHECK(chord.Notes().size() <= 4);
        CHECK(chord.ChordKeyNrFromKeyNr(number) < 12);
    }
    CNote low;
    low.mNoteNr = std::numeric_limits<std::int64_t>::min();
    CNote high;
    high.mNoteNr = std::numeric_limits<std::int64_t>::max();
    CChordHeavy far(high, CMySet<CNote>{low, high}, 0);
    CHECK_FALSE(far.IsNarrowChord());
    CHECK(far.IntvlSet().size() <= 2);
    CHECK(far.BasicChord() == TBasicChord::None);
    far.Invert();
    far.Transpose(-1);
    CHECK(far.HighestNote().mNoteNr <= 127);
}

TEST_CASE("Usual chords need no memory but their own") {
    const CChordLite chord(kC, kD, CSemitones{0, 2, 4, 5, 7, 9, 10});
    const CChordHeavy unfolded = chord.ToChordHeavy(24);
    const auto inside = [&](const void* address) {
        const auto* const begin = reinterpret_cast<const char*>(&unfolded);
        const auto* const at = static_cast<const char*>(address);
        return !std::less<>()(at, begin) && std::less<>()(at, begin + sizeof(unfolded));
    };
    CHECK(inside(&*unfolded.Notes().begin()));
    CHECK(inside(&*unfolded.IntvlSet().begin()));
}

TEST_CASE("Intervals are added above the root, and notes outside a key are counted") {
    CChordHeavy chord(kC, CSemitones{0, 4, 7}, {}, 12);
    const auto tones = [&] { return chord.Semitones(); };
    chord.AddIntvlSetAboveRootNote(CIntvlSet{10});
    CHECK(tones() == CSemitones{0, 4, 7, 10});
    chord.AddIntvlSetInCompingRange(CIntvlSet{14});
    CHECK(tones() == CSemitones{0, 2, 4, 7, 10});
    // Of C9 only the B flat lies outside C major.
    CHECK(chord.CountNotesNotInSignKey(CSignKeyHeavy(kC, TSignKeyTypeNoUndef_Major)) == 1);
    CHECK(chord.CountNotesNotInSignKey(CSignKeyHeavy(CKeyEnh_F, TSignKeyTypeNoUndef_Major)) == 0);
}

TEST_CASE(
    "The root of a chord moves to the note of an interval, and is undefined behind the last") {
    CChordHeavy chord(CNote(60, TEnh_n), {60, 64, 67, 70});
    chord.SetRootNoteToIntvlIx(1);
    CHECK(chord.RootKeyEnh() == CKeyEnh_E);
    chord.SetRootNoteToIntvlIx(99);
    CHECK(chord.RootKeyEnh().IsUndef());
}

TEST_CASE("The intervals of a chord are worked out anew when its notes have changed") {
    CChordHeavy chord(CNote(60, TEnh_n), {60, 64, 67});
    (void)chord.IntvlSet();
    CHECK_FALSE(chord.IntvlSetAndBassNoteHasIntvlAloneNeedsUpdate());
    chord.AddNote(CNote(70, TEnh_b));
    CHECK(chord.IntvlSetAndBassNoteHasIntvlAloneNeedsUpdate());
    (void)chord.IntvlSet();
    CHECK_FALSE(chord.IntvlSetAndBassNoteHasIntvlAloneNeedsUpdate());
}
