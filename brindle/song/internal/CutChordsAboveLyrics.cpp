// SPDX-License-Identifier: MIT
#include "brindle/platform/ReadNumber.h"
#include "brindle/song/internal/LineKinds.h"
#include "brindle/song/internal/PlayWords.h"
#include "brindle/song/internal/SongTokens.h"
#include "brindle/song/internal/SongWords.h"

#include <algorithm>
#include <cmath>
#include <string>

namespace brindle::SongText {

namespace {

/// The chords of a line, behind the name of a part: `[Intro] G C`.
void CutChordsOfSheet(std::string_view line, CTokenList& list) {
    const std::size_t bracket = line.front() == '[' ? line.find(']') : line.npos;
    if (bracket != line.npos && !IsDigit(line[1]) && LengthOfPlayWords(line) == 0) {
        list.Add(TTokenKind::Section, Trimmed(line.substr(1, bracket - 1)));
        line = Trimmed(line.substr(bracket + 1));
    }
    CutSheetLine(line, list);
}

class CSheet {
public:
    explicit CSheet(CTokenList& list) : mList(list), mLines(LinesOf(list.Text())) {}

    void Cut() {
        TakeHead();
        for (const CTextLine& line : mLines) {
            if (mList.IsGivenUp()) return;
            if (line.mKind == TLineKind::Field) TakeField(line.mText);
            CutLineOfSheet(line, mList);
        }
    }

private:
    /// The first lines are the title and the maker if a blank line parts them from the song.
    void TakeHead() {
        CSong& song = mList.Song();
        const auto isWord = [](const CTextLine& line) { return line.mKind == TLineKind::Lyrics; };
        auto begin = std::find_if(mLines.begin(), mLines.end(), [](const CTextLine& line) {
            return line.mKind != TLineKind::Blank;
        });
        const auto end = std::find_if_not(begin, mLines.end(), isWord);
        const bool isHead = begin != end && end - begin <= 3 &&
                            (end == mLines.end() || end->mKind == TLineKind::Blank ||
                             end->mKind == TLineKind::Field);
        if (!isHead) return;
        song.mTitle = begin->mText;
        if (++begin != end) song.mMakers = WithoutBy(begin->mText);
    }

    static std::string_view WithoutBy(std::string_view makers) {
        std::string_view rest = makers;
        return Lower(TakeWordOf(rest)) == "by" && !rest.empty() ? rest : makers;
    }

    void TakeField(std::string_view line) {
        CSong& song = mList.Song();
        const std::size_t end = std::min(line.find_first_of(": \t"), line.size());
        const std::string name = Lower(line.substr(0, end));
        const std::string_view value =
            Trimmed(line.substr(std::min(line.find_first_not_of(": \t", end), line.size())));
        if (name == "title") {
            song.mTitle = value;
        } else if (name == "artist" || name == "composer" || name == "by") {
            if (song.mMakers.empty()) song.mMakers = value;
        } else if (name == "style") {
            song.mStyle = value;
        } else if (name == "key") {
            mList.Add(TTokenKind::Key, value);
        } else if (name == "capo") {
            song.mCapo = std::clamp(ReadInteger(value), 0, 24);
        } else if (name == "tempo" || name == "bpm") {
            const double tempo = value.empty() ? 0.0 : ReadDecimal(value);
            if (tempo > 0.0 && std::isfinite(tempo)) song.mTempo = tempo;
        } else if (name == "time") {
            TakeTime(value);
        } else {
            song.mRemarks.push_back({name, std::string(value)});
        }
    }

    void TakeTime(std::string_view text) {
        const CSongTime time = ReadTime(text);
        if (!time.IsUndef()) mList.Add(TTokenKind::Time).mTime = time;
    }

    CTokenList& mList;
    std::vector<CTextLine> mLines;
};

}  // namespace

void CutLineOfSheet(const CTextLine& line, CTokenList& list) {
    if (line.mKind == TLineKind::Section) {
        list.Add(TTokenKind::Section, NameOfSection(line.mText));
    } else if (line.mKind == TLineKind::Chords) {
        CutChordsOfSheet(line.mText, list);
    }
}

void CutChordsAboveLyrics(CTokenList& list) {
    CSheet(list).Cut();
}

}  // namespace brindle::SongText
