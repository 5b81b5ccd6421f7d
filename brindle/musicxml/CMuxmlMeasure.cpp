// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CMuxmlMeasure.h"

#include "brindle/musicxml/internal/ReadMuxml.h"

namespace brindle {

void CMuxmlMeasure::ReadFromAttributes(const CMuxmlAttributes& attributes) {
    muxml::ReadAttribute(attributes, "number", mNumber);
}

}  // namespace brindle
