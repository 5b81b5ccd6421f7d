// SPDX-License-Identifier: MIT
#include "cli/Program.h"

#include "cli/CommandLine.h"
#include "cli/DataFolder.h"
#include "cli/Language.h"

#include "brindle/Version.h"

namespace brindle::cli {
namespace {

constexpr CCommandHelp kProgramHelp{
    "brindle",
    "Music theory and harmony analysis",
    "  brindle analyse \"Dm7 G7 | C\"\n"
    "  brindle analyse song.musicxml\n"
    "  brindle analyse song.txt --format svg >song.svg\n"
    "  brindle keys song.txt\n"
    "  brindle import song.musicxml --midi song.mid\n"
    "  brindle corpus songs >songs.jsonl\n"
    "  brindle chord F#m7/C# Bb13\n"
    "  brindle function Dm7 G7 --key C\n"
    "  brindle numerals \"ii7 V7 I^7\" --key \"Eb major\"\n"
    "  brindle name E2 G3 C4\n"
    "  brindle scale \"D dorian\"\n"
    "  brindle key \"F# minor\" --json\n"
    "  brindle grid x32010\n"
    "  brindle markov learn -o model.json songs\n",
};

}  // namespace

TStatus RunProgram(int argc, char** argv) {
    UseLanguageOfUser();
    UseDataOfProgram();
    CCommand program(kProgramHelp, BrindleVersionString);
    AddAnalyse(program);
    AddKeys(program);
    AddCopies(program);
    AddHarmonies(program);
    AddImport(program);
    AddCorpus(program);
    AddChord(program);
    AddFunction(program);
    AddNumerals(program);
    AddVector(program);
    AddName(program);
    AddTypes(program);
    AddNet(program);
    AddScale(program);
    AddKey(program);
    AddGrid(program);
    AddGrids(program);
    AddMarkov(program);
    AddCompletion(program);
    AddManual(program);
    return program.Run(argc, argv);
}

}  // namespace brindle::cli
