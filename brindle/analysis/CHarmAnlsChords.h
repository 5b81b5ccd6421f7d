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

/// Chords by length: where one ends the next begins.
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

    /// The last position plus 1, in beats; `kPosUndef` for an empty list. The end marker counts as
    /// a chord.
    [[nodiscard]] double LastChordEndPos() const;
    /// The last element with a root; the end if there is none (which is also the begin of an empty
    /// list).
    [[nodiscard]] const_iterator LastNonUndefChord() const;
    /// Each chord with a root once, without its position.
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

    /// Writes a list of the chords. No strict JSON: it ends with a comma.
    void AppendJSONString(std::ostream& stream) const;
};

/// Writes the JSON text, for debugging.
std::ostream& operator<<(std::ostream& stream, const CHarmAnlsChords& chords);

}  // namespace brindle
