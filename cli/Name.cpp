// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/FaultMessage.h"
#include "cli/Input.h"
#include "cli/KeyText.h"
#include "cli/NamingOptions.h"

#include "brindle/chords/NameNotes.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/neural/RootCostsByNet.h"
#include "brindle/present/ChordsOverRootsText.h"
#include "brindle/present/NamedChordsText.h"
#include "brindle/theory/ReadNotesText.h"

#include <fmt/format.h>

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kNameHelp{
    "name",
    "Name the chord of some notes",
    "  brindle name E2 G3 C4\n"
    "  brindle name 40 55 60 --json\n"
    "  brindle name E3 G3 A3 C4 --candidates 3 --key \"A minor\"\n"
    "  brindle name E3 G3 A3 C4 --before Dm7 --after G7\n"
    "  printf 'G2 F3 B3 D4\\nE3 G3 A3 C4\\nG2 F3 B3 D4\\n' | brindle name - --progression\n"
    "  brindle name F#3 A3 C#4 --german\n"
    "  cat chords.txt | brindle name - --method score\n"
    "\n"
    "A note is a key and its octave, or a MIDI number; a key without octave is the next one\n"
    "above the note before it. Notes with names keep them, numbers are spelled by the chord\n"
    "and the key.\n",
};

constexpr int kMostCandidates = 12;

struct CNameOptions {
    std::vector<std::string> mWords;
    std::string mMethod = "notes";
    std::string mKey;
    std::string mBefore;
    std::string mAfter;
    std::string mBass = "usual";
    std::string mRoot;
    int mCandidates = 1;
    bool mAllRoots = false;
    bool mProgression = false;
    bool mIsExact = false;
    ::brindle::CNamingOptions mContext;  // of the words above, but the limit
    CKeyEnh mRootKey;                    // of mRoot
    cli::CNamingOptions mNaming;
    CFormatOptions mFormat;
};

using TNamesOfSets = std::vector<std::vector<CNamedChord>>;

TBassUse BassUseOf(const std::string& word) {
    if (word == "only") return TBassUse::Only;
    return word == "none" ? TBassUse::None : TBassUse::Usual;
}

/// Reads the root behind --root. False when it is none; then the error has been printed.
bool ReadRoot(CNameOptions& options) {
    if (options.mRoot.empty()) return true;
    const std::string typed = FoldAccidentals(options.mRoot);
    int consumed = 0;
    options.mRootKey.SetFromString(typed, &consumed, options.mNaming.Prefs());
    const auto column = static_cast<std::size_t>(consumed);
    if (!options.mRootKey.IsUndef() && column == typed.size()) return true;
    static_cast<void>(
        FailAt(TStatus::BadUsage, "--root: a root is a key, as in Bb", typed, column));
    return false;
}

/// The root of a neighbouring chord. Nothing when it is no chord; then the error has been printed.
std::optional<int> ReadNeighbour(const std::string& option, const std::string& typed,
                                 const CNameOptions& options) {
    if (typed.empty()) return kKeyNrUndef;
    const CChordTextReading read =
        ReadChordText(typed, {.mBIsBFlat = options.mNaming.Prefs().mBForBFlat});
    if (read.mKind == TChordText_Chord) return read.mChord.mRootKeyEnh.mKeyNr;
    const std::string fault = read.mFault.empty() ? "this is no chord" : read.mFault;
    static_cast<void>(FailAtCharacter(TStatus::BadUsage, option + ": " + FaultMessage(fault), typed,
                                      static_cast<std::size_t>(read.mFaultPos)));
    return std::nullopt;
}

bool IsAsPlayed(const CNameOptions& options) {
    return options.mMethod == "notes" || options.mMethod == "both";
}

/// Whether anything is told that only the names as played take up.
bool HasContext(const CNameOptions& options) {
    return !options.mKey.empty() || !options.mBefore.empty() || !options.mAfter.empty() ||
           options.mBass != "usual" || options.mIsExact || options.mCandidates != 1;
}

/// Reads what was told about the notes besides themselves. False after an error.
bool ReadContext(CNameOptions& options) {
    const auto key = ReadKeyIfTold(options.mKey);
    if (!key) return false;
    options.mContext.mKey = *key;
    const auto before = ReadNeighbour("--before", options.mBefore, options);
    const auto after = ReadNeighbour("--after", options.mAfter, options);
    if (!before || !after) return false;
    options.mContext.mPreviousRoot = *before;
    options.mContext.mNextRoot = *after;
    options.mContext.mBass = BassUseOf(options.mBass);
    if (options.mProgression && options.mMethod != "notes") {
        static_cast<void>(Fail(TStatus::BadUsage, "--progression goes with --method notes"));
        return false;
    }
    if (!IsAsPlayed(options) && HasContext(options)) {
        static_cast<void>(Fail(TStatus::BadUsage,
                               "--key, --before, --after, --bass, --candidates and --exact go with "
                               "--method notes or both"));
        return false;
    }
    if (options.mAllRoots) options.mCandidates = kMostCandidates;
    return ReadRoot(options);
}

