// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/platform/PlainText.h"

#include <iosfwd>

/// The pieces of JSON text that the records of an analysis share.
namespace brindle::NativeText {

/// The bare word Undef for `kPosUndef`, else the number.
void WriteProbability(std::ostream& stream, double probability);

/// Each element on lines of its own. Kept: the last one has a comma behind it, too.
template <class TList>
void WriteList(std::ostream& stream, const TList& list) {
    PlainText::Write(stream, "[");
    PlainText::EndLine(stream);
    for (const auto& element : list) {
        element.AppendJSONString(stream);
        PlainText::Write(stream, ",");
        PlainText::EndLine(stream);
    }
    PlainText::Write(stream, "]");
    PlainText::EndLine(stream);
}

}  // namespace brindle::NativeText
