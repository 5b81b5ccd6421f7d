// SPDX-License-Identifier: MIT
#include "brindle/song/WriteSong.h"

#include "brindle/chords/CProgressionSpelling.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/song/internal/QuotedRow.h"
#include "brindle/song/internal/SongPlan.h"
#include "brindle/song/internal/WriteStretch.h"

#include <fmt/format.h>

#include <algorithm>
#include <numeric>

namespace brindle {
namespace {

// Songs that quote too much are rarely left without a way.
constexpr int kMostTries = 20;

using CWrittenChords = std::vector<CWrittenChord>;

CWrittenChords Joined(const std::vector<CWrittenChords>& parts) {
    CWrittenChords all;
    for (const CWrittenChords& part : parts) all.insert(all.end(), part.begin(), part.end());
    return all;
}

/// The first beats of a part; the chord that goes on behind them is cut.
CWrittenChords FirstBeats(const CWrittenChords& chords, std::size_t beats) {
    CWrittenChords first;
    auto left = static_cast<std::int32_t>(beats);
    for (const CWrittenChord& chord : chords) {
        if (left <= 0) break;
        first.push_back(chord);
        first.back().mBeats = std::min(chord.mBeats, left);
        left -= chord.mBeats;
    }
    return first;
}

/// Writes the stretches of a plan and copies what is the same.
class CPlanWriter {
public:
    CPlanWriter(const CSongModel& model, CSongPlan& plan, SeededRandom& random)
        : mModel(model), mPlan(plan), mRandom(random) {}

    [[nodiscard]] TStretchEnd Write() {
        for (std::size_t part = 0; part < mPlan.mParts.size(); ++part) {
            const TStretchEnd end = WritePart(part);
            if (end != TStretch_Written) return end;
        }
        return TStretch_Written;
    }
    [[nodiscard]] const std::vector<CWrittenChords>& Parts() const { return mParts; }

private:
    TStretchEnd WritePart(std::size_t index) {
        const CFormPart& part = mPlan.mParts[index];
        if (part.mIsLike >= 0) {
            mParts.push_back(mParts[static_cast<std::size_t>(part.mIsLike)]);
            return TStretch_Written;
        }
        CSongStretch stretch = StretchOf(index);
        CWrittenChords begin;
        if (!part.IsNew()) {
            begin =
                FirstBeats(mParts[static_cast<std::size_t>(part.mBeginsLike)], stretch.mFirstBeat);
        }
        stretch.mBefore = Joined(mParts);
        stretch.mBefore.insert(stretch.mBefore.end(), begin.begin(), begin.end());
        if (index + 1 < mPlan.mParts.size() && mPlan.mParts[index + 1].mBeginsLike >= 0 &&
            mPlan.mParts[index + 1].mLetter != part.mLetter) {
            stretch.mBehind = mParts[static_cast<std::size_t>(mPlan.mParts[index + 1].mBeginsLike)];
        }
        CWrittenChords written;
        const TStretchEnd end = WriteStretch(mModel, stretch, mRandom, written);
        if (end != TStretch_Written) return end;
        begin.insert(begin.end(), written.begin(), written.end());
        mParts.push_back(std::move(begin));
        return TStretch_Written;
    }
    [[nodiscard]] CSongStretch StretchOf(std::size_t part) const {
        const auto found =
            std::find_if(mPlan.mStretches.begin(), mPlan.mStretches.end(),
                         [&](const CPlannedStretch& planned) { return planned.mPart == part; });
        return found->mStretch;
    }

