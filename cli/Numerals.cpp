// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/Input.h"
#include "cli/Json.h"
#include "cli/KeyText.h"

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/analysis/RomanNumeral.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/present/ShownNames.h"

#include <fmt/format.h>

#include <memory>

namespace brindle::cli {
namespace {

constexpr TCommandHelp kHelp{
    "numerals",
    "Turn Roman numerals or Nashville numbers into chords of a key, and chords into these",
    "  brindle numerals \"ii7 V7 | I^7\" --key \"Eb major\"\n"
    "  brindle numerals \"2-7 57 | 1\" --key G\n"
    "  brindle numerals \"Fm7 Bb7/D Eb\" --key Eb --figures\n"
    "  brindle numerals \"Fm7 Bb7 Eb\" --key Eb --nashville\n"
    "  cat song.txt | brindle numerals - --key \"A minor\" --json\n",
};

struct TNumeralsOptions {
    std::vector<std::string> mWords;
    std::string mKey;
    std::string mFrom = "guess";
    TNumeralOptions mNumerals;
    CFormatOptions mFormat;
};

// A word of the text: a chord, or a mark of the bars, which stays as it is.
struct TWord {
    std::string mTyped;
    std::size_t mLine = 0;
    std::size_t mColumn = 0;
    CChordLite mChord;

    [[nodiscard]] bool IsMark() const { return mTyped == "|" || mTyped == "."; }
};

std::vector<TWord> WordsWithPlaces(const std::vector<std::string>& lines) {
    std::vector<TWord> words;
    for (std::size_t line = 0; line < lines.size(); ++line) {
        std::size_t from = 0;
        for (const std::string& word : WordsOf(lines[line])) {
            const std::size_t column = lines[line].find(word, from);
            from = column + word.size();
            words.push_back({word, line, column, {}});
        }
    }
    return words;
}

// The first chord tells whether the text has numerals. No chord symbol begins as a numeral does.
bool AreNumerals(const std::vector<TWord>& words, const CSignKeyLite& key,
                 const TNumeralsOptions& options) {
    if (options.mFrom != "guess") return options.mFrom == "numerals";
    for (const TWord& word : words) {
        if (!word.IsMark()) return ChordFromNumeral(word.mTyped, key).has_value();
    }
    return false;
}

// False for the first word that is no chord; the others are then not read.
bool ReadChord(TWord& word, bool isNumeral, const CSignKeyLite& key,
               const TNumeralOptions& options) {
    if (word.IsMark()) return true;
    if (!isNumeral) {
        word.mChord = ReadChordText(word.mTyped).mChord;
    } else if (const auto chord = ChordFromNumeral(word.mTyped, key, options)) {
        word.mChord = *chord;
    }
    return !word.mChord.IsUndef();
}

// The numerals of all words in one key; empty for the marks.
std::vector<std::string> Numerals(const std::vector<TWord>& words, const CSignKeyLite& key,
                                  const TNumeralOptions& options) {
    CHarmAnlsChords chords;
    for (const TWord& word : words) {
        chords.emplace_back(word.mChord, static_cast<double>(chords.size()));
    }
    CKeyOfSong keys;
    keys.mRegions.push_back({.mKey = key, .mBegin = 0, .mEnd = chords.size()});
    return NumeralsOf(chords, keys, options);
}

std::string WordsJson(const std::vector<TWord>& words, const CSignKeyLite& key, bool areNumerals,
                      TNumeralOptions options) {
    options.mNashville = false;
    const std::vector<std::string> roman = Numerals(words, key, options);
    options.mNashville = true;
    const std::vector<std::string> nashville = Numerals(words, key, options);
    Json list = Json::array();
    for (std::size_t i = 0; i < words.size(); ++i) {
        const TWord& word = words[i];
        if (word.IsMark()) continue;
        list.push_back(
            {{"Symbol", areNumerals ? WriteChordSymbol(word.mChord) : Printable(word.mTyped)},
             {"Numeral", roman[i]},
             {"Nashville", nashville[i]},
             {"RootKeyEnh", KeyEnhToJson(word.mChord.mRootKeyEnh)},
             {"BassKeyEnh", KeyEnhToJson(word.mChord.mBassKeyEnh)},
             {"Semitones", word.mChord.mSemitones.Mask()},
             {"Intervals", IntervalsToJson(word.mChord.mSemitones)}});
    }
    return JsonText({{"Key", key.NameLong(NamePrefs())}, {"Chords", list}});
}

// The lines as they were typed, with the words turned.
std::string WordsText(const std::vector<TWord>& words, const CSignKeyLite& key, bool toChords,
                      const TNumeralOptions& options) {
    std::vector<std::string> turned(words.size());
    if (!toChords) turned = Numerals(words, key, options);
    std::string text;
    for (std::size_t i = 0; i < words.size(); ++i) {
        if (i > 0) text += words[i].mLine == words[i - 1].mLine ? ' ' : '\n';
        if (words[i].IsMark()) {
            text += words[i].mTyped;
        } else {
            text += toChords ? WriteChordSymbol(words[i].mChord) : turned[i];
        }
    }
    return text + '\n';
}

TStatus Numerals(const TNumeralsOptions& options) {
    const auto key = ReadKeyOption(options.mKey);
    if (!key) return TStatus::BadUsage;
    const auto lines = TypedLines(options.mWords);
    if (!lines) return TStatus::BadInput;
    std::vector<TWord> words = WordsWithPlaces(*lines);
    const bool areNumerals = AreNumerals(words, *key, options);
    for (TWord& word : words) {
        if (ReadChord(word, areNumerals, *key, options.mNumerals)) continue;
        return FailAt(
            TStatus::BadInput,
            areNumerals ? "this is no Roman numeral and no Nashville number" : "this is no chord",
            (*lines)[word.mLine], word.mColumn);
    }
    if (options.mFormat.Format() == TFormat::Json) {
        return Print(WordsJson(words, *key, areNumerals, options.mNumerals));
    }
    const bool toChords = areNumerals && !options.mNumerals.mNashville;
    return Print(WordsText(words, *key, toChords, options.mNumerals));
}

}  // namespace

void AddNumeralOptions(CCommand& command, TNumeralOptions& options) {
    command.AddFlag("--nashville", options.mNashville, "Print Nashville numbers: 2-7 57 1");
    command.AddFlag("--figures", options.mFigures,
                    "Inversions are figures: V65, I6 (otherwise V7/7, I/3)");
    command.AddFlag("--printed-signs", options.mPrintedSigns,
                    "Diminished chords as in print: \xC3\xB8 and \xC2\xB0 for h and o");
}

void AddNumerals(CCommand& program) {
    CCommand& command = program.AddCommand(kHelp);
    const auto options = std::make_shared<TNumeralsOptions>();
    command.AddArgument("TEXT", options->mWords, "Numerals or chords; - reads standard input")
        .Required();
    command.AddOption("--key", "KEY", options->mKey, "The key, as in \"A minor\" or Bb").Required();
    command.AddChoice("--from", options->mFrom, {"guess", "numerals", "chords"},
                      "What the text has; the first word tells");
    AddNumeralOptions(command, options->mNumerals);
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return Numerals(*options); });
}

}  // namespace brindle::cli
