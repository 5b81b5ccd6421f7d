// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/CMarkovTransitionMap.h"
#include "brindle/markov/TMarkovGenerateOptions.h"
#include "brindle/markov/TMarkovSampledSequence.h"

#include <cstdint>
#include <functional>
#include <limits>
#include <nlohmann/json_fwd.hpp>
#include <string>
#include <utility>
#include <vector>

namespace brindle {

class CIteratorIndexConverter;
class TMarkovSamplingInformation;

/// For VariableLengthMarkovModel::AppendNextFittingSymbol: as long as the options allow.
inline constexpr std::uint64_t kMarkovLongestHistory = std::numeric_limits<std::int64_t>::max();
/// A free sequence of more symbols counts as missed.
inline constexpr std::size_t kMarkovMaxFreeSymbols = 4096;
/// A template search goes no deeper.
inline constexpr std::size_t kMarkovMaxTemplateSymbols = 250'000;

/// When the search for a sequence is given up.
struct CMarkovSearchLimits {
    /// Attempts of one call of SampleSequenceWithLength.
    std::uint64_t mAttempts = 10'000'000;
    /// Symbols tried in one attempt to fill a template; a search that reaches it ends the call.
    std::uint64_t mSteps = 1'000'000;
};

/// The length of a sequence: that of its chords and gaps together.
[[nodiscard]] double TMarkovSequenceLengthInBeats(MarkovSequenceView sequence);

/// Learns chord sequences and makes new ones in their manner.
///
/// It counts which symbol follows which history, for every history length from 1 to N. A table of
/// probabilities belongs to exactly one history; generation takes the longest history whose table
/// is varied enough, and that is the variable length.
///
/// A model is used by one caller at a time: learning and asking share one window of symbols.
class VariableLengthMarkovModel {
public:
    /// Gives 32 random bits a call.
    using RandomSource = std::function<std::uint32_t()>;

    /// The counts.
    CMarkovTransitionMap mTransitionMap;
    /// N.
    std::uint64_t mMaxHistoryLength = 0;
    /// The last N symbols that were learned or asked about.
    MarkovSequence mHistory;
    /// All symbols since QueryStartSequence, start symbols included.
    MarkovSequence mQuerySymbols;
    /// The store of the symbols that all of these point into.
    CMarkovObjects mObjects;

    /// An empty model. `maxHistoryLength` is N; a model of 0 learns nothing.
    explicit VariableLengthMarkovModel(std::uint64_t maxHistoryLength = 0);
    /// Where random numbers come from, 32 bits each; an empty one is the operating system.
    void SetRandomSource(RandomSource source);
    /// Replaces the limits that end a search which finds nothing.
    void SetSearchLimits(const CMarkovSearchLimits& limits) { mSearchLimits = limits; }
    /// The limits in force.
    [[nodiscard]] const CMarkovSearchLimits& SearchLimits() const { return mSearchLimits; }

    // Learning. A sequence is StartSequence, LearnAddSymbol for each symbol, EndSequence.

    /// Fills the window with start symbols.
    void StartSequence();
    /// Counts the symbol behind the window at every length and moves the window on.
    void LearnAddSymbol(const CMarkovObject& symbol);
    /// Learns N end symbols.
    void EndSequence();
    /// Back to the empty model; N stays. The symbols of a query are dead then.
    void Clear();

    // Histories.

    /// Interns each object.
    MarkovSequence IteratorSequenceForObjects(const std::vector<CMarkovObject>& objects);
    /// The last n symbols of `source`, with start symbols before them where it has fewer.
    void Subvector(std::uint64_t n, MarkovSequenceView source, MarkovSequence& out);
    /// The same of the window, n limited to 1 up to N.
    void HistorySubvector(std::uint64_t n, MarkovSequence& out);
    /// Limits `n` to 1 up to N; 0 for a model of 0.
    void ValidateHistoryLength(std::uint64_t& n) const;

    // Tables. They are empty for a history that was never seen.

