// SPDX-License-Identifier: MIT
#include "brindle/present/ImportText.h"

#include "brindle/platform/SortByNumber.h"
#include "brindle/present/CTable.h"
#include "brindle/present/ShownText.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle {
namespace {

std::string QuartersOfTicks(std::int32_t ticks) {
    return ShortNumber(static_cast<double>(ticks) / kImportTicksPerQuarter);
}

std::string ShownQuarters(std::int32_t ticks) {
    return QuartersOfTicks(ticks) + (ticks == kImportTicksPerQuarter ? " quarter" : " quarters");
}

// The number of the bar in which a position lies. Bars may begin at the same place; the last
// counts.
std::string BarAt(const CImportedPart& part, std::int32_t position) {
    auto bar = std::upper_bound(part.mMeasures.begin(), part.mMeasures.end(), position,
                                [](std::int32_t sought, const CImportedMeasure& measure) {
                                    return sought < measure.mPosition;
                                });
    return bar == part.mMeasures.begin() ? "" : Printable((--bar)->mNumber);
}

void AddRow(CTable& table, const CImportedPart& part, const CImportedEvent& event) {
    const std::string bar = BarAt(part, event.mPosition);
    const std::string position = QuartersOfTicks(event.mPosition);
    if (!event.mIsNote) {
        table.AddRow({bar, position, "", event.mWhat, "", "", "", "", ""});
        return;
    }
    table.AddRow({bar, position, event.mLength ? QuartersOfTicks(*event.mLength) : "?", event.mWhat,
                  event.mNoteNr < 0 ? "-" : fmt::format("{}", event.mNoteNr),
                  fmt::format("{}", event.mVelocity), fmt::format("{}", event.mVoice),
                  event.mStaff == 0 ? "" : fmt::format("{}", event.mStaff), event.mMarks});
}

std::string PartText(CImportedPart part, const CPaint& paint) {
    // A tied note is told where its tie ends; here it stands where it begins.
    SortByNumber(part.mEvents, [](const CImportedEvent& event) { return event.mPosition; });
    // Broken time signatures lead bars back; they are looked up by their position.
    SortByNumber(part.mMeasures, [](const CImportedMeasure& measure) { return measure.mPosition; });
    CTable table({" bar", " position", " length", "event", " note", " velocity", " voice", " staff",
                  "marks"});
    for (const CImportedEvent& event : part.mEvents) AddRow(table, part, event);
    const auto notes = std::count_if(part.mEvents.begin(), part.mEvents.end(),
                                     [](const CImportedEvent& event) { return event.mIsNote; });
    const std::string separator = part.mID.empty() || part.mName.empty() ? "" : " ";
    const std::string name = Printable(part.mID + separator + part.mName);
    std::string text = fmt::format(
        "{}: {} {}, {} {}, {}\n\n", paint.Strong(name.empty() ? "Part without name" : name),
        part.mMeasures.size(), part.mMeasures.size() == 1 ? "bar" : "bars", notes,
        notes == 1 ? "note" : "notes", ShownQuarters(part.mEnd));
    text += table.Text(paint, "  ");
    for (const CImportedEvent& note : part.mNotesLeftOpen) {
        text += fmt::format("\n  The tie of {} at {} does not end; it is played for {}\n",
                            note.mWhat, QuartersOfTicks(note.mPosition),
                            note.mLength ? ShownQuarters(*note.mLength) : "? quarters");
    }
    return text;
}

}  // namespace

std::string ImportText(CImportedScore score, const CPaint& paint) {
    std::string text;
    for (CImportedPart& part : score.mParts) {
        if (!text.empty()) text += '\n';
        text += PartText(std::move(part), paint);
    }
    return text;
}

}  // namespace brindle
