// SPDX-License-Identifier: MIT
#include "brindle/present/ImportedScore.h"

#include "brindle/musicxml/MuxmlBlocks.h"
#include "brindle/platform/ReadNumber.h"
#include "brindle/present/ShownNames.h"
#include "brindle/present/ShownText.h"
#include "brindle/theory/CSignKeyHeavy.h"
#include "brindle/theory/CSignKeyLite.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <map>
#include <memory>
#include <string_view>
#include <utility>

namespace brindle {
namespace {

// Field of a note, the word for it in the column of marks.
struct CMark {
    bool (*mHas)(const CMuxmlNote& note);
    std::string_view mWord;
};

constexpr auto kMarks = std::to_array<CMark>({
    {[](const CMuxmlNote& n) { return n.mIsChordNote; }, "chord"},
    {[](const CMuxmlNote& n) { return n.mIsGraceNote; }, "grace"},
    {[](const CMuxmlNote& n) { return n.mIsCueNote; }, "cue"},
    {[](const CMuxmlNote& n) { return n.mNoteType == TMuxmlEnum_NoteType_Unpitched; }, "unpitched"},
    {[](const CMuxmlNote& n) { return n.mAccent.mExists; }, "accent"},
    {[](const CMuxmlNote& n) { return n.mStrongAccent.mExists; }, "strong-accent"},
    {[](const CMuxmlNote& n) { return n.mStaccato.mExists; }, "staccato"},
    {[](const CMuxmlNote& n) { return n.mStaccatissimo.mExists; }, "staccatissimo"},
    {[](const CMuxmlNote& n) { return n.mTenuto.mExists; }, "tenuto"},
    {[](const CMuxmlNote& n) { return n.mDetachedLegato.mExists; }, "detached-legato"},
    {[](const CMuxmlNote& n) { return n.mFermata.mExists; }, "fermata"},
    {[](const CMuxmlNote& n) { return n.mBreathMark.mExists; }, "breath-mark"},
    {[](const CMuxmlNote& n) { return n.mCaesura.mExists; }, "caesura"},
    {[](const CMuxmlNote& n) { return n.mScoop.mExists; }, "scoop"},
    {[](const CMuxmlNote& n) { return n.mPlop.mExists; }, "plop"},
    {[](const CMuxmlNote& n) { return n.mDoit.mExists; }, "doit"},
    {[](const CMuxmlNote& n) { return n.mFallOff.mExists; }, "falloff"},
});

std::string MarksOf(const CMuxmlNote& note) {
    std::string marks;
    for (const CMark& mark : kMarks) {
        if (mark.mHas(note)) marks += fmt::format(" {}", mark.mWord);
    }
    return marks.empty() ? marks : marks.substr(1);
}

// As the file names pitches: letter, accidental, octave, where C4 is the middle C.
std::string WrittenName(const CMuxmlPitch& pitch) {
    const auto letter = mBiMap<TMuxmlEnum_Step>.WordOf(pitch.mStep);
    if (!letter) return "?";
    static constexpr auto kAccidentals =
        std::to_array<std::string_view>({"bb", "b", "", "#", "##"});
    const TEnh enh = pitch.AlterationToEnh();
    const std::string_view accidental =
        enh == TEnh_Undef ? "?" : kAccidentals[static_cast<std::size_t>(enh)];
    return fmt::format("{}{}{}", *letter, accidental, pitch.mOctave);
}

template <class Enumeration>
std::string_view WordOf(Enumeration value) {
    return mBiMap<Enumeration>.WordOf(value).value_or("?");
}

constexpr int kMidiPrograms = 128;
constexpr int kMidiKeys = 128;
constexpr int kMidiChannels = 16;

using TListedParts = std::map<std::string, CImportedPart, std::less<>>;

class CFiller {
public:
    explicit CFiller(CImportedScore& score) : mScore(&score) {}

    void PartStart(const CMuxmlPart& part) const {
        if (mScore->mParts.empty()) *mListedParts = ListedParts(part.mPartXML);
        // Taken: many parts with one identifier must not each have a copy.
        auto listed = mListedParts->extract(part.mID);
        CImportedPart& imported = mScore->mParts.emplace_back(
            listed.empty() ? CImportedPart() : std::move(listed.mapped()));
        mScore->mIsInPart = true;
        std::swap(imported.mEvents, mScore->mEventsBeforePart);
        imported.mID = part.mID;
        imported.mName = part.FindBestPartName();
    }

