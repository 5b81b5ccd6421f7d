// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/TEnh.h"

#include <iosfwd>
#include <nlohmann/json_fwd.hpp>

namespace brindle {

/// Key number of no key. Real key numbers are 0 (C) to 11 (B).
inline constexpr int kKeyNrUndef = 15;

/// A key together with its spelling: C sharp and D flat are one key, two CKeyEnh.
///
/// The fields are not checked against each other.
struct CKeyEnh {
    int mKeyNr = kKeyNrUndef;
    TEnh mEnh = TEnh_Undef;

    [[nodiscard]] constexpr bool IsUndef() const { return mKeyNr == kKeyNrUndef; }

    /// Writes `{"KeyNr":" 7","Enh":"neutral"}`, the number two places wide.
    void AppendJSONString(std::ostream& stream) const;

    struct JSONDeserializer_Helper {
        static constexpr const char* CKeyEnhJSONKey_CKeyEnh = "CKeyEnh";
        static constexpr const char* CKeyEnhJSONKey_KeyNr = "KeyNr";
        static constexpr const char* CKeyEnhJSONKey_Enh = "Enh";

        /// Reads what AppendJSONString wrote; a missing field is undefined.
        static CKeyEnh CKeyEnhFromJSONDictionary(const nlohmann::json& dictionary);
    };

    friend constexpr bool operator==(const CKeyEnh&, const CKeyEnh&) = default;
    /// By key number; at equal key number the larger spelling value comes first.
    friend constexpr bool operator<(const CKeyEnh& a, const CKeyEnh& b) {
        return a.mKeyNr != b.mKeyNr ? a.mKeyNr < b.mKeyNr : a.mEnh > b.mEnh;
    }
};

std::ostream& operator<<(std::ostream& stream, const CKeyEnh& keyEnh);

inline constexpr CKeyEnh CKeyEnh_Undef{};

}  // namespace brindle
