// SPDX-License-Identifier: MIT
#include "brindle/song/internal/StatedKey.h"

#include "brindle/song/CSong.h"
#include "brindle/song/internal/SongWords.h"
#include "brindle/theory/ReadKeyText.h"

namespace brindle {

std::optional<CSignKeyLite> ReadStatedKey(std::string_view text) {
    std::string name(SongText::Trimmed(text));
    // Charts write minor as a minus.
    if (name.ends_with('-')) name.back() = 'm';
    const CKeyText key = ReadKeyText(name);
    if (!key.mError.empty()) return std::nullopt;
    return key.mSignKey;
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

void StateSeventh(TSeventhSpelling seventh, CSong& song) {
    if (seventh == TSeventhSpelling_Undef) return;
    song.mSevenths.resize(song.mChords.size());
    song.mSevenths.back() = seventh;
}

}  // namespace brindle
