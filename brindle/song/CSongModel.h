// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CTaughtSong.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <map>
#include <span>
#include <unordered_map>
#include <vector>

namespace brindle {

/// Where in the bars a chord begins: on the first beat of the first to fourth of four bars, in the
/// middle of a bar, or elsewhere.
enum TBarPlace : std::uint8_t {
    TBarPlace_Bar1,
    TBarPlace_Bar2,
    TBarPlace_Bar3,
    TBarPlace_Bar4,
    TBarPlace_Middle,
    TBarPlace_Weak,
};
inline constexpr std::size_t kBarPlaceCount = 6;  ///< as many as TBarPlace has

/// Of a tick from the first bar line, kTicksPerBar to the bar; negative in an upbeat.
[[nodiscard]] TBarPlace BarPlaceOf(std::int32_t tick);

/// How much something was heard, all in all and by its TBarPlace. Each song adds the square root of
/// how often it plays it: songs repeat themselves, so that a passage that one of them plays eight
/// times says less about other songs than one that eight of them play.
struct CSongShares {
    float mAll = 0.0F;                        ///< at any place of the bar
    std::array<float, kBarPlaceCount> mAt{};  ///< the same by its TBarPlace

    /// Adds a song that plays it so often at each place.
    void AddSong(const std::array<std::uint32_t, kBarPlaceCount>& times);
};

/// Which lengths followed at a place of the bar, and how often; in ticks.
using CLengthCounts = std::vector<std::pair<std::int32_t, std::uint32_t>>;

/// What songs have in common: which chord follows which, where in the bar, how long, and how parts
/// of songs end. A value; it keeps the songs, so that a file of it is a list of songs.
///
/// A chord is predicted by interpolation: from how common chords are up to the longest history that
/// was heard, each level leaves the more to the level below, the more different chords followed
/// (Witten and Bell's method); what was heard counts as CSongShares tells. What is common and the
/// histories of one and two chords count once more with the place in the bar.
/// Histories are looked up in an array of all places in the songs, sorted by what stands before
/// them: building takes n log n, a query a few binary searches and as many steps as the history of
/// two chords was heard.
class CSongModel {
public:
    /// Chords that a prediction looks back at most.
    static constexpr std::size_t kLongestHistory = 5;

    /// A model that has heard nothing.
    CSongModel() = default;
    /// A model of these songs; those without chords are left out.
    explicit CSongModel(std::vector<CTaughtSong> songs);

    /// The songs that it was made of, by which places name them.
    [[nodiscard]] const std::vector<CTaughtSong>& Songs() const { return mSongs; }
    [[nodiscard]] bool IsEmpty() const { return mSongs.empty(); }  ///< no song with chords
    /// All chords, those of all songs together.
    [[nodiscard]] std::size_t ChordCount() const { return mPlaces.size() - mSongs.size(); }

    // Chords have numbers, 0 to VocabularySize() - 1.

    /// Different chords.
    [[nodiscard]] std::size_t VocabularySize() const { return mVocabulary.size(); }
    /// The chord of a number, which must be one.
    [[nodiscard]] const CRelativeChord& Chord(std::int32_t id) const {
        return mVocabulary[static_cast<std::size_t>(id)];
    }
    /// -1 for a chord that was never heard.
    [[nodiscard]] std::int32_t IdOf(const CRelativeChord& chord) const;
    /// How often the chord stands in the songs.
    [[nodiscard]] std::uint32_t CountOf(std::int32_t id) const;
    /// How often the chord was the last of a part.
    [[nodiscard]] std::uint32_t EndCountOf(std::int32_t id) const;

    /// What stands before the first chord of a song in such a key.
    [[nodiscard]] static constexpr std::int32_t StartId(bool isMinor) { return isMinor ? -3 : -2; }

