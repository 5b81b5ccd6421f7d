// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChChordElem.h"
#include "brindle/guitarchords/GChShortTuning.h"

#include <cstddef>
#include <cstdint>
#include <iosfwd>
#include <memory>
#include <nlohmann/json_fwd.hpp>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

class GChLibrary;
class GChTuning;

/// One fingering of a chord on a fretted instrument: its points and barres in the order in which
/// they are put down, the muted strings, and what the chord is.
///
/// A library owns its fingerings, GChChord is the view that is handed around. Pointers to elements
/// are valid until the fingering changes. Not to be changed while another thread reads it.
class GChBasicChord {
public:
    explicit GChBasicChord(const GChShortTuning& shortTuning);

    // Where it belongs

    void setLibrary(const std::shared_ptr<GChLibrary>& library) { mGchLibrary = library; }
    /// Null for a chord that is in no library.
    [[nodiscard]] std::shared_ptr<GChLibrary> gchLibrary() const { return mGchLibrary.lock(); }
    /// Of the library.
    [[nodiscard]] std::shared_ptr<GChTuning> gchTuning() const;
    /// The tuning that the fingering was made for.
    [[nodiscard]] const GChShortTuning& shortTuning() const { return mShortTuning; }
    [[nodiscard]] int numberOfStrings() const;
    /// Unique within the running database, -1 for none.
    [[nodiscard]] std::int32_t dbChordID() const { return mDbChordID; }
    void setDbChordID(std::int32_t id) { mDbChordID = id; }

    // What it is

    /// Key number of the root and of the bass, -1 for none. One signed byte each.
    [[nodiscard]] int rootNote() const { return mRootNote; }
    void setRootNote(int root) { mRootNote = static_cast<std::int8_t>(root); }
    [[nodiscard]] int bassNote() const { return mBassNote; }
    void setBassNote(int bass) { mBassNote = static_cast<std::int8_t>(bass); }
    /// A CChordTypeId, kept in one signed byte.
    [[nodiscard]] std::int16_t chordType() const { return mChordType; }
    void setChordType(int chordType) { mChordType = static_cast<std::int8_t>(chordType); }
    /// A file keeps 0 to 7.
    [[nodiscard]] int difficultyLevel() const { return mDifficultyLevel; }
    void setDifficultyLevel(int level) { mDifficultyLevel = static_cast<std::uint8_t>(level); }
    /// A name that the user has given, empty for none.
    [[nodiscard]] const std::string& userName() const { return mUserName; }
    void setUserName(std::string_view name) { mUserName = name; }

    /// A bit for each transpose index, which is taken modulo 32.
    [[nodiscard]] bool isFavoriteForTransposeIndex(int index) const;
    void setIsFavorite(bool isFavorite, int transposeIndex);
    [[nodiscard]] std::uint32_t isFavoriteMask() const { return mIsFavoriteMask; }
    void setIsFavoriteMask(std::uint32_t mask) { mIsFavoriteMask = mask; }
    void clearFavoriteMask() { mIsFavoriteMask = 0; }

    // Strings

    /// Kept: the mask is one signed byte, so that bit 7 answers for the strings above it, too.
    [[nodiscard]] bool isMutedForStringIndex(int stringIndex) const;
    /// setMuted:forStringIndex: changes nothing for a string above 7.
    void setMuted(bool isMuted, int stringIndex);
    [[nodiscard]] std::int8_t isMutedMask() const { return mIsMutedMask; }
    void setIsMutedMask(int mask) { mIsMutedMask = static_cast<std::int8_t>(mask); }
    [[nodiscard]] bool isOpenForStringIndex(int stringIndex) const;
    [[nodiscard]] bool hasOpenStrings() const;
    /// How many frets the string sounds above its open pitch: -1 for a muted string and outside
    /// 0 to 15, 0 for an open string. The real element that was put down last on it counts, not
    /// the highest one.
    [[nodiscard]] int maxAbsFretIndexPlusOneForStringIndex(int stringIndex) const;

    // Frets

    /// 0 if the whole fingering lies within so many frets from the nut, else its lowest fret.
    [[nodiscard]] int firstShownFretForNumberOfFrets(int frets) const;
    /// The least fret that is not negative; 0 without elements.
    [[nodiscard]] int lowestFingeredFret() const;
    void shiftFretIndexesBy(int frets);

    // Elements, in the order in which they were added. `sender` is not used.

    [[nodiscard]] const std::vector<GChChordElem>& chordElems() const { return mChordElems; }
    [[nodiscard]] std::size_t chordElemCount() const { return mChordElems.size(); }
    /// By fret, lowest string, highest string and finger.
    [[nodiscard]] std::vector<GChChordElem> sortedChordElems() const;

