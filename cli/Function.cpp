// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/Input.h"
#include "cli/Json.h"
#include "cli/KeyText.h"
#include "cli/TypedChords.h"

#include "brindle/chords/CChordHeavy.h"
#include "brindle/chords/CChordLite.h"
#include "brindle/chords/HarmFuncNames.h"
#include "brindle/present/CTable.h"
#include "brindle/present/ShownNames.h"
#include "brindle/theory/CSignKeyHeavy.h"

#include <fmt/format.h>

#include <memory>

namespace brindle::cli {
namespace {

constexpr TCommandHelp kHelp{
    "function",
    "Tell the function of chords in a key: Roman numerals and function letters",
    "  brindle function Dm7 G7 C --key C\n"
    "  brindle function E7 Am --key \"A minor\" --json\n"
    "  cat symbols.txt | brindle function - --key Eb\n",
};

struct TFunctionOptions {
    std::vector<std::string> mSymbols;
    std::string mKey;
    CTypedChords mReading;
    CFormatOptions mFormat;
};

struct TChordFunction {
    std::string mSymbol;
    int mFunction = -1;
    std::string mNumeral;  // empty without a function, as the letters
    std::string mLetters;
    int mRootDegree = -1;
    int mBassDegree = -1;
};

TChordFunction FunctionOf(const std::string& symbol, const CChordLite& chord,
                          const CSignKeyHeavy& key) {
    const CChordHeavy heavy = chord.ToChordHeavy(CChordHeavy::DefaultWrapIntvl);
    TChordFunction function;
    function.mSymbol = Printable(symbol);
    function.mFunction = heavy.HarmFuncIn(key);
    CChordNamePrefs letters = NamePrefs();
    letters.mChordPrefF = 1;
    if (function.mFunction >= 0) {
        function.mNumeral = heavy.HarmFuncName(key, NamePrefs());
        function.mLetters = heavy.HarmFuncName(key, letters);
    }
    function.mRootDegree = heavy.RootNoteDegreeNrInSignKey(key);
    function.mBassDegree = heavy.BassNoteDegreeNrInSignKey(key);
    return function;
}

Json NumberOrNull(int number) {
    return number < 0 ? Json(nullptr) : Json(number);
}

Json TextOrNull(const std::string& text) {
    return text.empty() ? Json(nullptr) : Json(text);
}

std::string FunctionsJson(const CSignKeyLite& key, const std::vector<TChordFunction>& functions) {
    Json list = Json::array();
    for (const TChordFunction& function : functions) {
        list.push_back({{"Symbol", function.mSymbol},
                        {"HarmFunc", NumberOrNull(function.mFunction)},
                        {"Numeral", TextOrNull(function.mNumeral)},
                        {"Letters", TextOrNull(function.mLetters)},
                        {"RootDegree", NumberOrNull(function.mRootDegree)},
                        {"BassDegree", NumberOrNull(function.mBassDegree)}});
    }
    return JsonText({{"Key", key.NameLong(NamePrefs())}, {"Chords", list}});
}

// Degrees are counted from 1 here, as people do.
std::string DegreeText(int degree) {
    return degree < 0 ? "-" : fmt::format("{}", degree + 1);
}

std::string OrDash(const std::string& text) {
    return text.empty() ? "-" : text;
}

std::string FunctionsText(const std::vector<TChordFunction>& functions, const CPaint& paint) {
    CTable table({"chord", "numeral", "letters", " root degree", " bass degree"});
    for (const TChordFunction& function : functions) {
        table.AddRow({function.mSymbol, OrDash(function.mNumeral), OrDash(function.mLetters),
                      DegreeText(function.mRootDegree), DegreeText(function.mBassDegree)});
    }
    return table.Text(paint);
}

TStatus Function(const TFunctionOptions& options) {
    const auto key = ReadKeyOption(options.mKey);
    if (!key) return TStatus::BadUsage;
    const auto symbols = TypedSymbols(options.mSymbols);
    if (!symbols) return TStatus::BadInput;
    const auto chords = options.mReading.ReadSymbols(*symbols);
    if (!chords) return TStatus::BadInput;
    const CSignKeyHeavy signKey = key->ToSignKeyHeavy();
    std::vector<TChordFunction> functions;
    for (std::size_t i = 0; i < symbols->size(); ++i) {
        functions.push_back(FunctionOf((*symbols)[i], (*chords)[i], signKey));
    }
    return Print(options.mFormat.Format() == TFormat::Json
                     ? FunctionsJson(*key, functions)
                     : FunctionsText(functions, PaintOfOutput()));
}

}  // namespace

void AddFunction(CCommand& program) {
    CCommand& command = program.AddCommand(kHelp);
    const auto options = std::make_shared<TFunctionOptions>();
    command.AddArgument("SYMBOL", options->mSymbols, "Chord symbols; - reads standard input")
        .Required();
    command.AddOption("--key", "KEY", options->mKey, "The key, as in \"A minor\" or Bb").Required();
    options->mReading.AddTo(command);
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return Function(*options); });
}

}  // namespace brindle::cli
