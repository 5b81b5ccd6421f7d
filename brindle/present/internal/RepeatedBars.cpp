// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/CSuffixes.h"
#include "brindle/present/internal/ReadingBars.h"

#include <fmt/format.h>

#include <algorithm>
#include <iterator>
#include <map>
#include <queue>
#include <tuple>

namespace brindle {
namespace {

/// A passage is worth a word from an eighth of the song on, but not below four bars, and from eight
/// on in any song.
std::size_t ShortestPassage(std::size_t barCount) {
    return std::clamp<std::size_t>(barCount / 8, 4, 8);
}

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

/// A passage that repeats an earlier one.
struct CRepeatedPassage {
    TPlace mPlace = 0;
    TPlace mCount = 0;

    /// The longest comes first, of those the earliest.
    friend bool operator<(const CRepeatedPassage& a, const CRepeatedPassage& b) {
        return a.mCount != b.mCount ? a.mCount < b.mCount : a.mPlace > b.mPlace;
    }
};

/// Whether all bars are the same, which says nothing of the song's form.
bool AreAllEqual(const std::vector<TPlace>& numbers, const CRepeatedPassage& passage) {
    const auto first = numbers.begin() + static_cast<std::ptrdiff_t>(passage.mPlace);
    return std::all_of(first, first + static_cast<std::ptrdiff_t>(passage.mCount),
                       [&](TPlace number) { return number == *first; });
}

/// The longest passages that do not overlap, by place. What a longer one leaves of a passage is
/// tried again; each place is in the queue once at a time.
std::map<TPlace, TPlace> LongestPassages(const std::vector<TPlace>& longest, TPlace shortest) {
    std::priority_queue<CRepeatedPassage> queue;
    for (TPlace place = 0; place < longest.size(); ++place) {
        if (longest[place] >= shortest) queue.push({place, longest[place]});
    }
    std::map<TPlace, TPlace> taken;
    while (!queue.empty()) {
        CRepeatedPassage passage = queue.top();
        queue.pop();
        const auto behind = taken.upper_bound(passage.mPlace);
        const bool isCovered =
            behind != taken.begin() &&
            std::prev(behind)->first + std::prev(behind)->second > passage.mPlace;
        if (isCovered) continue;
        if (behind != taken.end() && behind->first < passage.mPlace + passage.mCount) {
            passage.mCount = behind->first - passage.mPlace;
            if (passage.mCount >= shortest) queue.push(passage);
        } else {
            taken.emplace(passage.mPlace, passage.mCount);
        }
    }
    return taken;
}

}  // namespace

std::vector<CRepeatedBars> RepeatedBarsOf(const CSong& song, const CBars& bars,
                                          const std::vector<CReadingBar>& readingBars) {
    return RepeatedBarsOf(song, bars, readingBars, ShortestPassage(readingBars.size()));
}

std::vector<CRepeatedBars> RepeatedBarsOf(const CSong& song, const CBars& bars,
                                          const std::vector<CReadingBar>& readingBars,
                                          std::size_t shortest) {
    std::vector<CRepeatedBars> repeats;
    if (readingBars.size() < 2) return repeats;
    const std::vector<TPlace> numbers = CBarNumbers(song, bars).NumbersOf(readingBars);
    const CSuffixes suffixes(numbers);
    const auto passages = LongestPassages(LongestEarlier(suffixes), static_cast<TPlace>(shortest));
    for (const auto& [place, count] : passages) {
        const CReadingBar& first = readingBars[place];
        const bool isFullBar = count == 1 && first.mEnd - first.mBegin > 1;
        if (!isFullBar && AreAllEqual(numbers, {place, count})) continue;
        const TPlace source = suffixes.NextPlace(suffixes.RanksOfPassage(place, count), 0);
        const CReadingBar& last = readingBars[place + count - 1];
        repeats.push_back({first.mNumber, readingBars[source].mNumber,
                           last.mNumber + last.mCount - first.mNumber});
    }
    return repeats;
}

std::string RepeatText(const CRepeatedBars& repeat) {
    const auto bars = [&](long first) {
        return repeat.mCount == 1 ? fmt::format("bar {}", first)
                                  : fmt::format("bars {} to {}", first, first + repeat.mCount - 1);
    };
    return fmt::format("{} {} {}", bars(repeat.mFirst), repeat.mCount == 1 ? "repeats" : "repeat",
                       bars(repeat.mSource));
}

}  // namespace brindle
