// SPDX-License-Identifier: MIT
#include "brindle/markov/CIteratorIndexConverter.h"
#include "brindle/markov/VariableLengthMarkovModel.h"
#include "brindle/markov/internal/ParseMarkovFile.h"
#include "brindle/platform/AtomicFile.h"
#include "brindle/platform/DictionaryValues.h"
#include "brindle/platform/PlainText.h"

#include <nlohmann/json.hpp>

#include <algorithm>

namespace brindle {
namespace {

using nlohmann::json;
using PlainText::Write;
using PlainText::WriteInteger;

/// Writes all elements with a separator between them.
template <class List, class WriteElement>
void WriteJoined(std::ostream& stream, const List& list, std::string_view separator,
                 WriteElement writeElement) {
    bool isFirst = true;
    for (const auto& element : list) {
        if (!isFirst) Write(stream, separator);
        isFirst = false;
        writeElement(element);
    }
}

void WriteTransitions(std::ostream& stream, const CMarkovTransitions& entry,
                      CIteratorIndexConverter& converter) {
    const auto writeIndex = [&](MarkovIterator symbol) {
        WriteInteger(stream, converter.InsertIfUniqueAndReturnIndex(symbol), 4);
    };
    Write(stream, "[\n[");
    WriteJoined(stream, entry.mHistory, ",", writeIndex);
    Write(stream, "],[");
    WriteJoined(stream, entry.mCounts, ",", [&](const auto& successor) {
        Write(stream, "[");
        writeIndex(successor.first);
        Write(stream, ",");
        WriteInteger(stream, successor.second, 3);
        Write(stream, "]");
    });
    Write(stream, "]\n]");
}

/// The list under the key; an empty one if there is none.
const json& ListIn(const json& dictionary, const char* key) {
    static const json none = json::array();
    if (!dictionary.is_object()) return none;
    const auto list = dictionary.find(key);
    return list == dictionary.end() || !list->is_array() ? none : *list;
}

void FillModel(const json& dictionary, const CMarkovFileTransitions& transitions,
               VariableLengthMarkovModel& model) {
    using Helper = VariableLengthMarkovModel::JSONDeserialization_Helper;
    model.Clear();
    model.mMaxHistoryLength = static_cast<std::uint64_t>(std::clamp(
        IntegerIn(dictionary, "MaxHistoryLength").value_or(0), 0, kMarkovLongestHistoryInFile));
    model.mObjects =
        CMarkovObjects::JSONDeserialization_Helper::CMarkovObjectsFromJSONDictionary(dictionary);
    CIteratorIndexConverter converter(model.mObjects);
    model.mTransitionMap = transitions.ToMap(converter);
    Helper::HistoryFromJSONDictionary(dictionary, model.mHistory, converter);
}

CMarkovFileTransitions TransitionsIn(const json& dictionary) {
    CMarkovFileTransitions transitions;
    for (const json& entry : ListIn(dictionary, kMarkovTransitionsKey)) transitions.Add(entry);
    return transitions;
}

}  // namespace

bool VariableLengthMarkovModel::SaveToFile(const std::string& path) const {
    return WriteFileAtomically(path, [this](std::ostream& stream) { AppendJSONString(stream); });
}

void VariableLengthMarkovModel::AppendJSONString(std::ostream& stream) const {
    CIteratorIndexConverter converter(mObjects);
    Write(stream, "{\"VariableLengthMarkovModel\":\n{\n\"MaxHistoryLength\":");
    PlainText::WriteUnsigned(stream, mMaxHistoryLength);
    Write(stream, ",\n\"CMarkovObjects\":\n");
    mObjects.AppendJSONString(stream);
    Write(stream, "\n,\n\"TransitionMap\":\n");
    TransitionMapAppendToJSON(stream, converter);
    Write(stream, ",\n\"History\":\n[");
    WriteJoined(stream, mHistory, ",", [&](MarkovIterator symbol) {
        WriteInteger(stream, converter.InsertIfUniqueAndReturnIndex(symbol));
    });
    Write(stream, "]\n}\n}");
}

// Each count of a shorter history is the sum of those of the longest ones that end in it, so these
// tell all.
void VariableLengthMarkovModel::TransitionMapAppendToJSON(
    std::ostream& stream, CIteratorIndexConverter& converter) const {
    Write(stream, "[\n");
    WriteJoined(
        stream, mTransitionMap.InOrder(mMaxHistoryLength), ",\n",
        [&](const CMarkovTransitions* entry) { WriteTransitions(stream, *entry, converter); });
    Write(stream, "\n]");
}

bool VariableLengthMarkovModel::JSONDeserialization_Helper::VariableLengthMarkovModelFromJSONFile(
    const std::string& path, VariableLengthMarkovModel& model) {
    const auto text = ReadWholeFile(path);
    if (!text) return false;
    VariableLengthMarkovModelFromJSONString(*text, model);
    return true;
}

void VariableLengthMarkovModel::JSONDeserialization_Helper::VariableLengthMarkovModelFromJSONString(
    const std::string& text, VariableLengthMarkovModel& model) {
    CMarkovFileTransitions transitions;
    const json file = ParseMarkovFile(text, transitions);
    const auto found = file.find(kMarkovModelKey);
    if (found == file.end()) {
        FillModel(json::object(), {}, model);
    } else {
        FillModel(*found, transitions, model);
    }
}

void VariableLengthMarkovModel::JSONDeserialization_Helper::
    VariableLengthMarkovModelFromJSONDictionary(const json& dictionary,
                                                VariableLengthMarkovModel& model) {
    FillModel(dictionary, TransitionsIn(dictionary), model);
}

CMarkovTransitionMap
VariableLengthMarkovModel::JSONDeserialization_Helper::MarkovTransitionMapFromJSONDictionary(
    const json& dictionary, CIteratorIndexConverter& converter) {
    return TransitionsIn(dictionary).ToMap(converter);
}

void VariableLengthMarkovModel::JSONDeserialization_Helper::HistoryFromJSONDictionary(
    const json& dictionary, MarkovSequence& history, CIteratorIndexConverter& converter) {
    history.clear();
    for (const json& index : ListIn(dictionary, "History")) {
        const MarkovIterator symbol =
            converter.InsertIfUniqueAndReturnPointer(MarkovIndexOf(index));
        if (!converter.IsEnd(symbol)) history.push_back(symbol);
    }
}

}  // namespace brindle
