// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CMuxmlTranspose.h"

#include "brindle/musicxml/internal/ReadMuxml.h"

namespace brindle {

void CMuxmlTranspose::ReadFromAttributes(const CMuxmlAttributes& attributes) {
    mHasBeenReadFromXML = true;
    muxml::ReadAttribute(attributes, "number", mStaffNumber);
}

void CMuxmlTranspose::ReadFromXMLElement(const XmlNode& element) {
    mHasBeenReadFromXML = true;
    if (const XmlNode found = element.firstDescendant("number")) {
        mStaffNumber = muxml::ReadUnsigned(found.stringValue());
    }
    if (const XmlNode found = element.firstDescendant("diatonic")) {
        mDiatonic = ReadInteger(found.stringValue());
    }
    if (const XmlNode found = element.firstDescendant("chromatic")) {
        mChromatic = muxml::ReadFloat(found.stringValue());
    }
    if (const XmlNode found = element.firstDescendant("octave-change")) {
        mOctaveChange = ReadInteger(found.stringValue());
    }
    mDouble = static_cast<bool>(element.firstDescendant("double"));
}

bool operator<(const CMuxmlTranspose& a, const CMuxmlTranspose& b) {
    if (a.mStaffNumber != b.mStaffNumber) return a.mStaffNumber < b.mStaffNumber;
    if (a.mDiatonic != b.mDiatonic) return a.mDiatonic < b.mDiatonic;
    if (a.mChromatic != b.mChromatic) return a.mChromatic < b.mChromatic;
    if (a.mOctaveChange != b.mOctaveChange) return false;
    return !a.mDouble && b.mDouble;
}

}  // namespace brindle