    /// addChordElem:fingerNumber:absFretIndex:stringIndex1:stringIndex2:fingerPointType: adds an
    /// element from string 1 up to string 2. Null, and nothing is added, if it cannot exist.
    GChChordElem* addChordElem(const void* sender, int fingerNumber, int absFretIndex,
                               int stringIndex1, int stringIndex2, std::uint8_t fingerPointType);
    GChChordElem* addChordElem(const void* sender, int fingerNumber, int absFretIndex,
                               int stringIndex1, int stringIndex2);
    GChChordElem* addChordElem(const void* sender, int fingerNumber, int absFretIndex,
                               int stringIndex);
    /// These remove elements of this fingering, told by their address in chordElems().
    void removeChordElem(const GChChordElem* elem);
    void removeChordElems(std::span<const GChChordElem* const> elems);

    /// The first element at the fret that covers the string, or null.
    [[nodiscard]] const GChChordElem* elemAtAbsFretIndex(int absFretIndex, int stringIndex) const;
    /// The first single spot there.
    [[nodiscard]] const GChChordElem* spotAtAbsFretIndex(int absFretIndex, int stringIndex) const;
    /// The single spot with the highest fret on the string, the first of several.
    [[nodiscard]] const GChChordElem* realSpotAtMaxIndexForStringIndex(int stringIndex) const;
    [[nodiscard]] const GChChordElem* optionalSpotAtMaxIndexForStringIndex(int stringIndex) const;

    [[nodiscard]] bool hasSingleSpot(const void* sender, int strIndex, int fretIndex) const;
    [[nodiscard]] bool hasSingleSpot(const void* sender, int strIndex, int fretIndex,
                                     int fingerNum) const;
    // An element over exactly these strings, in any order; with one string a single spot counts.
    [[nodiscard]] bool hasBarreSpot(const void* sender, int strIndex0, int strIndex1,
                                    int fretIndex) const;
    [[nodiscard]] bool hasBarreSpot(const void* sender, int strIndex0, int strIndex1, int fretIndex,
                                    int fingerNum) const;
    /// The fret of the first such element, or -1.
    [[nodiscard]] int fretIndexForBarreSpot(const void* sender, int strIndex0, int strIndex1) const;
    /// Whether a barre at or below the fret covers both strings.
    [[nodiscard]] bool liesInBarreShadow(const void* sender, int absFretIndex, int stringIndex1,
                                         int stringIndex2) const;

    // Single spots of a string: all, optional ones, real ones

    [[nodiscard]] int numberOfSpotsForStringIndex(int stringIndex) const;
    [[nodiscard]] int numberOfOptionalSpotsForStringIndex(int stringIndex) const;
    [[nodiscard]] int numberOfRealSpotsForStringIndex(int stringIndex) const;
    // With `onlyLastElement` these remove only the spot with the highest fret.
    void removeSpotsForStringIndex(int stringIndex, bool onlyLastElement);
    void removeOptionalSpotsForStringIndex(int stringIndex, bool onlyLastElement);
    void removeRealSpotsForStringIndex(int stringIndex, bool onlyLastElement);

    // The whole

    /// Same muted strings, difficulty, root, bass, type, and elements in any order.
    [[nodiscard]] bool isEqualToChordRange(const GChBasicChord& other,
                                           bool includeFavoriteMask) const;
    /// Nothing but a tuning and perhaps a name.
    [[nodiscard]] bool isEmpty() const;
    /// Makes it so; name, number and tuning stay.
    void clearAll();

    /// chordName:capodasterOffset: the root and the user's name. Without such a name the harmonic
    /// one of the root as stored and the pitches under the capodaster; nothing for a root above 11.
    [[nodiscard]] std::optional<std::string> chordName(int enhType, int capodasterOffset) const;

    [[nodiscard]] nlohmann::json propertyList() const;

    // Its chunk in a library file (the layout is in internal/LibraryFile.h)

    [[nodiscard]] std::size_t chordChunkSize() const;
    /// writeChordChunkToBuffer:remLength: the size of the chunk, 0 if it does not fit.
    ///
    /// Kept: a file has 15 elements at most, frets up to 7 above the lowest one, and cannot tell an
    /// optional point that was read from a file from a real one.
    std::size_t writeChordChunkToBuffer(std::uint8_t* buffer, std::size_t remLength) const;

private:
    std::weak_ptr<GChLibrary> mGchLibrary;
    GChShortTuning mShortTuning;
    std::vector<GChChordElem> mChordElems;
    std::int8_t mIsMutedMask = 0;
    std::uint32_t mIsFavoriteMask = 0;
    std::uint8_t mDifficultyLevel = 0;
    std::int8_t mRootNote = -1;
    std::int8_t mBassNote = -1;
    std::int8_t mChordType = 0;
    std::string mUserName;
    std::int32_t mDbChordID = -1;
};

/// The property list, for debugging.
std::ostream& operator<<(std::ostream& stream, const GChBasicChord& chord);

}  // namespace brindle
