// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CPaint.h"
#include "brindle/theory/CSignKeyLite.h"

#include <string>
#include <vector>

namespace brindle {

class CChordLite;
class CSignKeyHeavy;

/// The function of a chord in a key, as it is shown.
struct CChordFunction {
    std::string mSymbol;
    int mFunction = -1;    // none
    std::string mNumeral;  // empty without a function, as the letters
    std::string mLetters;
    int mRootDegree = -1;
    int mBassDegree = -1;
};

/// `symbol` is the chord as somebody wrote it.
[[nodiscard]] CChordFunction FunctionOf(const std::string& symbol, const CChordLite& chord,
                                        const CSignKeyHeavy& key);

/// A table, in which degrees are counted from 1.
[[nodiscard]] std::string FunctionsText(const std::vector<CChordFunction>& functions,
                                        const CPaint& paint);
/// JSON, in which degrees are counted from 0, see docs/json.md.
[[nodiscard]] std::string FunctionsJson(const CSignKeyLite& key,
                                        const std::vector<CChordFunction>& functions);

}  // namespace brindle
