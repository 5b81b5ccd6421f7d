// SPDX-License-Identifier: MIT
#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Note.h"

#include "brindle/musicxml/MuxmlLimits.h"
#include "brindle/musicxml/internal/ElementTable.h"
#include "brindle/musicxml/internal/ReadMuxml.h"

#include <utility>

namespace brindle {

namespace {

using TNote = XMLParserDelegate_RecursiveMuxml_Note;
using Text = std::string_view;

struct CNoteRow {
    std::string_view mElement;
    void (*mRead)(TNote& self, CMuxmlNote& note, const CMuxmlAttributes& attributes, Text text);
};
using A = const CMuxmlAttributes&;

// Element, what is done with its text. Each is done with the empty text at the start of the
// element, and once more if there is a text: counters and lists then grow twice.
// clang-format off
constexpr muxml::CElementTable kElements(std::to_array<CNoteRow>({
    {"accent",          [](TNote&, CMuxmlNote& n, A a, Text) { n.mAccent.ReadFromAttributes(a); }},
    {"breath-mark",     [](TNote&, CMuxmlNote& n, A a, Text) { n.mBreathMark.ReadFromAttributes(a); }},
    {"caesura",         [](TNote&, CMuxmlNote& n, A a, Text) { n.mCaesura.ReadFromAttributes(a); }},
    {"detached-legato", [](TNote&, CMuxmlNote& n, A a, Text) { n.mDetachedLegato.ReadFromAttributes(a); }},
    {"staccato",        [](TNote&, CMuxmlNote& n, A a, Text) { n.mStaccato.ReadFromAttributes(a); }},
    {"staccatissimo",   [](TNote&, CMuxmlNote& n, A a, Text) { n.mStaccatissimo.ReadFromAttributes(a); }},
    {"strong-accent",   [](TNote&, CMuxmlNote& n, A a, Text) { n.mStrongAccent.ReadFromAttributes(a); }},
    {"tenuto",          [](TNote&, CMuxmlNote& n, A a, Text) { n.mTenuto.ReadFromAttributes(a); }},
    {"doit",            [](TNote&, CMuxmlNote& n, A a, Text) { n.mDoit.ReadFromAttributes(a); }},
    {"falloff",         [](TNote&, CMuxmlNote& n, A a, Text) { n.mFallOff.ReadFromAttributes(a); }},
    {"plop",            [](TNote&, CMuxmlNote& n, A a, Text) { n.mPlop.ReadFromAttributes(a); }},
    {"scoop",           [](TNote&, CMuxmlNote& n, A a, Text) { n.mScoop.ReadFromAttributes(a); }},
    {"accidental",      [](TNote&, CMuxmlNote& n, A a, Text t) { n.mAccidental.ReadFromFoundCharactersAndAttributes(t, a); }},
    {"fermata",         [](TNote&, CMuxmlNote& n, A a, Text t) { n.mFermata.ReadFromFoundCharactersAndAttributes(t, a); }},
    {"stem",            [](TNote&, CMuxmlNote& n, A a, Text t) { n.mStem.ReadFromFoundCharactersAndAttributes(t, a); }},
    {"type",            [](TNote&, CMuxmlNote& n, A a, Text t) { n.mGraphicalNoteType.ReadFromFoundCharactersAndAttributes(t, a); }},
    {"alter",           [](TNote&, CMuxmlNote& n, A, Text t) { n.mPitch.mAlteration = muxml::ReadFloat(t); }},
    {"step",            [](TNote&, CMuxmlNote& n, A, Text t) { n.mPitch.mStep = MuxmlValueOf(t, TMuxmlEnum_Step_Undef); }},
    {"octave",          [](TNote&, CMuxmlNote& n, A, Text t) { n.mPitch.mOctave = ReadInteger(t); }},
    {"display-step",    [](TNote&, CMuxmlNote& n, A, Text t) { n.mUnpitched.mDisplayStep = MuxmlValueOf(t, TMuxmlEnum_Step_Undef); }},
    {"display-octave",  [](TNote&, CMuxmlNote& n, A, Text t) { n.mUnpitched.mDisplayOctave = ReadInteger(t); }},
    {"chord",           [](TNote&, CMuxmlNote& n, A, Text) { n.mIsChordNote = true; }},
    {"cue",             [](TNote&, CMuxmlNote& n, A, Text) { n.mIsCueNote = true; }},
    {"grace",           [](TNote&, CMuxmlNote& n, A, Text) { n.mIsGraceNote = true; }},
    {"dot",             [](TNote&, CMuxmlNote& n, A, Text) { ++n.mDots; }},
    {"duration",        [](TNote&, CMuxmlNote& n, A, Text t) { n.mLengthAsDuration = ReadInteger(t); }},
    {"instrument",      [](TNote& self, CMuxmlNote&, A, Text t) { self.InstrumentName = t; }},
    {"pitch",           [](TNote&, CMuxmlNote& n, A, Text) { n.mNoteType = TMuxmlEnum_NoteType_Pitched; }},
    {"unpitched",       [](TNote&, CMuxmlNote& n, A, Text) { n.mNoteType = TMuxmlEnum_NoteType_Unpitched; }},
    {"rest",            [](TNote&, CMuxmlNote& n, A, Text) { n.mNoteType = TMuxmlEnum_NoteType_Rest; }},
    {"staff",           [](TNote&, CMuxmlNote& n, A, Text t) { n.mStaff = ReadInteger(t); }},
    {"voice",           [](TNote&, CMuxmlNote& n, A, Text t) { n.mVoice = ReadInteger(t); }},
    {"tie",             [](TNote& self, CMuxmlNote&, A, Text) { self.FoundTie(); }},
    {"attack",          [](TNote&, CMuxmlNote& n, A, Text t) { n.mPositionDisplayOffsetAsMidiTicks = muxml::TruncatedToInteger(muxml::ReadFloat(t)); }},
    {"release",         [](TNote&, CMuxmlNote& n, A, Text t) { n.mLengthDisplayOffsetAsMidiTicks = muxml::TruncatedToInteger(muxml::ReadFloat(t)); }},
    {"notations",       [](TNote& self, CMuxmlNote&, A, Text) { self.FindNotations(); }},
    {"notehead",        [](TNote& self, CMuxmlNote&, A, Text) { self.FindNotehead(); }},
    {"notehead-text",   [](TNote& self, CMuxmlNote&, A, Text) { self.FindNoteheadText(); }},
    {"time-modification", [](TNote&, CMuxmlNote&, A, Text) {}},
    {"actual-notes",    [](TNote&, CMuxmlNote& n, A, Text t) { n.mTimeModification.mActualNotes = muxml::ReadUnsigned(t); }},
    {"normal-notes",    [](TNote&, CMuxmlNote& n, A, Text t) { n.mTimeModification.mNormalNotes = muxml::ReadUnsigned(t); }},
    {"normal-type",     [](TNote&, CMuxmlNote& n, A, Text t) { n.mTimeModification.mNormalNoteType = MuxmlValueOf(t, TMuxmlEnum_NoteTypeValue_Quarter); }},
    {"normal-dot",      [](TNote&, CMuxmlNote& n, A, Text) { ++n.mTimeModification.mNormalNumberOfDots; }},
    {"tuplet",          [](TNote&, CMuxmlNote& n, A a, Text) { n.mTuplet.ReadFromAttributes(a); }},
}));

// The same inside the two sides of the ratio of a tuplet.
struct CTupletRow {
    std::string_view mElement;
    void (*mRead)(CMuxmlTupletPortion& portion, const CMuxmlAttributes& attributes, Text text);
};
constexpr muxml::CElementTable kTupletElements(std::to_array<CTupletRow>({
    {"tuplet-number", [](CMuxmlTupletPortion& p, A a, Text t) { p.mTupletNumber.ReadFromFoundCharactersAndAttributes(t, a); }},
    {"tuplet-type",   [](CMuxmlTupletPortion& p, A a, Text t) { p.mTupletType.ReadFromFoundCharactersAndAttributes(t, a); }},
    {"tuplet-dot",    [](CMuxmlTupletPortion& p, A a, Text t) { p.mTupletDot.ReadFromFoundCharactersAndAttributes(t, a); }},
}));
// clang-format on
static_assert(kElements.HasNoNameTwice() && kTupletElements.HasNoNameTwice());

}  // namespace

void TNote::didStartMyElement(XmlStreamParser&, std::string_view, const XmlAttributes& attributes) {
    InstrumentName.clear();
    if (const auto dynamics = attributes.Find("dynamics")) {
        EncounteredNote.mVelocityAsDynamics = static_cast<float>(ReadInteger(*dynamics));
    }
    if (const auto dynamics = attributes.Find("end-dynamics")) {
        EncounteredNote.mRelVelocityAsEndDynamics = static_cast<float>(ReadInteger(*dynamics));
    }
    ++Context().CurrentPartMeasureNotesXMLIx;
}

void TNote::foundTrimmedCharacters(XmlStreamParser& parser, std::string_view text) {
    if (const CNoteRow* row = kElements.Find(currentElementName)) {
        row->mRead(*this, EncounteredNote, currentAttributes, text);
        return;
    }
    if (!IsInside("tuplet")) {
        ParentDelegate->foundCharacters(parser, text);
        return;
    }
    CMuxmlTupletPortion* const portion = OpenTupletPortion();
    const CTupletRow* const row = kTupletElements.Find(currentElementName);
    if (portion != nullptr && row != nullptr) row->mRead(*portion, currentAttributes, text);
}

CMuxmlTupletPortion* TNote::OpenTupletPortion() {
    if (IsInside("tuplet-actual")) return &EncounteredNote.mTuplet.mTupletActual;
    return IsInside("tuplet-normal") ? &EncounteredNote.mTuplet.mTupletNormal : nullptr;
}

void TNote::FoundTie() {
    if (EncounteredNote.mNoteTies.size() >= kMuxmlMaxTies) return;
    const auto word = currentAttributes.Find("type").value_or(std::string_view());
    EncounteredNote.mNoteTies.push_back(MuxmlValueOf(word, TMuxmlEnum_StartStop_Undef));
}

void TNote::FindNotations() {
    if (std::exchange(mHasLookedForNotations, true)) return;
    EncounteredNote.mNotationsXMLs =
        Context().CurrentPartMeasureNoteXMLs().descendants("notations");
}

void TNote::FindNotehead() {
    if (std::exchange(mHasLookedForNotehead, true)) return;
    EncounteredNote.mNoteheadXML =
        Context().CurrentPartMeasureNoteXMLs().firstDescendant("notehead");
}

void TNote::FindNoteheadText() {
    if (std::exchange(mHasLookedForNoteheadText, true)) return;
    EncounteredNote.mNoteheadTextXML =
        Context().CurrentPartMeasureNoteXMLs().firstDescendant("notehead-text");
}

}  // namespace brindle
