// SPDX-License-Identifier: MIT
// Any JSON as a record of each kind: what is read of it can be written, and once it has been
// written and read again it stays as it is.

#include "brindle/analysis/CHarmAnls.h"
#include "brindle/markov/CMarkovObject.h"
#include "brindle/theory/CSignKeyHeavy.h"
#include "brindle/theory/CSignKeyNoEnh.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <nlohmann/json.hpp>
#include <sstream>
#include <string>

namespace {

using namespace brindle;
using Json = nlohmann::json;

template <typename TRecord>
std::string Written(const TRecord& record) {
    std::ostringstream stream;
    record.AppendJSONString(stream);
    return stream.str();
}

template <typename CRead>
void Check(const Json& json, CRead read) {
    const std::string first = Written(read(json));
    const std::string second = Written(read(Json::parse(first, nullptr, false)));
    if (Written(read(Json::parse(second, nullptr, false))) != second) std::abort();
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const Json json = Json::parse(data, data + size, nullptr, false);
    Check(json, CKeyEnh::JSONDeserializer_Helper::CKeyEnhFromJSONDictionary);
    Check(json, CChordLite::FromDictionary);
    Check(json, CSignKeyHeavy::FromJSONDict);
    Check(json, CSignKeyNoEnh::FromJSONDict);
    Check(json, CHarmAnls::Chord::FromDictionary);
    Check(json, CHarmAnls::ChordWithPos::FromDictionary);
    Check(json, CHarmAnls::ChordWithLength::FromDictionary);
    (void)Written(CMarkovObject::JSONDeserialization_Helper::CMarkovObjectFromJSONDictionary(json));
    return 0;
}
