// SPDX-License-Identifier: MIT
#include "brindle/markov/MarkovChords.h"
#include "brindle/platform/Utf8.h"
#include "brindle/song/internal/SongReaders.h"
#include "brindle/theory/KeyNames.h"

#include <algorithm>
#include <cmath>

namespace brindle::SongReaders {

namespace {

/// Puts chords with lengths one behind the other.
class CChordStrings {
public:
    CChordStrings(std::string_view text, CSong& song) : mText(text), mSong(song) {}

    void Read() {
        while (!mText.empty()) {
            ++mLine;
            const std::size_t end = std::min(mText.find('\n'), mText.size());
            ReadLine(mText.substr(0, end));
            mText.remove_prefix(std::min(end + 1, mText.size()));
            // Lines do not go on from each other.
            if (!mSong.mChords.empty()) mSong.mSections.push_back({{}, mPosition});
        }
        while (!mSong.mSections.empty() && mSong.mSections.back().mPosition >= mPosition) {
            mSong.mSections.pop_back();
        }
        if (!mSong.mChords.empty()) mSong.mChords.emplace_back(CChordLite_Undef, mPosition);
    }

private:
    void ReadLine(std::string_view line) {
        for (std::size_t begin = 0; begin < line.size();) {
            const std::size_t end = std::min(line.find(';', begin), line.size());
            ReadElement(line, begin, line.substr(begin, end - begin));
            begin = end + 1;
        }
    }

    void ReadElement(std::string_view line, std::size_t begin, std::string_view element) {
        std::string kept(element);
        std::erase_if(kept, [](char c) { return c == ' ' || c == '\t' || c == '\r'; });
        if (kept.empty()) return;
        ConvertUtf8SharpAndFlatToAscii(kept);
        for (const CHarmAnlsChordWithLength& chord : HarmChordsFromChordString(kept)) {
            const bool isFine = std::isfinite(chord.mLength) && chord.mLength > 0.0;
            const std::string symbol = SymbolIn(kept);
            if (!isFine || (chord.IsUndef() && symbol != "U")) {
                AddFault(line, begin, "\"" + kept + "\" is no length and chord, as in (4,C)");
            }
            if (!isFine) continue;
            mSong.mChords.emplace_back(chord, mPosition);
            mSong.mSymbols.push_back(symbol);
            mPosition += chord.mLength;
        }
    }

    static std::string SymbolIn(std::string_view element) {
        const std::size_t comma = std::min(element.find(','), element.size() - 1) + 1;
        return std::string(element.substr(comma, element.find_first_of(",)", comma) - comma));
    }

    void AddFault(std::string_view line, std::size_t offset, std::string text) {
        const std::size_t before = CountUtf8Characters(line.substr(0, offset));
        mSong.mFaults.push_back({mLine, before + 1, std::move(text)});
    }

    std::string_view mText;
    CSong& mSong;
    std::size_t mLine = 0;
    double mPosition = 0.0;
};

}  // namespace

CSong ReadChordStrings(std::string_view text, const CSongOptions& prefs) {
    CSong song;
    song.mFormat = TSongFormat_ChordStrings;
    song.mBeatsPerBar = prefs.mBeatsPerBar;
    CChordStrings(text, song).Read();
    GiveUpWhatIsAtFault(song, prefs.mLenient);
    return song;
}

void GiveUpWhatIsAtFault(CSong& song, bool isLenient) {
    if (isLenient || !song.HasFault()) return;
    CSong left;
    left.mTitle = std::move(song.mTitle);
    left.mMakers = std::move(song.mMakers);
    left.mStyle = std::move(song.mStyle);
    left.mBeatsPerBar = song.mBeatsPerBar;
    left.mFormat = song.mFormat;
    left.mFaults = std::move(song.mFaults);
    song = std::move(left);
}

}  // namespace brindle::SongReaders
