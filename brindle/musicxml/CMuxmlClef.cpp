// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CMuxmlClef.h"

#include "brindle/musicxml/internal/ReadMuxml.h"

namespace brindle {

void CMuxmlClef::ReadFromAttributes(const CMuxmlAttributes& attributes) {
    CMuxmlXYColor::ReadFromAttributes(attributes);
    CMuxmlFont::ReadFromAttributes(attributes);
    muxml::ReadAttribute(attributes, "number", mStaffNumber);
    muxml::ReadAttribute(attributes, "print-object", mPrintObject);
    muxml::ReadAttribute(attributes, "additional", mAdditional);
    muxml::ReadAttribute(attributes, "size", mSize);
    muxml::ReadAttribute(attributes, "after-barline", mAfterBarline);
}

}  // namespace brindle
