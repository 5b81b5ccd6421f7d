// SPDX-License-Identifier: MIT
#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/platform/Error.h"
#include "brindle/song/HarmonySymbols.h"
#include "brindle/song/internal/SongReaders.h"

namespace brindle::SongReaders {

CSong ReadScoreSong(std::string_view bytes, TSongFormat format) {
    CSong song;
    song.mFormat = format;
    TMusicXMLDoc doc;
    Error error;
    if (!doc.LoadAsPlayedFromBytes(bytes, &error)) {
        song.mFaults.push_back({1, 1, error.description});
        return song;
    }
    song.mTitle = doc.Title;
    for (const TMusicXMLHarmony& harmony : doc.Harmonies) {
        song.mChords.emplace_back(ChordOfHarmony(harmony), harmony.mPosition);
        song.mSymbols.push_back(HarmonySymbol(harmony));
    }
    if (!doc.Harmonies.empty()) {
        const TMusicXMLHarmony& last = doc.Harmonies.back();
        song.mChords.emplace_back(CChordLite_Undef, last.mPosition + last.mDuration);
    }
    return song;
}

}  // namespace brindle::SongReaders
