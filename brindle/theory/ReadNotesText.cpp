// SPDX-License-Identifier: MIT
#include "brindle/theory/ReadNotesText.h"

#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <charconv>
#include <optional>
#include <utility>

namespace brindle {
namespace {

constexpr std::int64_t kMiddleC = 60;
constexpr std::int64_t kHighestNoteNr = 127;

/// The whole text as a number.
std::optional<int> WholeNumber(std::string_view text) {
    int number = 0;
    const char* const end = text.data() + text.size();
    const auto read = std::from_chars(text.data(), end, number);
    if (read.ec != std::errc() || read.ptr != end) return std::nullopt;
    return number;
}

/// The lowest note of a key that is not below `limit`.
std::int64_t NoteNrFrom(std::int64_t limit, int keyNr) {
    return limit + (keyNr - limit % 12 + 12) % 12;
}

class CNotesReader {
public:
    explicit CNotesReader(const CChordNamePrefs& prefs) : mPrefs(prefs) {}

    /// What is wrong with the word; empty if it is a note.
    std::string Read(std::string_view word) {
        if (const auto number = WholeNumber(word)) return Add(*number, TEnh_Undef, word);
        CKeyEnh key;
        int consumed = 0;
        key.SetFromString(std::string(word), &consumed, mPrefs);
        if (key.IsUndef()) {
            return "a note is a key and its octave, as in Eb4, or a number of 0 to 127";
        }
        const std::string_view octave = word.substr(static_cast<std::size_t>(consumed));
        if (octave.empty()) return Add(NoteNrFrom(mNext, key.mKeyNr), key.mEnh, word);
        const auto octaveNr = WholeNumber(octave);
        if (!octaveNr) return "behind the key stands its octave, not " + std::string(octave);
        return Add(NoteNrIn(*octaveNr, key), key.mEnh, word);
    }

    [[nodiscard]] CNotesText Notes() && { return std::move(mNotes); }

private:
    [[nodiscard]] std::int64_t NoteNrIn(int octaveNr, const CKeyEnh& key) const {
        const int octaveOfMiddleC = 3 + mPrefs.mOctaveNaming;
        const int signs = EnhToSemitone(key.mEnh);
        const int aboveC = FoldIntoOctave(key.mKeyNr - signs) + signs;
        return (std::int64_t{octaveNr} - octaveOfMiddleC) * 12 + kMiddleC + aboveC;
    }

    std::string Add(std::int64_t noteNr, TEnh enh, std::string_view word) {
        if (noteNr < 0 || noteNr > kHighestNoteNr) {
            return std::string(word) + " is outside of the notes 0 to 127";
        }
        if (mNotes.mTyped.size() == kMostTypedNotes) {
            return "a chord has at most " + std::to_string(kMostTypedNotes) + " notes";
        }
        mNotes.mTyped.emplace_back(noteNr, enh);
        const auto isSame = [&](const CNote& note) { return note.mNoteNr == noteNr; };
        if (std::none_of(mNotes.mNotes.begin(), mNotes.mNotes.end(), isSame)) {
            mNotes.mNotes.insert(CNote(noteNr, enh == TEnh_Undef ? TEnh_n : enh));
        }
        mNext = noteNr + 1;
        return {};
    }

    const CChordNamePrefs& mPrefs;
    CNotesText mNotes;
    std::int64_t mNext = kMiddleC;
};

}  // namespace

CNotesText ReadNotesText(std::string_view text, const CChordNamePrefs& prefs) {
    constexpr std::string_view blanks = " \t\r\n";
    CNotesReader reader(prefs);
    std::size_t begin = text.find_first_not_of(blanks);
    while (begin != text.npos) {
        const std::size_t end = std::min(text.find_first_of(blanks, begin), text.size());
        std::string error = reader.Read(text.substr(begin, end - begin));
        if (!error.empty()) return {{}, {}, std::move(error), begin};
        begin = text.find_first_not_of(blanks, end);
    }
    return std::move(reader).Notes();
}

}  // namespace brindle
