// SPDX-License-Identifier: MIT
#include "cli/HarmoniesFromNotes.h"

#include "brindle/platform/Error.h"
#include "brindle/present/HarmoniesText.h"

#include <fmt/format.h>

#include <optional>
#include <string>

namespace brindle::cli {
namespace {

std::optional<CScoreNotes> ReadNotes(const CTypedSong& song) {
    CScoreNotes notes;
    Error error;
    if (ReadScoreNotes(song.mText, notes, &error)) return notes;
    TellScoreFault(song.mText, song.mName, error.description);
    return std::nullopt;
}

}  // namespace

TSongOutput ShowChordsFromNotes(const CTypedSong& song, const CChordsFromNotesOptions& options,
                                bool isJson) {
    const auto notes = ReadNotes(song);
    if (!notes) return TStatus::BadInput;
    const CChordsFromNotes chords = ChordsFromNotes(*notes, options);
    return isJson ? ChordsFromNotesJson(chords)
                  : ChordsFromNotesText(*notes, chords, PaintOfOutput());
}

}  // namespace brindle::cli
