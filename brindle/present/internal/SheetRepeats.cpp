// SPDX-License-Identifier: MIT
#include "brindle/present/internal/SheetRepeats.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <unordered_map>
#include <utility>

namespace brindle::LeadSheet {
namespace {

// Where no repeat sign is known, a longer ending is no ending to the eye.
constexpr std::size_t kLongestEnding = 8;

/// A repeat in bars: from `mAgain` on, `mCount` bars are those from `mSource` on.
struct CRepeat {
    std::size_t mSource = 0;
    std::size_t mAgain = 0;
    std::size_t mCount = 0;
};

/// A passage that is played several times in a row.
struct CPassage {
    std::size_t mBegin = 0;
    /// Where each time begins behind the first, ascending.
    std::vector<std::size_t> mAgain;
    /// So many bars are common to all times, and the first time has so many.
    std::size_t mCommon = 0;
    std::size_t mLength = 0;
    /// Of each time behind the first, whether it is the same to its end.
    std::vector<bool> mIsWhole;
    /// Behind the last bar that belongs to it.
    std::size_t mEnd = 0;

    [[nodiscard]] bool HasEndings() const { return mCommon < mLength; }
};

class CFolding {
public:
    CFolding(const CSong& song, CSheet& sheet)
        : mSong(song),
          mSheet(sheet),
          mBars(sheet.mBars),
          mIsHidden(sheet.mBars.size(), false),
          mIsSource(sheet.mBars.size(), false) {}

    void Fold() {
        mJumps = BarsThatJump();
        FoldJumps();
        const std::vector<CRepeat> repeats = Repeats();
        for (std::size_t i = 0; i < repeats.size();) {
            std::size_t next = i + 1;
            if (!mIsHidden[repeats[i].mAgain]) next = FoldFrom(repeats, i);
            i = next;
        }
        TakeOutHidden();
        RemarkReplays();
    }

private:
    void TakeOutHidden() {
        std::size_t kept = 0;
        for (std::size_t i = 0; i < mBars.size(); ++i) {
            if (mIsHidden[i]) continue;
            if (kept != i) mBars[kept] = std::move(mBars[i]);
            ++kept;
        }
        mBars.resize(kept);
    }

    // What a written jump plays again stands there already.
    void FoldJumps() {
        std::unordered_map<std::size_t, std::size_t> first;
        bool isReplay = false;
        for (std::size_t i = 0; i < mBars.size(); ++i) {
            const std::size_t written = mBars[i].mWritten;
            if (written == CSongBar::kNotWritten) return;
            const auto [drawn, isNew] = first.try_emplace(written, i);
            isReplay = isReplay && !isNew && AreSame(drawn->second, i);
            if (isReplay) HideBar(i, drawn->second);
            isReplay = isReplay || IsJump(i);
        }
    }

    // By its place in the written song, the last time that each bar with words for a jump leads
    // back. Earlier ones take a repeat that ends there.
    [[nodiscard]] std::unordered_map<std::size_t, std::size_t> BarsThatJump() const {
        std::unordered_map<std::size_t, std::size_t> jumps;
        for (std::size_t i = 0; i + 1 < mBars.size(); ++i) {
            const bool hasJump = mBars[i].mWords.find("D.") != std::string::npos;
            const bool leadsBack = mBars[i + 1].mWritten <= mBars[i].mWritten;
            if (hasJump && leadsBack) jumps.insert_or_assign(mBars[i].mWritten, i);
        }
        return jumps;
    }

    [[nodiscard]] bool IsJump(std::size_t bar) const {
        const auto jump = mJumps.find(mBars[bar].mWritten);
        return jump != mJumps.end() && jump->second == bar;
    }

    // Wherever drawn bars begin to stand a second time, a remark tells where they stood first.
    void RemarkReplays() {
        std::unordered_map<std::size_t, std::size_t> first;
        for (std::size_t i = 0; i < mBars.size();) {
            std::size_t source = SourceOf(i, first);
            if (source == kNone) {
                ++i;
                continue;
            }
            const std::size_t begin = i;
            const std::size_t from = source;
            while (i < mBars.size() && SourceOf(i, first) == source) {
                ++i;
                ++source;
            }
            if (i - begin > 1 && mBars[begin].mRemark.empty()) Remark(begin, from, i - begin);
        }
    }

    // The bar that is drawn first for the same written one; `kNone` for a bar that is that itself.
    [[nodiscard]] std::size_t SourceOf(std::size_t bar,
                                       std::unordered_map<std::size_t, std::size_t>& first) const {
        const std::size_t written = mBars[bar].mWritten;
        if (written == CSongBar::kNotWritten) return kNone;
        const std::size_t source = first.try_emplace(written, bar).first->second;
        return source == bar ? kNone : source;
    }

    // The bar that begins there, `kNone` if there is none.
    [[nodiscard]] std::size_t BarAt(double position) const {
        const auto bar = std::lower_bound(
            mBars.begin(), mBars.end(), position - kTolerance,
            [](const CSheetBar& one, double begin) { return one.mPosition < begin; });
        const bool isThere = bar != mBars.end() && bar->mPosition <= position + kTolerance;
        return isThere ? static_cast<std::size_t>(bar - mBars.begin()) : kNone;
    }

