// SPDX-License-Identifier: MIT
#pragma once

#include <string>

namespace brindle {

/// The first error of an XML text that is not well-formed, and where it stands.
struct XmlError {
    int mCode = 0;             ///< as the XML library numbers it; 0 for a fault that is not its own
    std::string mDescription;  ///< for people, in English, without the place
    int mLine = 0;             ///< from 1; 0 if unknown
    int mColumn = 0;           ///< from 1; 0 if unknown
};

}  // namespace brindle
