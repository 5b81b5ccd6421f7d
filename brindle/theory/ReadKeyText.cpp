// SPDX-License-Identifier: MIT
#include "brindle/theory/ReadKeyText.h"

#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/ScaleCatalogue.h"
#include "brindle/theory/ScaleStrings.h"
#include "brindle/theory/SetFromStringHelper.h"
#include "brindle/theory/SignKeyStrings.h"
#include "brindle/theory/internal/GermanKeyText.h"

#include <algorithm>

namespace brindle {
namespace {

// The key at the start of a text, and where the word behind it begins.
struct CTypedRoot {
    CKeyEnh mRoot;
    int mConsumed = 0;
    std::size_t mWord = 0;
};

CTypedRoot ReadRoot(const std::string& text) {
    CTypedRoot root;
    root.mRoot.SetFromString(text, &root.mConsumed, ChordNamePrefsNonUTF8);
    root.mWord = std::min(text.find_first_not_of(' ', static_cast<std::size_t>(root.mConsumed)),
                          text.size());
    return root;
}

// Whether a reader that moved from the word's begin to `position` has read all of the text.
bool IsReadToItsEnd(std::string_view text, int position) {
    return text.find_first_not_of(' ', static_cast<std::size_t>(position)) == text.npos;
}

// The scale whose printed name is this, in whatever case; null for none.
const CScaleRow* ScaleOfName(std::string_view name) {
    const std::string sought = SetFromStringHelper::ToLowercase(name);
    const auto* const row =
        std::find_if(kScaleCatalogue.begin(), kScaleCatalogue.end(), [&](const CScaleRow& scale) {
            return !scale.mName.empty() && SetFromStringHelper::ToLowercase(scale.mName) == sought;
        });
    return row == kScaleCatalogue.end() ? nullptr : row;
}

}  // namespace

CKeyText ReadKeyText(std::string_view typed) {
    const std::string text = EnglishKeyText(typed).value_or(std::string(typed));
    const CTypedRoot root = ReadRoot(text);
    if (root.mRoot.IsUndef()) return {{}, "a key begins with a letter A to H, as in \"Bb minor\""};
    int position = root.mConsumed;
    const TSignKeyType type = _SignKeyTypeFromString(text, position);
    if (!IsReadToItsEnd(text, position)) {
        return {{}, "behind the key stands major or minor, or nothing", root.mWord};
    }
    return {{root.mRoot, type}, {}, 0};
}

CScaleText ReadScaleText(std::string_view typed) {
    const std::string text(typed);
    const CTypedRoot root = ReadRoot(text);
    if (root.mRoot.IsUndef()) {
        return {{}, "a scale begins with a letter A to H, as in \"D dorian\""};
    }
    int position = root.mConsumed;
    static_cast<void>(_SemitonesScaleFromString(text, position));
    if (!IsReadToItsEnd(text, position)) {
        const CScaleRow* const row = ScaleOfName(std::string_view(text).substr(root.mWord));
        if (row == nullptr) return {{}, "no scale of this name is known", root.mWord};
        return {CScaleHeavy(root.mRoot, row->Semitones()), {}, 0};
    }
    CScaleText read;
    read.mScale.SetFromString(text, ChordNamePrefsNonUTF8);
    return read;
}

}  // namespace brindle
