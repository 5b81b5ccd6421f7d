// SPDX-License-Identifier: MIT
#include "brindle/present/MarkovText.h"

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/present/ShownText.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <vector>

namespace brindle {
namespace {

// Longer texts are shown as chord strings.
constexpr double kMostBeatsOfText = 1e6;

CHarmAnlsChords ChordsOf(MarkovSequenceView sequence) {
    CHarmAnlsChords chords;
    double position = 0.0;
    for (const MarkovIterator symbol : sequence) {
        if (!symbol->HasBeats()) continue;
        chords.emplace_back(symbol->mChord, position);
        position += std::max(0.0, symbol->mChord.mLength);
    }
    chords.emplace_back(CChordLite_Undef, position);
    return chords;
}

bool IsWholeBeats(double length) {
    return length >= 1.0 && length <= kMostBeatsOfText && std::floor(length) == length;
}

/// Puts one word for each beat into bars.
class CBarsWriter {
public:
    CBarsWriter(int beatsPerBar, int barsPerLine)
        : mBeatsPerBar(beatsPerBar), mBarsPerLine(barsPerLine) {}

    void Add(const std::string& symbol, int beats) {
        for (int beat = 0; beat < beats; ++beat) AddWord(beat == 0 ? symbol : ".");
    }

    [[nodiscard]] std::string Text() const { return mText + mBar; }

private:
    void AddWord(const std::string& word) {
        if (mBeat == mBeatsPerBar) EndBar();
        // The bar line tells how long the last chord of a bar is held.
        if (word == "." && mBeat > 0) {
            mHeld += " .";
        } else {
            mBar += mHeld + (mBeat == 0 ? "" : " ") + word;
            mHeld.clear();
        }
        ++mBeat;
    }
    void EndBar() {
        ++mBars;
        const bool isLineEnd = mBarsPerLine > 0 && mBars % mBarsPerLine == 0;
        mText += mBar + (isLineEnd ? " |\n" : " | ");
        mBar.clear();
        mHeld.clear();
        mBeat = 0;
    }

    int mBeatsPerBar;
    int mBarsPerLine;
    int mBeat = 0;
    int mBars = 0;
    std::string mText;
    std::string mBar;
    std::string mHeld;
};

}  // namespace

CMarkovSpelling::CMarkovSpelling(MarkovSequenceView sequence, MarkovSequenceView beside)
    : mKey(FindKeys(ChordsOf(sequence)).mKey) {
    std::vector<CChordLite> chords;
    for (const MarkovSequenceView view : {sequence, beside}) {
        for (const MarkovIterator symbol : view) {
            if (symbol->HasBeats()) chords.push_back(symbol->mChord);
        }
    }
    mNames = CProgressionSpelling(mKey, chords);
}

std::string CMarkovSpelling::SymbolOf(const CMarkovObject& object) const {
    switch (object.mType) {
        case TMarkovObjectType_Chord:
            return object.mChord.IsUndef() ? "U" : WriteChordSymbol(Spelled(object.mChord));
        case TMarkovObjectType_Start:
            return "start";
        case TMarkovObjectType_End:
            return "end";
        case TMarkovObjectType_Gap:
            return "U";
    }
    return fmt::format("#{}", object.mIndex);
}

std::string ChordString(MarkovSequenceView sequence, const CMarkovSpelling& spelling) {
    std::string text;
    for (const MarkovIterator symbol : sequence) {
        text += text.empty() ? "" : ";";
        text += symbol->HasBeats() ? fmt::format("({},{})", ShortNumber(symbol->mChord.mLength),
                                                 spelling.SymbolOf(*symbol))
                                   : spelling.SymbolOf(*symbol);
    }
    return text;
}

std::string BarsText(MarkovSequenceView sequence, const CMarkovSpelling& spelling, int beatsPerBar,
                     int barsPerLine) {
    const auto fits = [](MarkovIterator symbol) {
        return symbol->HasBeats() && IsWholeBeats(symbol->mChord.mLength);
    };
    if (!std::all_of(sequence.begin(), sequence.end(), fits) ||
        TMarkovSequenceLengthInBeats(sequence) > kMostBeatsOfText) {
        return ChordString(sequence, spelling);
    }
    CBarsWriter bars(beatsPerBar, barsPerLine);
    for (const MarkovIterator symbol : sequence) {
        bars.Add(spelling.SymbolOf(*symbol), static_cast<int>(symbol->mChord.mLength));
    }
    return bars.Text();
}

}  // namespace brindle
