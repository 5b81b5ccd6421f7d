// SPDX-License-Identifier: MIT
#pragma once

#include <iostream>
#include <sstream>
#include <string>

namespace brindle {

/// The debugging prints of every record: a type gives `operator<<`, and a member
/// `void TraceBriefTo(std::ostream&) const` where its brief text differs from the full one.
template <class T>
void TraceBriefTo(std::ostream& stream, const T& value) {
    if constexpr (requires { value.TraceBriefTo(stream); }) {
        value.TraceBriefTo(stream);
    } else {
        stream << value;
    }
}

/// The full text of `value`.
template <class T>
[[nodiscard]] std::string TraceString(const T& value) {
    std::ostringstream stream;
    stream << value;
    return stream.str();
}

/// The same text as TraceString, under its other given name.
template <class T>
[[nodiscard]] std::string TraceStr(const T& value) {
    return TraceString(value);
}

/// The brief text of `value`.
template <class T>
[[nodiscard]] std::string TraceBriefString(const T& value) {
    std::ostringstream stream;
    TraceBriefTo(stream, value);
    return stream.str();
}

/// Writes the full text of `value` to standard output.
template <class T>
void Trace(const T& value) {
    std::cout << value;
}

/// Writes the brief text of `value` to standard output.
template <class T>
void TraceBrief(const T& value) {
    TraceBriefTo(std::cout, value);
}

}  // namespace brindle
