// SPDX-License-Identifier: MIT
#include "brindle/analysis/ChordVectorText.h"

#include "brindle/analysis/CHarmAnlsChordForMetro.h"
#include "brindle/platform/JsonString.h"

#include <algorithm>
#include <array>
#include <nlohmann/json.hpp>

namespace brindle {

namespace {

constexpr std::string_view kBetween = " \t\r\n,";
// Where a new group of digits begins.
constexpr std::array<std::size_t, 4> kGroups = {3, 15, 22, 34};

CChordVectorText Fault(std::string error, std::size_t column) {
    return {{}, std::move(error), column};
}

CChordVectorText CheckedCount(std::vector<float> vector) {
    if (vector.size() == CHarmAnlsChordForMetro::VectorSize) return {std::move(vector), {}, 0};
    return Fault("a vector has 46 places, here are " + std::to_string(vector.size()), 0);
}

CChordVectorText ReadDigits(std::string_view text) {
    std::vector<float> vector;
    for (std::size_t column = 0; column < text.size(); ++column) {
        if (kBetween.find(text[column]) != kBetween.npos) continue;
        if (text[column] != '0' && text[column] != '1') {
            return Fault("a place of a vector is 0 or 1", column);
        }
        vector.push_back(text[column] == '1' ? 1.0F : 0.0F);
    }
    return CheckedCount(std::move(vector));
}

CChordVectorText ReadJson(std::string_view text) {
    const auto json = ParseJson(text);
    const bool isObject = json.is_object() && json.contains("VectorRep");
    const nlohmann::json& list = isObject ? json.at("VectorRep") : json;
    if (!list.is_array()) return Fault("this is no JSON list of the places of a vector", 0);
    std::vector<float> vector;
    for (const nlohmann::json& place : list) {
        if (place != 0 && place != 1) return Fault("a place of a vector is 0 or 1", 0);
        vector.push_back(place == 1 ? 1.0F : 0.0F);
    }
    return CheckedCount(std::move(vector));
}

bool AreDigits(std::string_view word) {
    return word.find_first_not_of("01 ") == word.npos;
}

std::size_t CountDigits(std::string_view word) {
    return word.size() - static_cast<std::size_t>(std::count(word.begin(), word.end(), ' '));
}

}  // namespace

bool BeginsAsChordVector(std::string_view text) {
    return !text.empty() && std::string_view("01[{").find(text.front()) != text.npos;
}

std::vector<std::string> JoinChordVectors(std::span<const std::string> words) {
    std::vector<std::string> joined;
    for (const std::string& word : words) {
        const bool isRest = !joined.empty() && AreDigits(word) && AreDigits(joined.back()) &&
                            CountDigits(joined.back()) < CHarmAnlsChordForMetro::VectorSize;
        if (isRest) {
            joined.back() += ' ' + word;
        } else {
            joined.push_back(word);
        }
    }
    return joined;
}

CChordVectorText ReadChordVector(std::string_view text) {
    const std::size_t first = text.find_first_not_of(kBetween);
    const bool isJson = first != text.npos && (text[first] == '[' || text[first] == '{');
    return isJson ? ReadJson(text.substr(first)) : ReadDigits(text);
}

std::string WriteChordVector(std::span<const float> vector) {
    std::string text;
    for (std::size_t place = 0; place < vector.size(); ++place) {
        if (std::find(kGroups.begin(), kGroups.end(), place) != kGroups.end()) text += ' ';
        text += vector[place] == 1.0F ? '1' : '0';
    }
    return text;
}

}  // namespace brindle
