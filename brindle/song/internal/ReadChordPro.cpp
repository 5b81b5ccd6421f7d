// SPDX-License-Identifier: MIT
#include "brindle/song/internal/SongReaders.h"
#include "brindle/song/internal/SongWords.h"

namespace brindle::SongReaders {

namespace {

bool BeginsSong(std::string_view line) {
    const std::string directive = SongText::Lower(SongText::Trimmed(line));
    return directive == "{new_song}" || directive == "{ns}";
}

}  // namespace

std::vector<CPartOfText> SongsOfChordPro(std::string_view text) {
    std::vector<CPartOfText> songs;
    const auto begin = [&](const char* place, std::size_t line) {
        // What holds nothing but white space is no song.
        if (!songs.empty() && SongText::Trimmed(songs.back().mText).empty()) songs.pop_back();
        songs.push_back({{place, 0}, line});
    };
    begin(text.data(), 0);
    std::size_t lineCount = 0;
    for (std::string_view rest = text; !rest.empty(); ++lineCount) {
        const std::string_view line = SongText::TakeLine(rest);
        if (BeginsSong(line)) {
            begin(rest.data(), lineCount + 1);
        } else {
            const char* const first = songs.back().mText.data();
            songs.back().mText = {first, static_cast<std::size_t>(rest.data() - first)};
        }
    }
    if (songs.size() > 1 && SongText::Trimmed(songs.back().mText).empty()) songs.pop_back();
    return songs;
}

CSong ReadChordProSong(const CPartOfText& part, const CSongOptions& prefs) {
    CSong song = ReadSheet(part.mText, TSongFormat_ChordPro, prefs);
    for (CSongFault& fault : song.mFaults) {
        if (fault.mLine > 0) fault.mLine += part.mLinesBefore;
    }
    return song;
}

}  // namespace brindle::SongReaders
