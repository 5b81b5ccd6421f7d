// SPDX-License-Identifier: MIT
#include "brindle/present/NamedChordsText.h"

#include "brindle/present/CTable.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/NamesOfNotes.h"
#include "brindle/present/ShownNames.h"
#include "brindle/theory/KeyNames.h"

#include <fmt/format.h>

#include <algorithm>
#include <nlohmann/json.hpp>
#include <utility>

namespace brindle {
namespace {

std::vector<std::string> DegreeNames(const std::vector<CChordDegree>& degrees) {
    std::vector<std::string> names;
    for (const CChordDegree& degree : degrees) names.push_back(degree.Name());
    return names;
}

std::string DegreesText(const std::vector<CChordDegree>& degrees) {
    return fmt::format("{}", fmt::join(DegreeNames(degrees), " "));
}

std::string KeyOrDash(const CKeyEnh& key, const CChordNamePrefs& prefs) {
    return key.IsUndef() ? "-" : KeyNrAndEnhToName(key.mKeyNr, key.mEnh, prefs);
}

Json NamedChordToJson(const CNamedChord& named, const CNamedChordStyle& style) {
    CChordNamePrefs notePrefs = NamePrefs();
    notePrefs.mOctaveNaming = style.mPrefs.mOctaveNaming;
    return {{"Notes", NotesToJson(named.mNotes, notePrefs)},
            {"Name", NamedChordSymbol(named, style.mPrefs, style.mIsExact)},
            {"ExactName", NamedChordSymbol(named, style.mPrefs, true)},
            {"RootKeyEnh", KeyEnhToJson(named.mRoot)},
            {"BassKeyEnh", KeyEnhToJson(named.mBass)},
            {"BasicChord", BasicChordName(named.mChord.BasicChord())},
            {"Intervals", IntervalsToJson(named.mChord.mSemitones)},
            {"Omitted", DegreeNames(named.mOmitted)},
            {"Added", DegreeNames(named.mAdded)},
            {"Cost", named.mCost}};
}

}  // namespace

std::string NamedChordsText(std::span<const std::vector<CNamedChord>> sets, std::size_t count,
                            const CNamedChordStyle& style, const CPaint& paint) {
    CTable table({"notes", "name", "root", "bass", "left out", "added", " cost"});
    for (const auto& names : sets) {
        std::string notesAbove;
        for (const CNamedChord& named : std::span(names).first(std::min(names.size(), count))) {
            const std::string notes = NamesOfNotes(named.mNotes, style.mPrefs);
            table.AddRow({notes == notesAbove ? "" : notes,
                          NamedChordSymbol(named, style.mPrefs, style.mIsExact),
                          KeyOrDash(named.mRoot, style.mPrefs),
                          KeyOrDash(named.mBass, style.mPrefs), DegreesText(named.mOmitted),
                          DegreesText(named.mAdded), fmt::format("{}", named.mCost)});
            notesAbove = notes;
        }
    }
    return table.Text(paint);
}

std::string NamedChordsJson(std::span<const std::vector<CNamedChord>> sets,
                            const CNamedChordStyle& style) {
    Json list = Json::array();
    for (const auto& names : sets) {
        if (names.empty()) continue;
        Json json = NamedChordToJson(names.front(), style);
        json["Candidates"] = Json::array();
        for (const CNamedChord& named : names) {
            json["Candidates"].push_back(NamedChordToJson(named, style));
        }
        list.push_back(std::move(json));
    }
    return JsonText({{"Chords", list}});
}

}  // namespace brindle
