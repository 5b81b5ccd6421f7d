// SPDX-License-Identifier: MIT
#include "brindle/theory/CKeyEnh.h"

#include "brindle/platform/DictionaryValues.h"
#include "brindle/platform/PlainText.h"
#include "brindle/theory/MakeSensefulEnh.h"

#include <ostream>

namespace brindle {

bool CKeyEnh::HasSensefulEnh() const {
    return IsSensefulEnhForKeyNr(mKeyNr, mEnh);
}

std::string CKeyEnh::StringForInitializerList() const {
    return "CKeyEnh(" + std::to_string(mKeyNr) + ", " + brindle::StringForInitializerList(mEnh) +
           ")";
}

void CKeyEnh::AppendJSONString(std::ostream& stream) const {
    PlainText::Write(stream, R"({"KeyNr":")");
    PlainText::WriteInteger(stream, mKeyNr, 2);
    stream << R"(","Enh":")" << mEnh << "\"}";
}

CKeyEnh CKeyEnh::JSONDeserializer_Helper::CKeyEnhFromJSONDictionary(
    const nlohmann::json& dictionary) {
    const int keyNr = IntegerIn(dictionary, CKeyEnhJSONKey_KeyNr).value_or(kKeyNrUndef);
    const bool isKey = keyNr >= 0 && keyNr < 12;
    return {isKey ? keyNr : kKeyNrUndef,
            EnhFromStdString(TextIn(dictionary, CKeyEnhJSONKey_Enh).value_or(""))};
}

std::ostream& operator<<(std::ostream& stream, const CKeyEnh& keyEnh) {
    return stream << keyEnh.mKeyNr << ' ' << keyEnh.mEnh;
}

}  // namespace brindle
