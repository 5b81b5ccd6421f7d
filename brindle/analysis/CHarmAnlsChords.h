// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChord.h"

#include <cstddef>
#include <iosfwd>
#include <set>
#include <string_view>
#include <vector>

namespace brindle {

struct TChordStringParse;

/// Different chords, whatever their function and position.
using CHarmAnlsChordsSet = std::set<CHarmAnlsChord>;

using CHarmAnlsChordsWithLength = std::vector<CHarmAnlsChordWithLength>;

/// A chord sequence, ascending by position. A list that was read from a chord text ends with an
/// undefined chord, the end marker, which tells where the last chord ends.
class CHarmAnlsChords : public std::vector<CHarmAnlsChordWithPos> {
public:
    using std::vector<CHarmAnlsChordWithPos>::vector;
    CHarmAnlsChords() = default;
    /// The chords of a chord text such as "C F | G7 . . . | C".
    CHarmAnlsChords(std::string_view text, const TChordStringParse& parse);

    /// Replaces the content with the chords of a chord text.
    void ParseStringIntoChords(std::string_view text, const TChordStringParse& parse);

    /// The last position plus 1; `kPosUndef` for an empty list.
    [[nodiscard]] double LastChordEndPos() const;
    /// The last element with a root; the end if there is none (which is also the begin of an empty
    /// list).
    [[nodiscard]] const_iterator LastNonUndefChord() const;
    [[nodiscard]] CHarmAnlsChordsSet CreateSetOfNonUndefChords() const;
    /// C at two positions counts once, C and C/E are two, C sharp and D flat are two.
    [[nodiscard]] std::size_t CountDifferentNonUndefChords() const;

    /// Inserts the range behind the elements that do not start after its first chord, and sorts.
    /// The range must not lie inside this list. An empty range does nothing.
    void InsertAtCorrectPosition(const_iterator first, const_iterator last);
    /// Inserts the range at `where`, and sorts.
    void InsertAtCorrectPosition(const_iterator where, const_iterator first, const_iterator last);
    /// Ascending; chords at equal positions keep their order, positions that are not a number go
    /// to the end.
    void SortByPosition();

    void AppendJSONString(std::ostream& stream) const;
};

std::ostream& operator<<(std::ostream& stream, const CHarmAnlsChords& chords);

}  // namespace brindle