TNamesOfSets NamesOf(const std::vector<CNotesText>& sets, const CNameOptions& options) {
    std::vector<std::vector<CNote>> notes;
    for (const CNotesText& set : sets) notes.push_back(set.mTyped);
    if (options.mProgression) return NameProgression(notes, options.mContext);
    TNamesOfSets names;
    for (const auto& set : notes) {
        auto context = options.mContext;
        if (options.mMethod == "both") context.mRootCosts = RootCostsByNet(set);
        names.push_back(NameNotes(set, context));
    }
    return names;
}

/// The name over the root of --root first. Without one there are no names, and that is told.
void TakeRoot(std::vector<CNamedChord>& names, const CNameOptions& options) {
    if (options.mRootKey.IsUndef() || names.empty()) return;
    if (PutRootFirst(names, options.mRootKey.mKeyNr)) return;
    static_cast<void>(
        Fail(TStatus::BadInput,
             fmt::format("these notes have no name over {}; --method net names them over any root",
                         options.mRoot)));
    names.clear();
}

/// By how common chords are.
std::string NameAsPlayed(const std::vector<CNotesText>& sets, const CNameOptions& options) {
    TNamesOfSets names = NamesOf(sets, options);
    for (auto& ofSet : names) TakeRoot(ofSet, options);
    const CNamedChordStyle style{options.mNaming.PlayersPrefs(), options.mIsExact};
    if (options.mFormat.Format() == TFormat::Json) return NamedChordsJson(names, style);
    return NamedChordsText(names, static_cast<std::size_t>(options.mCandidates), style,
                           PaintOfOutput());
}

/// By a search for the root, "net" or "score", and the name of the chord over it.
std::string NameByRoot(const std::vector<CNotesText>& sets, const CNameOptions& options) {
    const CChordNamePrefs prefs = options.mNaming.Prefs();
    const auto search = options.mMethod == "net" ? TSingleChordAnalysisAlgo_NeuronalNet
                                                 : TSingleChordAnalysisAlgo_Score;
    std::vector<CNotesOverRoots> chords;
    for (const CNotesText& set : sets) {
        chords.push_back(
            {{set.mNotes.begin(), set.mNotes.end()},
             NameOverRoots(set.mNotes, {options.mRootKey, search, options.mAllRoots, prefs})});
    }
    if (options.mFormat.Format() == TFormat::Json) {
        return ChordsOverRootsJson(chords, prefs, options.mAllRoots);
    }
    return ChordsOverRootsText(chords, prefs, PaintOfOutput());
}

TStatus Name(CNameOptions options) {
    if (!ReadContext(options)) return TStatus::BadUsage;
    const auto lines = TypedLines(options.mWords);
    if (!lines) return TStatus::BadInput;
    TStatus status = TStatus::Success;
    std::vector<CNotesText> sets;
    for (const std::string& line : *lines) {
        const std::string typed = FoldAccidentals(line);
        CNotesText notes = ReadNotesText(typed, options.mNaming.Prefs());
        if (notes.mError.empty() && notes.mTyped.empty()) notes.mError = "there are no notes";
        if (notes.mError.empty()) {
            sets.push_back(std::move(notes));
        } else {
            status = FailAt(TStatus::BadInput, FaultMessage(notes.mError), typed, notes.mColumn);
        }
    }
    if (sets.empty()) return status;
    const TStatus printed =
        Print(IsAsPlayed(options) ? NameAsPlayed(sets, options) : NameByRoot(sets, options));
    return printed == TStatus::Success ? status : printed;
}

}  // namespace

void AddName(CCommand& program) {
    CCommand& command = program.AddCommand(kNameHelp);
    const auto options = std::make_shared<CNameOptions>();
    command.AddArgument("NOTE", options->mWords, "Notes of a chord; - reads one chord a line")
        .Required();
    command.AddChoice("--method", options->mMethod, {"notes", "both", "net", "score"},
                      "By how common chords are; with the net; over a root of net or score");
    command.AddOption("--key", "KEY", options->mKey, "The key of the piece: \"Bb major\"");
    command.AddOption("--before", "CHORD", options->mBefore, "The chord before these notes");
    command.AddOption("--after", "CHORD", options->mAfter, "The chord behind these notes");
    command.AddChoice("--bass", options->mBass, {"usual", "only", "none"},
                      "The lowest note is of the chord or not; only its bass; or says nothing");
    command.AddFlag("--progression", options->mProgression,
                    "The chords of the lines follow each other");
    command.AddOption("--candidates", "N", options->mCandidates, "How many names (default: 1)")
        .InRange(1, kMostCandidates);
    command.AddFlag("--exact", options->mIsExact, "Say all that is left out: C7(no5)");
    command.AddOption("--root", "KEY", options->mRoot, "The root; without it, it is searched");
    command.AddFlag("--all-roots", options->mAllRoots, "The names with each root that has one");
    options->mFormat.AddTo(command, {"text", "json"});
    options->mNaming.AddTo(command);
    command.OnCall([options] { return Name(*options); });
}

}  // namespace brindle::cli
