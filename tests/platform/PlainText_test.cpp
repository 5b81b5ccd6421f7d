// SPDX-License-Identifier: MIT
#include "brindle/platform/PlainText.h"

#include <doctest/doctest.h>

#include <iomanip>
#include <limits>
#include <sstream>

using namespace brindle;

TEST_CASE("Numbers stand right-aligned in their field whatever the stream was told") {
    struct CRow {
        double mValue;
        const char* mText;
    };
    constexpr double kInfinity = std::numeric_limits<double>::infinity();
    const CRow rows[] = {
        {1.0, "  1.00"},
        {-0.125, " -0.12"},
        {128.0, "128.00"},
        {1234567.891, "1234567.89"},
        {kInfinity, "   inf"},
        {-kInfinity, "  -inf"},
        {std::numeric_limits<double>::quiet_NaN(), "   nan"},
        {-std::numeric_limits<double>::quiet_NaN(), "   nan"},
    };
    for (const CRow& row : rows) {
        std::ostringstream stream;
        stream << std::left << std::setfill('*') << std::scientific << std::setw(12);
        PlainText::WriteFixed(stream, row.mValue);
        CHECK(stream.str() == row.mText);
    }
    std::ostringstream stream;
    PlainText::WriteInteger(stream, 7, 2);
    PlainText::WriteInteger(stream, -11, 2);
    CHECK(stream.str() == " 7-11");
}
