// SPDX-License-Identifier: MIT
#include "brindle/platform/ReadNumber.h"
#include "brindle/song/internal/SongTokens.h"
#include "brindle/song/internal/SongWords.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <string>

namespace brindle::SongText {
namespace {

enum class TDirective {
    Title,
    Maker,
    Style,
    Key,
    Time,
    Tempo,
    Capo,
    Transpose,
    Remark,
    Meta,
    Section,
    BeginChorus,
    EndChorus,
    ChorusAgain,
    BeginSkip,
    EndSkip,
    BeginGrid,
    EndGrid,
    Nothing,
};

struct CDirectiveRow {
    std::string_view mName;
    TDirective mDirective;
    /// The name of a section that has none of its own.
    std::string_view mSection = {};
};

constexpr auto kDirectiveRows = std::to_array<CDirectiveRow>({
    {"title", TDirective::Title},
    {"t", TDirective::Title},
    {"subtitle", TDirective::Remark},
    {"st", TDirective::Remark},
    {"artist", TDirective::Maker},
    {"composer", TDirective::Maker},
    {"lyricist", TDirective::Maker},
    {"arranger", TDirective::Remark},
    {"album", TDirective::Remark},
    {"year", TDirective::Remark},
    {"copyright", TDirective::Remark},
    {"duration", TDirective::Remark},
    {"sorttitle", TDirective::Remark},
    {"tag", TDirective::Remark},
    {"style", TDirective::Style},
    {"key", TDirective::Key},
    {"time", TDirective::Time},
    {"tempo", TDirective::Tempo},
    {"capo", TDirective::Capo},
    {"transpose", TDirective::Transpose},
    {"meta", TDirective::Meta},
    {"comment", TDirective::Section},
    {"c", TDirective::Section},
    {"comment_italic", TDirective::Section},
    {"ci", TDirective::Section},
    {"comment_box", TDirective::Section},
    {"cb", TDirective::Section},
    {"highlight", TDirective::Section},
    {"start_of_chorus", TDirective::BeginChorus, "Chorus"},
    {"soc", TDirective::BeginChorus, "Chorus"},
    {"end_of_chorus", TDirective::EndChorus},
    {"eoc", TDirective::EndChorus},
    {"chorus", TDirective::ChorusAgain, "Chorus"},
    {"start_of_verse", TDirective::Section, "Verse"},
    {"sov", TDirective::Section, "Verse"},
    {"start_of_bridge", TDirective::Section, "Bridge"},
    {"sob", TDirective::Section, "Bridge"},
    {"end_of_verse", TDirective::Nothing},
    {"eov", TDirective::Nothing},
    {"end_of_bridge", TDirective::Nothing},
    {"eob", TDirective::Nothing},
    // Tablature is no text of chords, nor is what other programs draw.
    {"start_of_tab", TDirective::BeginSkip},
    {"sot", TDirective::BeginSkip},
    {"end_of_tab", TDirective::EndSkip},
    {"eot", TDirective::EndSkip},
    {"start_of_abc", TDirective::BeginSkip},
    {"end_of_abc", TDirective::EndSkip},
    {"start_of_ly", TDirective::BeginSkip},
    {"end_of_ly", TDirective::EndSkip},
    {"start_of_musicxml", TDirective::BeginSkip},
    {"end_of_musicxml", TDirective::EndSkip},
    {"start_of_svg", TDirective::BeginSkip},
    {"end_of_svg", TDirective::EndSkip},
    {"start_of_textblock", TDirective::BeginSkip},
    {"end_of_textblock", TDirective::EndSkip},
    {"start_of_grid", TDirective::BeginGrid},
    {"sog", TDirective::BeginGrid},
    {"end_of_grid", TDirective::EndGrid},
    {"eog", TDirective::EndGrid},
});

/// `Verse 1` and `label="Verse 1"` name a section alike.
std::string_view LabelIn(std::string_view value) {
    std::string_view rest = value;
    if (!Ascii::TakePrefix(rest, "label=") || rest.empty()) return value;
    const char quote = rest.front();
    if (quote != '"' && quote != '\'') return rest.substr(0, rest.find_first_of(" \t"));
    rest.remove_prefix(1);
    return rest.substr(0, rest.find(quote));
}

/// A number from -24 to 24, 0 for what is none.
int SmallNumber(std::string_view text) {
    return std::clamp(ReadInteger(text), -24, 24);
}

class CChordProText {
public:
    explicit CChordProText(CTokenList& list) : mList(list) {}

