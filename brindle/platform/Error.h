// SPDX-License-Identifier: MIT
#pragma once

#include <string>

namespace brindle {

/// What a reader of files reports: whose error it is, which one, and a text for people.
struct Error {
    std::string domain;
    int code = 0;
    std::string description;

    friend bool operator==(const Error&, const Error&) = default;
};

}  // namespace brindle
