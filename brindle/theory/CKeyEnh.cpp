// SPDX-License-Identifier: MIT
#include "brindle/theory/CKeyEnh.h"

#include <iomanip>
#include <nlohmann/json.hpp>
#include <ostream>

namespace brindle {

void CKeyEnh::AppendJSONString(std::ostream& stream) const {
    stream << R"({"KeyNr":")" << std::setw(2) << mKeyNr << R"(","Enh":")" << mEnh << "\"}";
}

CKeyEnh CKeyEnh::JSONDeserializer_Helper::CKeyEnhFromJSONDictionary(
    const nlohmann::json& dictionary) {
    CKeyEnh keyEnh;
    if (const auto it = dictionary.find(CKeyEnhJSONKey_KeyNr); it != dictionary.end()) {
        keyEnh.mKeyNr =
            it->is_string() ? std::atoi(it->get_ref<const std::string&>().c_str()) : it->get<int>();
    }
    if (const auto it = dictionary.find(CKeyEnhJSONKey_Enh); it != dictionary.end()) {
        keyEnh.mEnh = EnhFromStdString(it->get_ref<const std::string&>());
    }
    return keyEnh;
}

std::ostream& operator<<(std::ostream& stream, const CKeyEnh& keyEnh) {
    return stream << keyEnh.mKeyNr << ' ' << keyEnh.mEnh;
}

}  // namespace brindle