    /// The counts behind the last n symbols of the window, n limited to 1 up to N.
    void TransitionFrequenciesForNextSymbol(std::uint64_t n, MarkovCounts& out);
    /// The same for the whole window.
    void TransitionFrequenciesForNextSymbol(MarkovCounts& out);
    /// The counts over their sum, without the start symbol. No smoothing, no shorter histories.
    void ProbabilitiesForNextSymbol(MarkovSequenceView history, MarkovProbabilities& out) const;
    /// For the last n symbols of the window.
    void ProbabilitiesForNextSymbol(std::uint64_t n, MarkovProbabilities& out);
    /// For the whole window.
    void ProbabilitiesForNextSymbol(MarkovProbabilities& out) const;
    /// Adds the count of the pair to that of its symbol.
    static void MapAddToOrInsert(MarkovCounts& map,
                                 const std::pair<MarkovIterator, std::uint32_t>& entry);
    /// The sum of all values: 1 for a table without start symbols, 0 for an empty one.
    [[nodiscard]] static double SumProbabilities(const MarkovProbabilities& map);
    /// In natural units; 0 for an empty table, not a number for one with a zero in it.
    [[nodiscard]] static double CalculateEntropy(const MarkovProbabilities& map);
    /// Entropy and maximal entropy of each history of length N in their order.
    void CalculateAllEntropies(std::vector<std::pair<double, double>>& out) const;

    // The query window, which generation moves on.

    /// Empties the query: the window is all start symbols, as before a song.
    void QueryStartSequence();
    /// Moves the window on by a symbol, which joins the store if it is new. Nothing is counted.
    void QueryAddSymbol(const CMarkovObject& symbol);
    /// Takes the last symbol back; nothing if the window is empty.
    void QueryRemoveLastItem();

    // Choosing. Each choice draws two random numbers and uses the second.

    /// A symbol with the chance of its value among all values; the end of the store if there is
    /// none.
    [[nodiscard]] MarkovIterator ChooseFromProbabilities(const MarkovProbabilities& map) const;
    /// `out` stays as it is if there are no sequences.
    void ChooseFromWeightedSequences(const std::vector<CMarkovWeightedSequence>& sequences,
                                     TMarkovSampledSequence& out) const;
    /// Turns logarithms into weights of which the largest is 1.
    static void NormalizeLogProbabilities(std::vector<CMarkovWeightedSequence>& sequences);
    /// Takes out the symbols that the set has; those left keep their values.
    static void RemoveItemsFromProbabilities(MarkovProbabilities& map,
                                             const MarkovSymbolSet& symbols);
    /// Takes out the end symbol and the chords that are longer than `remaining` beats.
    static void RemoveNonFittingSymbolsFromProbabilities(MarkovProbabilities& map,
                                                         double remaining);
    /// The longest length in whole beats; 0 for an empty table.
    [[nodiscard]] static std::int64_t GetMaxLengthFromProbabilities(const MarkovProbabilities& map);

    // Free generation: to a length, whatever the symbols.

    /// Appends a symbol chosen behind the history or behind its longest end that is varied enough.
    /// Appends nothing if no end of it was ever seen.
    void AppendNextSymbol(TMarkovSampledSequence& sequence, MarkovSequenceView history,
                          const TMarkovGenerateOptions& options);
    /// A sequence as long as the template. One that missed the length, or whose ending was never
    /// learned, gets a weight below e^-700.
    void GenerateSequenceWithFixedLength(std::uint64_t length, TMarkovSampledSequence& sequence,
                                         const TMarkovGenerateOptions& options);
    /// The same with the longest history of the model.
    void GenerateSequenceWithFixedLength(TMarkovSampledSequence& sequence,
                                         const TMarkovGenerateOptions& options);

    // Generation under a template.

