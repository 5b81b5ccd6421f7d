// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/KeyText.h"
#include "cli/Message.h"
#include "cli/TypedChords.h"
#include "cli/TypedSongs.h"

#include "brindle/analysis/ReadNumerals.h"
#include "brindle/analysis/ReadRomanText.h"
#include "brindle/analysis/RomanNumeral.h"
#include "brindle/present/NumeralsJson.h"
#include "brindle/present/NumeralsText.h"
#include "brindle/present/RomanTextTable.h"
#include "brindle/song/ReadSong.h"

#include <memory>
#include <optional>
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
    CTypedSongs mTexts;
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
bool AcceptsFaults(const CTypedSong& text, const std::vector<CTextFault>& faults,
                   const CNumeralsOptions& options) {
    if (faults.empty()) return true;
    const std::size_t count = options.mIsLenient ? faults.size() : 1;
    PrintFaults(text.mText, std::span(faults).first(count), options.mIsLenient, text.mName);
    return options.mIsLenient;
}

// Whether a file is a song in a form that has more than chords, bar lines and holds.
bool IsWholeSong(const CTypedSong& typed) {
    const TSongFormat format = SongFormatOf(typed.mText);
    return !typed.mName.empty() && format != TSongFormat_ChordText &&
           format != TSongFormat_ChordStrings && format != TSongFormat_RomanText;
}

TSongOutput WordsShown(const CTypedSong& typed, const CSignKeyLite& key,
                       const CNumeralsOptions& options) {
    const std::string& text = typed.mText;
    const bool areNumerals = AreNumerals(text, key, options);
    const CNumeralsReading reading =
        areNumerals ? ReadNumerals(text, key, options.mNumerals) : ReadChordWords(text);
    if (!reading.mFaults.empty() && !options.mIsLenient && IsWholeSong(typed)) {
        return Fail(TStatus::BadInput,
                    Message("{name} is a whole song; {call} tells its numerals",
                            {{"name", Printable(typed.mName)}, {"call", "brindle analyse"}}));
    }
    if (!AcceptsFaults(typed, reading.mFaults, options)) return TStatus::BadInput;
    if (options.mFormat.Format() == TFormat::Json) {
        return NumeralsJson(reading, text, key, areNumerals, options.mNumerals);
    }
    const bool toChords = areNumerals && !options.mNumerals.mNashville;
    return NumeralWordsText(reading.mWords, key, toChords, options.mNumerals);
}

TSongOutput AnalysisShown(const CTypedSong& typed, const CSignKeyLite& key,
                          const CNumeralsOptions& options) {
    const CRomanTextReading reading = ReadRomanText(typed.mText, key);
    PrintFaults(typed.mText, reading.mNotes, true, typed.mName);
    if (!AcceptsFaults(typed, reading.mFaults, options)) return TStatus::BadInput;
    // What is taken for headers alone was hardly meant so.
    if (reading.mChords.empty()) return Fail(TStatus::BadInput, "the analysis has no numerals");
    const bool isJson = options.mFormat.Format() == TFormat::Json;
    return isJson ? RomanTextJson(reading, typed.mText) : RomanTextText(reading, PaintOfOutput());
}

// What is wrong with options that are fine one by one.
std::optional<std::string> Contradiction(const CNumeralsOptions& options) {
    const bool isAnalysis = options.mFrom == "romantext";
    if (options.mKey.empty() && !isAnalysis) {
        return "--key is required; see brindle numerals --help";
    }
    const CNumeralOptions& numerals = options.mNumerals;
    if (isAnalysis &&
        (numerals.mNashville || numerals.mFigures || numerals.mByKey || numerals.mPrintedSigns)) {
        return "--nashville, --figures, --by-key and --printed-signs are not for --from "
               "romantext, whose numerals stay as they are; brindle analyse writes its own";
    }
    return std::nullopt;
}

TStatus Numerals(const CNumeralsOptions& options) {
    if (const auto contradiction = Contradiction(options)) {
        return Fail(TStatus::BadUsage, *contradiction);
    }
    const auto key = ReadKeyIfTold(options.mKey);
    if (!key) return TStatus::BadUsage;
    return options.mTexts.Print(options.mFormat.Format(), [&](const CTypedSong& text) {
        return options.mFrom == "romantext" ? AnalysisShown(text, *key, options)
                                            : WordsShown(text, *key, options);
    });
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
    options->mTexts.AddTo(command,
                          "Numerals, chords or an analysis, or files with them; - reads standard "
                          "input");
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
