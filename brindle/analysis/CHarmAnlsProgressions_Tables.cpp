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

constexpr const CSemitonesMatch* kMajor = &ChordPattern::Major;
constexpr const CSemitonesMatch* kMinor = &ChordPattern::Minor;
constexpr const CSemitonesMatch* kDiminished = &ChordPattern::Diminished;
constexpr const CSemitonesMatch* kHalfDiminished = &ChordPattern::HalfDiminished;
constexpr const CSemitonesMatch* kDominant7 = &ChordPattern::Dominant7;

constexpr TSignKeyType kMajorKey = TSignKeyType_Major;
constexpr TSignKeyType kMinorKey = TSignKeyType_Minor;

// Rows that are equal in length and priority are tried in the order of the table.
// clang-format off

CHarmAnlsProgressions MakeTonicProgressions() {
    // elements: quality and distance from the tonic                    priority  mode
    const CRow rows[] = {
        {{{kDominant7, 7}, {kMajor, 0}},                                  9, kMajorKey},
        {{{kMajor, 7}, {kMajor, 0}},                                      8, kMajorKey},
        {{{kMajor, 0}, {kMajor, 5}},                                      8, kMajorKey},  // ends on the subdominant
        {{{kDiminished, 11}, {kMajor, 0}},                                8, kMajorKey},
        {{{kDominant7, 1}, {kMajor, 0}},                                  8, kMajorKey},  // the tritone substitute of the dominant
        {{{kMinor, 2}, {kMajor, 7}, {kMajor, 0}},                         8, kMajorKey},
        {{{kMinor, 5}, {kMajor, 7}, {kMajor, 0}},                         6, kMajorKey},
        {{{kMajor, 9}, {kMinor, 2}, {kMajor, 7}, {kMajor, 0}},            8, kMajorKey},  // a secondary dominant first, that of the second degree
        {{{kMajor, 5}, {kMinor, 5}, {kMajor, 0}},                         4, kMajorKey},  // the minor subdominant is borrowed from the parallel key
        {{{kMajor, 5}, {kHalfDiminished, 2}, {kMajor, 0}},               10, kMajorKey},
        {{{kMajor, 5}, {kMajor, 7}, {kMinor, 9}},                         4, kMajorKey},  // deceptive: the tonic does not sound
        {{{kMajor, 0}, {kMajor, 5}, {kHalfDiminished, 2}, {kMajor, 0}},   4, kMajorKey},
        {{{kMinor, 2}, {kMajor, 7}, {kMinor, 0}},                         8, kMinorKey},
        {{{kDiminished, 2}, {kMajor, 7}, {kMinor, 0}},                    8, kMinorKey},
        {{{kMajor, 7}, {kMinor, 0}},                                      4, kMinorKey},
    };
    return TableOf(rows);
}

CHarmAnlsProgressions MakeCadenceProgressions() {
    // elements: quality and distance from the tonic                    priority  mode
    const CRow rows[] = {
        {{{kMinor, 9}, {kMinor, 2}, {kMajor, 7}, {kMajor, 0}},            8, kMajorKey},
        {{{kMinor, 2}, {kMajor, 7}, {kMajor, 0}},                         8, kMajorKey},
        {{{kMajor, 7}, {kMajor, 0}},                                      4, kMajorKey},
        {{{kMajor, 7}, {kMinor, 9}},                                      4, kMajorKey},
        {{{kMinor, 2}, {kMajor, 7}},                                      2, kMajorKey},
        {{{kMinor, 2}, {kMajor, 7}, {kMinor, 0}},                         8, kMinorKey},
        {{{kDiminished, 2}, {kMajor, 7}, {kMinor, 0}},                    8, kMinorKey},
        {{{kMajor, 7}, {kMinor, 0}},                                      4, kMinorKey},
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