    // In the order of playing. No two of them reach over each other.
    [[nodiscard]] std::vector<CRepeat> Repeats() {
        std::vector<CRepeat> repeats;
        for (const CSongRepeat& told : mSong.mRepeats) {
            const CRepeat repeat{BarAt(told.mSourcePosition), BarAt(told.mPosition),
                                 told.mBarCount};
            if (repeat.mAgain == kNone || repeat.mSource >= repeat.mAgain) continue;
            if (mIsHidden[repeat.mAgain]) continue;
            repeats.push_back(repeat);
            mIsSource[repeat.mSource] = true;
        }
        std::sort(repeats.begin(), repeats.end(), [](const CRepeat& one, const CRepeat& other) {
            return one.mAgain < other.mAgain;
        });
        for (std::size_t i = 0; i < repeats.size(); ++i) {
            const std::size_t end = i + 1 < repeats.size() ? repeats[i + 1].mAgain : mBars.size();
            repeats[i].mCount =
                CountSame(repeats[i], std::min(repeats[i].mCount, end - repeats[i].mAgain));
        }
        return repeats;
    }

    [[nodiscard]] std::size_t CountSame(const CRepeat& repeat, std::size_t most) const {
        std::size_t count = 0;
        while (count < most && AreSame(repeat.mSource + count, repeat.mAgain + count)) ++count;
        return count;
    }

    [[nodiscard]] bool AreSame(std::size_t a, std::size_t b) const {
        const CSheetBar& one = mBars[a];
        const CSheetBar& other = mBars[b];
        if (one.mEnd - one.mBegin != other.mEnd - other.mBegin) return false;
        for (std::size_t i = 0; i < one.mEnd - one.mBegin; ++i) {
            const std::size_t chord = one.mBegin + i;
            const std::size_t again = other.mBegin + i;
            const double offset = mSheet.mPositions[chord] - one.mPosition;
            const double offsetAgain = mSheet.mPositions[again] - other.mPosition;
            if (std::fabs(offset - offsetAgain) > kTolerance || !AreSameChord(chord, again)) {
                return false;
            }
        }
        return true;
    }

    [[nodiscard]] bool AreSameChord(std::size_t a, std::size_t b) const {
        const auto& symbols = mSong.mSymbols;
        if (std::max(a, b) < symbols.size()) return symbols[a] == symbols[b];
        return static_cast<const CChordLite&>(mSong.mChords[a]) == mSong.mChords[b];
    }

    // Folds the passage whose second time is the repeat `first`, or tells in a remark what it is.
    // The repeat behind what was folded.
    std::size_t FoldFrom(const std::vector<CRepeat>& repeats, std::size_t first) {
        CPassage passage;
        passage.mBegin = repeats[first].mSource;
        passage.mLength = repeats[first].mAgain - passage.mBegin;
        passage.mCommon = passage.mLength;
        std::size_t next = first;
        while (next < repeats.size() && Takes(passage, repeats, next)) {
            const CRepeat& repeat = repeats[next];
            passage.mAgain.push_back(repeat.mAgain);
            passage.mIsWhole.push_back(repeat.mCount >= passage.mLength);
            passage.mCommon = std::min(passage.mCommon, repeat.mCount);
            ++next;
        }
        if (passage.mAgain.empty() || !IsFree(passage)) {
            const CRepeat& repeat = repeats[first];
            if (repeat.mCount > 1) Remark(repeat.mAgain, repeat.mSource, repeat.mCount);
            return first + 1;
        }
        FindEnd(passage);
        Hide(passage);
        WriteSigns(passage);
        return next;
    }

    // Whether a repeat is one more time of the passage.
    [[nodiscard]] bool Takes(const CPassage& passage, const std::vector<CRepeat>& repeats,
                             std::size_t index) const {
        const CRepeat& repeat = repeats[index];
        const bool isFirst = passage.mAgain.empty();
        const std::size_t before = isFirst ? passage.mBegin : passage.mAgain.back();
        if (repeat.mSource != passage.mBegin && repeat.mSource != before) return false;
        if (!isFirst && passage.mIsWhole.back() && repeat.mAgain != before + passage.mLength) {
            return false;
        }
        const std::size_t common = std::min(repeat.mCount, passage.mLength);
        if (common == passage.mLength) return true;
        // All times that end on their own are to leave the passage at the same place.
        const bool isSamePlace = passage.HasEndings() ? common == passage.mCommon : true;
        if (common == 0 || !isSamePlace) return false;
        if (IsWritten(repeat)) return GoesOnBehind(repeat, common);
        const std::size_t ending = passage.mLength - common;
        const bool isShort = repeat.mAgain - before - common <= kLongestEnding;
        return isShort && ending <= std::min(common, kLongestEnding);
    }

    // Whether the song tells which bars stand there a second time.
    [[nodiscard]] bool IsWritten(const CRepeat& repeat) const {
        const std::size_t written = mBars[repeat.mAgain].mWritten;
        return written != CSongBar::kNotWritten && written == mBars[repeat.mSource].mWritten;
    }

