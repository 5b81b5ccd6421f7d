// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChBasicChord.h"

#include <cstdint>
#include <iosfwd>
#include <memory>
#include <nlohmann/json_fwd.hpp>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace brindle {

/// A fingering as it is handed around: a view of a GChBasicChord, whose changes all views see, with
/// the spelling of root and bass. A copy is another view of the same fingering.
class GChChord {
public:
    /// initWithChordRange:transposeIndex: the index is not used. Nothing without a chord.
    [[nodiscard]] static std::optional<GChChord> make(std::shared_ptr<GChBasicChord> chord,
                                                      int transposeIndex);

    /// Never null.
    [[nodiscard]] const std::shared_ptr<GChBasicChord>& basicChord() const { return mBasicChord; }

    /// How the root is spelled: -1 for none, 1 for sharps, 2 for flats.
    [[nodiscard]] int rootEnhType() const { return mRootEnhType; }
    /// Cut to one signed byte.
    void setRootEnhType(int enhType) { mRootEnhType = static_cast<std::int8_t>(enhType); }
    /// How the bass is spelled, in the same way.
    [[nodiscard]] int bassEnhType() const { return mBassEnhType; }
    /// Cut to one signed byte.
    void setBassEnhType(int enhType) { mBassEnhType = static_cast<std::int8_t>(enhType); }

    /// Always 0: fingerings are not transposed, and setting it does nothing.
    [[nodiscard]] int transposeIndex() const { return 0; }
    /// Does nothing.
    void setTransposeIndex(int /*index*/) {}

    // Of the fingering: the functions of GChBasicChord, at transpose index 0. What is set is set in
    // all views.

    /// 0 is the easiest; a file keeps 0 to 7.
    [[nodiscard]] int difficultyLevel() const { return mBasicChord->difficultyLevel(); }
    /// Of the fingering, in all views.
    void setDifficultyLevel(int level) { mBasicChord->setDifficultyLevel(level); }
    /// A CChordTypeId.
    [[nodiscard]] std::int16_t chordType() const { return mBasicChord->chordType(); }
    /// Of the fingering, in all views.
    void setChordType(int chordType) { mBasicChord->setChordType(chordType); }
    /// A name that the user has given, empty for none.
    [[nodiscard]] const std::string& userName() const { return mBasicChord->userName(); }
    /// Of the fingering, in all views.
    void setUserName(std::string_view name) { mBasicChord->setUserName(name); }
    /// Unique within the running database, -1 for none.
    [[nodiscard]] std::int32_t dbChordID() const { return mBasicChord->dbChordID(); }
    /// Its points and barres, in the order in which they were added.
    [[nodiscard]] const std::vector<GChChordElem>& chordElems() const {
        return mBasicChord->chordElems();
    }
    /// The library that it is in; null for none.
    [[nodiscard]] std::shared_ptr<GChLibrary> gchLibrary() const {
        return mBasicChord->gchLibrary();
    }
    /// The tuning of that library; null for none.
    [[nodiscard]] std::shared_ptr<GChTuning> gchTuning() const { return mBasicChord->gchTuning(); }
    /// Of its own tuning.
    [[nodiscard]] int numberOfStrings() const { return mBasicChord->numberOfStrings(); }
    /// See GChBasicChord for strings above 7.
    [[nodiscard]] bool isMutedForStringIndex(int stringIndex) const {
        return mBasicChord->isMutedForStringIndex(stringIndex);
    }
    /// Whether the string sounds without a finger.
    [[nodiscard]] bool isOpenForStringIndex(int stringIndex) const {
        return mBasicChord->isOpenForStringIndex(stringIndex);
    }
    /// Whether a string of the tuning does.
    [[nodiscard]] bool hasOpenStrings() const { return mBasicChord->hasOpenStrings(); }
    /// The least fret that is not negative, 0 for the first one; 0 without elements.
    [[nodiscard]] int lowestFingeredFret() const { return mBasicChord->lowestFingeredFret(); }
    /// Frets that the string sounds above its open pitch: 0 for open, -1 for muted.
    [[nodiscard]] int maxAbsFretIndexPlusOneForStringIndex(int stringIndex) const {
        return mBasicChord->maxAbsFretIndexPlusOneForStringIndex(stringIndex);
    }
    /// 0 if it lies within so many frets from the nut, else its lowest fret.
    [[nodiscard]] int firstShownFretForNumberOfFrets(int frets) const {
        return mBasicChord->firstShownFretForNumberOfFrets(frets) + transposeIndex();
    }
    /// At transpose index 0.
    [[nodiscard]] bool isFavorite() const { return mBasicChord->isFavoriteForTransposeIndex(0); }
    /// At transpose index 0.
    void setIsFavorite(bool isFavorite) { mBasicChord->setIsFavorite(isFavorite, 0); }

    // Sound. A capodaster offset is the fret that it lies on, 1 being the first; a negative one
    // counts as 0, none.

    /// pitchForStringIndex:capodasterOffset: -1 for a muted string and outside 0 to 15.
    [[nodiscard]] int pitchForStringIndex(int stringIndex, int capodasterOffset) const;
    /// The names of the pitches from the lowest string, with a blank behind each: "E2 A2 ".
    [[nodiscard]] std::string stringFromPitches(int capodasterOffset) const;
    /// Key numbers under the capodaster; -1 for none.
    [[nodiscard]] int rootNote(int capodasterOffset) const;
    /// The same of the bass.
    [[nodiscard]] int bassNote(int capodasterOffset) const;
    /// Equal tunings and the same pitch on each string. False for a chord that is in no library.
    [[nodiscard]] bool isSimilarToChord(const GChChord& other) const;

    // Names

    /// chordName: the root under the capodaster and the user's name, else the harmonic name.
    [[nodiscard]] std::string chordName(int capodasterOffset) const;
    /// chordNameWithIndex:capodasterOffset: with the flag the transpose index stands behind, as in
    /// "C maj7 (0)".
    [[nodiscard]] std::string chordNameWithIndex(bool withIndex, int capodasterOffset) const;

    /// That of the fingering, with the spellings of root and bass.
    [[nodiscard]] nlohmann::json propertyList() const;

private:
    explicit GChChord(std::shared_ptr<GChBasicChord> chord) : mBasicChord(std::move(chord)) {}

    std::shared_ptr<GChBasicChord> mBasicChord;
    std::int8_t mRootEnhType = -1;
    std::int8_t mBassEnhType = -1;
};

/// The property list, for debugging.
std::ostream& operator<<(std::ostream& stream, const GChChord& chord);

/// The name of a chord that the user has named: "C# maj7". A negative root is left out, one above
/// 11 has an empty name.
[[nodiscard]] std::string GChUserChordName(int root, std::string_view userName);

}  // namespace brindle
