// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/Input.h"
#include "cli/KeyText.h"
#include "cli/TypedChords.h"

#include "brindle/analysis/ReadNumerals.h"
#include "brindle/analysis/ReadRomanText.h"
#include "brindle/analysis/RomanNumeral.h"
#include "brindle/present/NumeralsJson.h"
#include "brindle/present/NumeralsText.h"
#include "brindle/present/RomanTextTable.h"

#include <memory>
#include <span>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kNumeralsHelp{
    "numerals",
    "Turn Roman numerals or Nashville numbers into chords of a key, and chords into these",
    "  brindle numerals \"ii7 V7 | I^7\" --key \"Eb major\"\n"
    "  brindle numerals \"2-7 57 | 1\" --key G\n"
    "  brindle numerals \"Fm7 Bb7/D Eb\" --key Eb --figures\n"
    "  brindle numerals \"i iio6 V6/5/V Cad64 V7\" --key \"C minor\" --figures\n"
    "  brindle numerals --from romantext analysis.txt\n"
    "  brindle numerals --from romantext \"C: I V65/V V a: i\"\n"
    "  brindle numerals \"Fm7 Bb7 Eb\" --key Eb --nashville\n"
    "  cat song.txt | brindle numerals - --key \"A minor\" --json\n",
};

struct CNumeralsOptions {
    std::vector<std::string> mWords;
    std::string mKey;
    std::string mFrom = "guess";
    bool mIsLenient = false;
    CNumeralOptions mNumerals;
    CFormatOptions mFormat;
};

bool AreNumerals(std::string_view text, const CSignKeyLite& key, const CNumeralsOptions& options) {
    return options.mFrom == "guess" ? BeginsWithNumeral(text, key) : options.mFrom == "numerals";
}

// False where faults end the reading; they have been printed.
bool AcceptsFaults(const std::string& text, const std::vector<CTextFault>& faults,
                   const CNumeralsOptions& options) {
    if (faults.empty()) return true;
    const std::size_t count = options.mIsLenient ? faults.size() : 1;
    PrintFaults(text, std::span(faults).first(count), options.mIsLenient);
    return options.mIsLenient;
}

TStatus ShowWords(const std::string& text, const CSignKeyLite& key,
                  const CNumeralsOptions& options) {
    const bool areNumerals = AreNumerals(text, key, options);
    const CNumeralsReading reading =
        areNumerals ? ReadNumerals(text, key, options.mNumerals) : ReadChordWords(text);
    if (!AcceptsFaults(text, reading.mFaults, options)) return TStatus::BadInput;
    if (options.mFormat.Format() == TFormat::Json) {
        return Print(NumeralsJson(reading, text, key, areNumerals, options.mNumerals));
    }
    const bool toChords = areNumerals && !options.mNumerals.mNashville;
    return Print(NumeralWordsText(reading.mWords, key, toChords, options.mNumerals));
}

TStatus ShowAnalysis(const std::string& text, const CSignKeyLite& key,
                     const CNumeralsOptions& options) {
    const CRomanTextReading reading = ReadRomanText(text, key);
    PrintFaults(text, reading.mNotes, true);
    if (!AcceptsFaults(text, reading.mFaults, options)) return TStatus::BadInput;
    // What is taken for headers alone was hardly meant so.
    if (reading.mChords.empty()) return Fail(TStatus::BadInput, "the analysis has no numerals");
    const bool isJson = options.mFormat.Format() == TFormat::Json;
    return Print(isJson ? RomanTextJson(reading, text) : RomanTextText(reading, PaintOfOutput()));
}

// As it was typed or stands in a file, so that faults have their lines.
std::optional<std::string> TypedNumerals(const std::vector<std::string>& words) {
    const bool isSource = words.size() == 1 && (words[0] == "-" || IsFileName(words[0]));
    return isSource ? ReadInput(words[0]) : TextFromWords(words);
}

TStatus Numerals(const CNumeralsOptions& options) {
    const bool isAnalysis = options.mFrom == "romantext";
    CSignKeyLite key;
    if (options.mKey.empty() && !isAnalysis) {
        return Fail(TStatus::BadUsage, "--key is required; see brindle numerals --help");
    }
    if (!options.mKey.empty()) {
        const auto typed = ReadKeyOption(options.mKey);
        if (!typed) return TStatus::BadUsage;
        key = *typed;
    }
    const auto text = TypedNumerals(options.mWords);
    if (!text) return TStatus::BadInput;
    return isAnalysis ? ShowAnalysis(*text, key, options) : ShowWords(*text, key, options);
}

}  // namespace

void AddNumeralOptions(CCommand& command, CNumeralOptions& options) {
    command.AddFlag("--nashville", options.mNashville, "Print Nashville numbers: 2-7 57 1");
    command.AddFlag("--figures", options.mFigures,
                    "Inversions are figures: V65, I6 (otherwise V7/^7, I/^3)");
    command.AddFlag("--by-key", options.mByKey,
                    "What has no sign is of the key: IV7 in C is Fmaj7, vi in A minor is F#m");
    command.AddFlag("--printed-signs", options.mPrintedSigns,
                    "Diminished chords as in print: \xC3\xB8 and \xC2\xB0 for h and o");
}

void AddNumerals(CCommand& program) {
    CCommand& command = program.AddCommand(kNumeralsHelp);
    const auto options = std::make_shared<CNumeralsOptions>();
    command
        .AddArgument("TEXT", options->mWords,
                     "Numerals, chords or an analysis, or a file with them; - reads standard input")
        .Required();
    command.AddOption("--key", "KEY", options->mKey,
                      "The key, as in \"A minor\" or Bb; of an analysis, up to its own first key");
    command.AddChoice("--from", options->mFrom, {"guess", "numerals", "chords", "romantext"},
                      "What the text has; the first word tells numerals from chords");
    command.AddFlag("--lenient", options->mIsLenient,
                    "Go on where a word is not understood, and leave it as it is");
    AddNumeralOptions(command, options->mNumerals);
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return Numerals(*options); });
}

}  // namespace brindle::cli