    const CSongModel& mModel;
    CSongPlan& mPlan;
    SeededRandom& mRandom;
    std::vector<CWrittenChords> mParts;
};

void AddChords(const CWrittenChords& chords, const CSignKeyLite& home, double& position,
               CSong& song) {
    for (const CWrittenChord& written : chords) {
        const CSignKeyLite key = KeyAbove(home, written.mTonic, written.mChord.mIsMinorKey);
        const CChordLite chord = ChordInKey(written.mChord, key);
        song.mChords.emplace_back(chord, position);
        position += written.mBeats;
    }
}

/// Gives the chords of all keys of a song the names of its own, and their symbols.
void SpellChords(CSong& song) {
    const std::vector<CChordLite> chords(song.mChords.begin(), song.mChords.end());
    const CProgressionSpelling spelling(*song.mStatedKey, chords);
    for (CHarmAnlsChordWithPos& chord : song.mChords) {
        static_cast<CChordLite&>(chord) = spelling.Spelled(chord);
        song.mSymbols.push_back(WriteChordSymbol(chord));
    }
}

CSong SongOf(const std::vector<CWrittenChords>& parts, const CSongPlan& plan,
             const CWriteSongOptions& options) {
    CSong song;
    const auto beats = static_cast<double>(options.mBeatsPerBar);
    song.mBeatsPerBar = beats;
    song.mStatedKey = options.mKey;
    double position = 0.0;
    for (std::size_t ix = 0; ix < parts.size(); ++ix) {
        const CFormPart& part = plan.mParts[ix];
        if (plan.mParts.size() > 1)
            song.mSections.push_back({std::string(1, part.mLetter), position});
        if (ix > 0 && plan.mParts[ix - 1].mLetter == part.mLetter) {
            const double before = position - static_cast<double>(part.mBars) * beats;
            const std::size_t same =
                part.mIsLike == static_cast<std::ptrdiff_t>(ix) - 1 ? part.mBars : part.EndingBar();
            song.mRepeats.push_back({position, before, same});
        }
        AddChords(parts[ix], options.mKey, position, song);
    }
    SpellChords(song);
    song.mChords.emplace_back(CChordLite_Undef, position);
    for (std::size_t bar = 0; bar < options.mBars; ++bar) {
        song.mBars.push_back({fmt::format("{}", bar + 1),
                              static_cast<double>(bar) * beats,
                              beats,
                              {options.mBeatsPerBar, 4}});
    }
    return song;
}

CWrittenQuote QuoteOf(const CSongModel& model, std::span<const CQuotedChord> row) {
    const CSongQuote quote = LongestQuote(model, row);
    if (quote.mSong < 0) return {};
    const auto bars = [](std::int32_t ticks) { return static_cast<double>(ticks) / kTicksPerBar; };
    return {model.Songs()[static_cast<std::size_t>(quote.mSong)].mTitle,
            bars(quote.mSourceTick) + 1.0, bars(quote.mTick) + 1.0, bars(quote.mLength)};
}

std::string FaultOf(const CSongModel& model, const CWriteSongOptions& options) {
    if (model.IsEmpty()) return "the model has learned nothing";
    if (options.mKey.IsUndef()) return "the key is none";
    std::string range = RangeFaultOf(options);
    if (!range.empty()) return range;
    if (PartsOfForm(options.mForm, options.mBars).empty()) {
        return fmt::format("a form is letters from A to Z that share {} bars evenly",
                           options.mBars);
    }
    return {};
}

CWrittenSong RefusedSong(std::string fault) {
    CWrittenSong refused;
    refused.mFault = std::move(fault);
    return refused;
}

}  // namespace

std::string RangeFaultOf(const CWriteSongOptions& options) {
    if (options.mBars == 0 || options.mBars > kMostWrittenBars) {
        return fmt::format("a song has 1 to {} bars", kMostWrittenBars);
    }
    if (options.mBeatsPerBar < 1 || options.mBeatsPerBar > kMostWrittenBeatsPerBar) {
        return fmt::format("a bar has 1 to {} beats", kMostWrittenBeatsPerBar);
    }
    if (!(options.mMostQuotedBars >= 0.0 && options.mMostQuotedBars <= kLongestQuoteLimit)) {
        return fmt::format("the longest quote has 0 to {} bars", kLongestQuoteLimit);
    }
    if (options.mOrder < 1 || options.mOrder > CSongModel::kLongestHistory) {
        return fmt::format("histories have 1 to {} chords", CSongModel::kLongestHistory);
    }
    return {};
}

CWrittenSong WriteSong(const CSongModel& model, const CWriteSongOptions& options) {
    CWrittenSong result = RefusedSong(FaultOf(model, options));
    if (!result.mFault.empty()) return result;
    for (const std::size_t wish : ContradictingWishes(model, options)) {
        result.mContradiction.push_back(options.mWishes[wish].mText);
    }
    if (!result.mContradiction.empty()) return result.mFault = "these wishes contradict", result;
    std::vector<std::size_t> wishes(options.mWishes.size());
    std::iota(wishes.begin(), wishes.end(), std::size_t{0});
    CSongPlan plan = PlanSong(model, options, wishes);
    SeededRandom random(options.mSeed);
    for (int tries = 0; tries < kMostTries; ++tries) {
        CPlanWriter writer(model, plan, random);
        const TStretchEnd end = writer.Write();
        if (end == TStretch_Impossible)
            return RefusedSong("the songs of the model never come to rest in such a key");
        if (end != TStretch_Written) continue;
        const std::vector<CQuotedChord> row =
            QuotedRowOf(Joined(writer.Parts()), 0, options.mBeatsPerBar);
        // Copies of parts may join to more than either.
        const std::int32_t most = MostQuotedTicks(options);
        if (most > 0 && QuotesMoreThan(most, model, row)) continue;
        result.mLongestQuote = QuoteOf(model, row);
        result.mSong = SongOf(writer.Parts(), plan, options);
        return result;
    }
    return RefusedSong(fmt::format("no song was found that quotes {} bars at most; allow more",
                                   options.mMostQuotedBars));
}

}  // namespace brindle
