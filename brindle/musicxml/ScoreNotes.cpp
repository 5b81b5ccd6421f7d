// SPDX-License-Identifier: MIT
#include "brindle/musicxml/ScoreNotes.h"
#include "brindle/musicxml/ImportScore.h"
#include "brindle/musicxml/ScoreContainer.h"
#include "brindle/platform/Alerts.h"

#include <algorithm>
#include <tuple>

namespace brindle {
namespace {

constexpr std::int32_t kTicksPerQuarterOfNotes = 960;

double Quarters(std::int32_t ticks) {
    return static_cast<double>(ticks) / kTicksPerQuarterOfNotes;
}

/// Three short notes make a beat of 6/8, 9/8 or 12/8.
double BeatOf(const CMuxmlSignTime& time) {
    const int count = time.mNomAkaBeats;
    const int unit = time.mDenomAkaBeatTypeAsInt;
    if (unit < 1 || unit > 64) return 1.0;
    const bool isCompound = unit >= 8 && count > 3 && count % 3 == 0;
    return (isCompound ? 12.0 : 4.0) / unit;
}

/// Takes what the import tells. The bars are those of the first part.
class CCollector {
public:
    explicit CCollector(CScoreNotes& notes) : mScore(&notes) {}

    void PartEnd() { ++mParts; }

    void SignTime(const CMuxmlSignTime& time) {
        if (!time.mSenzaMisura) mBeat = BeatOf(time);
    }

    void MeasureEnd(const CMuxmlMeasure& measure) {
        if (mParts > 0) return;
        const double begin = Quarters(measure.mPositionAsMidiTicks);
        const double end = Quarters(measure.mEndPositionAsMidiTicks);
        if (end > begin) mScore->mBars.push_back({begin, end, mBeat});
    }

    void Note(const CMuxmlNote& note) {
        const bool isPitched = note.mNoteType == TMuxmlEnum_NoteType_Pitched;
        const bool isOnKeyboard = note.mNoteNr >= 0 && note.mNoteNr <= 127;
        const bool hasTime = note.mPositionAsMidiTicks >= 0 && note.mLengthAsMidiTicks > 0;
        if (!isPitched || !isOnKeyboard || !hasTime || note.mIsGraceNote || note.mIsCueNote) return;
        const bool isAsWritten = note.mPitch.ToNoteNrLarge() == note.mNoteNr;
        mScore->mNotes.push_back(
            {Quarters(note.mPositionAsMidiTicks), Quarters(note.mLengthAsMidiTicks),
             CNote(note.mNoteNr, isAsWritten ? note.mPitch.AlterationToEnh() : TEnh_Undef)});
    }

private:
    CScoreNotes* mScore;
    int mParts = 0;
    double mBeat = 1.0;
};

MusicXmlParserDelegate HostFor(CCollector& collector) {
    MusicXmlParserDelegate host;
    host.didEncounterPartEnd = [&collector](const auto&) { collector.PartEnd(); };
    host.didEncounterMeasureEnd = [&collector](const CMuxmlMeasure& measure) {
        collector.MeasureEnd(measure);
    };
    host.didEncounterSignTime = [&collector](const CMuxmlSignTime& t) { collector.SignTime(t); };
    host.didEncounterNote = [&collector](const CMuxmlNote& note) { collector.Note(note); };
    return host;
}

}  // namespace

bool ReadScoreNotes(std::string_view bytes, CScoreNotes& notes, Error* error) {
    notes = {};
    Error own;
    const CMutedAlerts quiet;
    CCollector collector(notes);
    const bool isRead = ImportScore(bytes, IsScoreContainer(bytes), kTicksPerQuarterOfNotes,
                                    HostFor(collector), own);
    if (!isRead && error != nullptr) *error = own;
    std::sort(notes.mNotes.begin(), notes.mNotes.end(), [](const auto& a, const auto& b) {
        return std::tie(a.mPosition, a.mNote.mNoteNr) < std::tie(b.mPosition, b.mNote.mNoteNr);
    });
    return isRead;
}

}  // namespace brindle
