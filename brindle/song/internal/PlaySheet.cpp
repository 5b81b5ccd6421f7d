// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/PlayingOrder.h"
#include "brindle/song/internal/SheetBars.h"
#include "brindle/song/internal/SongTokens.h"
#include "brindle/song/internal/StatedKey.h"
#include "brindle/song/internal/WrittenSigns.h"

#include <algorithm>
#include <cmath>
#include <string>

namespace brindle::SongText {
namespace {

/// What repeats may add, in chords and holds: 64 times what is written, but so much that a short
/// song can be repeated often, and not more than a long one needs.
std::size_t MostRepeated(std::size_t written) {
    return std::clamp<std::size_t>(64 * written, 10'000, 100'000);
}

/// Puts the bars in time, in the order in which they are played.
class CPlayer {
public:
    explicit CPlayer(CTokenList& list)
        : mList(list),
          mPrefs(list.Prefs()),
          mSong(list.Song()),
          mHasBarLines(list.HasBarLines()),
          mIsEven((mPrefs.mEven || list.mIsEven) && mHasBarLines),
          mWritten(MakeSheetBars(list)),
          mBudget(MostRepeated(list.mTokens.size()) + list.mTokens.size()) {}

    void Play() {
        if (mList.IsGivenUp()) return;
        const CPlayingOrder order = PlayInOrder(mWritten.mMarks);
        for (const std::uint32_t bar : order.mMeasures) {
            mStarts.push_back(mPosition);
            if (!PlayBar(mWritten.mBars[bar])) break;
            if (mHasBarLines) AppendBar(bar);
        }
        if (order.mWasCut) GiveUp("its repeats and jumps make the song too long to be played");
        if (mWritten.mBars.empty()) TellKeys();
        if (!mSong.mChords.empty()) mSong.mChords.emplace_back(CChordLite_Undef, mPosition);
        AppendRepeats(order);
    }

private:
    /// Of a song without chords.
    void TellKeys() {
        for (const CToken& token : mList.mTokens) {
            if (token.mKind == TTokenKind::Key) AppendStatedKey(token.mText, 0.0, mSong);
        }
    }

    void AppendRepeats(const CPlayingOrder& order) {
        for (const CJumpBack& jump : order.mJumpsBack) {
            if (jump.mTo >= mStarts.size()) return;
            mSong.mRepeats.push_back({mStarts[jump.mTo], mStarts[jump.mFrom], jump.mLength});
        }
    }

    [[nodiscard]] double BeatsOf(const CWrittenBar& bar) const {
        return bar.mTime.IsUndef() ? mPrefs.mBeatsPerBar : bar.mTime.mNumerator;
    }

    void AppendBar(std::size_t bar) {
        mSong.mBars.push_back({std::to_string(bar + 1), mStarts.back(), mPosition - mStarts.back(),
                               mWritten.mBars[bar].mTime});
        SetWritten(bar, mWritten.mMarks[bar], mSong.mBars.back());
    }

    bool PlayBar(const CWrittenBar& bar) {
        const double begin = mPosition;
        const std::ptrdiff_t chords = mIsEven ? ChordsThatShare(bar) : 0;
        const double step =
            chords > 0 ? BeatsOf(bar) / static_cast<double>(chords) : mPrefs.mBeatsPerChord;
        int steps = 0;
        for (std::size_t i = bar.mBegin; i < bar.mEnd; ++i) {
            const CToken& token = mList.mTokens[i];
            if (!PlayToken(token, bar.mIsCopy)) return false;
            const int count = StepsOf(token);
            steps += count;
            // Shared bars are divided and not added up, so that thirds of a bar end where it ends.
            mPosition =
                chords > 0 ? begin + step * steps : mPosition + LengthOf(token, step * count);
        }
        if (chords > 0) {
            mPosition = begin + BeatsOf(bar);
        } else if (bar.mIsClosed) {
            CloseBar(bar, begin);
        }
        return mPosition < kPosEnd || GiveUp("the song is too long");
    }

    static double LengthOf(const CToken& token, double lengthOfSteps) {
        return token.mLength > 0.0 ? token.mLength : lengthOfSteps;
    }

    static int StepsOf(const CToken& token) {
        if (token.mKind == TTokenKind::Hold) return token.mCount;
        return token.mKind == TTokenKind::Chord || token.mKind == TTokenKind::RepeatBars ? 1 : 0;
    }

    /// A bar line moves on to the next multiple of the bar.
    void CloseBar(const CWrittenBar& bar, double begin) {
        const double beats = BeatsOf(bar);
        const double from = bar.mTime.IsUndef() ? 0.0 : begin;
        mPosition = from + std::ceil((mPosition - from) / beats) * beats;
    }

    bool PlayToken(const CToken& token, bool isCopy) {
        if (token.mKind == TTokenKind::Section && !isCopy) {
            mSong.mSections.push_back({std::string(token.mText), mPosition});
        } else if (token.mKind == TTokenKind::Key && !isCopy) {
            AppendStatedKey(token.mText, mPosition, mSong);
        } else if (token.mKind == TTokenKind::Chord) {
            mSong.mChords.emplace_back(token.mChord, mPosition);
            mSong.mSymbols.emplace_back(token.mText);
            StateSeventh(token.mSeventh, mSong);
        }
        if (mBudget == 0)
            return GiveUp("its repeats and jumps make the song too long to be played");
        --mBudget;
        return true;
    }

    /// The chords that share a bar evenly; 0 for a bar with holds.
    [[nodiscard]] std::ptrdiff_t ChordsThatShare(const CWrittenBar& bar) const {
        const auto begin = mList.mTokens.begin() + static_cast<std::ptrdiff_t>(bar.mBegin);
        const auto end = mList.mTokens.begin() + static_cast<std::ptrdiff_t>(bar.mEnd);
        const bool hasHolds = std::any_of(begin, end, [](const CToken& token) {
            return token.mKind == TTokenKind::Hold || token.mKind == TTokenKind::RepeatBars;
        });
        if (hasHolds) return 0;
        return std::count_if(begin, end,
                             [](const CToken& token) { return token.mKind == TTokenKind::Chord; });
    }

    bool GiveUp(const char* reason) {
        mList.AddFault(mList.Text(), reason);
        return false;
    }

    CTokenList& mList;
    const CSongOptions& mPrefs;
    CSong& mSong;
    bool mHasBarLines;
    bool mIsEven;
    CSheetBars mWritten;
    std::size_t mBudget;
    std::vector<double> mStarts;  // of each bar that was played
    double mPosition = 0.0;
};

}  // namespace

void PlaySheet(CTokenList& list) {
    CPlayer(list).Play();
}

}  // namespace brindle::SongText