    /// Of a song with its chords in brackets.
    void CutLine(std::string_view line) {
        line = Trimmed(line);
        if (IsNoText(line)) return;
        line = BehindSection(line);
        if (mIsGrid || HasChordsAlone(line)) return CutChordsAlone(line);
        if (IsLineOfChords(line)) return CutSheetLine(line, mList);
        CutLyrics(line);
    }

    /// Of a song without brackets, whose chords stand on lines of their own.
    void CutLine(const CTextLine& line) {
        if (IsNoText(line.mText)) return;
        if (mIsGrid) return CutChordsAlone(line.mText);
        CutLineOfSheet(line, mList);
    }

private:
    /// A line without chords or lyrics; directives are obeyed.
    bool IsNoText(std::string_view line) {
        if (line.empty() || line.front() == '#') return true;
        const bool isDirective = line.front() == '{' && line.back() == '}';
        if (isDirective) CutDirective(line.substr(1, line.size() - 2));
        return isDirective || mIsSkipping;
    }

    void CutDirective(std::string_view directive) {
        directive = TrimmedInFront(directive);
        const std::string name = Lower(directive.substr(0, directive.find_first_of(": \t")));
        std::string_view value = TrimmedInFront(directive.substr(name.size()));
        if (value.starts_with(':')) value = TrimmedInFront(value.substr(1));
        Obey(name, value, directive);
    }

    void Obey(std::string_view name, std::string_view value, std::string_view directive) {
        const auto* const row =
            std::find_if(kDirectiveRows.begin(), kDirectiveRows.end(),
                         [&](const CDirectiveRow& r) { return r.mName == name; });
        if (row != kDirectiveRows.end()) {
            Obey(*row, value);
        } else if (name.starts_with("start_of_")) {
            AddSection(LabelIn(value), directive.substr(9, name.size() - 9));
        }
    }

    void Obey(const CDirectiveRow& row, std::string_view value) {
        CSong& song = mList.Song();
        switch (row.mDirective) {
            case TDirective::Title:
                if (song.mTitle.empty()) song.mTitle = value;
                return;
            case TDirective::Maker:
                return AddMaker(value);
            case TDirective::Style:
                if (song.mStyle.empty()) song.mStyle = value;
                return;
            case TDirective::Remark:
                song.mRemarks.push_back({std::string(NameOfRemark(row)), std::string(value)});
                return;
            case TDirective::Meta:
                return AddMeta(value);
            case TDirective::Key:
                mList.Add(TTokenKind::Key, value);
                return;
            case TDirective::Time:
                return AddTime(value);
            case TDirective::Tempo:
                return SetTempo(value);
            case TDirective::Capo:
                song.mCapo = std::max(0, SmallNumber(value));
                return;
            case TDirective::Transpose:
                song.mTranspose = SmallNumber(value);
                return;
            default:
                return ObeyInTime(row, value);
        }
    }

    /// What concerns the passages of the song.
    void ObeyInTime(const CDirectiveRow& row, std::string_view value) {
        switch (row.mDirective) {
            case TDirective::BeginChorus:
                mChorusBegin = mList.mTokens.size();
                mIsInChorus = true;
                [[fallthrough]];
            case TDirective::Section:
                return AddSection(LabelIn(value), row.mSection);
            case TDirective::EndChorus:
                if (mIsInChorus) mChorusEnd = mList.mTokens.size();
                mIsInChorus = false;
                return;
            case TDirective::ChorusAgain:
                return PlayChorusAgain(value, row.mSection);
            case TDirective::BeginSkip:
            case TDirective::EndSkip:
                mIsSkipping = row.mDirective == TDirective::BeginSkip;
                return;
            case TDirective::BeginGrid:
            case TDirective::EndGrid:
                mIsGrid = row.mDirective == TDirective::BeginGrid;
                return;
            default:
                return;
        }
    }

    void AddSection(std::string_view name, std::string_view usual) {
        mList.Add(TTokenKind::Section, name.empty() ? usual : name);
    }

    static std::string_view NameOfRemark(const CDirectiveRow& row) {
        return row.mName == "st" ? "subtitle" : row.mName;
    }

    void AddMaker(std::string_view maker) {
        std::string& makers = mList.Song().mMakers;
        if (maker.empty() || makers.find(maker) != makers.npos) return;
        if (!makers.empty()) makers += ", ";
        makers += maker;
    }