    /// The probability of each known chord behind a history, the newest chord last, and `order`
    /// chords of it at most; what is left over is that of chords that were never heard.
    void Predict(std::span<const std::int32_t> history, TBarPlace place, std::size_t order,
                 std::vector<double>& probabilities) const;
    /// The same for one chord, also for one that was never heard: then by its root, its key and
    /// its tones alone.
    [[nodiscard]] double ProbabilityOf(const CRelativeChord& chord,
                                       std::span<const std::int32_t> history, TBarPlace place,
                                       std::size_t order) const;

    /// A chord that came behind another; successors stand in ascending order of chords.
    struct CSuccessor {
        std::int32_t mId;     ///< of the second chord
        CSongShares mShares;  ///< how much it came
    };
    /// What followed a chord or a StartId, by number.
    [[nodiscard]] std::span<const CSuccessor> SuccessorsOf(std::int32_t id) const;

    /// Of chords that begin at a tick of the bar behind one of such a length, in songs with as many
    /// beats in a bar. `lengthBefore` 0 is any.
    [[nodiscard]] const CLengthCounts& LengthsAt(int beatsPerBar, std::int32_t tickInBar,
                                                 std::int32_t lengthBefore) const;
    /// Whether a song has as many beats in a bar.
    [[nodiscard]] bool KnowsMetre(int beatsPerBar) const;

    /// A place in the songs: a chord, or, with an `mId` below 0, what stands before a song.
    struct CPlace {
        std::int32_t mId;      ///< a number or a StartId
        std::int32_t mLength;  ///< in ticks; 0 before a song
        std::int32_t mSong;    ///< an index of Songs()
        TBarPlace mBarPlace;   ///< where the chord begins
    };
    /// All songs, one behind the other.
    [[nodiscard]] std::span<const CPlace> Places() const { return mPlaces; }
    /// The places of a chord in ascending order.
    [[nodiscard]] std::span<const std::uint32_t> PlacesOf(std::int32_t id) const;

private:
    struct CRange {
        std::size_t mBegin;
        std::size_t mEnd;
    };
    [[nodiscard]] std::int32_t IdAhead(std::size_t place, std::size_t back) const;
    [[nodiscard]] CRange Narrowed(CRange range, std::int32_t id, std::size_t back) const;
    void AddSong(std::size_t index);
    void SortHistories();
    void CountPlaces();
    void ShareTriples();
    void CountSuccessors();
    void CountLengths();
    void CountKinds();
    [[nodiscard]] double KindProbability(const CRelativeChord& chord) const;
    void PredictAlone();
    void MixNearest(std::int32_t id, TBarPlace place, std::vector<double>& probabilities) const;
    void MixRange(CRange range, const TBarPlace* place, std::vector<double>& probabilities) const;

    std::vector<CTaughtSong> mSongs;
    std::vector<CRelativeChord> mVocabulary;
    std::unordered_map<std::uint32_t, std::int32_t> mIds;
    std::vector<CPlace> mPlaces;
    /// The places of chords, sorted by the chords before them, the nearest first.
    std::vector<std::uint32_t> mByHistory;
    /// The places of chords, sorted by the chord itself, and where those of each chord begin.
    std::vector<std::uint32_t> mByChord;
    std::vector<std::size_t> mChordBegins;
    std::vector<CSuccessor> mSuccessors;
    /// For each chord and both starts.
    std::vector<std::size_t> mSuccessorBegins;
    /// Of each chord.
    std::vector<CSongShares> mChordShares;
    /// Of each place what its chord, behind the two before it, adds to the share of its song.
    std::vector<float> mTripleShares;
    /// What Predict gives without a history, for each place in the bar.
    std::array<std::vector<double>, kBarPlaceCount> mAlone;
    std::vector<std::uint32_t> mEndCounts;
    std::map<std::array<std::int32_t, 3>, CLengthCounts> mLengths;
    std::unordered_map<std::uint32_t, std::uint32_t> mKindCounts;
    std::unordered_map<std::uint32_t, std::uint32_t> mKeyCounts;
};

}  // namespace brindle
