// SPDX-License-Identifier: MIT
#include "brindle/present/CJsonWriter.h"

#include "brindle/analysis/Positions.h"
#include "brindle/present/JsonValues.h"

#include <doctest/doctest.h>
#include <nlohmann/json.hpp>

#include <limits>
#include <random>
#include <string>
#include <utility>

namespace brindle::test {
namespace {

// What the writer has to give, told once more with the whole value at hand.
std::string LaidOut(const Json& json, std::size_t indent) {
    const std::string compact = json.dump();
    if (!json.is_structured() || json.empty() || indent + compact.size() <= 120) return compact;
    std::string text(1, json.is_object() ? '{' : '[');
    const char* separator = "\n";
    for (const auto& [key, value] : json.items()) {
        text += separator + std::string(indent + 2, ' ');
        if (json.is_object()) text += Json(key).dump() + ": ";
        text += LaidOut(value, indent + 2);
        separator = ",\n";
    }
    return text + '\n' + std::string(indent, ' ') + (json.is_object() ? '}' : ']');
}

Json RandomJson(std::mt19937& random, int depth) {
    const auto below = [&](unsigned limit) { return static_cast<unsigned>(random() % limit); };
    switch (depth == 0 ? below(5) : below(9)) {
        case 0:
            return nullptr;
        case 1:
            return below(2) == 0;
        case 2:
            return static_cast<int>(below(2000)) - 1000;
        case 3:
            return (static_cast<double>(below(4000)) - 2000.0) / 16.0;
        case 4:
            return std::string(below(below(8) == 0 ? 150 : 20), 'x') +
                   (below(3) == 0 ? "\"\n" : "");
        case 5:
        case 6: {
            Json list = Json::array();
            for (auto n = below(8); n > 0; --n) list.push_back(RandomJson(random, depth - 1));
            return list;
        }
        default: {
            Json object = Json::object();
            for (auto n = below(6); n > 0; --n) {
                object[std::string(1 + below(30), static_cast<char>('a' + n))] =
                    RandomJson(random, depth - 1);
            }
            return object;
        }
    }
}

TEST_CASE("What fits on a line stands on a line, and all else is broken") {
    CJsonWriter json;
    json.BeginObject().Key("Short").BeginArray().Integer(1).Number(2.0).Null().EndArray();
    json.Key("Long").BeginArray();
    for (int n = 0; n < 3; ++n) {
        json.BeginObject().Key("Text").String(std::string(50, 'x')).EndObject();
    }
    json.EndArray().Key("Empty").BeginArray().EndArray().EndObject();
    const std::string xs(50, 'x');
    CHECK(std::move(json).Text() ==
          "{\n"
          "  \"Short\": [1,2.0,null],\n"
          "  \"Long\": [\n"
          "    {\"Text\":\"" +
              xs +
              "\"},\n"
              "    {\"Text\":\"" +
              xs +
              "\"},\n"
              "    {\"Text\":\"" +
              xs +
              "\"}\n"
              "  ],\n"
              "  \"Empty\": []\n"
              "}\n");
}

TEST_CASE("Written as it comes, a value looks as it does with the whole of it at hand") {
    for (unsigned seed = 1; seed <= 3000; ++seed) {
        std::mt19937 random(seed);
        const Json json = RandomJson(random, 5);
        const std::string text = JsonText(json);
        INFO("seed " << seed);
        REQUIRE(text == LaidOut(json, 0) + "\n");
        REQUIRE(Json::parse(text) == json);
    }
}

TEST_CASE("Numbers that are none, and undefined positions, are null") {
    CJsonWriter json;
    json.BeginArray().Number(std::numeric_limits<double>::infinity());
    json.Number(std::numeric_limits<double>::quiet_NaN()).Number(kPosUndef).Number(-0.0);
    json.Number(1e300).Number(0.1).Number(4.0).EndArray();
    CHECK(std::move(json).Text() == "[null,null,null,-0.0,1e+300,0.1,4.0]\n");
}

TEST_CASE("Bytes that are no UTF-8 do not get into JSON") {
    CJsonWriter json;
    json.String("a\xFF\x01");
    CHECK(std::move(json).Text() == "\"a\xEF\xBF\xBD\\u0001\"\n");
}

}  // namespace
}  // namespace brindle::test
