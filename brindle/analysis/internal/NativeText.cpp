// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/NativeText.h"

#include "brindle/analysis/Positions.h"

namespace brindle::NativeText {

void WriteProbability(std::ostream& stream, double probability) {
    if (probability == kPosUndef) {
        PlainText::Write(stream, "Undef");
    } else {
        PlainText::WriteFixed(stream, probability);
    }
}

}  // namespace brindle::NativeText
