// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CMuxmlNote.h"

#include "brindle/theory/CNote.h"

namespace brindle {

std::int64_t CMuxmlNote::ConvertToNoteNrLarge(const CMuxmlSignKey& signKey) const {
    switch (mNoteType) {
        case TMuxmlEnum_NoteType_Unpitched:
        case TMuxmlEnum_NoteType_Rest:
            return mUnpitched.ToNoteNrLarge(signKey);
        case TMuxmlEnum_NoteType_Pitched:
            return mPitch.ToNoteNrLarge();
        case TMuxmlEnum_NoteType_Undefined:
            break;
    }
    return kNoteNrUndef;
}

}  // namespace brindle