    // Whether the written song goes back by a repeat sign, and leaves the passage for an ending
    // that is written further on.
    [[nodiscard]] bool GoesOnBehind(const CRepeat& repeat, std::size_t common) const {
        const std::size_t next = repeat.mAgain + common;
        return !IsJump(repeat.mAgain - 1) && next < mBars.size() &&
               mBars[next].mWritten != CSongBar::kNotWritten &&
               mBars[next].mWritten > mBars[next - 1].mWritten;
    }

    // Whether the first time of the passage is drawn and takes no sign twice.
    [[nodiscard]] bool IsFree(const CPassage& passage) const {
        const std::size_t last = passage.mBegin + passage.mLength - 1;
        if (mIsHidden[passage.mBegin] || mIsHidden[last]) return false;
        if (mBars[passage.mBegin].mBeginsRepeat || mBars[last].mEndsRepeat) return false;
        for (std::size_t i = passage.mBegin + passage.mCommon; i <= last; ++i) {
            if (mIsHidden[i] || mBars[i].mIsInEnding || mBars[i].mBeginsRepeat) return false;
        }
        return true;
    }

    // The last ending ends where the song says so, else it is as long as the first; in any case it
    // ends before a section, a repeat or a jump.
    void FindEnd(CPassage& passage) const {
        const std::size_t last = passage.mAgain.back();
        if (passage.mIsWhole.back()) {
            passage.mEnd = last + passage.mLength;
            return;
        }
        const std::size_t begin = last + passage.mCommon;
        std::size_t end = begin;
        bool isTold = false;
        while (end < mBars.size() && !isTold && (end == begin || !BeginsPart(end))) {
            isTold = mBars[end++].mEndsEnding;
        }
        const std::size_t usual = std::max(begin + 1, last + passage.mLength);
        passage.mEnd = isTold ? end : std::min(end, usual);
    }

    [[nodiscard]] bool BeginsPart(std::size_t bar) const {
        return mBars[bar].mBeginsSection || mIsHidden[bar] || mIsSource[bar] ||
               mBars[bar].mSign != TSongSign_None || IsJump(bar - 1);
    }

    void Hide(const CPassage& passage) {
        for (std::size_t time = 0; time < passage.mAgain.size(); ++time) {
            const std::size_t count = passage.mIsWhole[time] ? passage.mLength : passage.mCommon;
            for (std::size_t i = 0; i < count; ++i) {
                HideBar(passage.mAgain[time] + i, passage.mBegin + i);
            }
        }
    }

    void HideBar(std::size_t bar, std::size_t drawn) {
        mIsHidden[bar] = true;
        for (std::size_t i = mBars[bar].mBegin; i < mBars[bar].mEnd; ++i) {
            mSheet.mDrawnAs[i] = mSheet.mDrawnAs[mBars[drawn].mBegin + i - mBars[bar].mBegin];
        }
    }

    void WriteSigns(const CPassage& passage) {
        mBars[passage.mBegin].mBeginsRepeat = true;
        const std::size_t last = passage.mBegin + passage.mLength - 1;
        mBars[last].mEndsRepeat = true;
        if (!passage.HasEndings()) {
            mBars[last].mTimes = passage.mAgain.size() + 1;
            return;
        }
        std::string firstLabel = "1.";
        for (std::size_t time = 0; time < passage.mAgain.size(); ++time) {
            const std::string label = fmt::format("{}.", time + 2);
            if (passage.mIsWhole[time]) {
                firstLabel += " " + label;
                continue;
            }
            const bool isLast = time + 1 == passage.mAgain.size();
            const std::size_t end = isLast ? passage.mEnd : passage.mAgain[time + 1];
            WriteEnding(passage.mAgain[time] + passage.mCommon, end, label, !isLast);
        }
        WriteEnding(passage.mBegin + passage.mCommon, last + 1, firstLabel, true);
    }

    void WriteEnding(std::size_t begin, std::size_t end, std::string label, bool goesBack) {
        if (begin >= end || end > mBars.size()) return;
        mBars[begin].mEnding = std::move(label);
        for (std::size_t i = begin; i < end; ++i) mBars[i].mIsInEnding = true;
        mBars[end - 1].mClosesEnding = goesBack;
        if (goesBack) mBars[end - 1].mEndsRepeat = true;
    }

    void Remark(std::size_t again, std::size_t source, std::size_t count) {
        const std::string& first = mBars[source].mNumber;
        const std::string& last = mBars[source + count - 1].mNumber;
        mBars[again].mRemark = fmt::format("= bars {}\xE2\x80\x93{}", first, last);
    }

    const CSong& mSong;
    CSheet& mSheet;
    std::vector<CSheetBar>& mBars;
    std::vector<bool> mIsHidden;
    /// Whether a repeat plays again what begins with the bar.
    std::vector<bool> mIsSource;
    /// By their places in the written song, the bars behind which a jump leads back.
    std::unordered_map<std::size_t, std::size_t> mJumps;
};

}  // namespace

void FoldRepeats(const CSong& song, CSheet& sheet) {
    CFolding(song, sheet).Fold();
}

}  // namespace brindle::LeadSheet
