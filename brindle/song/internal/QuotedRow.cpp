// SPDX-License-Identifier: MIT
#include "brindle/song/internal/QuotedRow.h"

#include "brindle/theory/KeyIntervals.h"

#include <cmath>

namespace brindle {
namespace {

/// Songs are learned with the ticks of their chords rounded, where a bar has five beats.
std::int32_t TickOfBeat(std::size_t beat, int beatsPerBar) {
    return static_cast<std::int32_t>(
        std::lround(static_cast<double>(beat) * kTicksPerBar / beatsPerBar));
}

bool AreOneChord(const CSoundingChord& a, const CSoundingChord& b) {
    return a.mRoot == b.mRoot && a.mBass == b.mBass && a.mMask == b.mMask;
}

}  // namespace

CQuotedChord QuotedChordOf(const CWrittenChord& chord, std::size_t beat, int beatsPerBar) {
    const std::size_t end = beat + static_cast<std::size_t>(chord.mBeats);
    const int root = FoldIntoOctave(chord.mTonic + chord.mChord.mRoot);
    return {{static_cast<std::uint8_t>(root), chord.mChord.mBass, chord.mChord.mMask,
             TickOfBeat(end, beatsPerBar) - TickOfBeat(beat, beatsPerBar)},
            chord.mIsWished};
}

std::vector<CQuotedChord> QuotedRowOf(std::span<const CWrittenChord> chords, std::size_t beat,
                                      int beatsPerBar) {
    std::vector<CQuotedChord> row;
    for (const CWrittenChord& chord : chords) {
        const CQuotedChord next = QuotedChordOf(chord, beat, beatsPerBar);
        beat += static_cast<std::size_t>(chord.mBeats);
        if (row.empty() || !AreOneChord(row.back().mChord, next.mChord)) {
            row.push_back(next);
            continue;
        }
        row.back().mChord.mLength += next.mChord.mLength;
        row.back().mIsWished = row.back().mIsWished && next.mIsWished;
    }
    return row;
}

}  // namespace brindle
