// SPDX-License-Identifier: MIT
#include "tools/make_chord_grids/ChordGridText.h"

#include "brindle/chords/ReadChordText.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/guitarchords/FindFingerings.h"
#include "brindle/guitarchords/GChChordTypes.h"
#include "brindle/guitarchords/GChDatabase.h"

#include <algorithm>
#include <array>
#include <cctype>
#include <optional>
#include <sstream>
#include <vector>

namespace brindle::tools {

namespace {

constexpr int kStrings = 6;
constexpr int kMuted = -1;
constexpr int kLastFret = 12;
constexpr int kMostDifficultyInFile = 7;

/// A finger that lies on several strings, these counted from 0.
struct CBarre {
    int mFinger = 0;
    int mMinString = 0;
    int mMaxString = 0;
};

/// A line of the text.
struct CGridLine {
    std::string mName;
    std::array<int, kStrings> mFrets{};    // kMuted, 0 for open
    std::array<int, kStrings> mFingers{};  // 0 for none
    std::vector<CBarre> mBarres;
};

/// What a chord symbol says, as a database keeps it.
struct CChordFacts {
    int mRoot = 0;
    int mType = 0;
    int mBass = -1;  // none
    std::string mUserName;
};

std::optional<CChordFacts> FactsOf(const std::string& symbol) {
    const CChordLite chord = ReadChordText(symbol).mChord;
    const CChordTypeId type = GChChordTypeIdForSemitones(chord.mSemitones);
    if (chord.IsUndef()) return std::nullopt;
    const int bass = chord.IsSlashChord() ? chord.mBassKeyEnh.mKeyNr : -1;
    // A chord of none of the built-in types, as C5, is kept by its name.
    const std::string name = type == 0 ? ChordSymbolSuffix(chord.mSemitones) : std::string();
    return CChordFacts{chord.mRootKeyEnh.mKeyNr, type, bass, name};
}

/// One digit or "x" for each string.
bool ReadStrings(const std::string& word, std::array<int, kStrings>& values) {
    if (word.size() != kStrings) return false;
    for (std::size_t i = 0; i < kStrings; ++i) {
        const bool isMuted = word[i] == 'x';
        if (!isMuted && std::isdigit(static_cast<unsigned char>(word[i])) == 0) return false;
        values[i] = isMuted ? kMuted : word[i] - '0';
    }
    return true;
}

/// "1:6-1"
std::optional<CBarre> ReadBarre(const std::string& word) {
    if (word.size() != 5 || word[1] != ':' || word[3] != '-') return std::nullopt;
    const CBarre barre{word[0] - '0', kStrings - (word[2] - '0'), kStrings - (word[4] - '0')};
    const bool isFine = barre.mFinger >= 1 && barre.mFinger <= 4 && barre.mMinString >= 0 &&
                        barre.mMinString < barre.mMaxString && barre.mMaxString < kStrings;
    return isFine ? std::optional(barre) : std::nullopt;
}

std::optional<CGridLine> ReadGridLine(std::istringstream& words) {
    CGridLine line;
    std::string frets;
    std::string fingers;
    if (!(words >> line.mName >> frets >> fingers)) return std::nullopt;
    if (!ReadStrings(frets, line.mFrets) || !ReadStrings(fingers, line.mFingers)) {
        return std::nullopt;
    }
    for (std::string word; words >> word;) {
        const auto barre = ReadBarre(word);
        if (!barre) return std::nullopt;
        line.mBarres.push_back(*barre);
    }
    return line;
}

/// The frets of a line some frets up the neck.
std::vector<int> FretsOf(const CGridLine& line, int shift) {
    std::vector<int> frets(line.mFrets.begin(), line.mFrets.end());
    for (int& fret : frets) fret += fret > 0 ? shift : 0;
    return frets;
}

std::shared_ptr<GChBasicChord> ChordOf(const CGridLine& line, const CChordFacts& facts, int shift) {
    auto chord = std::make_shared<GChBasicChord>(kGChStandardGuitar);
    chord->setRootNote((facts.mRoot + shift) % 12);
    chord->setChordType(facts.mType);
    chord->setUserName(facts.mUserName);
    if (facts.mBass >= 0) chord->setBassNote((facts.mBass + shift) % 12);
    std::array<bool, kStrings> isHeld{};
    for (const CBarre& barre : line.mBarres) {
        const auto at = static_cast<std::size_t>(barre.mMinString);
        const auto end = static_cast<std::size_t>(barre.mMaxString);
        const int fret = line.mFrets[at];
        chord->addChordElem(nullptr, barre.mFinger, fret + shift - 1, barre.mMinString,
                            barre.mMaxString);
        for (std::size_t i = at; i <= end; ++i) {
            isHeld[i] = line.mFrets[i] == fret && line.mFingers[i] == barre.mFinger;
        }
    }
    for (std::size_t i = 0; i < kStrings; ++i) {
        const auto string = static_cast<int>(i);
        if (line.mFrets[i] == kMuted) chord->setMuted(true, string);
        if (line.mFrets[i] <= 0 || isHeld[i]) continue;
        chord->addChordElem(nullptr, line.mFingers[i], line.mFrets[i] + shift - 1, string);
    }
    if (const auto hand = FingeringOfFrets(FretsOf(line, shift), kGChStandardGuitar)) {
        chord->setDifficultyLevel(std::min(hand->mDifficulty, kMostDifficultyInFile));
    }
    return chord;
}

int HighestFret(const GChBasicChord& chord) {
    int highest = 0;
    for (const GChChordElem& elem : chord.chordElems()) {
        highest = std::max(highest, elem.absFretIndex() + 1);
    }
    return highest;
}

bool IsSameChord(const GChBasicChord& a, const GChBasicChord& b) {
    return a.rootNote() == b.rootNote() && a.chordType() == b.chordType() &&
           a.bassNote() == b.bassNote() && a.userName() == b.userName();
}

/// Takes out what lies above the last comfortable fret where the chord is there below it.
void DropHighGrids(const GChTuning& tuning) {
    std::vector<std::shared_ptr<GChBasicChord>> low;
    for (const auto& library : tuning.tuningLibraries()) {
        for (const auto& chord : library->basicChords()) {
            if (HighestFret(*chord) <= kLastFret) low.push_back(chord);
        }
    }
    for (const auto& library : tuning.tuningLibraries()) {
        const auto chords = library->basicChords();
        for (const auto& chord : chords) {
            const bool isElsewhere = std::any_of(low.begin(), low.end(), [&](const auto& other) {
                return IsSameChord(*chord, *other);
            });
            if (HighestFret(*chord) > kLastFret && isElsewhere) library->deleteChordRange(chord);
        }
    }
}

}  // namespace

std::shared_ptr<GChTuning> ReadChordGrids(std::string_view text, std::string& fault) {
    const auto tuning = std::make_shared<GChTuning>(kGChStandardGuitar);
    tuning->setTuningName(kGChDefaultTuningName);
    std::shared_ptr<GChLibrary> library;
    int places = 1;
    std::istringstream lines{std::string(text)};
    int number = 0;
    for (std::string line; std::getline(lines, line);) {
        ++number;
        std::istringstream words(line);
        std::string first;
        if (!(words >> first) || first[0] == '#') continue;
        if (first == "library" || first == "movable") {
            places = first == "library" ? 1 : 12;
            library = tuning->createLibraryWithPath({});
            library->setLibraryName(line.substr(first.size() + 1));
            library->setIsReadOnlyLibrary(true);
            continue;
        }
        words.seekg(0);
        const auto grid = ReadGridLine(words);
        const auto facts = grid ? FactsOf(grid->mName) : std::nullopt;
        if (library == nullptr || !facts) {
            fault = "line " + std::to_string(number) + ": " + line;
            return nullptr;
        }
        for (int i = 0; i < places; ++i) library->addBasicChord(ChordOf(*grid, *facts, i));
    }
    DropHighGrids(*tuning);
    return tuning;
}

}  // namespace brindle::tools
