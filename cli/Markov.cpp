// SPDX-License-Identifier: MIT
#include "cli/Markov.h"

#include "cli/Input.h"
#include "cli/MarkovSongs.h"

#include "brindle/chords/ReadChordText.h"
#include "brindle/markov/MarkovChords.h"
#include "brindle/platform/SeededRandom.h"
#include "brindle/present/MarkovText.h"

#include <fmt/format.h>

#include <algorithm>
#include <sstream>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kMarkovHelp{
    "markov",
    "Learn songs and write new ones in their manner",
    "  brindle markov generate --form AABA --key \"Eb major\"\n"
    "  brindle markov learn -o model.json songs/\n"
    "  brindle markov generate model.json --sheet \"C | _ | _ | G7 | C\"\n"
    "  brindle markov next \"Dm7 G7\"\n"
    "  brindle markov score model.json more-songs/\n"
    "  brindle markov learn --plain --order 3 -o plain.json songs/\n"
    "  brindle markov fill plain.json \"(4,C);(4,U);(4,G7);(4,C)\"\n",
};

// Longer texts are shown as chord strings.
constexpr double kMostBeatsOfChord = 1e6;

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

// A chord string with its symbols as the reader of such strings knows them: it takes the brackets
// of
// "(4,Gm(maj7))" away before it reads the chord.
std::string WithPlainSymbols(const std::string& text) {
    std::istringstream elements(text);
    std::string plain;
    for (std::string element; std::getline(elements, element, ';');) {
        plain += plain.empty() ? "" : ";";
        const std::size_t comma = element.find(',');
        const bool isPair =
            element.starts_with('(') && element.ends_with(')') && comma != element.npos;
        const auto symbol =
            isPair ? NormaliseChordSymbol(element.substr(comma + 1, element.size() - comma - 2))
                   : std::nullopt;
        plain += symbol ? element.substr(0, comma + 1) + *symbol + ")" : element;
    }
    return plain;
}

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
        return fail("is no model file; brindle markov learn --plain makes one");
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
    typed = WithPlainSymbols(typed);
    const CHarmAnlsChordsWithLength chords = HarmChordsFromChordString(typed);
    const bool areLengths = std::all_of(chords.begin(), chords.end(), [](const auto& chord) {
        return chord.mLength > 0.0 && chord.mLength <= kMostBeatsOfChord;
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

Json SymbolToJson(const CMarkovObject& object, const CMarkovSpelling& spelling) {
    const std::string symbol = spelling.SymbolOf(object);
    if (!object.HasBeats()) return {{"Symbol", symbol}};
    const CChordLite chord = spelling.Spelled(object.mChord);
    return {{"Symbol", symbol},
            {"Length", object.mChord.mLength},
            {"RootKeyEnh", KeyEnhToJson(chord.mRootKeyEnh)},
            {"BassKeyEnh", KeyEnhToJson(chord.mBassKeyEnh)},
            {"Semitones", chord.mSemitones.Mask()},
            {"Intervals", IntervalsToJson(chord.mSemitones)}};
}

void AddMarkov(CCommand& program) {
    CCommand& markov = program.AddCommand(kMarkovHelp);
    AddMarkovLearn(markov);
    AddMarkovGenerate(markov);
    AddMarkovFill(markov);
    AddMarkovShow(markov);
    AddMarkovNext(markov);
    AddMarkovScore(markov);
}

}  // namespace brindle::cli
