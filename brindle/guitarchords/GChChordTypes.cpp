// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/GChChordTypes.h"

#include <algorithm>
#include <cstddef>

namespace brindle {

namespace {

const CChordType* RowAt(int index) {
    const CChordTypeVec& rows = _s_chordTypes().BuiltIn();
    const auto row = static_cast<std::size_t>(std::max(index, 0));
    return row < rows.size() ? &rows[row] : nullptr;
}

}  // namespace

int GChNumberOfChordTypes() {
    return static_cast<int>(_s_chordTypes().BuiltIn().size());
}

std::string GChChordTypeNameForIndex(int index) {
    const CChordType* const row = RowAt(index);
    return row == nullptr ? std::string() : row->mName;
}

CChordTypeId GChChordTypeIdForIndex(int index) {
    const CChordType* const row = RowAt(index);
    return row == nullptr ? 0 : row->mId;
}

std::string GChChordTypeNameForId(CChordTypeId id) {
    const CChordTypes& types = _s_chordTypes();
    const auto row = types.ChordTypeBuiltInFromId(id);
    return row == types.BuiltIn().end() ? std::string() : row->mName;
}

CChordTypeId GChChordTypeIdForSemitones(const CSemitones& semitones) {
    const CChordTypeVec& rows = _s_chordTypes().BuiltIn();
    const auto row = std::find_if(rows.begin(), rows.end(), [&](const CChordType& type) {
        return type.mIntvls.ToSemitones() == semitones;
    });
    return row == rows.end() ? 0 : row->mId;
}

}  // namespace brindle
