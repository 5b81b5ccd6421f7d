// SPDX-License-Identifier: MIT
#include "brindle/platform/ReadNumber.h"

#include <doctest/doctest.h>

using namespace brindle;

TEST_CASE("Numbers at the front of a text are read free of the locale and within limits") {
    struct CRow {
        const char* mText;
        std::int32_t mInteger;
        double mDouble;
    };
    const CRow rows[] = {
        {"12", 12, 12.0},
        {" \n-7.5x", -7, -7.5},
        {"+3e2", 3, 300.0},
        {"1e", 1, 1.0},
        {".5", 0, 0.5},
        {"0x1F", 0, 0.0},
        {"nan", 0, 0.0},
        {"inf", 0, 0.0},
        {"- 4", 0, 0.0},
        {"", 0, 0.0},
        {"2147483648", 2147483647, 2147483648.0},
        {"-99999999999", -2147483647 - 1, -99999999999.0},
        {"1,5", 1, 1.0},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mText);
        CHECK(ReadInteger(row.mText) == row.mInteger);
        CHECK(ReadDecimal(row.mText) == row.mDouble);
    }
}
