// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/ChordSheetTokens.h"
#include "brindle/musicxml/ScoreContainer.h"
#include "brindle/song/ReadSong.h"

namespace brindle {

namespace {

std::string_view WithoutBlanksInFront(std::string_view bytes) {
    for (const std::string_view mark : {"\xEF\xBB\xBF", "\xFF\xFE", "\xFE\xFF"}) {
        if (bytes.starts_with(mark)) bytes.remove_prefix(mark.size());
    }
    const std::size_t first = bytes.find_first_not_of(std::string_view(" \t\r\n\0", 5));
    return first == bytes.npos ? std::string_view() : bytes.substr(first);
}

}  // namespace

TSongFormat SongFormatOf(std::string_view bytes) {
    if (IsScoreContainer(bytes)) return TSongFormat_CompressedMusicXml;
    const std::string_view text = WithoutBlanksInFront(bytes);
    if (text.starts_with('<')) return TSongFormat_MusicXml;
    if (text.starts_with('(')) return TSongFormat_ChordStrings;
    switch (ChordSheet::LikeliestForm(text)) {
        case TChordSheet_ChordPro:
            return TSongFormat_ChordPro;
        case TChordSheet_IReal:
            return TSongFormat_Chart;
        case TChordSheet_Plain:
        case TChordSheet_Auto:
            break;
    }
    return TSongFormat_ChordText;
}

}  // namespace brindle
