// SPDX-License-Identifier: MIT
#pragma once

#include <iostream>
#include <sstream>
#include <string>

namespace brindle::test {

/// Takes what is printed to standard output while it lives.
class PrintedText {
public:
    PrintedText() : mBefore(std::cout.rdbuf(mStream.rdbuf())) {}
    ~PrintedText() { std::cout.rdbuf(mBefore); }
    PrintedText(const PrintedText&) = delete;
    PrintedText& operator=(const PrintedText&) = delete;

    [[nodiscard]] std::string Text() const { return mStream.str(); }

private:
    std::ostringstream mStream;
    std::streambuf* mBefore;
};

}  // namespace brindle::test
