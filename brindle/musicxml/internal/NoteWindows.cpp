// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/NoteWindows.h"

#include <algorithm>
#include <limits>

namespace brindle {
namespace {

constexpr double kMostBeatsOfBar = 64.0;
constexpr double kTiny = 1e-6;

void AddBeats(const CScoreBar& bar, std::vector<CNoteWindow>& windows) {
    const bool isWhole = bar.mEndPosition - bar.mPosition > kMostBeatsOfBar * bar.mBeat;
    const double beat = isWhole ? bar.mEndPosition - bar.mPosition : bar.mBeat;
    for (int count = 0; bar.mPosition + count * beat < bar.mEndPosition - kTiny; ++count) {
        const double position = bar.mPosition + count * beat;
        const double end = std::min(position + beat, bar.mEndPosition);
        windows.push_back({.mPosition = position, .mEndPosition = end, .mFirstBeatEnd = end});
    }
}

std::vector<CNoteWindow> EmptyWindows(const CScoreNotes& score, bool areBeats) {
    std::vector<CNoteWindow> windows;
    for (const CScoreBar& bar : score.mBars) {
        if (areBeats) {
            AddBeats(bar, windows);
        } else {
            windows.push_back(
                {.mPosition = bar.mPosition,
                 .mEndPosition = bar.mEndPosition,
                 .mFirstBeatEnd = std::min(bar.mPosition + bar.mBeat, bar.mEndPosition)});
        }
    }
    return windows;
}

/// Fills windows in the order of time. Of each of the 128 notes it remembers until when it sounds,
/// so that a window costs no more than them and the notes that begin in it.
class CSounding {
public:
    explicit CSounding(const std::vector<CTimedNote>& notes) : mNotes(notes) {
        mEnds.fill(std::numeric_limits<double>::lowest());
        mSpellings.fill(TEnh_Undef);
    }

    void Fill(CNoteWindow& window) {
        for (std::size_t nr = 0; nr < mEnds.size(); ++nr) {
            Take(window, nr, window.mPosition, mEnds[nr]);
        }
        for (; mNext < mNotes.size() && mNotes[mNext].mPosition < window.mEndPosition - kTiny;
             ++mNext) {
            Begin(window, mNotes[mNext]);
        }
        window.mSpellings = mSpellings;
        Finish(window);
    }

private:
    void Begin(CNoteWindow& window, const CTimedNote& note) {
        const auto nr = static_cast<std::size_t>(note.mNote.mNoteNr);
        const double from = std::max(note.mPosition, window.mPosition);
        // What it doubles counts once.
        Take(window, nr, std::max(from, mEnds[nr]), note.EndPosition());
        mEnds[nr] = std::max(mEnds[nr], note.EndPosition());
        if (note.mNote.mEnh == TEnh_Undef) return;
        mSpellings[static_cast<std::size_t>(note.mNote.KeyNr())] = note.mNote.mEnh;
    }

    void Take(CNoteWindow& window, std::size_t nr, double from, double end) {
        const double length = std::min(end, window.mEndPosition) - from;
        if (length < kTiny) return;
        window.mShares[nr % 12] += length;
        const auto noteNr = static_cast<std::int64_t>(nr);
        const bool isAtBegin = from < window.mFirstBeatEnd - kTiny;
        if (mLowest < 0 || noteNr < mLowest) mLowest = noteNr;
        if (isAtBegin && (window.mBass < 0 || noteNr < window.mBass)) window.mBass = noteNr;
    }

    void Finish(CNoteWindow& window) {
        if (window.mBass < 0) window.mBass = mLowest;
        mLowest = -1;
        double sum = 0.0;
        for (const double share : window.mShares) sum += share;
        if (sum <= 0.0) return;
        for (double& share : window.mShares) share /= sum;
    }

    const std::vector<CTimedNote>& mNotes;
    std::size_t mNext = 0;
    std::array<double, 128> mEnds{};
    std::array<TEnh, 12> mSpellings{};
    // Of the present window.
    std::int64_t mLowest = -1;
};

}  // namespace

std::vector<CNoteWindow> NoteWindows(const CScoreNotes& score, bool areBeats) {
    std::vector<CNoteWindow> windows = EmptyWindows(score, areBeats);
    CSounding sounding(score.mNotes);
    for (CNoteWindow& window : windows) sounding.Fill(window);
    return windows;
}

}  // namespace brindle
