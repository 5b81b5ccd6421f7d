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

/// A chord as it is heard, whatever key it is read in.
struct CSoundingChord {
    std::uint8_t mRoot = 0;    ///< semitones above any tone, the same one for a whole song; 0 to 11
    std::uint8_t mBass = 0;    ///< semitones from the root up, 0 to 11
    std::uint16_t mMask = 0;   ///< the tones above the root, 12 bits
    std::int32_t mLength = 0;  ///< in ticks

    friend constexpr bool operator==(const CSoundingChord&, const CSoundingChord&) = default;
};

/// Which lengths followed at a place of the bar, and how often; in ticks.
using CLengthCounts = std::vector<std::pair<std::int32_t, std::uint32_t>>;

/// What songs have in common: which chord follows which, where in the bar, how long, and how parts
/// of songs end. A value; it keeps the songs, so that a file of it is a list of songs.
///
/// A chord is predicted by interpolation: from how common chords are, and are in the mode of the
/// key before, up to the longest history that was heard, each level leaves the more to the level
/// below, the more different chords followed (Witten and Bell's method); what was heard counts as
/// CSongShares tells. What is common in a mode and the histories of one and two chords count once
/// more with the place in the bar. Histories are looked up in an array of all places in the songs,
/// sorted by what stands before them: building takes n log n, a query a few binary searches and as
/// many steps as the history of two chords was heard.
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
    /// What stands in a history for a chord that was never heard: only its key tells anything.
    [[nodiscard]] static constexpr std::int32_t UnknownId(bool isMinor) {
        return isMinor ? -4 : -1;
    }
    /// IdOf, or the UnknownId of its key.
    [[nodiscard]] std::int32_t HistoryIdOf(const CRelativeChord& chord) const;
    /// How often the chord stands in the songs.
    [[nodiscard]] std::uint32_t CountOf(std::int32_t id) const;
    /// How often the chord was the last of a part.
    [[nodiscard]] std::uint32_t EndCountOf(std::int32_t id) const;
    /// How often the chord was the last of a song.
    [[nodiscard]] std::uint32_t FinalCountOf(std::int32_t id) const;
    /// How many times as often as all chords those begin at such a place with which a part comes to
    /// rest on its tonic: above 1 on first beats, where songs end there.
    [[nodiscard]] double RestRatioAt(TBarPlace place) const;

    /// What stands before the first chord of a song in such a key.
    [[nodiscard]] static constexpr std::int32_t StartId(bool isMinor) { return isMinor ? -3 : -2; }

    /// The probability of each known chord behind a history of HistoryIdOf and StartId, the newest
    /// chord last, and `order` chords of it at most, but always the mode of the key before; what is
    /// left over is that of chords that were never heard.
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

    /// A place in the songs: a chord, or, with an `mId` below 0, what stands before a song.
    struct CPlace {
        std::int32_t mId;      ///< a number or a StartId
        std::int32_t mLength;  ///< in ticks; 0 before a song
        std::int32_t mSong;    ///< an index of Songs()
        TBarPlace mBarPlace;   ///< where the chord begins
        std::uint8_t mRoot;    ///< of the chord, in semitones above the tonic of the song, 0 to 11
    };
    /// All songs, one behind the other.
    [[nodiscard]] std::span<const CPlace> Places() const { return mPlaces; }
    /// The chord of a place, which must have one, as it sounds.
    [[nodiscard]] CSoundingChord SoundAt(std::size_t place) const;
    /// The places, in ascending order, of chords that sound so behind a chord that sounds like
    /// `before`, in whatever key.
    [[nodiscard]] std::span<const std::uint32_t> PlacesOfPair(const CSoundingChord& before,
                                                              const CSoundingChord& chord) const;

private:
    struct CRange {
        std::size_t mBegin;
        std::size_t mEnd;
    };
    [[nodiscard]] bool IsInMinor(std::int32_t historyId) const;
    [[nodiscard]] std::int32_t IdAhead(std::size_t place, std::size_t back) const;
    [[nodiscard]] CRange Narrowed(CRange range, std::int32_t id, std::size_t back) const;
    void AddSong(std::size_t index);
    void SortHistories();
    [[nodiscard]] std::uint64_t PairAt(std::size_t place) const;
    void SortPairs();
    void CountPlaces();
    void ShareTriples();
    void CountSuccessors();
    template <typename TIsCounted>
    [[nodiscard]] std::vector<CSongShares> SharesOfChords(const TIsCounted& isCounted) const;
    void ShareChords();
    void CountLengths();
    void CountKinds();
    [[nodiscard]] double KindProbability(const CRelativeChord& chord) const;
    [[nodiscard]] bool HasBothModes() const;
    void PredictAlone();
    void MixNearest(std::int32_t id, TBarPlace place, std::vector<double>& probabilities) const;
    void MixRange(CRange range, const TBarPlace* place, std::vector<double>& probabilities) const;

    std::vector<CTaughtSong> mSongs;
    std::vector<CRelativeChord> mVocabulary;
    std::unordered_map<std::uint32_t, std::int32_t> mIds;
    std::vector<CPlace> mPlaces;
    /// The places of chords, sorted by the chords before them, the nearest first.
    std::vector<std::uint32_t> mByHistory;
    /// The places of chords with a chord before them, sorted by how both sound.
    std::vector<std::uint32_t> mByPair;
    /// How often each chord stands in the songs.
    std::vector<std::uint32_t> mCounts;
    std::vector<CSuccessor> mSuccessors;
    /// For each chord and both starts.
    std::vector<std::size_t> mSuccessorBegins;
    /// Of each chord, all in all and behind chords in a mode: the first of major.
    std::vector<CSongShares> mChordShares;
    std::array<std::vector<CSongShares>, 2> mModeShares;
    /// Of each place what its chord, behind the two before it, adds to the share of its song.
    std::vector<float> mTripleShares;
    /// What Predict gives by the mode of the key before alone, for each place in the bar.
    std::array<std::array<std::vector<double>, kBarPlaceCount>, 2> mAlone;
    /// By TBarPlace: the chords that begin there, and those that end a part on the tonic.
    std::array<std::uint32_t, kBarPlaceCount> mPlaceCounts{};
    std::array<std::uint32_t, kBarPlaceCount> mRestCounts{};
    std::vector<std::uint32_t> mEndCounts;
    std::vector<std::uint32_t> mFinalCounts;
    std::map<std::array<std::int32_t, 3>, CLengthCounts> mLengths;
    std::unordered_map<std::uint32_t, std::uint32_t> mKindCounts;
    std::unordered_map<std::uint32_t, std::uint32_t> mKeyCounts;
};

}  // namespace brindle
