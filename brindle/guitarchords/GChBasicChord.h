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
    /// An empty fingering; the tuning is kept as it is, valid or not.
    explicit GChBasicChord(const GChShortTuning& shortTuning);

    // Where it belongs

    /// Not owned; done by the library that takes the chord in.
    void setLibrary(const std::shared_ptr<GChLibrary>& library) { mGchLibrary = library; }
    /// Null for a chord that is in no library.
    [[nodiscard]] std::shared_ptr<GChLibrary> gchLibrary() const { return mGchLibrary.lock(); }
    /// Of the library.
    [[nodiscard]] std::shared_ptr<GChTuning> gchTuning() const;
    /// The tuning that the fingering was made for.
    [[nodiscard]] const GChShortTuning& shortTuning() const { return mShortTuning; }
    /// Of its own tuning, 0 to 16.
    [[nodiscard]] int numberOfStrings() const;
    /// Unique within the running database, -1 for none.
    [[nodiscard]] std::int32_t dbChordID() const { return mDbChordID; }
    /// Done by the library that reads it from a file.
    void setDbChordID(std::int32_t id) { mDbChordID = id; }

    // What it is

    /// Key number of the root as it is stored, without a capodaster: 0 to 11, -1 for none. One
    /// signed byte.
    [[nodiscard]] int rootNote() const { return mRootNote; }
    /// Cut to one signed byte.
    void setRootNote(int root) { mRootNote = static_cast<std::int8_t>(root); }
    /// Key number of the bass in the same way.
    [[nodiscard]] int bassNote() const { return mBassNote; }
    /// Cut to one signed byte.
    void setBassNote(int bass) { mBassNote = static_cast<std::int8_t>(bass); }
    /// A CChordTypeId, kept in one signed byte.
    [[nodiscard]] std::int16_t chordType() const { return mChordType; }
    /// Cut to one signed byte, too: 130 becomes -126.
    void setChordType(int chordType) { mChordType = static_cast<std::int8_t>(chordType); }
    /// A file keeps 0 to 7.
    [[nodiscard]] int difficultyLevel() const { return mDifficultyLevel; }
    /// Cut to one byte.
    void setDifficultyLevel(int level) { mDifficultyLevel = static_cast<std::uint8_t>(level); }
    /// A name that the user has given, empty for none.
    [[nodiscard]] const std::string& userName() const { return mUserName; }
    /// An empty name takes it away.
    void setUserName(std::string_view name) { mUserName = name; }

    /// A bit for each transpose index, which is taken modulo 32.
    [[nodiscard]] bool isFavoriteForTransposeIndex(int index) const;
    /// For the index see isFavoriteForTransposeIndex.
    void setIsFavorite(bool isFavorite, int transposeIndex);
    /// The favorites of all transpose indexes, bit 0 for index 0.
    [[nodiscard]] std::uint32_t isFavoriteMask() const { return mIsFavoriteMask; }
    /// Replaces them all.
    void setIsFavoriteMask(std::uint32_t mask) { mIsFavoriteMask = mask; }
    /// No favorite at any index.
    void clearFavoriteMask() { mIsFavoriteMask = 0; }

    // Strings

    /// Kept: the mask is one signed byte, so that bit 7 answers for the strings above it, too.
    [[nodiscard]] bool isMutedForStringIndex(int stringIndex) const;
    /// setMuted:forStringIndex: changes nothing for a string above 7.
    void setMuted(bool isMuted, int stringIndex);
    /// Bit 0 is the string with the lowest index; as one signed byte.
    [[nodiscard]] std::int8_t isMutedMask() const { return mIsMutedMask; }
    /// Cut to one signed byte.
    void setIsMutedMask(int mask) { mIsMutedMask = static_cast<std::int8_t>(mask); }
    /// Whether it sounds without a finger. A string outside 0 to 15 is not open.
    [[nodiscard]] bool isOpenForStringIndex(int stringIndex) const;
    /// Whether a string of the tuning is open.
    [[nodiscard]] bool hasOpenStrings() const;
    /// How many frets the string sounds above its open pitch: -1 for a muted string and outside
    /// 0 to 15, 0 for an open string. The real element that was put down last on it counts, not
    /// the highest one.
    [[nodiscard]] int maxAbsFretIndexPlusOneForStringIndex(int stringIndex) const;

    // Frets

    /// 0 if the whole fingering lies within so many frets from the nut, else its lowest fret.
    [[nodiscard]] int firstShownFretForNumberOfFrets(int frets) const;
    /// The least fret that is not negative, 0 for the first one of the neck; 0 also without
    /// elements.
    [[nodiscard]] int lowestFingeredFret() const;
    /// Moves every element, as GChChordElem::shiftFretIndexBy does: nothing stops at the nut.
    void shiftFretIndexesBy(int frets);

    // Elements, in the order in which they were added. `sender` is not used.

    /// The elements themselves; pointers to them are valid until the fingering changes.
    [[nodiscard]] const std::vector<GChChordElem>& chordElems() const { return mChordElems; }
    /// How many there are; a file keeps the first 15.
    [[nodiscard]] std::size_t chordElemCount() const { return mChordElems.size(); }
    /// By fret, lowest string, highest string and finger.
    [[nodiscard]] std::vector<GChChordElem> sortedChordElems() const;

    /// addChordElem:fingerNumber:absFretIndex:stringIndex1:stringIndex2:fingerPointType: adds an
    /// element from string 1 up to string 2. Null, and nothing is added, if it cannot exist.
    GChChordElem* addChordElem(const void* sender, int fingerNumber, int absFretIndex,
                               int stringIndex1, int stringIndex2, std::uint8_t fingerPointType);
    /// The same for a real point.
    GChChordElem* addChordElem(const void* sender, int fingerNumber, int absFretIndex,
                               int stringIndex1, int stringIndex2);
    /// A real point on one string.
    GChChordElem* addChordElem(const void* sender, int fingerNumber, int absFretIndex,
                               int stringIndex);
    /// These remove elements of this fingering, told by their address in chordElems().
    void removeChordElem(const GChChordElem* elem);
    /// All of them at once; a null and an address of another fingering are passed over.
    void removeChordElems(std::span<const GChChordElem* const> elems);

    /// The first element at the fret that covers the string, or null.
    [[nodiscard]] const GChChordElem* elemAtAbsFretIndex(int absFretIndex, int stringIndex) const;
    /// The first single spot there.
    [[nodiscard]] const GChChordElem* spotAtAbsFretIndex(int absFretIndex, int stringIndex) const;
    /// The single spot with the highest fret on the string, the first of several.
    [[nodiscard]] const GChChordElem* realSpotAtMaxIndexForStringIndex(int stringIndex) const;
    /// The same among optional points.
    [[nodiscard]] const GChChordElem* optionalSpotAtMaxIndexForStringIndex(int stringIndex) const;

    /// Whether there is a single spot at that string and fret, real or optional.
    [[nodiscard]] bool hasSingleSpot(const void* sender, int strIndex, int fretIndex) const;
    /// The same with that finger.
    [[nodiscard]] bool hasSingleSpot(const void* sender, int strIndex, int fretIndex,
                                     int fingerNum) const;
    /// Whether there is an element at the fret over exactly these strings, in any order; with one
    /// string a single spot counts.
    [[nodiscard]] bool hasBarreSpot(const void* sender, int strIndex0, int strIndex1,
                                    int fretIndex) const;
    /// The same with that finger.
    [[nodiscard]] bool hasBarreSpot(const void* sender, int strIndex0, int strIndex1, int fretIndex,
                                    int fingerNum) const;
    /// The fret of the first such element, or -1.
    [[nodiscard]] int fretIndexForBarreSpot(const void* sender, int strIndex0, int strIndex1) const;
    /// Whether a barre at or below the fret covers both strings.
    [[nodiscard]] bool liesInBarreShadow(const void* sender, int absFretIndex, int stringIndex1,
                                         int stringIndex2) const;

    // Single spots of a string: all, optional ones, real ones

    /// All, on one string; 0 for a negative index.
    [[nodiscard]] int numberOfSpotsForStringIndex(int stringIndex) const;
    /// Those of GChFingerPointType_Optional.
    [[nodiscard]] int numberOfOptionalSpotsForStringIndex(int stringIndex) const;
    /// Those of GChFingerPointType_Real.
    [[nodiscard]] int numberOfRealSpotsForStringIndex(int stringIndex) const;
    /// Removes those of all kinds from a string; with `onlyLastElement` only the one with the
    /// highest fret.
    void removeSpotsForStringIndex(int stringIndex, bool onlyLastElement);
    /// The same of the optional ones.
    void removeOptionalSpotsForStringIndex(int stringIndex, bool onlyLastElement);
    /// The same of the real ones.
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

    /// All that a file keeps, by name, and the pitches of the tuning.
    [[nodiscard]] nlohmann::json propertyList() const;

    // Its chunk in a library file (the layout is in internal/LibraryFile.h)

    /// Bytes of the chunk, its own size field included.
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
