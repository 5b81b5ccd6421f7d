// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/Input.h"
#include "cli/Json.h"
#include "cli/TypedChords.h"

#include "brindle/chords/CChordLite.h"
#include "brindle/present/CTable.h"
#include "brindle/present/ShownNames.h"

#include <fmt/format.h>

#include <memory>

namespace brindle::cli {
namespace {

constexpr TCommandHelp kHelp{
    "chord",
    "Read chord symbols: root, bass, semitones, basic chord and hash code",
    "  brindle chord F#m7/C# Bb13\n"
    "  brindle chord \"C maj 7\" --json\n"
    "  brindle chord CΔ Co7 \"F♯m7♭5\" C7alt Ab:min/b3\n"
    "  cat symbols.txt | brindle chord -\n",
};

struct TChordOptions {
    std::vector<std::string> mSymbols;
    CTypedChords mReading;
    CFormatOptions mFormat;
};

struct TReadChord {
    std::string mSymbol;
    CChordLite mChord;
};

std::string HashCode(const CChordLite& chord) {
    return fmt::format("0x{:010X}", chord.GetChordHashCode());
}

std::string NonChordName(const CChordLite& chord) {
    if (chord.IsNoChordYield()) return "no chord, yield";
    return chord.IsNoChordForce() ? "no chord, force" : "undefined";
}

Json ChordToJson(const TReadChord& read) {
    const CChordLite& chord = read.mChord;
    return {{"Symbol", read.mSymbol},
            {"RootKeyEnh", KeyEnhToJson(chord.mRootKeyEnh)},
            {"BassKeyEnh", KeyEnhToJson(chord.mBassKeyEnh)},
            {"Semitones", chord.mSemitones.Mask()},
            {"Intervals", IntervalsToJson(chord.mSemitones)},
            {"BasicChord", BasicChordName(chord.BasicChord())},
            {"NonChord", chord.IsUndef() ? Json(NonChordName(chord)) : Json(nullptr)},
            {"HashCode", chord.GetChordHashCode()}};
}

std::string ChordsJson(const std::vector<TReadChord>& chords) {
    Json list = Json::array();
    for (const TReadChord& chord : chords) list.push_back(ChordToJson(chord));
    return JsonText({{"Chords", list}});
}

std::string ChordsText(const std::vector<TReadChord>& chords, const CPaint& paint) {
    CTable table({"chord", "root", "bass", "basic chord", "semitones", " mask", "hash code"});
    for (const auto& [symbol, chord] : chords) {
        table.AddRow({symbol, chord.IsUndef() ? NonChordName(chord) : KeyName(chord.mRootKeyEnh),
                      chord.HasBassNote() ? KeyName(chord.mBassKeyEnh) : "-",
                      std::string(BasicChordName(chord.BasicChord())),
                      SemitonesText(chord.mSemitones), fmt::format("{}", chord.mSemitones.Mask()),
                      HashCode(chord)});
    }
    return table.Text(paint);
}

TStatus Chord(const TChordOptions& options) {
    const auto symbols = TypedSymbols(options.mSymbols);
    if (!symbols) return TStatus::BadInput;
    const auto read = options.mReading.ReadSymbols(*symbols);
    if (!read) return TStatus::BadInput;
    std::vector<TReadChord> chords;
    for (std::size_t i = 0; i < symbols->size(); ++i) {
        chords.push_back({Printable((*symbols)[i]), (*read)[i]});
    }
    return Print(options.mFormat.Format() == TFormat::Json ? ChordsJson(chords)
                                                           : ChordsText(chords, PaintOfOutput()));
}

}  // namespace

void AddChord(CCommand& program) {
    CCommand& command = program.AddCommand(kHelp);
    const auto options = std::make_shared<TChordOptions>();
    command.AddArgument("SYMBOL", options->mSymbols, "Chord symbols; - reads standard input")
        .Required();
    options->mReading.AddTo(command);
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return Chord(*options); });
}

}  // namespace brindle::cli
