// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/ChordSheetTokens.h"
#include "brindle/analysis/internal/ChordSheetWords.h"

#include <algorithm>
#include <array>

namespace brindle::ChordSheet {
namespace {

enum class TDirective { Title, Key, Time, Section, BeginSkip, EndSkip, BeginGrid, EndGrid };

struct TDirectiveRow {
    std::string_view mName;
    TDirective mDirective;
    /// The name of a section that has none of its own.
    std::string_view mSection = {};
};

// Directives without a row mean nothing to the chords.
constexpr auto kDirectiveRows = std::to_array<TDirectiveRow>({
    {"title", TDirective::Title},
    {"t", TDirective::Title},
    {"key", TDirective::Key},
    {"time", TDirective::Time},
    {"comment", TDirective::Section},
    {"c", TDirective::Section},
    {"start_of_chorus", TDirective::Section, "Chorus"},
    {"soc", TDirective::Section, "Chorus"},
    {"start_of_verse", TDirective::Section, "Verse"},
    {"sov", TDirective::Section, "Verse"},
    {"start_of_bridge", TDirective::Section, "Bridge"},
    {"sob", TDirective::Section, "Bridge"},
    // Tablature is no text of chords.
    {"start_of_tab", TDirective::BeginSkip},
    {"sot", TDirective::BeginSkip},
    {"end_of_tab", TDirective::EndSkip},
    {"eot", TDirective::EndSkip},
    {"start_of_grid", TDirective::BeginGrid},
    {"sog", TDirective::BeginGrid},
    {"end_of_grid", TDirective::EndGrid},
    {"eog", TDirective::EndGrid},
});

/// The beats of "3/4", 0 for what is none.
double BeatsOf(std::string_view time) {
    int beats = 0;
    for (std::size_t i = 0; i < time.size() && IsDigit(time[i]) && beats < 100; ++i) {
        beats = beats * 10 + (time[i] - '0');
    }
    return beats;
}

class CChordProText {
public:
    explicit CChordProText(CTokenList& list) : mList(list) {}

    void CutLine(std::string_view line) {
        line = Trimmed(line);
        if (line.empty() || line.front() == '#') return;
        if (line.front() == '{' && line.back() == '}') {
            return CutDirective(line.substr(1, line.size() - 2));
        }
        if (mIsSkipping) return;
        if (mIsGrid || HasChordsAlone(line)) return CutChordsAlone(line);
        CutLyrics(line);
    }

private:
    void CutDirective(std::string_view directive) {
        const std::string_view name = directive.substr(0, directive.find_first_of(": \t"));
        const std::size_t begin = std::min(name.size() + 1, directive.size());
        const std::string_view value = Trimmed(directive.substr(begin));
        const auto* const row =
            std::find_if(kDirectiveRows.begin(), kDirectiveRows.end(),
                         [&](const TDirectiveRow& r) { return r.mName == name; });
        if (row != kDirectiveRows.end()) Obey(*row, value);
    }

    void Obey(const TDirectiveRow& row, std::string_view value) {
        switch (row.mDirective) {
            case TDirective::Title:
                if (mList.mTitle.empty()) mList.mTitle = value;
                return;
            case TDirective::Key:
                if (mList.mKey.empty()) mList.mKey = value;
                return;
            case TDirective::Time:
                if (const double beats = BeatsOf(value); beats > 0.0) {
                    mList.Add(TTokenKind::Beats).mBeats = beats;
                }
                return;
            case TDirective::Section:
                mList.Add(TTokenKind::Section, value.empty() ? row.mSection : value);
                return;
            case TDirective::BeginSkip:
            case TDirective::EndSkip:
                mIsSkipping = row.mDirective == TDirective::BeginSkip;
                return;
            case TDirective::BeginGrid:
            case TDirective::EndGrid:
                mIsGrid = row.mDirective == TDirective::BeginGrid;
                return;
        }
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
            CutPlainLine(line.substr(0, end), mList);
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
        CutPlainLine(inside, mList);
    }

    CTokenList& mList;
    bool mIsSkipping = false;
    bool mIsGrid = false;
};

}  // namespace

void CutChordPro(CTokenList& list) {
    CChordProText chordPro(list);
    std::string_view rest = list.Text();
    while (!rest.empty() && !list.IsGivenUp()) chordPro.CutLine(TakeLine(rest));
}

}  // namespace brindle::ChordSheet
