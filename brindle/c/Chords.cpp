// SPDX-License-Identifier: MIT
#include "brindle/c/internal/Border.h"
#include "brindle/c/internal/Values.h"

#include "brindle/chords/ChordTones.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/chords/WriteChordSymbol.h"

#include <fmt/format.h>

using namespace brindle::border;

namespace {

brindle_status FailForSymbol(const brindle::CChordTextReading& reading, const char* symbol) {
    if (reading.mKind == brindle::TChordText_Repeat) {
        return Fail(BRINDLE_ERROR_INPUT, fmt::format("\"{}\" repeats the chord before it", symbol),
                    1);
    }
    return Fail(BRINDLE_ERROR_INPUT, reading.mFault,
                static_cast<std::size_t>(reading.mFaultPos > 0 ? reading.mFaultPos : 1));
}

}  // namespace

brindle_status brindle_chord_read(const char* symbol, unsigned flags, brindle_chord* chord) {
    if (chord == nullptr) return FailForNull("chord");
    *chord = ToC(brindle::CChordLite());
    if (symbol == nullptr) return FailForNull("symbol");
    return Guarded([&] {
        const auto reading = brindle::ReadChordText(symbol, ChordOptionsOf(flags));
        const bool isRead = reading.mKind == brindle::TChordText_Chord ||
                            reading.mKind == brindle::TChordText_NoChord;
        if (!isRead) return FailForSymbol(reading, symbol);
        *chord = ToC(reading.mChord);
        return BRINDLE_OK;
    });
}

brindle_status brindle_chord_write(const brindle_chord* chord, const brindle_style* style,
                                   char** symbol) {
    if (symbol == nullptr) return FailForNull("symbol");
    *symbol = nullptr;
    if (chord == nullptr) return FailForNull("chord");
    return Guarded([&] { return GiveText(WriteChordSymbol(FromC(*chord), FromC(style)), symbol); });
}

brindle_status brindle_chord_tones(const brindle_chord* chord, brindle_tone tones[12],
                                   size_t* count) {
    if (tones == nullptr || count == nullptr) return FailForNull("tones or count");
    *count = 0;
    if (chord == nullptr) return FailForNull("chord");
    return Guarded([&] {
        GiveTones(ChordTones(FromC(*chord)), tones, count);
        return BRINDLE_OK;
    });
}
