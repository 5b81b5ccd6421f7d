// SPDX-License-Identifier: MIT
#include "brindle/musicxml/MuxmlNotations.h"

#include "brindle/musicxml/internal/ReadMuxml.h"

namespace brindle {

using muxml::ReadAttribute;

void CMuxmlAccidental::ReadFromAttributes(const CMuxmlAttributes& attributes) {
    CMuxmlXYColor::ReadFromAttributes(attributes);
    CMuxmlFont::ReadFromAttributes(attributes);
    ReadAttribute(attributes, "cautionary", mCautionary);
    ReadAttribute(attributes, "editorial", mEditorial);
    ReadAttribute(attributes, "parentheses", mParentheses);
    ReadAttribute(attributes, "bracket", mBracket);
}

void CMuxmlAccidental::ReadFromFoundCharactersAndAttributes(std::string_view text,
                                                            const CMuxmlAttributes& attributes) {
    mExists = true;
    mValue = MuxmlValueOf(text, mValue);
    ReadFromAttributes(attributes);
}

void CMuxmlGraphicalNoteType::ReadFromAttributes(const CMuxmlAttributes& attributes) {
    ReadAttribute(attributes, "size", mSize);
}

void CMuxmlGraphicalNoteType::ReadFromFoundCharactersAndAttributes(
    std::string_view text, const CMuxmlAttributes& attributes) {
    mExists = true;
    mValue = MuxmlValueOf(text, TMuxmlEnum_NoteTypeValue_Quarter);
    ReadFromAttributes(attributes);
}

void CMuxmlFermata::ReadFromAttributes(const CMuxmlAttributes& attributes) {
    mExists = true;
    CMuxmlXYColor::ReadFromAttributes(attributes);
    CMuxmlFont::ReadFromAttributes(attributes);
    ReadAttribute(attributes, "type", mType);
}

void CMuxmlFermata::ReadFromFoundCharactersAndAttributes(std::string_view text,
                                                         const CMuxmlAttributes& attributes) {
    ReadFromAttributes(attributes);
    mShape = MuxmlValueOf(text, mShape);
}

void CMuxmlStem::ReadFromFoundCharactersAndAttributes(std::string_view text,
                                                      const CMuxmlAttributes& attributes) {
    mExists = true;
    mValue = MuxmlValueOf(text, mValue);
    ReadFromAttributes(attributes);
}

void CMuxmlNotationEmptyPlacement::ReadFromAttributes(const CMuxmlAttributes& attributes) {
    mExists = true;
    CMuxmlXYColor::ReadFromAttributes(attributes);
    CMuxmlFont::ReadFromAttributes(attributes);
    ReadAttribute(attributes, "placement", mPlacement);
}

void CMuxmlArticulationEmptyLine::ReadFromAttributes(const CMuxmlAttributes& attributes) {
    CMuxmlNotationEmptyPlacement::ReadFromAttributes(attributes);
    CMuxmlLine::ReadFromAttributes(attributes);
}

}  // namespace brindle
