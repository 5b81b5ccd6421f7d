// SPDX-License-Identifier: MIT
#include "cli/Markov.h"

#include <fmt/format.h>

#include <algorithm>
#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kMarkovFillHelp{
    "fill",
    "Put a chord into each gap of a sequence, by what the model knows of its neighbours",
    "  brindle markov fill model.json \"(4,C);(4,U);(4,G7);(4,C)\"\n"
    "  brindle markov fill model.json \"(2,Dm);(2,U);(4,C)\" --seed 1 --json\n",
};

// A gap and the end of a sequence are symbols, too, and can be drawn for a gap.
constexpr int kDraws = 100;

struct CFillOptions {
    std::string mModel;
    std::string mSequence;
    std::optional<std::uint64_t> mSeed;
    CFormatOptions mFormat;
};

/// Draws a chord for the first gap, one as long as the gap if the model comes upon it.
std::optional<MarkovIterator> DrawChord(VariableLengthMarkovModel& model,
                                        const MarkovSequence& sequence, double length) {
    std::optional<MarkovIterator> otherLength;
    for (int draw = 0; draw < kDraws; ++draw) {
        model.QueryStartSequence();
        const MarkovIterator drawn = model.FillGapInSequence(sequence);
        if (drawn->mType != TMarkovObjectType_Chord) continue;
        if (drawn->mChord.mLength == length) return drawn;
        if (!otherLength) otherLength = drawn;
    }
    return otherLength;
}

/// False if a gap could not be filled by histories of the model's length.
bool FillGaps(VariableLengthMarkovModel& model, MarkovSequence& sequence) {
    // Start symbols before the sequence, so that a gap near its front has its real neighbours.
    MarkovSequence padded;
    model.Subvector(model.mMaxHistoryLength + sequence.size(), sequence, padded);
    const auto offset = static_cast<std::ptrdiff_t>(model.mMaxHistoryLength);
    for (auto symbol = padded.begin(); symbol != padded.end(); ++symbol) {
        if (!(*symbol)->IsGap()) continue;
        const auto chord = DrawChord(model, padded, (*symbol)->mChord.mLength);
        if (!chord) return false;
        *symbol = *chord;
    }
    sequence.assign(padded.begin() + offset, padded.end());
    return true;
}

std::string FilledJson(const MarkovSequence& sequence, const MarkovSequence& typed) {
    const CMarkovSpelling spelling(sequence);
    Json symbols = Json::array();
    for (std::size_t ix = 0; ix < sequence.size(); ++ix) {
        Json symbol = SymbolToJson(*sequence[ix], spelling);
        symbol["Filled"] = typed[ix]->IsGap();
        symbols.push_back(symbol);
    }
    return JsonText({{"ChordString", ChordString(sequence, spelling)}, {"Symbols", symbols}});
}

TStatus MarkovFill(const CFillOptions& options) {
    auto model = ReadModel(options.mModel);
    if (!model) return TStatus::BadInput;
    const auto symbols = ReadSymbols("SEQUENCE", options.mSequence);
    if (!symbols) return TStatus::BadUsage;
    const MarkovSequence typed = model->IteratorSequenceForObjects(*symbols);
    SetSeed(*model, options.mSeed);
    MarkovSequence filled = typed;
    // A model holds the counts of all lower orders, too.
    while (!FillGaps(*model, filled) && model->mMaxHistoryLength > 0) --model->mMaxHistoryLength;
    if (model->mMaxHistoryLength == 0) {
        return Fail(TStatus::BadInput, "the model knows no chord between these neighbours");
    }
    return Print(options.mFormat.Format() == TFormat::Json
                     ? FilledJson(filled, typed)
                     : ChordString(filled, CMarkovSpelling(filled)) + '\n');
}

}  // namespace

void AddMarkovFill(CCommand& markov) {
    CCommand& command = markov.AddCommand(kMarkovFillHelp);
    const auto options = std::make_shared<CFillOptions>();
    command.AddArgument("MODEL", options->mModel, "Model file; - reads standard input").Required();
    command.AddArgument("SEQUENCE", options->mSequence, "Chords with their lengths; U is a gap")
        .Required();
    command.AddOption("--seed", "S", options->mSeed, "Repeats a run exactly");
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return MarkovFill(*options); });
}

}  // namespace brindle::cli
