// SPDX-License-Identifier: MIT
#include "cli/HarmoniesFromNotes.h"
#include "cli/Json.h"

#include "brindle/platform/Alerts.h"
#include "brindle/platform/Error.h"
#include "brindle/present/CBars.h"
#include "brindle/present/CTable.h"
#include "brindle/present/ShownNames.h"

#include <fmt/format.h>

#include <optional>
#include <string>
#include <vector>

namespace brindle::cli {
namespace {

/// What goes wrong in an import is told once, by its error.
class CNoAlerts {
public:
    CNoAlerts() {
        SetAlertHandler([](const TAlert&) {});
    }
    CNoAlerts(const CNoAlerts&) = delete;
    CNoAlerts& operator=(const CNoAlerts&) = delete;
    ~CNoAlerts() { SetAlertHandler({}); }
};

std::optional<CScoreNotes> ReadNotes(const TTypedSong& song) {
    const CNoAlerts quiet;
    CScoreNotes notes;
    Error error;
    if (ReadScoreNotes(song.mText, notes, &error)) return notes;
    Fail(TStatus::BadInput,
         fmt::format("{}: {}", Printable(song.mName), Printable(error.description)));
    return std::nullopt;
}

Json ChordToJson(const CChordFromNotes& chord) {
    const CNamedChord& named = chord.mChord;
    return {{"Position", NumberToJson(chord.mPosition)},
            {"Duration", NumberToJson(chord.mLength)},
            {"Symbol", named.mSymbol},
            {"RootKeyEnh", KeyEnhToJson(named.mRoot)},
            {"BassKeyEnh", KeyEnhToJson(named.mBass)},
            {"Intervals", IntervalsToJson(named.mChord.mSemitones)}};
}

std::string ChordsJson(const CChordsFromNotes& chords) {
    Json list = Json::array();
    for (const CChordFromNotes& chord : chords.mChords) list.push_back(ChordToJson(chord));
    return JsonText(
        {{"Key", chords.mKey.IsUndef() ? Json(nullptr) : Json(chords.mKey.NameLong(NamePrefs()))},
         {"Harmonies", list}});
}

std::string ChordsText(const CScoreNotes& score, const CChordsFromNotes& chords) {
    std::vector<double> starts;
    for (const CScoreBar& bar : score.mBars) starts.push_back(bar.mPosition);
    const CBars bars(1.0, std::move(starts));
    CTable table({" bar", " beat", " position", " length", "chord"});
    long barBefore = 0;
    for (const CChordFromNotes& chord : chords.mChords) {
        const long bar = bars.BarOf(chord.mPosition);
        table.AddRow({bar == barBefore ? "" : fmt::format("{}", bar),
                      ShortNumber(bars.BeatOf(chord.mPosition)), ShortNumber(chord.mPosition),
                      ShortNumber(chord.mLength), chord.mChord.mSymbol});
        barBefore = bar;
    }
    const CPaint paint = PaintOfOutput();
    if (chords.mKey.IsUndef()) return table.Text(paint);
    return paint.Strong(chords.mKey.NameLong(NamePrefs())) + "\n\n" + table.Text(paint);
}

}  // namespace

TStatus PrintChordsFromNotes(const TTypedSong& song, const CChordsFromNotesOptions& options,
                             bool isJson) {
    const auto notes = ReadNotes(song);
    if (!notes) return TStatus::BadInput;
    const CChordsFromNotes chords = ChordsFromNotes(*notes, options);
    return Print(isJson ? ChordsJson(chords) : ChordsText(*notes, chords));
}

}  // namespace brindle::cli
