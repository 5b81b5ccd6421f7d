// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CMuxmlPart.h"

namespace brindle {

std::string CMuxmlPart::FindBestPartName() const {
    for (const std::string* name :
         {&mPartNameDisplay, &mPartName, &mPartAbbreviationDisplay, &mPartAbbreviation}) {
        if (!name->empty()) return *name;
    }
    return mScoreInstruments.empty() ? std::string() : mScoreInstruments.front().mInstrumentName;
}

}  // namespace brindle
