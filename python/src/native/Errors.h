// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/c/brindle.h"

#include <nanobind/nanobind.h>

#include <cstddef>
#include <exception>
#include <memory>
#include <string>

namespace brindle::python {

namespace nb = nanobind;

/// Becomes an exception of the Python module `brindle._errors`.
struct CFault : std::exception {
    /// "ChordError".
    std::string mKind;
    std::string mMessage;
    /// What was handed in.
    std::string mText;
    /// In characters from 1; 0 for nowhere.
    std::size_t mPosition = 0;

    CFault(std::string kind, std::string message, std::string text = {}, std::size_t position = 0)
        : mKind(std::move(kind)),
          mMessage(std::move(message)),
          mText(std::move(text)),
          mPosition(position) {}
    [[nodiscard]] const char* what() const noexcept override { return mMessage.c_str(); }
};

/// Raises what a call of the C interface tells: OSError for files, otherwise the named kind.
void Check(brindle_status status, const char* kind);

struct CFreeText {
    void operator()(char* text) const { brindle_free(text); }
};
/// A text that the C interface gave.
using CText = std::unique_ptr<char, CFreeText>;

void BindErrors();

}  // namespace brindle::python
