// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsProgressions.h"

#include <span>
#include <utility>

namespace brindle {

namespace {

/// A chord of a row: its quality, and its root in semitones above the tonic.
struct CElement {
    const CSemitonesMatch* mQuality;
    int mRootDist;
};

struct CRow {
    std::vector<CElement> mElements;
    int mPriority;
    TSignKeyType mSignKeyType;
};

CHarmAnlsProgressions TableOf(std::span<const CRow> rows) {
    CHarmAnlsProgressions table;
    table.reserve(rows.size());
    for (const CRow& row : rows) {
        std::vector<CHarmAnlsProgressionEl> elements;
        elements.reserve(row.mElements.size());
        for (const CElement& element : row.mElements) {
            elements.push_back({element.mRootDist, element.mRootDist, *element.mQuality});
        }
        table.emplace_back(std::move(elements), row.mPriority, row.mSignKeyType);
    }
    return table;
}

constexpr const CSemitonesMatch* Major = &ChordPattern::Major;
constexpr const CSemitonesMatch* Minor = &ChordPattern::Minor;
constexpr const CSemitonesMatch* Diminished = &ChordPattern::Diminished;
constexpr const CSemitonesMatch* HalfDiminished = &ChordPattern::HalfDiminished;
constexpr const CSemitonesMatch* Dominant7 = &ChordPattern::Dominant7;

constexpr TSignKeyType kMajor = TSignKeyType_Major;
constexpr TSignKeyType kMinor = TSignKeyType_Minor;

// Rows that are equal in length and priority are tried in the order of the table.
// clang-format off

CHarmAnlsProgressions MakeTonicProgressions() {
    // elements: quality and distance from the tonic                            priority  mode
    const CRow rows[] = {
        {{{Dominant7, 7}, {Major, 0}},                                               9, kMajor},
        {{{Major, 7}, {Major, 0}},                                                   8, kMajor},
        {{{Major, 0}, {Major, 5}},                                                   8, kMajor},  // ends on the subdominant
        {{{Diminished, 11}, {Major, 0}},                                             8, kMajor},
        {{{Dominant7, 1}, {Major, 0}},                                               8, kMajor},  // the tritone substitute of the dominant
        {{{Minor, 2}, {Major, 7}, {Major, 0}},                                       8, kMajor},
        {{{Minor, 5}, {Major, 7}, {Major, 0}},                                       6, kMajor},
        {{{Major, 9}, {Minor, 2}, {Major, 7}, {Major, 0}},                           8, kMajor},  // a secondary dominant first, that of the second degree
        {{{Major, 5}, {Minor, 5}, {Major, 0}},                                       4, kMajor},  // the minor subdominant is borrowed from the parallel key
        {{{Major, 5}, {HalfDiminished, 2}, {Major, 0}},                             10, kMajor},
        {{{Major, 5}, {Major, 7}, {Minor, 9}},                                       4, kMajor},  // deceptive: the tonic does not sound
        {{{Major, 0}, {Major, 5}, {HalfDiminished, 2}, {Major, 0}},                  4, kMajor},
        {{{Minor, 2}, {Major, 7}, {Minor, 0}},                                       8, kMinor},
        {{{Diminished, 2}, {Major, 7}, {Minor, 0}},                                  8, kMinor},
        {{{Major, 7}, {Minor, 0}},                                                   4, kMinor},
    };
    return TableOf(rows);
}

CHarmAnlsProgressions MakeCadenceProgressions() {
    // elements: quality and distance from the tonic                            priority  mode
    const CRow rows[] = {
        {{{Minor, 9}, {Minor, 2}, {Major, 7}, {Major, 0}},                           8, kMajor},
        {{{Minor, 2}, {Major, 7}, {Major, 0}},                                       8, kMajor},
        {{{Major, 7}, {Major, 0}},                                                   4, kMajor},
        {{{Major, 7}, {Minor, 9}},                                                   4, kMajor},
        {{{Minor, 2}, {Major, 7}},                                                   2, kMajor},
        {{{Minor, 2}, {Major, 7}, {Minor, 0}},                                       8, kMinor},
        {{{Diminished, 2}, {Major, 7}, {Minor, 0}},                                  8, kMinor},
        {{{Major, 7}, {Minor, 0}},                                                   4, kMinor},
    };
    return TableOf(rows);
}

// clang-format on

}  // namespace

const CHarmAnlsProgressions& CHarmAnlsProgressions::TonicProgressions() {
    static const CHarmAnlsProgressions table = MakeTonicProgressions();
    return table;
}

const CHarmAnlsProgressions& CHarmAnlsProgressions::CadenceProgressions() {
    static const CHarmAnlsProgressions table = MakeCadenceProgressions();
    return table;
}

}  // namespace brindle
