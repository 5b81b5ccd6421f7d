// SPDX-License-Identifier: MIT
#include "brindle/present/WrittenSongText.h"

#include "brindle/present/internal/PianoAndBass.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <cmath>
#include <vector>

namespace brindle {
namespace {

constexpr int kTicksPerQuarter = 480;
// The middle of the chords, the E above middle C, and the lowest tone of the bass, a low E.
constexpr double kMiddle = 64.0;
constexpr int kLowestBass = 40;
// How much a chord that wanders off is drawn back.
constexpr double kPullToMiddle = 0.5;

/// The tones of a chord close together, the first of them the `lowest` of its tones, in order.
std::vector<int> ClosePosition(const std::vector<int>& tones, std::size_t lowest, int octave) {
    std::vector<int> notes;
    int before = octave * 12 + tones[lowest];
    for (std::size_t ix = 0; ix < tones.size(); ++ix) {
        const int tone = tones[(lowest + ix) % tones.size()];
        before += ix == 0 ? 0 : FoldIntoOctave(tone - before);
        notes.push_back(before);
    }
    return notes;
}

double MeanOf(const std::vector<int>& notes) {
    double sum = 0.0;
    for (const int note : notes) sum += note;
    return sum / static_cast<double>(notes.size());
}

/// How far the tones lie from the nearest tone before.
double MotionTo(const std::vector<int>& notes, const std::vector<int>& before) {
    double motion = kPullToMiddle * std::abs(MeanOf(notes) - kMiddle);
    for (const int note : notes) {
        int nearest = before.empty() ? 0 : 127;
        for (const int other : before) nearest = std::min(nearest, std::abs(note - other));
        motion += nearest;
    }
    return motion;
}

/// The position of the chord that moves least.
std::vector<int> Voiced(const CChordLite& chord, const std::vector<int>& before) {
    std::vector<int> tones;
    for (int intvl = 0; intvl < 12; ++intvl) {
        if (chord.mSemitones.HasIntvl(intvl)) {
            tones.push_back(FoldIntoOctave(chord.mRootKeyEnh.mKeyNr + intvl));
        }
    }
    // Of five tones and more the bass has the root.
    if (tones.size() > 4) tones.erase(tones.begin());
    std::vector<int> best;
    for (int octave = 4; octave <= 6; ++octave) {
        for (std::size_t lowest = 0; lowest < tones.size(); ++lowest) {
            const std::vector<int> notes = ClosePosition(tones, lowest, octave);
            if (best.empty() || MotionTo(notes, before) < MotionTo(best, before)) best = notes;
        }
    }
    return best;
}

int BassOf(const CChordLite& chord) {
    const CKeyEnh& key = chord.HasBassNote() ? chord.mBassKeyEnh : chord.mRootKeyEnh;
    return kLowestBass + FoldIntoOctave(key.mKeyNr - kLowestBass);
}

std::int64_t TickOf(double beats) {
    return static_cast<std::int64_t>(std::min(std::round(beats * kTicksPerQuarter), 1e9));
}

}  // namespace

CMidiPiece MidiPieceOfSong(const CSong& song, double tempo) {
    CMidiPiece piece;
    piece.mTicksPerQuarter = kTicksPerQuarter;
    piece.mTempos = {{0, tempo}};
    piece.mTimeSignatures = {{0, static_cast<int>(song.mBeatsPerBar), 4}};
    if (song.mStatedKey) {
        piece.mKeySignatures = {{0, std::clamp(song.mStatedKey->SignsCount(), -7, 7),
                                 song.mStatedKey->mSignKeyType == TSignKeyType_Minor}};
    }
    piece.mTracks = PianoAndBass();
    std::vector<int> before;
    for (std::size_t ix = 0; ix + 1 < song.mChords.size(); ++ix) {
        const CHarmAnlsChordWithPos& chord = song.mChords[ix];
        const std::int64_t begin = TickOf(chord.mPosition);
        const std::int64_t length = TickOf(song.mChords[ix + 1].mPosition) - begin;
        if (chord.IsUndef() || chord.mSemitones.IsEmpty()) continue;
        before = Voiced(chord, before);
        for (const int note : before)
            piece.mTracks[0].mNotes.push_back({begin, length, kPianoChannel, note, 75});
        piece.mTracks[1].mNotes.push_back({begin, length, kBassChannel, BassOf(chord), 90});
    }
    return piece;
}

}  // namespace brindle
