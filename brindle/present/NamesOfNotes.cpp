// SPDX-License-Identifier: MIT
#include "brindle/present/NamesOfNotes.h"

#include "brindle/present/JsonValues.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <algorithm>
#include <nlohmann/json.hpp>

namespace brindle {
namespace {

std::string NameOfNote(const CNote& note, const CChordNamePrefs& prefs) {
    const std::int64_t natural = note.mNoteNr - EnhToSemitone(note.mEnh);
    return note.KeyName(prefs) + CNote(std::max<std::int64_t>(natural, 0), TEnh_n).OctName(prefs);
}

}  // namespace

std::string NamesOfNotes(std::span<const CNote> notes, const CChordNamePrefs& prefs) {
    std::string names;
    for (const CNote& note : notes) names += (names.empty() ? "" : " ") + NameOfNote(note, prefs);
    return names;
}

Json NotesToJson(std::span<const CNote> notes, const CChordNamePrefs& prefs) {
    Json list = Json::array();
    for (const CNote& note : notes) {
        list.push_back({{"Name", NameOfNote(note, prefs)}, {"NoteNr", note.mNoteNr}});
    }
    return list;
}

}  // namespace brindle
