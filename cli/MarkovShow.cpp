// SPDX-License-Identifier: MIT
#include "cli/Markov.h"

#include "brindle/present/CTable.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <memory>
#include <numeric>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kMarkovShowHelp{
    "show",
    "Show what a model has learned: its size, how sure it is, and what follows a history",
    "  brindle markov show model.json\n"
    "  brindle markov show model.json --history \"(4,Dm7);(4,G7)\"\n",
};

struct CShowOptions {
    std::string mModel;
    std::string mHistory;
    std::uint64_t mTop = 10;
    CFormatOptions mFormat;
};

/// The histories of one length.
struct CLengthRow {
    std::size_t mLength = 0;
    std::size_t mHistories = 0;
    /// Means over all places of what was learned.
    double mEntropy = 0.0;
    double mMaxEntropy = 0.0;
};

struct CContinuation {
    MarkovIterator mSymbol;
    std::uint32_t mCount = 0;
    double mProbability = 0.0;
};

CLengthRow RowOf(const VariableLengthMarkovModel& model, std::size_t length) {
    CLengthRow row{length};
    double places = 0.0;
    MarkovProbabilities table;
    for (const CMarkovTransitions* const entry : model.mTransitionMap.OfLength(length)) {
        model.ProbabilitiesForNextSymbol(entry->mHistory, table);
        double count = 0.0;
        for (const auto& successor : entry->mCounts) count += successor.second;
        const double entropy = model.CalculateEntropy(table);
        ++row.mHistories;
        if (table.empty() || std::isnan(entropy)) continue;
        row.mEntropy += entropy * count;
        row.mMaxEntropy += std::log(static_cast<double>(table.size())) * count;
        places += count;
    }
    if (places > 0.0) {
        row.mEntropy /= places;
        row.mMaxEntropy /= places;
    }
    return row;
}

std::vector<CLengthRow> RowsOf(const VariableLengthMarkovModel& model) {
    std::vector<CLengthRow> rows;
    for (std::size_t length = 1; length <= model.mMaxHistoryLength; ++length) {
        rows.push_back(RowOf(model, length));
    }
    return rows;
}

/// Of the history, or of its longest end that the model knows, the most frequent first.
std::vector<CContinuation> ContinuationsOf(const VariableLengthMarkovModel& model,
                                           MarkovSequence& history) {
    const MarkovCounts* counts = nullptr;
    const auto isContinued = [&] {
        counts = model.mTransitionMap.Find(history);
        return counts != nullptr && !counts->empty();
    };
    while (!history.empty() && !isContinued()) history.erase(history.begin());
    std::vector<CContinuation> continuations;
    if (counts == nullptr) return continuations;
    MarkovProbabilities table;
    model.ProbabilitiesForNextSymbol(history, table);
    for (const auto& [symbol, count] : *counts) {
        const auto found = table.find(symbol);
        continuations.push_back({symbol, count, found == table.end() ? 0.0 : found->second});
    }
    std::stable_sort(
        continuations.begin(), continuations.end(),
        [](const CContinuation& a, const CContinuation& b) { return a.mCount > b.mCount; });
    return continuations;
}

/// One spelling for the history and what follows it.
CMarkovSpelling SpellingOf(MarkovSequence sequence,
                           const std::vector<CContinuation>& continuations) {
    for (const CContinuation& continuation : continuations) {
        sequence.push_back(continuation.mSymbol);
    }
    return CMarkovSpelling(sequence);
}

std::string ShownJson(const VariableLengthMarkovModel& model, const MarkovSequence& history,
                      const std::vector<CContinuation>& continuations) {
    Json rows = Json::array();
    for (const CLengthRow& row : RowsOf(model)) {
        rows.push_back({{"HistoryLength", row.mLength},
                        {"Histories", row.mHistories},
                        {"Entropy", NumberToJson(row.mEntropy)},
                        {"MaxEntropy", NumberToJson(row.mMaxEntropy)}});
    }
    const CMarkovSpelling spelling = SpellingOf(history, continuations);
    Json following = Json::array();
    for (const CContinuation& continuation : continuations) {
        Json symbol = SymbolToJson(*continuation.mSymbol, spelling);
        symbol["Count"] = continuation.mCount;
        symbol["Probability"] = NumberToJson(continuation.mProbability);
        following.push_back(symbol);
    }
    return JsonText({{"MaxHistoryLength", model.mMaxHistoryLength},
                     {"Symbols", model.mObjects.size()},
                     {"Histories", model.mTransitionMap.size()},
                     {"HistoryLengths", rows},
                     {"History", ChordString(history, spelling)},
                     {"Continuations", following}});
}

std::string ShownText(const VariableLengthMarkovModel& model, const MarkovSequence& history,
                      const std::vector<CContinuation>& continuations, const CPaint& paint) {
    CTable lengths({" history length", " histories", " mean entropy", " of at most"});
    for (const CLengthRow& row : RowsOf(model)) {
        lengths.AddRow({fmt::format("{}", row.mLength), fmt::format("{}", row.mHistories),
                        fmt::format("{:.3f}", row.mEntropy),
                        fmt::format("{:.3f}", row.mMaxEntropy)});
    }
    const CMarkovSpelling spelling = SpellingOf(history, continuations);
    CTable following({" count", " probability", "symbol"});
    for (const CContinuation& continuation : continuations) {
        following.AddRow({fmt::format("{}", continuation.mCount),
                          fmt::format("{:.3f}", continuation.mProbability),
                          ChordString({&continuation.mSymbol, 1}, spelling)});
    }
    return fmt::format("{} symbols, {} histories of 1 to {} symbols\n\n{}\nbehind {}\n{}",
                       model.mObjects.size(), model.mTransitionMap.size(), model.mMaxHistoryLength,
                       lengths.Text(paint), ChordString(history, spelling), following.Text(paint));
}

TStatus MarkovShow(const CShowOptions& options) {
    auto model = ReadModel(options.mModel);
    if (!model) return TStatus::BadInput;
    MarkovSequence history;
    if (options.mHistory.empty()) {
        model->Subvector(1, {}, history);
    } else {
        const auto symbols = ReadSymbols("--history", options.mHistory);
        if (!symbols) return TStatus::BadUsage;
        history = model->IteratorSequenceForObjects(*symbols);
    }
    auto continuations = ContinuationsOf(*model, history);
    if (history.empty()) {
        return Fail(TStatus::BadInput, "the model does not know the last chord of --history");
    }
    if (options.mTop < continuations.size()) {
        continuations.resize(static_cast<std::size_t>(options.mTop));
    }
    return Print(options.mFormat.Format() == TFormat::Json
                     ? ShownJson(*model, history, continuations)
                     : ShownText(*model, history, continuations, PaintOfOutput()));
}

}  // namespace

void AddMarkovShow(CCommand& markov) {
    CCommand& command = markov.AddCommand(kMarkovShowHelp);
    const auto options = std::make_shared<CShowOptions>();
    command.AddArgument("MODEL", options->mModel, "Model file; - reads standard input").Required();
    command.AddOption("--history", "CHORDS", options->mHistory,
                      "Show what follows these chords (default: the start of a sequence)");
    command.AddOption("--top", "N", options->mTop, "Continuations to show (default: 10)");
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return MarkovShow(*options); });
}

}  // namespace brindle::cli
