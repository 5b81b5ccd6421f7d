// SPDX-License-Identifier: MIT
#include "cli/Input.h"
#include "cli/KeyText.h"
#include "cli/MarkovSongs.h"
#include "cli/TypedChords.h"
#include "cli/TypedSymbols.h"

#include "brindle/present/NextChordsText.h"

#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kNextHelp{
    "next",
    "Rank the chords that may come next",
    "  brindle markov next \"Dm7 G7\"\n"
    "  brindle markov next \"Am F\" --key \"A minor\" --style folk\n"
    "  brindle markov next \"Dm7 G7\" --model songs.json --json\n",
};

struct CNextOptions {
    std::vector<std::string> mWords;
    std::string mModel;
    std::string mStyle;
    std::string mKey;
    std::uint64_t mCount = 10;
    std::uint64_t mOrder = CSongModel::kLongestHistory;
    CTypedChords mReading;
    CFormatOptions mFormat;
};

/// Chords between white space; bar lines do not count.
std::optional<std::vector<CChordLite>> TypedRow(const CNextOptions& options) {
    std::vector<std::string> words;
    for (const std::string& word : options.mWords) {
        const auto symbols =
            AreInputs({word}) ? std::vector{word} : SymbolsOf(FoldAccidentals(word));
        words.insert(words.end(), symbols.begin(), symbols.end());
    }
    if (words.empty()) return std::vector<CChordLite>();
    const auto symbols = TypedSymbols(words);
    return symbols ? options.mReading.ReadSymbols(*symbols) : std::nullopt;
}

TStatus MarkovNext(const CNextOptions& options) {
    const auto chords = TypedRow(options);
    if (!chords) return TStatus::BadInput;
    const auto key = ReadKeyIfTold(options.mKey);
    if (!key) return TStatus::BadUsage;
    CNextChordOptions asked;
    asked.mKey = *key;
    asked.mCount = options.mCount;
    asked.mOrder = options.mOrder;
    const auto model = ReadSongModelFile(options.mModel, options.mStyle);
    if (!model) return TStatus::BadInput;
    const CNextChords next = NextChords(*model, *chords, asked);
    if (model->IsEmpty()) return Fail(TStatus::BadInput, "the model has learned nothing");
    if (next.mKey.IsUndef()) {
        return Fail(TStatus::BadUsage, "without a chord --key is needed");
    }
    return Print(options.mFormat.Format() == TFormat::Json ? NextChordsJson(next)
                                                           : NextChordsText(next, PaintOfOutput()));
}

}  // namespace

void AddMarkovNext(CCommand& markov) {
    CCommand& command = markov.AddCommand(kNextHelp);
    const auto options = std::make_shared<CNextOptions>();
    command.AddArgument("CHORDS", options->mWords, "The chords before; - reads standard input");
    command.AddOption("--model", "MODEL", options->mModel,
                      "Model file of songs (default: the built-in one)");
    command.AddOption("--style", "STYLE", options->mStyle, "Only from songs of this style");
    command.AddOption("--key", "KEY", options->mKey, "Key of the chords (default: found)");
    command.AddOption("--top", "N", options->mCount, "Chords to show (default: 10)")
        .InRange(std::uint64_t{1}, std::uint64_t{1000});
    command.AddOption("--order", "N", options->mOrder, "Longest history, in chords (default: 5)")
        .InRange(std::uint64_t{1}, std::uint64_t{CSongModel::kLongestHistory});
    options->mReading.AddTo(command);
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return MarkovNext(*options); });
}

}  // namespace brindle::cli
