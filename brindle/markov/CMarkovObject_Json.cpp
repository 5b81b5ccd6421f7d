// SPDX-License-Identifier: MIT
#include "brindle/markov/CMarkovObjects.h"
#include "brindle/platform/DictionaryValues.h"
#include "brindle/platform/JsonString.h"
#include "brindle/platform/PlainText.h"

#include <nlohmann/json.hpp>

namespace brindle {

using nlohmann::json;

void CMarkovObject::AppendJSONString(std::ostream& stream) const {
    PlainText::Write(stream, R"({"Type":)");
    PlainText::WriteInteger(stream, mType);
    switch (mType) {
        case TMarkovObjectType_Chord:
            PlainText::Write(stream, ",\n\"CHarmAnlsChordWithLength\":\n{");
            mChord.AppendJSONClassSubstring(stream);
            PlainText::Write(stream, "}");
            break;
        // Kept: the comma before the brace makes these three no strict JSON.
        case TMarkovObjectType_Number:
        case TMarkovObjectType_Value:
            PlainText::Write(stream, ",\n");
            break;
        case TMarkovObjectType_Indexed:
            PlainText::Write(stream, ",\n\"Index\":");
            PlainText::WriteInteger(stream, mIndex);
            PlainText::Write(stream, ",\n");
            break;
    }
    PlainText::Write(stream, "}");
}

CMarkovObject CMarkovObject::JSONDeserialization_Helper::CMarkovObjectFromJSONDictionary(
    const json& dictionary) {
    CMarkovObject object;
    switch (IntegerIn(dictionary, "Type").value_or(0)) {
        case TMarkovObjectType_Chord: {
            // Never a copy: those of deeply nested values go as deep into the program's stack.
            static const json none = json::object();
            const auto chord = dictionary.find("CHarmAnlsChordWithLength");
            object.mChord = CHarmAnlsChordWithLength::JSONDeserializer_Helper::
                CHarmAnlsChordWithLengthFromJSONDictionary(chord == dictionary.end() ? none
                                                                                     : *chord);
            break;
        }
        case TMarkovObjectType_Start:
            return CMarkovObject_Start;
        case TMarkovObjectType_End:
            return CMarkovObject_End;
        case TMarkovObjectType_Indexed:
            object.mType = TMarkovObjectType_Indexed;
            object.mIndex = IntegerIn(dictionary, "Index").value_or(0);
            break;
    }
    return object;
}

CMarkovObject CMarkovObject::JSONDeserialization_Helper::CMarkovObjectFromJSONString(
    const std::string& text) {
    return CMarkovObjectFromJSONDictionary(ParseJson(text));
}

void CMarkovObjects::AppendJSONString(std::ostream& stream) const {
    PlainText::Write(stream, "[");
    for (const CMarkovStoredObject& object : mList) {
        if (object.mPlace > 0) PlainText::Write(stream, ",\n");
        object.AppendJSONString(stream);
    }
    PlainText::Write(stream, "]");
}

CMarkovObjects CMarkovObjects::JSONDeserialization_Helper::CMarkovObjectsFromJSONDictionary(
    const json& dictionary) {
    CMarkovObjects objects;
    if (!dictionary.is_object()) return objects;
    const auto list = dictionary.find("CMarkovObjects");
    if (list == dictionary.end() || !list->is_array()) return objects;
    for (const json& element : *list) {
        objects.insertObjectIfUnique(
            CMarkovObject::JSONDeserialization_Helper::CMarkovObjectFromJSONDictionary(element));
    }
    return objects;
}

}  // namespace brindle
