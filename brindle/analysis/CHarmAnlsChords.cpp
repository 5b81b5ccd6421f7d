// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsChords.h"

#include "brindle/analysis/internal/NativeText.h"

#include <algorithm>
#include <cmath>

namespace brindle {

namespace {

/// An order even if a position is not a number (a bar of no length makes such positions).
bool StartsBefore(const CHarmAnlsChordWithPos& a, const CHarmAnlsChordWithPos& b) {
    if (std::isnan(a.mPosition)) return false;
    return std::isnan(b.mPosition) || a.mPosition < b.mPosition;
}

bool HasRoot(const CHarmAnlsChord& chord) {
    return !chord.IsUndef();
}

}  // namespace

double CHarmAnlsChords::LastChordEndPos() const {
    return empty() ? kPosUndef : back().mPosition + 1.0;
}

CHarmAnlsChords::const_iterator CHarmAnlsChords::LastNonUndefChord() const {
    const auto last = std::find_if(rbegin(), rend(), HasRoot);
    return last == rend() ? end() : std::prev(last.base());
}

CHarmAnlsChordsSet CHarmAnlsChords::CreateSetOfNonUndefChords() const {
    CHarmAnlsChordsSet chords;
    for (const CHarmAnlsChord& chord : *this) {
        if (HasRoot(chord)) chords.insert(chord);
    }
    return chords;
}

std::size_t CHarmAnlsChords::CountDifferentNonUndefChords() const {
    return CreateSetOfNonUndefChords().size();
}

void CHarmAnlsChords::InsertAtCorrectPosition(const_iterator first, const_iterator last) {
    if (first == last) return;
    InsertAtCorrectPosition(std::upper_bound(begin(), end(), *first, StartsBefore), first, last);
}

void CHarmAnlsChords::InsertAtCorrectPosition(const_iterator where, const_iterator first,
                                              const_iterator last) {
    insert(where, first, last);
    SortByPosition();
}

void CHarmAnlsChords::SortByPosition() {
    if (std::is_sorted(begin(), end(), StartsBefore)) return;
    std::stable_sort(begin(), end(), StartsBefore);
}

void CHarmAnlsChords::AppendJSONString(std::ostream& stream) const {
    NativeText::WriteList(stream, *this);
}

}  // namespace brindle
