// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/ChordSheetTokens.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace brindle::ChordSheet {
namespace {

/// What repeats may add, in bars, chords and holds: 64 times what is written, but so much that a
/// short song can be repeated often, and not more than a long one needs.
std::size_t MostRepeated(std::size_t written) {
    return std::clamp<std::size_t>(64 * written, 10'000, 100'000);
}

/// A bar as it is written. Bars of nothing are none.
struct TBar {
    /// Tokens, of which chords, holds and sections count.
    std::size_t mBegin = 0;
    std::size_t mEnd = 0;
    bool mStartsRepeat = false;
    bool mEndsRepeat = false;
    /// It ends at a bar line, and not where its last chord does.
    bool mIsClosed = false;
    /// It stands for a bar before it, whose tokens it has.
    bool mIsCopy = false;
    std::uint64_t mEndings = 0;
    /// Length in beats; 0 for that of the preferences.
    double mBeats = 0.0;
};

/// Collects the tokens between bar lines.
class CBarMaker {
public:
    explicit CBarMaker(CTokenList& list) : mList(list) {}

    std::vector<TBar> Make() {
        for (std::size_t i = 0; i < mList.mTokens.size(); ++i) Take(i);
        Close(mList.mTokens.size(), false);
        return std::move(mBars);
    }

private:
    void Take(std::size_t i) {
        const TToken& token = mList.mTokens[i];
        switch (token.mKind) {
            case TTokenKind::Chord:
            case TTokenKind::Hold:
            case TTokenKind::RepeatBars:
                ++mStepCount;
                mLastStep = i;
                return;
            case TTokenKind::Bar:
                Close(i, true);
                if (token.mEndsRepeat && !mBars.empty()) mBars.back().mEndsRepeat = true;
                mNext.mStartsRepeat = mNext.mStartsRepeat || token.mStartsRepeat;
                return;
            case TTokenKind::Ending:
                Close(i, true);
                mNext.mEndings |= token.mEndings;
                return;
            case TTokenKind::Beats:
                mNext.mBeats = token.mBeats;
                return;
            case TTokenKind::Section:
                return;
        }
    }

    void Close(std::size_t end, bool isClosed) {
        if (mStepCount == 0) return;
        const TToken& last = mList.mTokens[mLastStep];
        if (mStepCount == 1 && last.mKind == TTokenKind::RepeatBars) {
            Repeat(last, end);
        } else {
            mNext.mEnd = end;
            mNext.mIsClosed = isClosed;
            mBars.push_back(mNext);
        }
        const double beats = mNext.mBeats;
        mNext = {};
        mNext.mBegin = end;
        mNext.mBeats = beats;
        mStepCount = 0;
    }

    /// The last bar, or the last two, once more.
    void Repeat(const TToken& token, std::size_t end) {
        const auto count = static_cast<std::size_t>(token.mCount);
        if (mBars.size() < count) {
            mList.AddFault(token.mText, count == 1 ? "there is no bar before this one to repeat"
                                                   : "there are no two bars before to repeat");
            mNext.mEnd = end;
            mNext.mIsClosed = true;
            mBars.push_back(mNext);
            return;
        }
        const std::size_t first = mBars.size() - count;
        for (std::size_t i = first; i < first + count; ++i) {
            TBar copy = mBars[i];
            copy.mIsClosed = copy.mIsCopy = true;
            copy.mStartsRepeat = i == first && mNext.mStartsRepeat;
            copy.mEndsRepeat = false;
            copy.mEndings = i == first ? mNext.mEndings : 0;
            mBars.push_back(copy);
        }
    }

    CTokenList& mList;
    std::vector<TBar> mBars;
    TBar mNext;
    std::size_t mStepCount = 0;
    std::size_t mLastStep = 0;
};

/// Goes through the bars as a player does.
class CPlayer {
public:
    CPlayer(CTokenList& list, std::vector<TBar> bars, CChordSheetReading& reading)
        : mList(list),
          mPrefs(list.Prefs()),
          mBars(std::move(bars)),
          mEndingsFrom(EndingsFrom(mBars)),
          mReading(reading),
          mBudget(MostRepeated(mBars.size() + list.mTokens.size()) + mBars.size() +
                  list.mTokens.size()),
          mIsEven((mPrefs.mEven || list.mIsEven) && HasBarLines(list)) {}

    void Play() {
        std::size_t bar = 0;
        while (bar < mBars.size()) {
            if (mBars[bar].mStartsRepeat && !mIsGoingBack) BeginRepeat(bar);
            mIsGoingBack = false;
            if (const std::size_t next = BehindOtherEndings(bar); next != bar) {
                bar = next;
                continue;
            }
            if (!PlayBar(mBars[bar])) return;
            bar = AfterBar(bar);
        }
        if (!mReading.mChords.empty()) mReading.mChords.emplace_back(CChordLite_Undef, mPosition);
    }

private:
    static bool HasBarLines(const CTokenList& list) {
        return std::any_of(list.mTokens.begin(), list.mTokens.end(),
                           [](const TToken& token) { return token.mKind == TTokenKind::Bar; });
    }

    void BeginRepeat(std::size_t bar) {
        mRepeatBegin = bar;
        mPass = 1;
    }

    /// The bar itself, or, at an ending of another pass, the next one to play: the ending of this
    /// pass, or else what stands behind the repeat.
    std::size_t BehindOtherEndings(std::size_t bar) {
        const auto isOfPass = [&](std::uint64_t endings) { return (endings >> mPass & 1) != 0; };
        if (mBars[bar].mEndings == 0 || isOfPass(mBars[bar].mEndings)) return bar;
        std::size_t behindRepeat = mBars.size();
        for (std::size_t i = bar + 1; i < mBars.size(); ++i) {
            if (mBars[i].mStartsRepeat) return std::min(i, behindRepeat);
            if (isOfPass(mBars[i].mEndings)) return i;
            const bool isBehind = mBars[i - 1].mEndsRepeat && mBars[i].mEndings == 0;
            if (isBehind) behindRepeat = std::min(i, behindRepeat);
            if (!Spend(1)) return mBars.size();
        }
        return behindRepeat;
    }

