// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/CChordTextParser.h"

#include <algorithm>

namespace brindle::ChordText {
namespace {

/// Where a bass may begin: a slash or the word `on`, and the note behind it.
struct CSeparator {
    std::size_t mBegin = 0;
    std::size_t mNote = 0;
};

std::optional<CSeparator> LastSlash(std::string_view text) {
    const std::size_t slash = text.rfind('/');
    if (slash == text.npos) return std::nullopt;
    return CSeparator{slash, slash + 1};
}

// `F on G`, or directly before a capital, `FonG`.
bool IsOn(std::string_view text, std::size_t on) {
    const std::size_t behind = on + 2;
    if (behind >= text.size()) return false;
    const bool standsAlone = on > 0 && text[on - 1] == ' ' && text[behind] == ' ';
    return standsAlone || IsCapitalNote(text[behind]);
}

std::optional<CSeparator> LastOn(std::string_view text) {
    std::size_t on = text.rfind("on");
    while (on != text.npos) {
        if (IsOn(text, on)) return CSeparator{on, on + 2};
        on = text.substr(0, on).rfind("on");
    }
    return std::nullopt;
}

}  // namespace

void CChordTextParser::CutBass() {
    const std::string_view rest = mScan.Rest();
    const auto slash = LastSlash(rest);
    const auto on = LastOn(rest);
    if (!slash && !on) return;
    const CSeparator last = !on || (slash && slash->mBegin > on->mBegin) ? *slash : *on;
    CutBassBehind(mScan.mPos + last.mBegin, mScan.mPos + last.mNote);
}

void CChordTextParser::CutBassBehind(std::size_t separator, std::size_t name) {
    mBass = WholeNote(name);
    if (!mBass) return;
    CTextScan before = mScan;
    before.CutAt(separator);
    const std::string_view rest = before.Rest();
    const std::size_t last = rest.find_last_not_of(' ');
    const bool hasOpenBracket = last != rest.npos && rest[last] == '(';
    mScan.CutAt(hasOpenBracket ? mScan.mPos + last : separator);
}

std::optional<CWrittenNote> CChordTextParser::WholeNote(std::size_t pos) const {
    CTextScan scan = mScan;
    scan.mPos = pos;
    scan.SkipBlanks();
    auto note = TakeNote(scan, mPrefs);
    if (!note) return std::nullopt;
    // Tune books write `D/f+`.
    if (note->mAccidental == 0 && scan.Take('+')) note->mAccidental = 1;
    const std::string_view rest = scan.Rest();
    const bool isAll =
        std::all_of(rest.begin(), rest.end(), [](char c) { return c == ' ' || c == ')'; });
    if (!isAll) return std::nullopt;
    return note;
}

}  // namespace brindle::ChordText
