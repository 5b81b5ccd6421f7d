// SPDX-License-Identifier: MIT
#include "brindle/musicxml/MuxmlBlocks.h"

#include "brindle/musicxml/internal/ReadMuxml.h"

namespace brindle {

using muxml::ReadAttribute;

void CMuxmlXY::ReadFromAttributes(const CMuxmlAttributes& attributes) {
    ReadAttribute(attributes, "default-x", mDefaultX);
    ReadAttribute(attributes, "default-y", mDefaultY);
    ReadAttribute(attributes, "relative-x", mRelativeX);
    ReadAttribute(attributes, "relative-y", mRelativeY);
}

void CMuxmlXYColor::ReadFromAttributes(const CMuxmlAttributes& attributes) {
    CMuxmlXY::ReadFromAttributes(attributes);
    ReadAttribute(attributes, "color", mColor);
}

void CMuxmlFont::ReadFromAttributes(const CMuxmlAttributes& attributes) {
    ReadAttribute(attributes, "font-family", mFontFamily);
    ReadAttribute(attributes, "font-style", mFontStyle);
    ReadAttribute(attributes, "font-size", mFontSize);
    ReadAttribute(attributes, "font-weight", mFontWeight);
}

void CMuxmlFontAndColor::ReadFromAttributes(const CMuxmlAttributes& attributes) {
    CMuxmlFont::ReadFromAttributes(attributes);
    ReadAttribute(attributes, "color", mColor);
}

void CMuxmlLine::ReadFromAttributes(const CMuxmlAttributes& attributes) {
    ReadAttribute(attributes, "line-shape", mLineShape);
    ReadAttribute(attributes, "line-type", mLineType);
    ReadAttribute(attributes, "dash-length", mDashLength);
    ReadAttribute(attributes, "space-length", mSpaceLength);
}

}  // namespace brindle