    void Add(std::int32_t position, std::string what) const {
        CImportedEvent event;
        event.mPosition = position;
        event.mWhat = std::move(what);
        auto& events = mScore->mIsInPart ? Part().mEvents : mScore->mEventsBeforePart;
        events.push_back(std::move(event));
    }

    void Note(const CMuxmlNote& note) const { Part().mEvents.push_back(EventOf(note)); }

    void NoteLeftOpen(const CMuxmlNote& note) const {
        Part().mNotesLeftOpen.push_back(EventOf(note));
    }

    [[nodiscard]] CImportedEvent EventOf(const CMuxmlNote& note) const {
        CImportedEvent event;
        event.mIsNote = true;
        event.mPosition = note.mPositionAsMidiTicks;
        if (note.mLengthAsMidiTicks != kMuxmlUndef) event.mLength = note.mLengthAsMidiTicks;
        event.mWhat =
            note.mNoteType == TMuxmlEnum_NoteType_Pitched ? WrittenName(note.mPitch) : "x";
        event.mMarks = MarksOf(note);
        event.mNoteNr = note.mNoteNr;
        event.mVelocity = note.mVelocity;
        event.mVoice = note.mVoice;
        event.mStaff = note.mStaff;
        return event;
    }

    void PlayedNote(const CMuxmlNote& note) const {
        CPlayedNote& played = Part().mPlayedNotes.emplace_back();
        played.mPosition = note.mPositionAsMidiTicks;
        if (note.mLengthAsMidiTicks != kMuxmlUndef) played.mLength = note.mLengthAsMidiTicks;
        played.mNoteNr = note.mNoteNr;
        played.mVelocity = note.mVelocity;
        played.mIsUnpitched = note.mNoteType == TMuxmlEnum_NoteType_Unpitched;
        if (const CImportedInstrument* const instrument = InstrumentOf(note)) {
            if (played.mIsUnpitched) played.mMidiKey = instrument->mUnpitchedKey;
            played.mMidiChannel = instrument->mChannel;
        }
    }

    void SignTime(const CMuxmlSignTime& time) const {
        Add(time.mPositionAsMidiTicks,
            time.mSenzaMisura
                ? std::string("time without measure")
                : fmt::format("time {}/{}", time.mNomAkaBeats, time.mDenomAkaBeatTypeAsInt));
        if (!IsOfFirstPart()) return;
        mScore->mTimeSignatures.push_back(
            {time.mPositionAsMidiTicks, time.mNomAkaBeats, time.mDenomAkaBeatTypeAsInt});
    }

    void SignKey(const CMuxmlSignKey& key) const {
        const CSignKeyHeavy written = key.ConvertToCSignKeyTransposedPitch();
        Add(key.mPositionAsMidiTicks, "key " + KeyInWords(written.ToSignKeyLite()));
        if (!IsOfFirstPart()) return;
        const CSignKeyHeavy sounding = key.ConvertToCSignKeySoundingPitch();
        mScore->mKeySignatures.push_back({key.mPositionAsMidiTicks, sounding.SignsCount(),
                                          sounding.SignKeyType() == TSignKeyType_Minor});
    }

    void Tempo(const CMuxmlTempoChange& change) const {
        Add(change.mPositionAsMidiTicks, "tempo " + ShortNumber(double{change.mTempo}));
        if (change.mTempo <= 0) return;
        mScore->mTempos.push_back({change.mPositionAsMidiTicks, double{change.mTempo}});
    }

    void PartEnd(const CMuxmlPartGatheredInfo& info) const {
        Part().mEnd = info.mPartEndPosAsMidiTicks;
        mScore->mIsInPart = false;
    }

    [[nodiscard]] CImportedPart& Part() const { return mScore->mParts.back(); }

private:
    // A time signature may be told before its part starts.
    [[nodiscard]] bool IsOfFirstPart() const {
        return mScore->mParts.size() == (mScore->mIsInPart ? 1U : 0U);
    }

    // How MIDI plays the parts of the list, once for all of them; of equal identifiers the first
    // counts. The instruments that an import tells are only those whose identifiers begin as that
    // of their part.
    static TListedParts ListedParts(XmlNode node) {
        while (const XmlNode parent = node.parent()) node = parent;
        TListedParts parts;
        for (const XmlNode& scorePart : node.child("part-list").children()) {
            if (scorePart.name() != "score-part") continue;
            parts.try_emplace(scorePart.attribute("id").value_or(""), ListedPart(scorePart));
        }
        return parts;
    }

