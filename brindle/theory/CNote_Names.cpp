// SPDX-License-Identifier: MIT
#include "brindle/platform/PlainText.h"
#include "brindle/platform/ReadNumber.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CNote.h"
#include "brindle/theory/KeyNames.h"

#include <ostream>

// How a note is written and read: its key, its octave, its JSON text.

namespace brindle {

namespace {

/// The number that names the octave of notes 0 to 11.
std::int64_t NumberOfLowestOct(const CChordNamePrefs& prefs) {
    if (prefs.mOctaveNaming == 2) return 0;
    return prefs.mOctaveNaming == 0 ? -2 : -1;
}

}  // namespace

std::string CNote::KeyName(const CChordNamePrefs& prefs) const {
    return KeyNrAndEnhToName(KeyNr(), mEnh, prefs);
}

std::string CNote::KeyNameWithoutEnh(const CChordNamePrefs& prefs) const {
    return KeyNrToNameIgnoringEnh(KeyNr(), mEnh, prefs);
}

std::string CNote::OctName(const CChordNamePrefs& prefs) const {
    if (IsUndef()) return {};
    return std::to_string(mNoteNr / 12 + NumberOfLowestOct(prefs));
}

bool CNote::SetFromString(std::string_view text, const CChordNamePrefs& prefs) {
    std::string folded(text);
    ConvertUtf8SharpAndFlatToAscii(folded);
    const int used = SetKeyNrAndEnhAssumingCMajorFromString(folded, prefs);
    if (used == 0) return false;
    const auto number = ReadInteger(std::string_view(folded).substr(std::size_t(used)));
    // SetOct counts the lowest octave as -1.
    const std::int64_t oct = std::int64_t{number} - NumberOfLowestOct(prefs) - 1;
    SetOct(static_cast<int>(std::clamp<std::int64_t>(oct, -2, 10)));
    return true;
}

int CNote::SetKeyNrAndEnhAssumingCMajorFromString(std::string_view text,
                                                  const CChordNamePrefs& prefs) {
    CKeyEnh keyEnh;
    int used = 0;
    keyEnh.SetFromString(text, &used, prefs);
    if (keyEnh.IsUndef()) {
        *this = CNote_Undef;
        return 0;
    }
    mEnh = keyEnh.mEnh;
    SetKeyNrAndEnhAssumingCMajor(keyEnh.mKeyNr);
    return used;
}

void CNote::AppendJSONString(std::ostream& stream) const {
    PlainText::Write(stream, R"({"name":")");
    PlainText::Write(stream, KeyName(CurrentChordNamePrefs));
    PlainText::Write(stream, R"(","nr":)");
    PlainText::WriteInteger(stream, mNoteNr);
    stream << R"(,"enh":")" << mEnh << "\"}";
}

}  // namespace brindle
