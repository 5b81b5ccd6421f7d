// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/Input.h"
#include "cli/TypedChords.h"
#include "cli/TypedSymbols.h"

#include "brindle/analysis/ChordVectorText.h"
#include "brindle/present/VectorsText.h"

#include <algorithm>
#include <iterator>
#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kVectorHelp{
    "vector",
    "Write chords as vectors of 46 places for learning systems, and read vectors back",
    "  brindle vector C/E F#m7\n"
    "  brindle vector 000 100000000000 1000000 000000000000 000010000000\n"
    "  cat vectors.txt | brindle vector - --json\n"
    "\n"
    "The groups of a vector are: no chord, EADGBE, wildcard; the root from C to B; major,\n"
    "minor, augmented, diminished, sus4, sus2, drone; the semitones beyond these, from 0\n"
    "to 11; and the bass from C to B. A vector may also be a JSON list of 46 numbers.\n",
};

struct CVectorOptions {
    std::vector<std::string> mWords;
    CTypedChords mReading;
    CFormatOptions mFormat;
};

// A line of standard input is a vector, or chord symbols between white space.
std::vector<std::string> ThingsIn(const std::vector<std::string>& lines) {
    std::vector<std::string> things;
    for (const std::string& line : lines) {
        if (BeginsAsChordVector(line)) {
            things.push_back(line);
        } else {
            const std::vector<std::string> symbols = SymbolsOf(line);
            things.insert(things.end(), symbols.begin(), symbols.end());
        }
    }
    return things;
}

std::optional<std::vector<std::string>> TypedThings(const std::vector<std::string>& words) {
    if (!AreInputs(words)) {
        const auto things = TypedSymbols(words);
        return things ? std::optional(JoinChordVectors(*things)) : std::nullopt;
    }
    const auto lines = TypedLines(words);
    if (!lines) return std::nullopt;
    return ThingsIn(*lines);
}

TStatus Vector(const CVectorOptions& options) {
    const auto things = TypedThings(options.mWords);
    if (!things) return TStatus::BadInput;
    std::vector<std::string> symbols;
    std::remove_copy_if(things->begin(), things->end(), std::back_inserter(symbols),
                        BeginsAsChordVector);
    const auto chords = options.mReading.ReadSymbols(symbols);
    if (!chords) return TStatus::BadInput;
    std::vector<CShownVector> vectors;
    auto chord = chords->begin();
    for (const std::string& typed : *things) {
        if (!BeginsAsChordVector(typed)) {
            vectors.push_back(ShowVectorOfChord(Printable(typed), *chord++));
            continue;
        }
        const CChordVectorText read = ReadChordVector(typed);
        if (!read.mError.empty()) {
            return FailAt(TStatus::BadInput, read.mError, typed, read.mColumn);
        }
        vectors.push_back(ShowVector(read.mVector));
    }
    return Print(options.mFormat.Format() == TFormat::Json ? VectorsJson(vectors)
                                                           : VectorsText(vectors, PaintOfOutput()));
}

}  // namespace

void AddVector(CCommand& program) {
    CCommand& command = program.AddCommand(kVectorHelp);
    const auto options = std::make_shared<CVectorOptions>();
    command
        .AddArgument("CHORD", options->mWords,
                     "Chord symbols or vectors; - reads standard input, a vector or chords a line")
        .Required();
    options->mReading.AddTo(command);
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return Vector(*options); });
}

}  // namespace brindle::cli