    /// `{meta: artist Somebody}` is `{artist: Somebody}`.
    void AddMeta(std::string_view value) {
        const std::string name = Lower(TakeWordOf(value));
        if (name.empty() || name == "meta") return;
        const auto* const row =
            std::find_if(kDirectiveRows.begin(), kDirectiveRows.end(),
                         [&](const CDirectiveRow& r) { return r.mName == name; });
        if (row != kDirectiveRows.end()) return Obey(*row, value);
        mList.Song().mRemarks.push_back({name, std::string(value)});
    }

    void AddTime(std::string_view value) {
        if (const CSongTime time = ReadTime(value); !time.IsUndef()) {
            mList.Add(TTokenKind::Time).mTime = time;
        } else {
            mList.AddNote(value, "a time is written as in 3/4");
        }
    }

    void SetTempo(std::string_view value) {
        const double tempo = value.empty() ? 0.0 : ReadDecimal(value);
        if (tempo > 0.0 && std::isfinite(tempo)) {
            if (!mList.Song().mTempo) mList.Song().mTempo = tempo;
        } else {
            mList.AddNote(value, "a tempo is a number of beats a minute");
        }
    }

    /// `value` is part of the text, also when it is empty.
    void PlayChorusAgain(std::string_view value, std::string_view name) {
        if (mChorusEnd <= mChorusBegin) {
            return mList.AddNote(value, "there is no chorus before this one");
        }
        AddSection(LabelIn(value), name);
        // The first token of a chorus is its name.
        if (!mList.AddAgain(mChorusBegin + 1, mChorusEnd)) {
            mList.AddFault(value, "the choruses make the song too long");
        }
    }

    /// Takes the name of a part off, which is no chord: `[Verse 1]`.
    std::string_view BehindSection(std::string_view line) {
        const std::size_t length = LengthOfNameInBrackets(line);
        if (length == 0) return line;
        mList.Add(TTokenKind::Section, Trimmed(line.substr(1, length - 2)));
        return Trimmed(line.substr(length));
    }

    /// Chords, bar lines and holds, and no lyrics between them.
    static bool HasChordsAlone(std::string_view line) {
        constexpr std::string_view kMarks = "|:./%-";
        bool isInBrackets = false;
        for (const char c : line) {
            if (c == '[') isInBrackets = true;
            if (!isInBrackets && !IsBlank(c) && kMarks.find(c) == kMarks.npos) return false;
            if (c == ']') isInBrackets = false;
        }
        return line.find("[*") == line.npos;
    }

    void CutChordsAlone(std::string_view line) {
        while (!line.empty() && !mList.IsGivenUp()) {
            const std::size_t end = std::min(line.find_first_of("[]"), line.size());
            CutChordLine(line.substr(0, end), mList);
            line.remove_prefix(std::min(end + 1, line.size()));
        }
    }

    void CutLyrics(std::string_view line) {
        while (!mList.IsGivenUp()) {
            const std::size_t begin = line.find('[');
            if (begin == line.npos) return;
            const std::size_t end = line.find(']', begin);
            if (end == line.npos) {
                return mList.AddFault(line.substr(begin), "\"[\" has no \"]\" behind it");
            }
            CutBrackets(Trimmed(line.substr(begin + 1, end - begin - 1)));
            line.remove_prefix(end + 1);
        }
    }

    void CutBrackets(std::string_view inside) {
        // `[*slowly]` is a remark.
        if (inside.empty() || inside.front() == '*') return;
        CutChordLine(inside, mList);
    }

    CTokenList& mList;
    bool mIsSkipping = false;
    bool mIsGrid = false;
    bool mIsInChorus = false;
    /// The tokens of the last chorus.
    std::size_t mChorusBegin = 0;
    std::size_t mChorusEnd = 0;
};

}  // namespace

void CutChordPro(CTokenList& list) {
    CChordProText chordPro(list);
    if (HasChordInBrackets(list.Text())) {
        std::string_view rest = list.Text();
        while (!rest.empty() && !list.IsGivenUp()) chordPro.CutLine(TakeLine(rest));
        return;
    }
    for (const CTextLine& line : LinesOf(list.Text())) {
        if (list.IsGivenUp()) return;
        chordPro.CutLine(line);
    }
}

}  // namespace brindle::SongText
