// SPDX-License-Identifier: MIT
#include "brindle/present/ChordProText.h"

#include "brindle/chords/ReadChordText.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/present/TonalityName.h"
#include "brindle/present/internal/ReadingBars.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <vector>

namespace brindle {
namespace {

constexpr int kMostStepsPerBeat = 4;
constexpr std::size_t kChordProBarsPerLine = 4;
constexpr const char* kRest = "N.C.";

bool IsWhole(double number) {
    return std::abs(number - std::round(number)) < 1e-6;
}

/// Into how many steps a beat is cut so that each chord begins with one; the most, if none will do.
int StepsPerBeat(const CSong& song) {
    for (int steps = 1; steps < kMostStepsPerBeat; ++steps) {
        const bool isEnough = std::all_of(
            song.mChords.begin(), song.mChords.end(),
            [steps](const CHarmAnlsChordWithPos& c) { return IsWhole(c.mPosition * steps); });
        if (isEnough) return steps;
    }
    return kMostStepsPerBeat;
}

/// As it is written, if that reads as the same chord in one word.
std::string WordOf(const CSong& song, std::size_t index) {
    const CChordLite& chord = song.mChords[index];
    if (chord.IsUndef()) return kRest;
    if (index < song.mSymbols.size()) {
        const std::string& symbol = song.mSymbols[index];
        const bool isWord = symbol.find_first_of(" \t|[]{}%:") == symbol.npos;
        if (isWord && ReadChordText(symbol).mChord == chord) return symbol;
    }
    return WriteChordSymbol(chord);
}

/// Whether its steps are more than anybody reads; of hostile lengths, too, which may be no numbers.
bool IsTooLongForGrid(const CSong& song) {
    constexpr double kMostSteps = 1e6;
    const int perBeat = StepsPerBeat(song);
    double steps = song.mBeatsPerBar * perBeat;
    for (const CSongBar& bar : song.mBars) steps += std::max(1.0, bar.mLength * perBeat);
    if (song.mBars.empty() && !song.mChords.empty() && song.mBeatsPerBar > 0.0) {
        const double end = song.mChords.back().mPosition;
        steps += std::max(end * perBeat, end / song.mBeatsPerBar);
    }
    return !(steps <= kMostSteps);
}

/// Of a song without bar lines all bars are as long as its first.
std::vector<CSongBar> BarsIn(const CSong& song) {
    if (!song.mBars.empty() || song.mChords.empty() || !(song.mBeatsPerBar > 0.0)) {
        return song.mBars;
    }
    std::vector<CSongBar> bars;
    const double end = song.mChords.back().mPosition;
    for (double position = 0.0; position < end; position += song.mBeatsPerBar) {
        bars.push_back({"", position, song.mBeatsPerBar, {}});
    }
    return bars;
}

class CChordProWriter {
public:
    explicit CChordProWriter(const CSong& song) : mSong(song), mSteps(StepsPerBeat(song)) {}

    std::string Text() {
        WriteHead();
        for (const CSongBar& bar : BarsIn(mSong)) WriteBar(bar);
        CloseGrid();
        return mText;
    }

private:
    void WriteDirective(const char* name, std::string value) {
        std::replace(value.begin(), value.end(), '\n', ' ');
        if (!value.empty()) mText += fmt::format("{{{}: {}}}\n", name, value);
    }

    void WriteHead() {
        WriteDirective("title", mSong.mTitle);
        WriteDirective("composer", mSong.mMakers);
        WriteDirective("style", mSong.mStyle);
        if (mSong.mStatedKey && !mSong.mStatedKey->IsUndef()) {
            WriteDirective("key", TonalityName(*mSong.mStatedKey));
        }
        if (mSong.mTempo) WriteDirective("tempo", fmt::format("{}", *mSong.mTempo * mSteps));
        if (mSong.mCapo > 0) WriteDirective("capo", fmt::format("{}", mSong.mCapo));
    }

    /// The chords count steps: 4/4 in halves of beats is 8/8.
    void WriteTime(long steps, const CSongTime& time) {
        if (steps == mBarSteps) return;
        mBarSteps = steps;
        CloseGrid();
        const int denominator = time.IsUndef() ? 4 : time.mDenominator;
        WriteDirective("time", fmt::format("{}/{}", steps, denominator * mSteps));
    }

    void WriteSections(const CSongBar& bar) {
        while (mSection < mSong.mSections.size() &&
               mSong.mSections[mSection].mPosition < bar.mPosition + bar.mLength) {
            CloseGrid();
            WriteDirective("comment", mSong.mSections[mSection++].mName);
        }
    }

    void OpenGrid() {
        if (!mIsGrid) mText += "{start_of_grid}\n";
        mIsGrid = true;
    }

    void CloseGrid() {
        if (!mIsGrid) return;
        mText += mBarsInLine > 0 ? " |\n{end_of_grid}\n" : "{end_of_grid}\n";
        mIsGrid = false;
        mBarsInLine = 0;
    }

    void WriteBar(const CSongBar& bar) {
        const long steps = std::max(1L, std::lround(bar.mLength * mSteps));
        const long full = std::max(steps, std::lround(mSong.mBeatsPerBar * mSteps));
        const bool isUpbeat = mBarSteps == 0 && steps < full;
        WriteSections(bar);
        WriteTime(isUpbeat ? full : steps, bar.mTime);
        OpenGrid();
        mText += mBarsInLine == 0 ? "|" : " |";
        for (long rest = isUpbeat ? full - steps : 0; rest > 0; --rest)
            WriteWord("", rest == full - steps);
        for (long step = 0; step < steps; ++step) WriteStep(bar.mPosition, step);
        if (++mBarsInLine == kChordProBarsPerLine) {
            mText += " |\n";
            mBarsInLine = 0;
        }
    }

    /// What begins in a step; of several chords the first.
    void WriteStep(double begin, long step) {
        const double end = begin + (static_cast<double>(step) + 1.0) / mSteps - 1e-6;
        std::string word;
        for (; mChord < ChordCountOf(mSong) && mSong.mChords[mChord].mPosition < end; ++mChord) {
            if (word.empty()) word = WordOf(mSong, mChord);
        }
        WriteWord(word, mIsFirst);
    }

    /// Before the first chord there is nothing that a point would hold.
    void WriteWord(const std::string& word, bool isFirst) {
        mText += ' ';
        if (!word.empty()) {
            mText += word;
        } else {
            mText += isFirst ? kRest : ".";
        }
        mIsFirst = false;
    }

    const CSong& mSong;
    int mSteps;
    std::string mText;
    std::size_t mChord = 0;
    std::size_t mSection = 0;
    std::size_t mBarsInLine = 0;
    long mBarSteps = 0;
    bool mIsGrid = false;
    bool mIsFirst = true;
};

}  // namespace

std::string ChordProText(const CSong& song) {
    if (IsTooLongForGrid(song)) return {};
    return CChordProWriter(song).Text();
}

}  // namespace brindle
