// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/internal/CSuffixes.h"

#include <vector>

namespace brindle {

/// A passage that may have partners (see COccurrences), as one of the forms of its group: passages
/// of one length that count as the same though their symbols differ.
struct CPassageForm {
    TPlace mLength = 0;
    /// The same for all forms of a group.
    TPlace mGroup = 0;
    /// Of the suffixes that begin with this form.
    CRanks mRanks;
};

/// All passages of two or more symbols that occur twice without overlap, as far as that is all that
/// the two share; the forms of a group side by side. A few passages without partners are among
/// them.
///
/// `symbols` and `groupSymbols` are of one length; symbols of one group have equal group symbols,
/// and equal symbols are of one group. `suffixes` are those of `symbols`. Takes n log^2 n steps.
[[nodiscard]] std::vector<CPassageForm> RepeatedPassages(const std::vector<TPlace>& symbols,
                                                         const CSuffixes& suffixes,
                                                         const std::vector<TPlace>& groupSymbols);

}  // namespace brindle
