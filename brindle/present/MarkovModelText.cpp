// SPDX-License-Identifier: MIT
#include "brindle/present/MarkovModelText.h"

#include "brindle/present/CTable.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/MarkovSequencesText.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>

namespace brindle {
namespace {

/// One spelling for the history and what follows it.
CMarkovSpelling SpellingWith(MarkovSequenceView history,
                             std::span<const CMarkovContinuation> continuations) {
    MarkovSequence all(history.begin(), history.end());
    for (const CMarkovContinuation& continuation : continuations) {
        all.push_back(continuation.mSymbol);
    }
    return CMarkovSpelling(all);
}

Json HistoriesToJson(const VariableLengthMarkovModel& model) {
    Json rows = Json::array();
    for (const CMarkovHistories& row : HistoriesByLength(model)) {
        rows.push_back({{"HistoryLength", row.mLength},
                        {"Histories", row.mCount},
                        {"Entropy", NumberToJson(row.mEntropy)},
                        {"MaxEntropy", NumberToJson(row.mMaxEntropy)}});
    }
    return rows;
}

CTable HistoriesTable(const VariableLengthMarkovModel& model) {
    CTable table({" history length", " histories", " mean entropy", " of at most"});
    for (const CMarkovHistories& row : HistoriesByLength(model)) {
        table.AddRow({fmt::format("{}", row.mLength), fmt::format("{}", row.mCount),
                      fmt::format("{:.3f}", row.mEntropy), fmt::format("{:.3f}", row.mMaxEntropy)});
    }
    return table;
}

}  // namespace

std::string MarkovModelText(const VariableLengthMarkovModel& model, MarkovSequenceView history,
                            std::span<const CMarkovContinuation> continuations,
                            const CPaint& paint) {
    const CMarkovSpelling spelling = SpellingWith(history, continuations);
    CTable following({" count", " probability", "symbol"});
    for (const CMarkovContinuation& continuation : continuations) {
        following.AddRow({fmt::format("{}", continuation.mCount),
                          fmt::format("{:.3f}", continuation.mProbability),
                          ChordString({&continuation.mSymbol, 1}, spelling)});
    }
    return fmt::format("{} symbols, {} histories of 1 to {} symbols\n\n{}\nbehind {}\n{}",
                       model.mObjects.size(), model.mTransitionMap.size(), model.mMaxHistoryLength,
                       HistoriesTable(model).Text(paint), ChordString(history, spelling),
                       following.Text(paint));
}

std::string MarkovModelJson(const VariableLengthMarkovModel& model, MarkovSequenceView history,
                            std::span<const CMarkovContinuation> continuations) {
    const CMarkovSpelling spelling = SpellingWith(history, continuations);
    Json following = Json::array();
    for (const CMarkovContinuation& continuation : continuations) {
        Json symbol = MarkovSymbolToJson(*continuation.mSymbol, spelling);
        symbol["Count"] = continuation.mCount;
        symbol["Probability"] = NumberToJson(continuation.mProbability);
        following.push_back(symbol);
    }
    return JsonText({{"MaxHistoryLength", model.mMaxHistoryLength},
                     {"Symbols", model.mObjects.size()},
                     {"Histories", model.mTransitionMap.size()},
                     {"HistoryLengths", HistoriesToJson(model)},
                     {"History", ChordString(history, spelling)},
                     {"Continuations", following}});
}

}  // namespace brindle
