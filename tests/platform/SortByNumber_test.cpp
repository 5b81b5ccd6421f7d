// SPDX-License-Identifier: MIT
#include "brindle/platform/SortByNumber.h"

#include <doctest/doctest.h>

#include <string>
#include <vector>

using namespace brindle;

TEST_CASE("records that begin together stay in the order in which they were written") {
    struct CRecord {
        int mBegin;
        std::string mName;
    };
    std::vector<CRecord> records{{4, "a"}, {0, "b"}, {4, "c"}, {-1, "d"}, {0, "e"}};
    SortByNumber(records, [](const CRecord& record) { return record.mBegin; });
    std::string names;
    for (const CRecord& record : records) names += record.mName;
    CHECK(names == "dbeac");
    CHECK(AscendingOrder(std::vector{0.0, 0.0, 1.0}).empty());
}
