// SPDX-License-Identifier: MIT
#include "cli/Markov.h"

#include "cli/Input.h"

#include "brindle/chords/CChordHeavy.h"
#include "brindle/markov/MarkovChords.h"
#include "brindle/platform/SeededRandom.h"
#include "brindle/present/ShownNames.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <sstream>

namespace brindle::cli {
namespace {

constexpr TCommandHelp kHelp{
    "markov",
    "Learn chord sequences and make new ones in their manner",
    "  brindle markov learn --order 3 -o model.json songs/\n"
    "  brindle markov generate model.json --beats 32\n"
    "  brindle markov fill model.json \"(4,C);(4,U);(4,G7);(4,C)\"\n"
    "  brindle markov show model.json\n",
};

// Wide enough for two octaves of tensions.
constexpr int kWrapIntvl = 24;
// Longer texts are shown as chord strings.
constexpr double kMostBeats = 1e6;

std::string SymbolName(const CMarkovObject& object) {
    switch (object.mType) {
        case TMarkovObjectType_Chord:
            return object.mChord.IsUndef() ? "U" : ChordName(object.mChord);
        case TMarkovObjectType_Start:
            return "start";
        case TMarkovObjectType_End:
            return "end";
        case TMarkovObjectType_Gap:
            return "U";
    }
    return fmt::format("#{}", object.mIndex);
}

bool IsWholeBeats(double length) {
    return length >= 1.0 && length <= kMostBeats && std::floor(length) == length;
}

/// A word that is neither a chord nor "U"; empty if there is none.
std::string UnknownSymbol(const std::string& text) {
    std::istringstream elements(text);
    for (std::string element; std::getline(elements, element, ';');) {
        const CHarmAnlsChordsWithLength chords = HarmChordsFromChordString(element);
        const std::size_t comma = element.find(',');
        if (chords.empty() || !IsUndefinedForMarkov(chords.front()) || comma == element.npos) {
            continue;
        }
        const std::string symbol = element.substr(comma + 1, element.find(')') - comma - 1);
        if (symbol != "U") return symbol;
    }
    return {};
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

std::optional<VariableLengthMarkovModel> ReadModel(const std::string& path) {
    using Helper = VariableLengthMarkovModel::JSONDeserialization_Helper;
    const auto text = ReadInput(path);
    if (!text) return std::nullopt;
    VariableLengthMarkovModel model;
    Helper::VariableLengthMarkovModelFromJSONString(*text, model);
    const std::string_view name = path == "-" ? "standard input" : std::string_view(path);
    const auto fail = [&](std::string_view what) {
        Fail(TStatus::BadInput, fmt::format("{} {}", Printable(name), what));
        return std::nullopt;
    };
    if (model.mMaxHistoryLength == 0) {
        return fail("is no model file; brindle markov learn makes one");
    }
    if (model.mMaxHistoryLength > kLongestOrder) return fail("has histories that are too long");
    if (model.mTransitionMap.empty()) return fail("is a model that has learned nothing");
    return model;
}

void SetSeed(VariableLengthMarkovModel& model, const std::optional<std::uint64_t>& seed) {
    if (!seed) return;
    model.SetRandomSource([random = SeededRandom(*seed)]() mutable { return random.Next(); });
}

std::optional<std::vector<CMarkovObject>> ReadSymbols(const std::string& option,
                                                      const std::string& text) {
    std::string typed = FoldAccidentals(text);
    std::erase_if(typed, [](char c) { return c == ' ' || c == '\t' || c == '\r' || c == '\n'; });
    if (!typed.empty() && typed.back() == ';') typed.pop_back();
    const CHarmAnlsChordsWithLength chords = HarmChordsFromChordString(typed);
    const bool areLengths = std::all_of(chords.begin(), chords.end(), [](const auto& chord) {
        return chord.mLength > 0.0 && chord.mLength <= kMostBeats;
    });
    if (chords.empty() || !areLengths) {
        Fail(TStatus::BadUsage, fmt::format("{}: chords with their lengths in beats are wanted, as "
                                            "in \"(4,C);(8,U);(4,G7)\"",
                                            option));
        return std::nullopt;
    }
    const std::string unknown = UnknownSymbol(typed);
    if (!unknown.empty()) {
        Fail(TStatus::BadUsage,
             fmt::format("{}: {} is no chord; a gap is U", option, Printable(unknown)));
        return std::nullopt;
    }
    std::vector<CMarkovObject> symbols;
    MarkovObjectsVectorForHarmChords(chords, symbols);
    return symbols;
}

std::string ChordName(const CHarmAnlsChordWithLength& chord) {
    return chord.ToChordHeavy(kWrapIntvl).NameWithSlash(NamePrefs());
}

std::string ChordString(MarkovSequenceView sequence) {
    std::string text;
    for (const MarkovIterator symbol : sequence) {
        text += text.empty() ? "" : ";";
        text += symbol->HasBeats() ? fmt::format("({},{})", ShortNumber(symbol->mChord.mLength),
                                                 SymbolName(*symbol))
                                   : SymbolName(*symbol);
    }
    return text;
}

std::string BarsText(MarkovSequenceView sequence, int beatsPerBar, int barsPerLine) {
    const auto fits = [](MarkovIterator symbol) {
        return symbol->HasBeats() && IsWholeBeats(symbol->mChord.mLength);
    };
    if (!std::all_of(sequence.begin(), sequence.end(), fits) ||
        TMarkovSequenceLengthInBeats(sequence) > kMostBeats) {
        return ChordString(sequence);
    }
    CBarsWriter bars(beatsPerBar, barsPerLine);
    for (const MarkovIterator symbol : sequence) {
        bars.Add(SymbolName(*symbol), static_cast<int>(symbol->mChord.mLength));
    }
    return bars.Text();
}

Json SymbolToJson(const CMarkovObject& object) {
    if (!object.HasBeats()) return {{"Symbol", SymbolName(object)}};
    const CHarmAnlsChordWithLength& chord = object.mChord;
    return {{"Symbol", SymbolName(object)},
            {"Length", chord.mLength},
            {"RootKeyEnh", KeyEnhToJson(chord.mRootKeyEnh)},
            {"BassKeyEnh", KeyEnhToJson(chord.mBassKeyEnh)},
            {"Semitones", chord.mSemitones.Mask()},
            {"Intervals", IntervalsToJson(chord.mSemitones)}};
}

void AddMarkov(CCommand& program) {
    CCommand& markov = program.AddCommand(kHelp);
    AddMarkovLearn(markov);
    AddMarkovGenerate(markov);
    AddMarkovFill(markov);
    AddMarkovShow(markov);
}

}  // namespace brindle::cli
