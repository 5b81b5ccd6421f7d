// SPDX-License-Identifier: MIT
#include "brindle/song/internal/StatedKey.h"

#include "brindle/song/CSong.h"
#include "brindle/song/internal/SongWords.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/KeyNames.h"
#include "brindle/theory/SignKeyStrings.h"

namespace brindle {

std::optional<CSignKeyLite> ReadStatedKey(std::string_view text) {
    std::string folded(SongText::Trimmed(text));
    ConvertUtf8SharpAndFlatToAscii(folded);
    // Charts write minor as a minus.
    if (folded.ends_with('-')) folded.back() = 'm';
    CKeyEnh root;
    int position = 0;
    root.SetFromString(folded, &position, ChordNamePrefsNonUTF8);
    if (root.IsUndef()) return std::nullopt;
    const TSignKeyType type = _SignKeyTypeFromString(folded, position);
    const bool isWhole =
        folded.find_first_not_of(' ', static_cast<std::size_t>(position)) == folded.npos;
    if (!isWhole) return std::nullopt;
    return CSignKeyLite(root, type);
}

void AppendStatedKey(std::string_view text, double position, CSong& song) {
    if (const auto key = ReadStatedKey(text)) AppendStatedKey(*key, position, song);
}

void AppendStatedKey(const CSignKeyLite& key, double position, CSong& song) {
    CHarmAnlsSignKeys& keys = song.mStatedKeys;
    if (!keys.empty() && keys.back().mSignKey == key) return;
    // A key that begins later than the song leaves the beginning without one.
    if (keys.empty() && position > 0.0) keys.emplace_back().mPosition = 0.0;
    if (keys.empty() && !key.IsUndef()) song.mStatedKey = key;
    if (keys.empty() || keys.back().mPosition != position) keys.emplace_back();
    keys.back().mPosition = position;
    keys.back().mSignKey = key;
}

}  // namespace brindle
