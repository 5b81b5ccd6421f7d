// SPDX-License-Identifier: MIT
#include "brindle/song/internal/SheetBars.h"

#include "brindle/song/internal/PlayWords.h"

#include <utility>

namespace brindle::SongText {

namespace {

class CBarMaker {
public:
    explicit CBarMaker(CTokenList& list) : mList(list), mHasBarLines(list.HasBarLines()) {}

    CSheetBars Make() {
        for (std::size_t i = 0; i < mList.mTokens.size(); ++i) Take(i);
        // The last chord of a song with bars lasts to the end of its bar.
        Close(mList.mTokens.size(), mHasBarLines);
        if (!mMade.mMarks.empty()) mMade.mMarks.back().Add(mNextMarks);
        SetCodas();
        for (CPlayMarks& marks : mMade.mMarks) {
            if (marks.mToCoda.mIsSet) marks.mCoda = {};
        }
        TellLostWords(mWords, mMade.mMarks, mList);
        return std::move(mMade);
    }

private:
    /// Where the sign of a coda stands.
    struct CCodaSign {
        /// A bar, and whether the sign stands in front of its chords.
        std::size_t mBar = 0;
        bool mIsInFront = false;
    };

    void Take(std::size_t i) {
        const CToken& token = mList.mTokens[i];
        switch (token.mKind) {
            case TTokenKind::Chord:
            case TTokenKind::Hold:
            case TTokenKind::RepeatBars:
                ++mStepCount;
                mLastStep = i;
                return;
            case TTokenKind::Bar:
                Close(i, true);
                if (token.mEndsRepeat && !mMade.mMarks.empty()) {
                    mMade.mMarks.back().mRepeatBackward = true;
                }
                mNextMarks.mRepeatForward |= token.mStartsRepeat;
                return;
            case TTokenKind::Ending:
                Close(i, true);
                AddEndings(token.mEndings);
                return;
            case TTokenKind::Time:
                mNext.mTime = token.mTime;
                return;
            case TTokenKind::CodaSign:
                BeginPassage(i);
                mCodaSigns.push_back({mMade.mBars.size(), mStepCount == 0});
                return;
            case TTokenKind::PlayWords:
                return TakePlayWords(i, token.mText);
            case TTokenKind::Section:
                if (LengthOfPlayWords(token.mText) == token.mText.size()) {
                    TakePlayWords(i, token.mText);
                }
                return;
            case TTokenKind::Key:
                return;
        }
    }

    void AddEndings(std::uint64_t endings) {
        mNextMarks.mEndingStarts = true;
        for (std::int32_t n = 1; n < 64; ++n) {
            if ((endings >> n & 1) != 0) mNextMarks.mEndingNumbers.push_back(n);
        }
    }

    /// Segno and coda begin at their bar. All other words stand at the end of what is played before
    /// them; in charts they stand in front of it.
    void TakePlayWords(std::size_t i, std::string_view words) {
        BeginPassage(i);
        CPlayMarks marks;
        ReadPlayWordsOfText(words, marks);
        const bool isPlace = marks.mSegno.mIsSet || marks.mCoda.mIsSet;
        const bool isForNext =
            isPlace || mStepCount > 0 || mList.mWordsStandInFront || mMade.mMarks.empty();
        (isForNext ? mNextMarks : mMade.mMarks.back()).Add(marks);
        mWords.push_back({words, mMade.mMarks.size() - (isForNext ? 0 : 1)});
    }

    /// Without bar lines, marks stand between passages.
    void BeginPassage(std::size_t i) {
        if (!mHasBarLines) Close(i, false);
    }

    void Close(std::size_t end, bool isClosed) {
        if (mStepCount == 0) return;
        const CToken& last = mList.mTokens[mLastStep];
        if (mStepCount == 1 && last.mKind == TTokenKind::RepeatBars) {
            Repeat(last, end);
        } else {
            Append(end, isClosed);
        }
        const CSongTime time = mNext.mTime;
        mNext = {};
        mNext.mBegin = end;
        mNext.mTime = time;
        mNextMarks = {};
        mStepCount = 0;
    }

    void Append(std::size_t end, bool isClosed) {
        mNext.mEnd = end;
        mNext.mIsClosed = isClosed;
        mMade.mBars.push_back(mNext);
        mMade.mMarks.push_back(mNextMarks);
    }

    /// The last bar, or the last two, once more.
    void Repeat(const CToken& token, std::size_t end) {
        const auto count = static_cast<std::size_t>(token.mCount);
        if (mMade.mBars.size() < count) {
            mList.AddFault(token.mText, count == 1 ? "there is no bar before this one to repeat"
                                                   : "there are no two bars before to repeat");
            return Append(end, true);
        }
        const std::size_t first = mMade.mBars.size() - count;
        for (std::size_t i = first; i < first + count; ++i) {
            CWrittenBar copy = mMade.mBars[i];
            copy.mIsClosed = copy.mIsCopy = true;
            mMade.mBars.push_back(copy);
            mMade.mMarks.push_back(i == first ? mNextMarks : CPlayMarks());
        }
    }

    /// Signs come in pairs: the first stands where the coda is left to, the second where it begins.
    /// Where words tell the one, the signs are the other.
    void SetCodas() {
        bool hasWords = false;
        for (const CPlayMarks& marks : mMade.mMarks) hasWords = hasWords || marks.mToCoda.mIsSet;
        for (std::size_t i = 0; i < mCodaSigns.size(); ++i) {
            const bool isLeft = !hasWords && i % 2 == 0 && i + 1 < mCodaSigns.size();
            std::size_t bar = mCodaSigns[i].mBar;
            if (isLeft && mCodaSigns[i].mIsInFront && bar > 0) --bar;
            if (bar >= mMade.mMarks.size()) continue;
            (isLeft ? mMade.mMarks[bar].mToCoda : mMade.mMarks[bar].mCoda).Set();
        }
    }

    CTokenList& mList;
    bool mHasBarLines;
    CSheetBars mMade;
    CWrittenBar mNext;
    CPlayMarks mNextMarks;
    std::vector<CCodaSign> mCodaSigns;
    std::vector<CPlacedWords> mWords;
    std::size_t mStepCount = 0;
    std::size_t mLastStep = 0;
};

}  // namespace

CSheetBars MakeSheetBars(CTokenList& list) {
    return CBarMaker(list).Make();
}

}  // namespace brindle::SongText
