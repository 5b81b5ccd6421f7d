// SPDX-License-Identifier: MIT
#include "brindle/analysis/CSemitonesMatch.h"

#include "brindle/analysis/internal/NativeText.h"
#include "brindle/theory/CIntvlSet.h"

#include <algorithm>
#include <ostream>

namespace brindle {

namespace {

void WriteEntry(std::ostream& stream, TSemiMatch entry) {
    switch (entry) {
        case TSemiMatch_Absent:
            return PlainText::Write(stream, "0");
        case TSemiMatch_Present:
            return PlainText::Write(stream, "1");
        case TSemiMatch_Any:
            return PlainText::Write(stream, "x");
    }
    PlainText::Write(stream, "unknown TSemiMatch: ");
    PlainText::WriteInteger(stream, static_cast<std::int32_t>(entry));
}

}  // namespace

void CSemitonesMatch::SetFromIntvlSet(const CIntvlSet& intvls) {
    Reset();
    const std::uint64_t sounding = intvls.ToSemitones().Mask();
    for (unsigned n = 0; n < 12; ++n) {
        if ((sounding >> n & 1) != 0) SetSemitone(n, TSemiMatch_Present);
    }
}

void CSemitonesMatch::AppendJSONString(std::ostream& stream) const {
    PlainText::Write(stream, "[");
    for (std::size_t n = 0; n < size(); ++n) {
        if (n > 0) PlainText::Write(stream, ",");
        WriteEntry(stream, mEntries[n]);
    }
    PlainText::Write(stream, "]");
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
    NativeText::WriteList(stream, *this);
}

}  // namespace brindle
