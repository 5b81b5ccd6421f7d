// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CMuxmlTuplet.h"

#include "brindle/musicxml/internal/ReadMuxml.h"

namespace brindle {

using muxml::ReadAttribute;

void CMuxmlTupletNumber::ReadFromFoundCharactersAndAttributes(std::string_view text,
                                                              const CMuxmlAttributes& attributes) {
    mTupletNumber = ReadInteger(text);
    ReadFromAttributes(attributes);
}

void CMuxmlTupletType::ReadFromFoundCharactersAndAttributes(std::string_view text,
                                                            const CMuxmlAttributes& attributes) {
    mTupletType = MuxmlValueOf(text, TMuxmlEnum_NoteTypeValue_Quarter);
    ReadFromAttributes(attributes);
}

void CMuxmlTupletDot::ReadFromFoundCharactersAndAttributes(std::string_view,
                                                           const CMuxmlAttributes& attributes) {
    ReadFromAttributes(attributes);
}

void CMuxmlTuplet::ReadFromAttributes(const CMuxmlAttributes& attributes) {
    CMuxmlXY::ReadFromAttributes(attributes);
    ReadAttribute(attributes, "start-stop", mType);
    ReadAttribute(attributes, "number", mNumber);
    ReadAttribute(attributes, "bracket", mBracket);
    ReadAttribute(attributes, "show-number", mShowNumber);
    ReadAttribute(attributes, "show-type", mShowTuplet);
    ReadAttribute(attributes, "line-shape", mLineShape);
    ReadAttribute(attributes, "placement", mPlacement);
}

void CMuxmlTuplet::ReadFromFoundCharactersAndAttributes(std::string_view,
                                                        const CMuxmlAttributes& attributes) {
    ReadFromAttributes(attributes);
}

}  // namespace brindle
