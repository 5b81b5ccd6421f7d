// SPDX-License-Identifier: MIT
// Repeated passages. All pairs of places with the same chords would be quadratic in the number of
// chords, and much more where a song repeats a lot. So the passages are read off the sorted
// suffixes of the chord list, and the starts of each are found by searches (CPassageStarts). With
// e starts in all this takes e log^2 e steps. A list that repeats a few chords all the time has
// about n log n starts. A list of ever longer beginnings of one text, each followed by a chord of
// its own, has n^1.5, more than any other: every start is part of the result, so no search for them
// can take less.

#include "brindle/analysis/CHarmonicAnalyse.h"
#include "brindle/analysis/CopiedPassages.h"
#include "brindle/analysis/internal/CCopyFinder.h"
#include "brindle/analysis/internal/CPassageStarts.h"
#include "brindle/analysis/internal/RepeatedPassages.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstring>
#include <utility>

namespace brindle {

namespace {

/// The fields of a chord as numbers that are equal when the fields are.
using TFields = std::array<std::uint64_t, 8>;

std::uint64_t BitsOf(double length) {
    const double number = length + 0.0;  // -0.0 equals 0.0
    std::uint64_t bits = 0;
    static_assert(sizeof bits == sizeof number);
    std::memcpy(&bits, &number, sizeof bits);
    return bits;
}

std::uint64_t BitsOf(std::int32_t number) {
    return static_cast<std::uint64_t>(std::int64_t{number});
}

/// What is compared to find passages.
TFields AllFields(const CHarmAnlsChordWithLength& chord) {
    return {BitsOf(chord.mLength),
            chord.mSemitones.Mask(),
            BitsOf(chord.mRootKeyEnh.mKeyNr),
            BitsOf(static_cast<std::int32_t>(chord.mRootKeyEnh.mEnh)),
            BitsOf(chord.mBassKeyEnh.mKeyNr),
            BitsOf(static_cast<std::int32_t>(chord.mBassKeyEnh.mEnh)),
            BitsOf(chord.mRootDistToHarmCenter),
            BitsOf(chord.mBassDistToHarmCenter)};
}

/// What is compared to put passages together.
TFields GroupFields(const CHarmAnlsChordWithLength& chord) {
    // Kept: C/E F and C/G F are one sequence, with the starts of both.
    return {BitsOf(chord.mLength), chord.mSemitones.Mask(), BitsOf(chord.mRootKeyEnh.mKeyNr),
            BitsOf(chord.mRootDistToHarmCenter), BitsOf(chord.mBassDistToHarmCenter)};
}

/// Numbers from 0 that are equal for equal chords.
template <class TFieldsOf>
std::vector<TPlace> Numbered(const CHarmAnlsChordsWithLength& chords, TFieldsOf fieldsOf) {
    std::vector<TFields> fields;
    fields.reserve(chords.size());
    for (const CHarmAnlsChordWithLength& chord : chords) fields.push_back(fieldsOf(chord));
    std::vector<TFields> sorted = fields;
    std::sort(sorted.begin(), sorted.end());
    std::vector<TPlace> numbers;
    numbers.reserve(fields.size());
    for (const TFields& field : fields) {
        const auto found = std::lower_bound(sorted.begin(), sorted.end(), field);
        numbers.push_back(static_cast<TPlace>(found - sorted.begin()));
    }
    return numbers;
}

/// A length that is not a number equals nothing, not even itself.
void SeparateNotNumbers(const CHarmAnlsChordsWithLength& chords, std::vector<TPlace>& numbers) {
    std::vector<TPlace> used(chords.size(), 0);
    for (std::size_t place = 0; place < chords.size(); ++place) {
        if (std::isnan(chords[place].mLength)) numbers[place] += used[numbers[place]]++;
    }
}

void Append(const std::vector<CCopiedPassage>& passages, CHarmCopies& copies) {
    for (const CCopiedPassage& passage : passages) copies.push_back(passage.mCopy);
}

}  // namespace

std::vector<CCopiedPassage> FindCopiedPassages(const CHarmonicAnalyse& analyse) {
    CHarmAnlsChordsWithLength chords;
    analyse.ListAllHarmChordsWithLength(chords);
    THarmRepeatingSequences sequences;
    analyse.GenerateVectorWithRepeatingSequenceIndices(sequences, chords);
    std::vector<CCopiedPassage> passages;
    CCopyFinder(chords, sequences, 0).AppendCopies(0, passages);
    std::stable_sort(passages.begin(), passages.end(),
                     [](const CCopiedPassage& a, const CCopiedPassage& b) {
                         return a.mCopy.mTargetPos < b.mCopy.mTargetPos;
                     });
    return passages;
}

void CHarmonicAnalyse::FindHarmCopies(CHarmCopies& copies) const {
    copies.clear();
    Append(FindCopiedPassages(*this), copies);
}

void CHarmonicAnalyse::ListAllHarmChordsWithLength(CHarmAnlsChordsWithLength& chords) const {
    chords.clear();
    chords.reserve(mChords.size());
    double position = 0.0;
    for (const CHarmAnlsChordWithPos& chord : mChords) {
        if (!chords.empty()) chords.back().mLength = chord.mPosition - position;
        chords.emplace_back(static_cast<const CChordLite&>(chord));
        position = chord.mPosition;
    }
}

void CHarmonicAnalyse::GenerateVectorWithRepeatingSequenceIndices(
    THarmRepeatingSequences& sequences, CHarmAnlsChordsWithLength chords) const {
    std::vector<TPlace> symbols = Numbered(chords, AllFields);
    SeparateNotNumbers(chords, symbols);
    const CSuffixes suffixes(symbols);
    const auto forms = RepeatedPassages(symbols, suffixes, Numbered(chords, GroupFields));
    CPassageStarts starts(suffixes);
    sequences.clear();
    for (std::size_t first = 0; first < forms.size();) {
        std::size_t end = first;
        while (end < forms.size() && forms[end].mLength == forms[first].mLength &&
               forms[end].mGroup == forms[first].mGroup) {
            ++end;
        }
        auto found = starts.StartsOf(std::span(forms).subspan(first, end - first));
        if (!found.empty()) sequences.emplace_back(std::move(found), forms[first].mLength);
        first = end;
    }
    std::stable_sort(sequences.begin(), sequences.end());
}

void CHarmonicAnalyse::FindRecurringChordIndices(std::vector<std::uint64_t>& indices,
                                                 CHarmAnlsChordsWithLength chords,
                                                 std::uint64_t start) const {
    indices.clear();
    if (start >= chords.size()) return;
    for (std::uint64_t index = start + 1; index + 1 < chords.size(); ++index) {
        if (chords[index] == chords[start]) indices.push_back(index);
    }
}

void CHarmonicAnalyse::InsertRangeStartIfNoCollision(std::vector<std::uint64_t>& indices,
                                                     std::uint64_t start,
                                                     std::uint64_t length) const {
    for (const std::uint64_t index : indices) {
        if (index == start || (index < start && start - index < length)) return;
    }
    indices.push_back(start);
}

void CHarmonicAnalyse::RecursiveFillWithSequences(const CHarmAnlsChordsWithLength& chords,
                                                  const THarmRepeatingSequences& sequences,
                                                  std::uint64_t start, std::int32_t position,
                                                  CHarmCopies& copies) const {
    std::vector<CCopiedPassage> passages;
    CCopyFinder(chords, sequences, start).AppendCopies(position, passages);
    Append(passages, copies);
}

}  // namespace brindle
