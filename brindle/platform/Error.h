// SPDX-License-Identifier: MIT
#pragma once

#include <string>

namespace brindle {

/// What a reader of files reports: whose error it is, which one, and a text for people.
struct Error {
    std::string domain;  ///< who reports it: the reader's own domain, or that of XML or of files
    int code = 0;        ///< which error of that domain; 0 for none
    std::string description;  ///< for people; empty for none

    friend bool operator==(const Error&, const Error&) = default;
};

}  // namespace brindle
