// SPDX-License-Identifier: MIT
// A pair of partners either goes on with different symbols: then its passage is what neighbours in
// the sorted suffixes share, and there are fewer such passages than symbols. Or it is a tandem, a
// passage said twice: of these there are fewer than twice as many as symbols. The tandems of a
// length are found at every so-manieth symbol, since each covers one of them, by looking how far
// the symbols there and one length behind agree to the right and to the left.

#include "brindle/analysis/internal/RepeatedPassages.h"

#include <algorithm>
#include <tuple>

namespace brindle {

namespace {

using TForms = std::vector<CPassageForm>;

constexpr TPlace kShortest = 2;

void AddBranching(const CSuffixes& suffixes, TForms& forms) {
    struct COpen {
        TPlace mLength;
        TPlace mFirst;
    };
    std::vector<COpen> open;
    const TPlace count = suffixes.Count();
    for (TPlace rank = 1; rank <= count; ++rank) {
        const TPlace shared = rank < count ? suffixes.SharedWithPrevious(rank) : 0;
        TPlace first = rank - 1;
        while (!open.empty() && open.back().mLength > shared) {
            first = open.back().mFirst;
            forms.push_back({open.back().mLength, 0, {first, rank}});
            open.pop_back();
        }
        if (shared >= kShortest && (open.empty() || open.back().mLength < shared)) {
            open.push_back({shared, first});
        }
    }
}

class CTandems {
public:
    CTandems(const std::vector<TPlace>& symbols, const CSuffixes& suffixes)
        : mSymbols(symbols), mSuffixes(suffixes), mReversed({symbols.rbegin(), symbols.rend()}) {}

    void AddTo(TForms& forms) const {
        for (TPlace length = kShortest; length <= mSuffixes.Count() / 2; ++length) {
            AddTo(forms, length);
        }
    }

private:
    /// Places where a tandem begins, from the first to the last.
    struct CBegins {
        TPlace mFirst = 1;
        TPlace mLast = 0;

        [[nodiscard]] bool IsEmpty() const { return mFirst > mLast; }
    };

    void AddTo(TForms& forms, TPlace length) const {
        CBegins begins;
        for (TPlace place = 0; place + length < mSuffixes.Count(); place += length) {
            const CBegins more = BeginsOver(place, length);
            if (more.IsEmpty()) continue;
            if (!begins.IsEmpty() && more.mFirst == begins.mLast + 1) {
                begins.mLast = more.mLast;
            } else {
                Add(forms, begins, length);
                begins = more;
            }
        }
        Add(forms, begins, length);
    }

    /// The tandems whose first half covers a place.
    [[nodiscard]] CBegins BeginsOver(TPlace place, TPlace length) const {
        if (mSymbols[place] != mSymbols[place + length]) return {};
        const TPlace equal = mSuffixes.EqualCount(place, place + length);
        const TPlace before = place == 0 ? 0 : EqualCountBefore(place, place + length);
        const TPlace first = place - std::min(before, length - 1);
        const TPlace end = place + std::min(equal, length);
        return end < first + length ? CBegins{} : CBegins{first, end - length};
    }

    [[nodiscard]] TPlace EqualCountBefore(TPlace a, TPlace b) const {
        const TPlace count = mSuffixes.Count();
        return mReversed.EqualCount(count - a, count - b);
    }

    // From one period on the tandems come again.
    void Add(TForms& forms, CBegins begins, TPlace length) const {
        if (begins.IsEmpty()) return;
        const CRanks first = mSuffixes.RanksOfPassage(begins.mFirst, length);
        CRanks ranks = first;
        TPlace place = begins.mFirst;
        do {
            forms.push_back({length, 0, ranks});
            if (++place > begins.mLast) return;
            ranks = mSuffixes.RanksOfPassage(place, length);
        } while (ranks.mFirst != first.mFirst);
    }

    const std::vector<TPlace>& mSymbols;
    const CSuffixes& mSuffixes;
    CSuffixes mReversed;
};

void SetGroups(TForms& forms, const CSuffixes& suffixes, const CSuffixes& groupSuffixes) {
    for (CPassageForm& form : forms) {
        const TPlace place = suffixes.PlaceOf(form.mRanks.mFirst);
        form.mGroup = groupSuffixes.RanksOfPassage(place, form.mLength).mFirst;
    }
}

std::tuple<TPlace, TPlace, TPlace> SortKeyOf(const CPassageForm& form) {
    return {form.mLength, form.mGroup, form.mRanks.mFirst};
}

}  // namespace

std::vector<CPassageForm> RepeatedPassages(const std::vector<TPlace>& symbols,
                                           const CSuffixes& suffixes,
                                           const std::vector<TPlace>& groupSymbols) {
    TForms forms;
    if (symbols.empty()) return forms;
    AddBranching(suffixes, forms);
    CTandems(symbols, suffixes).AddTo(forms);
    if (groupSymbols == symbols) {
        SetGroups(forms, suffixes, suffixes);
    } else {
        SetGroups(forms, suffixes, CSuffixes(groupSymbols));
    }
    std::sort(forms.begin(), forms.end(),
              [](const auto& a, const auto& b) { return SortKeyOf(a) < SortKeyOf(b); });
    forms.erase(
        std::unique(forms.begin(), forms.end(),
                    [](const auto& a, const auto& b) { return SortKeyOf(a) == SortKeyOf(b); }),
        forms.end());
    return forms;
}

}  // namespace brindle
