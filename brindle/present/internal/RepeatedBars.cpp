// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/CSuffixes.h"
#include "brindle/present/internal/ReadingBars.h"

#include <algorithm>
#include <map>
#include <tuple>

namespace brindle {
namespace {

/// A shorter passage is no news in a song that is longer.
constexpr TPlace kShortestPassage = 4;
constexpr TPlace kShortestOfShortSong = 2;
constexpr std::size_t kShortSong = 16;

/// What sounds from a beat of a bar on.
using TSound = std::tuple<double, int, int, std::uint64_t>;
using TSounds = std::vector<TSound>;

bool IsSameSound(const TSound& a, const TSound& b) {
    return std::get<1>(a) == std::get<1>(b) && std::get<2>(a) == std::get<2>(b) &&
           std::get<3>(a) == std::get<3>(b);
}

/// Numbers the bars so that those that sound the same have the same number.
class CBarNumbers {
public:
    CBarNumbers(const CSong& song, const CBars& bars) : mSong(song), mBars(bars) {}

    [[nodiscard]] std::vector<TPlace> NumbersOf(const std::vector<CReadingBar>& bars) {
        std::vector<TPlace> numbers;
        numbers.reserve(bars.size());
        for (const CReadingBar& bar : bars) {
            TSounds sounds = SoundsOf(bar);
            // A row of held bars has a length of its own.
            if (bar.mCount > 1) sounds.emplace_back(-1.0, 0, 0, bar.mCount);
            const auto next = static_cast<TPlace>(mNumbers.size());
            numbers.push_back(mNumbers.try_emplace(std::move(sounds), next).first->second);
        }
        return numbers;
    }

private:
    [[nodiscard]] TSound SoundAt(std::size_t ix, double beat) const {
        const CHarmAnlsChord& chord = mSong.mChords[ix];
        if (chord.IsUndef()) return {beat, kKeyNrUndef, kKeyNrUndef, 0};
        const int bass = chord.HasBassNote() ? chord.mBassKeyEnh.mKeyNr : chord.mRootKeyEnh.mKeyNr;
        return {beat, chord.mRootKeyEnh.mKeyNr, bass, chord.mSemitones.Mask()};
    }

    [[nodiscard]] TSounds SoundsOf(const CReadingBar& bar) const {
        TSounds sounds;
        const bool isHeldOver =
            !bar.HasChords() || mBars.BeatOf(mSong.mChords[bar.mBegin].mPosition) > 1.0;
        if (isHeldOver && bar.mBegin > 0) sounds.push_back(SoundAt(bar.mBegin - 1, 1.0));
        for (std::size_t ix = bar.mBegin; ix < bar.mEnd; ++ix) {
            const TSound sound = SoundAt(ix, mBars.BeatOf(mSong.mChords[ix].mPosition));
            if (sounds.empty() || !IsSameSound(sounds.back(), sound)) sounds.push_back(sound);
        }
        return sounds;
    }

    const CSong& mSong;
    const CBars& mBars;
    std::map<TSounds, TPlace> mNumbers;
};

/// For each place how many symbols from there on stand at an earlier place, too: by the nearest
/// earlier places in the sorted order of suffixes, on either side.
std::vector<TPlace> LongestEarlier(const CSuffixes& suffixes) {
    std::vector<TPlace> longest(suffixes.Count(), 0);
    std::vector<TPlace> open;
    const auto visit = [&](TPlace place) {
        while (!open.empty() && open.back() > place) open.pop_back();
        if (!open.empty()) {
            const TPlace source = open.back();
            const TPlace equal = std::min(suffixes.EqualCount(source, place), place - source);
            longest[place] = std::max(longest[place], equal);
        }
        open.push_back(place);
    };
    for (TPlace rank = 0; rank < suffixes.Count(); ++rank) visit(suffixes.PlaceOf(rank));
    open.clear();
    for (TPlace rank = suffixes.Count(); rank > 0; --rank) visit(suffixes.PlaceOf(rank - 1));
    return longest;
}

bool AreAllEqual(const std::vector<TPlace>& numbers, TPlace begin, TPlace count) {
    const auto first = numbers.begin() + static_cast<std::ptrdiff_t>(begin);
    return std::all_of(first, first + static_cast<std::ptrdiff_t>(count),
                       [&](TPlace number) { return number == *first; });
}

}  // namespace

std::vector<CRepeatedBars> RepeatedBarsOf(const CSong& song, const CBars& bars,
                                          const std::vector<CReadingBar>& readingBars) {
    std::vector<CRepeatedBars> repeats;
    if (readingBars.size() < 2) return repeats;
    const std::vector<TPlace> numbers = CBarNumbers(song, bars).NumbersOf(readingBars);
    const CSuffixes suffixes(numbers);
    const std::vector<TPlace> longest = LongestEarlier(suffixes);
    const TPlace shortest =
        readingBars.size() <= kShortSong ? kShortestOfShortSong : kShortestPassage;
    for (TPlace place = 0; place < suffixes.Count();) {
        const TPlace count = longest[place];
        if (count < shortest || AreAllEqual(numbers, place, count)) {
            ++place;
            continue;
        }
        const TPlace source = suffixes.NextPlace(suffixes.RanksOfPassage(place, count), 0);
        const CReadingBar& last = readingBars[place + count - 1];
        const long first = readingBars[place].mNumber;
        repeats.push_back({first, readingBars[source].mNumber, last.mNumber + last.mCount - first});
        place += count;
    }
    return repeats;
}

}  // namespace brindle
