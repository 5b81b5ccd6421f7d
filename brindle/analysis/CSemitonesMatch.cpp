// SPDX-License-Identifier: MIT
#include "brindle/analysis/CSemitonesMatch.h"

#include <algorithm>
#include <ostream>

namespace brindle {

namespace {

void WriteEntry(std::ostream& stream, TSemiMatch entry) {
    switch (entry) {
        case TSemiMatch_Absent:
            stream << '0';
            return;
        case TSemiMatch_Present:
            stream << '1';
            return;
        case TSemiMatch_Any:
            stream << 'x';
            return;
    }
    stream << "unknown TSemiMatch: " << static_cast<std::int32_t>(entry);
}

}  // namespace

void CSemitonesMatch::AppendJSONString(std::ostream& stream) const {
    stream << '[';
    for (std::size_t n = 0; n < size(); ++n) {
        if (n > 0) stream << ',';
        WriteEntry(stream, mEntries[n]);
    }
    stream << ']';
}

std::ostream& operator<<(std::ostream& stream, const CSemitonesMatch& match) {
    match.AppendJSONString(stream);
    return stream;
}

bool CSemitonesMatches::Matches(CSemitones semitones) const {
    return std::any_of(begin(), end(),
                       [&](const CSemitonesMatch& pattern) { return pattern.Matches(semitones); });
}

void CSemitonesMatches::AppendJSONString(std::ostream& stream) const {
    stream << '[' << std::endl;
    for (const CSemitonesMatch& pattern : *this) {
        pattern.AppendJSONString(stream);
        stream << ',' << std::endl;
    }
    stream << ']' << std::endl;
}

}  // namespace brindle
