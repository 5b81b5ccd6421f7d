// SPDX-License-Identifier: MIT
#include "brindle/theory/ReadKeyText.h"

#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/KeyNames.h"
#include "brindle/theory/ScaleCatalogue.h"
#include "brindle/theory/ScaleStrings.h"
#include "brindle/theory/SetFromStringHelper.h"
#include "brindle/theory/SignKeyStrings.h"
#include "brindle/theory/internal/GermanKeyText.h"

#include <algorithm>
#include <utility>

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

// Where a place in the text with # and b stands in what was typed, whose signs may be longer.
std::size_t TypedColumn(std::string_view typed, std::size_t column) {
    std::size_t at = 0;
    for (; column > 0 && at < typed.size(); --column) {
        const std::string_view rest = typed.substr(at);
        at += rest.starts_with(kUtf8Sharp) || rest.starts_with(kUtf8Flat) ? kUtf8Sharp.size() : 1;
    }
    return std::min(at, typed.size());
}

std::string WithAsciiSigns(std::string_view typed) {
    std::string text(typed);
    ConvertUtf8SharpAndFlatToAscii(text);
    return text;
}

// "E flat minor" as "Eb minor"; other texts as they are.
std::string WithSignsForWords(const std::string& text) {
    const bool hasGap = text.size() > 2 && (text[1] == ' ' || text[1] == '-');
    if (!hasGap) return text;
    const std::string behind = SetFromStringHelper::ToLowercase(std::string_view(text).substr(2));
    for (const auto& [word, sign] : {std::pair("flat", 'b'), std::pair("sharp", '#')}) {
        const std::size_t end = std::string_view(word).size();
        if (!behind.starts_with(word) || (behind.size() > end && behind[end] != ' ')) continue;
        return text.substr(0, 1) + sign + text.substr(2 + end);
    }
    return text;
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
    const std::string plain = WithAsciiSigns(typed);
    const std::string text = WithSignsForWords(EnglishKeyText(plain).value_or(plain));
    const CTypedRoot root = ReadRoot(text);
    if (root.mRoot.IsUndef()) return {{}, "a key begins with a letter A to H, as in \"Bb minor\""};
    int position = root.mConsumed;
    const TSignKeyType type = _SignKeyTypeFromString(text, position);
    if (!IsReadToItsEnd(text, position)) {
        return {{},
                "behind the key stands major or minor, or nothing",
                TypedColumn(typed, root.mWord + std::max(plain.size(), text.size()) - text.size())};
    }
    return {{root.mRoot, type}, {}, 0};
}

CScaleText ReadScaleText(std::string_view typed) {
    const std::string text = WithAsciiSigns(typed);
    const CTypedRoot root = ReadRoot(text);
    if (root.mRoot.IsUndef()) {
        return {{}, "a scale begins with a letter A to H, as in \"D dorian\""};
    }
    int position = root.mConsumed;
    static_cast<void>(_SemitonesScaleFromString(text, position));
    if (!IsReadToItsEnd(text, position)) {
        const CScaleRow* const row = ScaleOfName(std::string_view(text).substr(root.mWord));
        if (row == nullptr)
            return {{}, "no scale of this name is known", TypedColumn(typed, root.mWord)};
        return {CScaleHeavy(root.mRoot, row->Semitones()), {}, 0};
    }
    CScaleText read;
    read.mScale.SetFromString(text, ChordNamePrefsNonUTF8);
    return read;
}

}  // namespace brindle
