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
    std::string mSymbol;   ///< as somebody wrote it, made safe to show
    int mFunction = -1;    ///< as CChordHeavy::HarmFuncIn tells it, 0 to 14; -1 for none
    std::string mNumeral;  ///< "IIm"; empty without a function, as the letters
    std::string mLetters;  ///< "Sp": tonic T, dominant D, subdominant S, parallel p
    int mRootDegree = -1;  ///< of the key, from 0; -1 for none
    int mBassDegree = -1;  ///< likewise, of the lowest note
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
