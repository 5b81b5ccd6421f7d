// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsSignKey.h"

#include <iosfwd>
#include <vector>

namespace brindle {

/// The sign keys of a piece, ascending by position.
class CHarmAnlsSignKeys : public std::vector<CHarmAnlsSignKey> {
public:
    using std::vector<CHarmAnlsSignKey>::vector;

    /// Joins neighbours of the same key, spelling and type.
    void MergeAdjacentSameSignKeys();
    /// Appends the centers of `second` to `first` and erases `second`. Returns the iterator behind.
    iterator _MergeSignKeysAndEraseSecond(iterator first, iterator second);
    /// Joins equal neighbours among the centers of each sign key.
    void MergeAdjacentSameHarmCenters();

    /// Writes a list of the sign keys. No strict JSON: each list ends with a comma.
    void AppendJSONString(std::ostream& stream) const;
};

/// Writes the JSON text, for debugging.
std::ostream& operator<<(std::ostream& stream, const CHarmAnlsSignKeys& signKeys);

}  // namespace brindle
