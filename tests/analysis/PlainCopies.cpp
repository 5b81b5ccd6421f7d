// SPDX-License-Identifier: MIT
#include "tests/analysis/PlainCopies.h"

#include <algorithm>
#include <cmath>
#include <map>
#include <tuple>

namespace brindle::test {

namespace {

using TIndices = std::vector<std::uint64_t>;

bool LessByFunctionLengthAndRoot(const CHarmAnlsChordWithLength& a,
                                 const CHarmAnlsChordWithLength& b) {
    const auto key = [](const CHarmAnlsChordWithLength& chord) {
        return std::make_tuple(chord.mRootDistToHarmCenter, chord.mLength,
                               chord.mBassDistToHarmCenter, chord.mSemitones.Mask(),
                               chord.mRootKeyEnh.mKeyNr);
    };
    return key(a) < key(b);
}

struct CLessByChords {
    bool operator()(const CHarmAnlsChordsWithLength& a, const CHarmAnlsChordsWithLength& b) const {
        return std::lexicographical_compare(a.begin(), a.end(), b.begin(), b.end(),
                                            LessByFunctionLengthAndRoot);
    }
};

TIndices RecurringIndices(const CHarmAnlsChordsWithLength& chords, std::size_t start) {
    TIndices indices;
    for (std::size_t i = start + 1; i + 1 < chords.size(); ++i) {
        if (chords[i] == chords[start]) indices.push_back(i);
    }
    return indices;
}

CHarmAnlsChordsWithLength Grown(const CHarmAnlsChordsWithLength& chords, std::size_t s,
                                std::size_t j) {
    CHarmAnlsChordsWithLength sequence;
    for (std::size_t k = 0; s + k < j && j + k < chords.size(); ++k) {
        if (!(chords[s + k] == chords[j + k])) break;
        sequence.push_back(chords[s + k]);
    }
    return sequence;
}

void InsertIfNoCollision(TIndices& indices, std::uint64_t start, std::uint64_t length) {
    for (const std::uint64_t e : indices) {
        if (e == start || (e < start && e + length > start)) return;
    }
    indices.push_back(start);
}

std::int32_t CutSum(const CHarmAnlsChordsWithLength& chords, std::size_t count) {
    std::int32_t sum = 0;
    for (std::size_t i = 0; i < count; ++i) {
        sum = static_cast<std::int32_t>(sum + chords[i].mLength);
    }
    return sum;
}

double Sum(const CHarmAnlsChordsWithLength& chords, std::size_t first, std::size_t last) {
    double sum = 0.0;
    for (std::size_t i = first; i < last; ++i) sum += chords[i].mLength;
    return sum;
}

void Fill(const CHarmAnlsChordsWithLength& chords, const TPlainSequences& sequences,
          std::size_t start, std::int32_t position, CHarmCopies& copies) {
    std::vector<bool> bits(chords.size(), false);
    for (const auto& [allStarts, n] : sequences) {
        if (2 * n > chords.size()) continue;
        TIndices starts;
        for (const std::uint64_t s : allStarts) {
            bool isFree = s >= start && s + n <= start + chords.size();
            for (std::size_t k = 0; isFree && k < n; ++k) isFree = !bits[s - start + k];
            if (isFree) starts.push_back(s - start);
        }
        if (starts.size() < 2) continue;
        for (const std::uint64_t s : starts) {
            const std::int32_t at = position + CutSum(chords, s);
            if (s == starts.front()) {
                const auto first = chords.begin() + static_cast<std::ptrdiff_t>(s);
                Fill({first, first + static_cast<std::ptrdiff_t>(n)}, sequences, start + s, at,
                     copies);
            } else {
                copies.push_back(
                    {static_cast<double>(at),
                     static_cast<std::int32_t>(-Sum(chords, starts.front(), s) / 4.0),
                     static_cast<std::uint64_t>(std::floor(Sum(chords, s, s + n) / 4.0)), 0});
            }
            std::fill_n(bits.begin() + static_cast<std::ptrdiff_t>(s), n, true);
        }
    }
}

}  // namespace

CHarmAnlsChordsWithLength PlainChordsWithLength(const CHarmAnlsChords& chords) {
    CHarmAnlsChordsWithLength list;
    for (std::size_t i = 0; i < chords.size(); ++i) {
        if (i > 0) list.back().mLength = chords[i].mPosition - chords[i - 1].mPosition;
        list.emplace_back(static_cast<const CChordLite&>(chords[i]), kPosUndef);
    }
    return list;
}

TPlainSequences PlainSequences(const CHarmAnlsChordsWithLength& chords) {
    std::map<CHarmAnlsChordsWithLength, TIndices, CLessByChords> map;
    for (std::size_t s = 0; s < chords.size(); ++s) {
        for (const std::uint64_t j : RecurringIndices(chords, s)) {
            const CHarmAnlsChordsWithLength sequence = Grown(chords, s, j);
            if (sequence.size() < 2) continue;
            TIndices& starts = map[sequence];
            InsertIfNoCollision(starts, j, sequence.size());
            InsertIfNoCollision(starts, s, sequence.size());
        }
    }
    TPlainSequences sequences;
    for (auto& [sequence, starts] : map) {
        std::sort(starts.begin(), starts.end());
        sequences.emplace_back(starts, sequence.size());
    }
    std::sort(sequences.begin(), sequences.end());
    return sequences;
}

CHarmCopies PlainCopies(const CHarmAnlsChords& chords) {
    CHarmCopies copies;
    const CHarmAnlsChordsWithLength list = PlainChordsWithLength(chords);
    Fill(list, PlainSequences(list), 0, 0, copies);
    std::stable_sort(copies.begin(), copies.end(), [](const CHarmCopy& a, const CHarmCopy& b) {
        return a.mTargetPos < b.mTargetPos;
    });
    return copies;
}

}  // namespace brindle::test