    /// Appends a symbol that fits into the `remaining` beats up to the next fixed symbol and is not
    /// among `excluded`; false if there is none.
    bool AppendNextFittingSymbol(TMarkovSampledSequence& sequence, double remaining,
                                 const MarkovSymbolSet& excluded,
                                 const TMarkovGenerateOptions& options,
                                 TMarkovSamplingInformation& info, std::uint64_t length);
    /// The next fixed symbol of the template at or after `beats`, else the end symbol, and how far
    /// away it is.
    void NextGivenObjectAndDistance(MarkovIterator& object, double& distance,
                                    const TMarkovGenerateOptions& options, double beats);
    /// Goes on from `sequence` to the end of the template by a depth-first search that remembers
    /// dead ends. False if there is no way; the sequence is then as it was.
    bool RecursiveGenerateSequence(TMarkovSampledSequence& sequence,
                                   const TMarkovGenerateOptions& options,
                                   TMarkovSamplingInformation& info);
    /// Adds to the weight how well the fixed symbols fit behind what was put before them.
    void CalculateEvidenceProbability(TMarkovSampledSequence& sequence,
                                      const TMarkovGenerateOptions& options);

    // The main entries.

    /// Draws sequences, under the template with `recursive`, else free ones of its length. They
    /// join `sequences`, each once with its count, in ascending order of weight; one of those drawn
    /// now becomes `out`, which is empty if there are none. Does nothing if the options are
    /// invalid.
    void SampleSequenceWithLength(TMarkovSampledSequence& out,
                                  std::vector<TMarkovSampledSequence>& sequences, bool recursive,
                                  const TMarkovGenerateOptions& options);
    /// A symbol for the first gap of the sequence, drawn by how well it bridges its neighbours; N
    /// symbols should stand before the gap. The end of the store if that is empty.
    [[nodiscard]] MarkovIterator FillGapInSequence(const MarkovSequence& sequence);

    // Files.

    /// Replaces the file at `path` as a whole; false if that failed.
    bool SaveToFile(const std::string& path) const;
    /// The text of a model file.
    void AppendJSONString(std::ostream& stream) const;
    /// Writes the histories of length N with their counts, symbols by the converter's indices.
    void TransitionMapAppendToJSON(std::ostream& stream, CIteratorIndexConverter& converter) const;

    /// Reads a model from a file.
    struct JSONDeserialization_Helper {
        /// False, and the model as it was, if the file cannot be read. What is no model file gives
        /// an empty model with N of 0.
        static bool VariableLengthMarkovModelFromJSONFile(const std::string& path,
                                                          VariableLengthMarkovModel& model);
        /// The same from text.
        static void VariableLengthMarkovModelFromJSONString(const std::string& text,
                                                            VariableLengthMarkovModel& model);
        /// Fills the model from what stands under "VariableLengthMarkovModel".
        static void VariableLengthMarkovModelFromJSONDictionary(const nlohmann::json& dictionary,
                                                                VariableLengthMarkovModel& model);
        /// Reads what TransitionMapAppendToJSON wrote; entries that make no sense are left out.
        [[nodiscard]] static CMarkovTransitionMap MarkovTransitionMapFromJSONDictionary(
            const nlohmann::json& dictionary, CIteratorIndexConverter& converter);
        /// Reads the window under "History"; indices that no symbol has are left out.
        static void HistoryFromJSONDictionary(const nlohmann::json& dictionary,
                                              MarkovSequence& history,
                                              CIteratorIndexConverter& converter);
    };

    /// Whether both count the same symbols behind the same histories, all fields compared.
    [[nodiscard]] bool CompareMaps(const VariableLengthMarkovModel& other) const;
    /// Same symbols in the same order, same counts, same N and same window.
    friend bool operator==(const VariableLengthMarkovModel& a, const VariableLengthMarkovModel& b);

private:
    [[nodiscard]] double RandomFraction() const;
    void MoveWindow(MarkovIterator symbol);
    void AddWeightOfEnding(std::uint64_t length, TMarkovSampledSequence& sequence,
                           const TMarkovGenerateOptions& options);

    RandomSource mRandomSource;
    CMarkovSearchLimits mSearchLimits;
};

}  // namespace brindle
