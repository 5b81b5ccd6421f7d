// SPDX-License-Identifier: MIT
#pragma once

#include <functional>
#include <map>
#include <nlohmann/json.hpp>
#include <string>

namespace brindle::test {

/// Answers one case: takes its "in" and gives what our code says, to be compared with its "out".
using Answer = std::function<nlohmann::json(const nlohmann::json& in)>;

/// Runs every case of tests/data/expected/<file>.jsonl through the answer for its "call" and fails
/// the running test with the first lines that differ. A call without an answer is a failure too.
///
/// Numbers compare as numbers (1 equals 1.0), exactly, unless `tolerance` is above 0: then they
/// may differ by that much, relatively or absolutely.
void CheckExpected(const std::string& file, const std::map<std::string, Answer>& answers,
                   double tolerance = 0.0);

/// Whether two JSON values agree by the rule of CheckExpected.
bool Agrees(const nlohmann::json& a, const nlohmann::json& b, double tolerance);

}  // namespace brindle::test
