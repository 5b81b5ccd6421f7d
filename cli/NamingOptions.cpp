// SPDX-License-Identifier: MIT
#include "cli/NamingOptions.h"

#include "cli/CCommand.h"

namespace brindle::cli {
namespace {

const std::string kNamingGroup = "Naming";

void AddNamingFlag(CCommand& command, const char* name, bool& value, const char* purpose) {
    command.AddFlag(name, value, purpose).InGroup(kNamingGroup);
}

std::int32_t MajorSeventhPref(const std::string& text) {
    if (text == "j7") return 1;
    return text == "maj7" ? 2 : 0;
}

}  // namespace

void CNamingOptions::AddSymbolsTo(CCommand& command, const char* majorSeventhPurpose) {
    AddNamingFlag(command, "--ascii", mAscii, "Signs are # and b");
    AddNamingFlag(command, "--german", mPrefs.mGermanNames, "Signs are words: Fis, Es");
    AddNamingFlag(command, "--h-for-b", mPrefs.mHForB, "The key below C is H");
    AddNamingFlag(command, "--b-for-b-flat", mPrefs.mBForBFlat,
                  "The key below H is B, also in what is read");
    AddNamingFlag(command, "--solfege", mPrefs.mSolfege, "Keys are syllables: Do, Re");
    AddNamingFlag(command, "--translate", mPrefs.mLocalizeSolfege,
                  "Syllables are those of the language");
    AddNamingFlag(command, "--lower-case-minor", mPrefs.mLowerCaseMinorRoot,
                  "The root of a minor chord is small");
    AddNamingFlag(command, "--spaces", mSpaces, "Blanks between the parts of the name");
    AddNamingFlag(command, "--spaces-around-slash", mSpacesAroundSlash,
                  "Blanks around the slash of the bass");
    command.AddOption("--slash-text", "TEXT", mPrefs.mSlashText, "Stands for the slash of the bass")
        .InGroup(kNamingGroup);
    command
        .AddChoice("--major-seventh", mMajorSeventh, {"usual", "ma7", "j7", "maj7"},
                   majorSeventhPurpose)
        .InGroup(kNamingGroup);
}

void CNamingOptions::AddTo(CCommand& command) {
    AddSymbolsTo(command, "A major seventh; usual is maj7, and ma7 with --method net or score");
    AddNamingFlag(command, "--slash", mSlash, "Show the bass of a chord within an octave, too");
    AddNamingFlag(command, "--keep-bass-option", mKeepBassOption,
                  "Name a bass that is foreign to the chord twice: C7/Bb for C/Bb");
    AddNamingFlag(command, "--commas", mPrefs.mCommaParts,
                  "Parts of the name are joined by commas");
    AddNamingFlag(command, "--brackets", mBrackets,
                  "Options after the first stand in brackets: C7(9)");
    command.AddChoice("--middle-c", mMiddleC, {"3", "4", "5"}, "The octave of note number 60")
        .InGroup(kNamingGroup);
}

CChordNamePrefs CNamingOptions::Prefs() const {
    CChordNamePrefs prefs = mPrefs;
    prefs.mAsciiAccidentals = mAscii ? 1 : 0;
    prefs.mChordPrefB = !mSlash;
    prefs.mOmitBassOption = !mKeepBassOption;
    prefs.mChordPrefC = MajorSeventhPref(mMajorSeventh);
    prefs.mOptionBrackets = mBrackets ? 1 : 0;
    prefs.mNoSpaceBetweenNameParts = mSpaces ? 0 : 1;
    prefs.mNoSpaceAroundSlash = mSpacesAroundSlash ? 0 : 1;
    prefs.mOctaveNaming = mMiddleC.front() - '3';
    return prefs;
}

CChordNamePrefs CNamingOptions::PlayersPrefs() const {
    constexpr std::int32_t kMaj7 = 2;
    CChordNamePrefs prefs = Prefs();
    if (mMajorSeventh == "usual") prefs.mChordPrefC = kMaj7;
    return prefs;
}

std::optional<CChordNamePrefs> CNamingOptions::ToldPrefs() const {
    const CChordNamePrefs prefs = PlayersPrefs();
    if (prefs == CNamingOptions().PlayersPrefs()) return std::nullopt;
    return prefs;
}

}  // namespace brindle::cli
