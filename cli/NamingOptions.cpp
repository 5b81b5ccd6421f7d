// SPDX-License-Identifier: MIT
#include "cli/NamingOptions.h"

#include "cli/CCommand.h"

namespace brindle::cli {
namespace {

std::int32_t MajorSeventhPref(const std::string& text) {
    if (text == "j7") return 1;
    return text == "maj7" ? 2 : 0;
}

}  // namespace

void CNamingOptions::AddTo(CCommand& command) {
    const std::string group = "Naming";
    const auto addFlag = [&](const char* name, bool& value, const char* purpose) {
        command.AddFlag(name, value, purpose).InGroup(group);
    };
    addFlag("--ascii", mAscii, "Signs are # and b");
    addFlag("--german", mPrefs.mGermanNames, "Signs are words: Fis, Es");
    addFlag("--h-for-b", mPrefs.mHForB, "The key below C is H");
    addFlag("--b-for-b-flat", mPrefs.mBForBFlat, "The key below H is B, also in what is read");
    addFlag("--solfege", mPrefs.mSolfege, "Keys are syllables: Do, Re");
    addFlag("--translate", mPrefs.mLocalizeSolfege, "Syllables are those of the language");
    addFlag("--lower-case-minor", mPrefs.mLowerCaseMinorRoot, "The root of a minor chord is small");
    addFlag("--slash", mSlash, "Show the bass of a chord within an octave, too");
    addFlag("--keep-bass-option", mKeepBassOption,
            "Name a bass that is foreign to the chord twice: C7/Bb for C/Bb");
    addFlag("--commas", mPrefs.mCommaParts, "Parts of the name are joined by commas");
    addFlag("--brackets", mBrackets, "Options after the first stand in brackets: C7(9)");
    addFlag("--spaces", mSpaces, "Blanks between the parts of the name");
    addFlag("--spaces-around-slash", mSpacesAroundSlash, "Blanks around the slash of the bass");
    command.AddOption("--slash-text", "TEXT", mPrefs.mSlashText, "Stands for the slash of the bass")
        .InGroup(group);
    command
        .AddChoice("--major-seventh", mMajorSeventh, {"usual", "ma7", "j7", "maj7"},
                   "A major seventh; usual is maj7, and ma7 with --method net or score")
        .InGroup(group);
    command.AddChoice("--middle-c", mMiddleC, {"3", "4", "5"}, "The octave of note number 60")
        .InGroup(group);
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

}  // namespace brindle::cli
