// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/JsonText.h"

#include "brindle/analysis/Positions.h"

namespace brindle::JsonText {

void WriteProbability(std::ostream& stream, double probability) {
    if (probability == kPosUndef) {
        PlainText::Write(stream, "Undef");
    } else {
        PlainText::WriteFixed(stream, probability);
    }
}

}  // namespace brindle::JsonText