    /// For each bar the endings from there to the next repeat.
    static std::vector<std::uint64_t> EndingsFrom(const std::vector<TBar>& bars) {
        std::vector<std::uint64_t> endings(bars.size() + 1, 0);
        for (std::size_t i = bars.size(); i-- > 0;) {
            const bool isLast = i + 1 == bars.size() || bars[i + 1].mStartsRepeat;
            endings[i] = bars[i].mEndings | (isLast ? 0 : endings[i + 1]);
        }
        return endings;
    }

    /// How often the repeat from `mRepeatBegin` is played.
    [[nodiscard]] int PassCount() const {
        const std::uint64_t endings = mEndingsFrom[mRepeatBegin];
        int last = 2;
        while (last < 63 && endings >> (last + 1) != 0) ++last;
        return last;
    }

    std::size_t AfterBar(std::size_t bar) {
        if (!mBars[bar].mEndsRepeat) return bar + 1;
        if (mPass == 1) mPassCount = PassCount();
        if (mPass < mPassCount) {
            ++mPass;
            mIsGoingBack = true;
            return mRepeatBegin;
        }
        BeginRepeat(bar + 1);
        return bar + 1;
    }

    bool PlayBar(const TBar& bar) {
        const double beats = bar.mBeats > 0.0 ? bar.mBeats : mPrefs.mBeatsPerBar;
        const double begin = mPosition;
        double step = mPrefs.mBeatsPerChord;
        const bool isShared = mIsEven && IsShared(bar);
        if (isShared) step = beats / static_cast<double>(StepCount(bar));
        if (!Spend(1)) return false;
        int steps = 0;
        for (std::size_t i = bar.mBegin; i < bar.mEnd; ++i) {
            const TToken& token = mList.mTokens[i];
            if (!PlayToken(token, bar.mIsCopy)) return false;
            if (token.mKind != TTokenKind::Chord && token.mKind != TTokenKind::Hold &&
                token.mKind != TTokenKind::RepeatBars) {
                continue;
            }
            steps += token.mKind == TTokenKind::Hold ? token.mCount : 1;
            // Shared bars are divided and not added up, so that thirds of a bar end where it ends.
            if (isShared) {
                mPosition = begin + step * steps;
            } else {
                mPosition += step * (token.mKind == TTokenKind::Hold ? token.mCount : 1);
            }
        }
        if (isShared) {
            mPosition = begin + beats;
        } else if (bar.mIsClosed) {
            CloseBar(bar, begin);
        }
        return mPosition < kPosEnd || GiveUp("the song is too long");
    }

    /// A bar line moves on to the next multiple of the bar.
    void CloseBar(const TBar& bar, double begin) {
        if (bar.mBeats > 0.0) {
            mPosition = begin + std::ceil((mPosition - begin) / bar.mBeats) * bar.mBeats;
        } else {
            mPosition = std::ceil(mPosition / mPrefs.mBeatsPerBar) * mPrefs.mBeatsPerBar;
        }
    }

    bool PlayToken(const TToken& token, bool isCopy) {
        if (token.mKind == TTokenKind::Section && !isCopy) {
            mReading.mSections.push_back({std::string(token.mText), mPosition});
        }
        if (token.mKind == TTokenKind::Chord) {
            mReading.mChords.emplace_back(token.mChord, mPosition);
            mReading.mSymbols.emplace_back(token.mText);
        }
        return Spend(1);
    }

    [[nodiscard]] bool IsShared(const TBar& bar) const {
        return StepCount(bar) > 0 && std::none_of(Begin(bar), End(bar), [](const TToken& token) {
                   return token.mKind == TTokenKind::Hold || token.mKind == TTokenKind::RepeatBars;
               });
    }
    [[nodiscard]] std::ptrdiff_t StepCount(const TBar& bar) const {
        return std::count_if(Begin(bar), End(bar),
                             [](const TToken& token) { return token.mKind == TTokenKind::Chord; });
    }
    [[nodiscard]] std::vector<TToken>::const_iterator Begin(const TBar& bar) const {
        return mList.mTokens.begin() + static_cast<std::ptrdiff_t>(bar.mBegin);
    }
    [[nodiscard]] std::vector<TToken>::const_iterator End(const TBar& bar) const {
        return mList.mTokens.begin() + static_cast<std::ptrdiff_t>(bar.mEnd);
    }

    bool Spend(std::size_t count) {
        if (mBudget < count) return GiveUp("its repeats make the song too long to be played");
        mBudget -= count;
        return true;
    }

    bool GiveUp(const char* reason) {
        mList.AddFault(mList.Text(), reason);
        return false;
    }

    CTokenList& mList;
    const CChordSheetPrefs& mPrefs;
    std::vector<TBar> mBars;
    std::vector<std::uint64_t> mEndingsFrom;
    CChordSheetReading& mReading;
    std::size_t mBudget;
    bool mIsEven;
    double mPosition = 0.0;
    std::size_t mRepeatBegin = 0;
    int mPass = 1;
    int mPassCount = 2;
    bool mIsGoingBack = false;
};

}  // namespace

void Play(CTokenList& list, CChordSheetReading& reading) {
    std::vector<TBar> bars = CBarMaker(list).Make();
    if (list.IsGivenUp()) return;
    CPlayer(list, std::move(bars), reading).Play();
}

}  // namespace brindle::ChordSheet