    static CImportedPart ListedPart(const XmlNode& scorePart) {
        CImportedPart part;
        part.mProgram = MidiNumber(scorePart, "midi-program", kMidiPrograms);
        part.mChannel = MidiNumber(scorePart, "midi-channel", kMidiChannels);
        part.mUsualDrum.mUnpitchedKey = kUsualDrumKey;
        bool hasUsualDrum = false;
        for (const XmlNode& midi : scorePart.descendants("midi-instrument")) {
            const CImportedInstrument instrument{MidiNumber(midi, "midi-program", kMidiPrograms),
                                                 MidiNumber(midi, "midi-channel", kMidiChannels),
                                                 MidiNumber(midi, "midi-unpitched", kMidiKeys)};
            part.mInstruments.insert_or_assign(midi.attribute("id").value_or(""), instrument);
            if (hasUsualDrum || !instrument.mUnpitchedKey) continue;
            part.mUsualDrum = instrument;
            hasUsualDrum = true;
        }
        return part;
    }

    // Notes of a part with one instrument need not name it; of several, the usual drum plays those
    // without a pitch. Null if it is not known.
    [[nodiscard]] const CImportedInstrument* InstrumentOf(const CMuxmlNote& note) const {
        const auto& instruments = Part().mInstruments;
        const XmlNode named = note.mNoteXML.firstDescendant("instrument");
        if (!named && instruments.size() == 1) return &instruments.begin()->second;
        if (named) {
            const auto found = instruments.find(named.attribute("id").value_or(""));
            if (found != instruments.end()) return &found->second;
        }
        const bool isDrum = note.mNoteType == TMuxmlEnum_NoteType_Unpitched;
        return isDrum && instruments.size() > 1 ? &Part().mUsualDrum : nullptr;
    }

    // Numbers of MIDI count from 1 in scores.
    static std::optional<int> MidiNumber(const XmlNode& scorePart, std::string_view name,
                                         int most) {
        const int number = ReadInteger(scorePart.firstDescendant(name).stringValue());
        return number >= 1 && number <= most ? std::optional(number - 1) : std::nullopt;
    }

    CImportedScore* mScore;
    std::shared_ptr<TListedParts> mListedParts = std::make_shared<TListedParts>();
};

}  // namespace

MusicXmlParserDelegate HostFor(CImportedScore& score) {
    const CFiller filler(score);
    MusicXmlParserDelegate host;
    host.didEncounterPartStart = [filler](const CMuxmlPart& part) { filler.PartStart(part); };
    host.didEncounterPartEnd = [filler](const CMuxmlPartGatheredInfo& info) {
        filler.PartEnd(info);
    };
    host.didEncounterMeasureEnd = [filler](const CMuxmlMeasure& measure) {
        const bool hasNumber = measure.mNumber != CMuxmlMeasure::kNumber_Undef;
        filler.Part().mMeasures.push_back(
            {measure.mPositionAsMidiTicks, hasNumber ? measure.mNumber : "-"});
    };
    host.didEncounterSignTime = [filler](const CMuxmlSignTime& time) { filler.SignTime(time); };
    host.didEncounterSignKey = [filler](const CMuxmlSignKey& key) { filler.SignKey(key); };
    host.didEncounterClef = [filler](const CMuxmlClef& clef) {
        filler.Add(clef.mPositionAsMidiTicks,
                   fmt::format("clef {} {}", WordOf(clef.mSign), clef.mStaffLine));
    };
    host.didEncounterTranspose = [filler](const CMuxmlTranspose& transpose) {
        filler.Add(transpose.mPositionAsMidiTicks,
                   fmt::format(
                       "transpose {:+g}",
                       transpose.mChromatic + 12.0F * static_cast<float>(transpose.mOctaveChange)));
    };
    host.didEncounterTempoChange = [filler](const CMuxmlTempoChange& c) { filler.Tempo(c); };
    host.didEncounterDirection = [filler](const CPositionedXMLElement& direction) {
        const XmlNode type = direction.XMLElement.firstDescendant("direction-type").firstChild();
        filler.Add(direction.PositionAsMidiTicks,
                   fmt::format("direction {}", type ? type.name() : "of no type"));
    };
    host.didEncounterNote = [filler](const CMuxmlNote& note) { filler.Note(note); };
    host.didPlayNote = [filler](const CMuxmlNote& note) { filler.PlayedNote(note); };
    host.didLeaveTieOpen = [filler](const CMuxmlNote& note) { filler.NoteLeftOpen(note); };
    return host;
}

}  // namespace brindle
