// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <cmath>
#include <fstream>

namespace brindle::test {

using nlohmann::json;

namespace {

constexpr int kShownDifferences = 12;

bool NumbersAgree(double a, double b, double tolerance) {
    if (a == b) return true;
    const double difference = std::abs(a - b);
    return difference <= tolerance || difference <= tolerance * std::max(std::abs(a), std::abs(b));
}

json Ask(const std::map<std::string, Answer>& answers, const json& test) {
    const auto answer = answers.find(test.at("call").get<std::string>());
    if (answer == answers.end()) return "no answer for this call";
    try {
        return answer->second(test.at("in"));
    } catch (const json::exception& error) {
        return std::string("the answer cannot read the case: ") + error.what();
    }
}

std::string Difference(int line, const json& test, const json& got) {
    return "line " + std::to_string(line) + " " + test.at("call").get<std::string>() +
           "\n  in       " + test.at("in").dump() + "\n  expected " + test.at("out").dump() +
           "\n  got      " + got.dump();
}

}  // namespace

bool Agrees(const json& a, const json& b, double tolerance) {
    if (a.is_number() && b.is_number()) {
        if (tolerance == 0.0) return a == b;
        return NumbersAgree(a.get<double>(), b.get<double>(), tolerance);
    }
    if (a.type() != b.type() || a.size() != b.size()) return false;
    if (a.is_array()) {
        return std::equal(a.begin(), a.end(), b.begin(),
                          [&](const json& x, const json& y) { return Agrees(x, y, tolerance); });
    }
    if (a.is_object()) {
        return std::all_of(a.items().begin(), a.items().end(), [&](const auto& item) {
            return b.contains(item.key()) && Agrees(item.value(), b.at(item.key()), tolerance);
        });
    }
    return a == b;
}

void CheckExpected(const std::string& file, const std::map<std::string, Answer>& answers,
                   double tolerance) {
    std::ifstream stream(std::string(BRINDLE_TEST_DATA "/expected/") + file + ".jsonl");
    std::string text;
    REQUIRE_MESSAGE(std::getline(stream, text), file << " can be read");  // the heading line
    int line = 1;
    int cases = 0;
    int differing = 0;
    while (std::getline(stream, text)) {
        ++line;
        const json test = json::parse(text);
        ++cases;
        const json got = Ask(answers, test);
        if (Agrees(test.at("out"), got, tolerance)) continue;
        if (++differing <= kShownDifferences) {
            MESSAGE(file << ".jsonl " << Difference(line, test, got));
        }
    }
    CHECK(cases > 0);
    CHECK_MESSAGE(differing == 0, file << ": " << differing << " of " << cases << " cases differ");
}

}  // namespace brindle::test
