// SPDX-License-Identifier: MIT
#include "brindle/present/ChordsOverRootsText.h"

#include "brindle/present/CTable.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/NamesOfNotes.h"
#include "brindle/present/ShownNames.h"
#include "brindle/theory/KeyNames.h"

#include <nlohmann/json.hpp>
#include <utility>

namespace brindle {
namespace {

Json ChordOverRootToJson(const CChordOverRoot& named) {
    return {{"Name", named.mName},
            {"RootKeyEnh", KeyEnhToJson(named.mRoot)},
            {"BassKeyEnh", KeyEnhToJson(named.mBass)},
            {"BasicChord", BasicChordName(named.mBasicChord)},
            {"Options", named.mOptions},
            {"RootSounds", named.mIsSounding}};
}

}  // namespace

std::string ChordsOverRootsText(std::span<const CNotesOverRoots> chords,
                                const CChordNamePrefs& prefs, const CPaint& paint) {
    const auto nameOf = [&](const CKeyEnh& key) {
        return key.IsUndef() ? "-" : KeyNrAndEnhToName(key.mKeyNr, key.mEnh, prefs);
    };
    CTable table({"notes", "name", "root", "bass", "basic chord"});
    for (const CNotesOverRoots& chord : chords) {
        std::string notes = NamesOfNotes(chord.mNotes, prefs);
        for (const CChordOverRoot& named : chord.mNames) {
            const std::string root = nameOf(named.mRoot);
            table.AddRow({std::exchange(notes, {}), named.mName,
                          named.mIsSounding ? root : '(' + root + ')', nameOf(named.mBass),
                          std::string(BasicChordName(named.mBasicChord))});
        }
    }
    return table.Text(paint);
}

std::string ChordsOverRootsJson(std::span<const CNotesOverRoots> chords,
                                const CChordNamePrefs& prefs, bool allRoots) {
    CChordNamePrefs notePrefs = NamePrefs();
    notePrefs.mOctaveNaming = prefs.mOctaveNaming;
    Json list = Json::array();
    for (const CNotesOverRoots& chord : chords) {
        Json json{{"Notes", NotesToJson(chord.mNotes, notePrefs)}};
        json.update(ChordOverRootToJson(chord.mNames.front()));
        if (allRoots) {
            json["AllRoots"] = Json::array();
            for (const CChordOverRoot& named : chord.mNames) {
                json["AllRoots"].push_back(ChordOverRootToJson(named));
            }
        }
        list.push_back(std::move(json));
    }
    return JsonText({{"Chords", list}});
}

}  // namespace brindle
