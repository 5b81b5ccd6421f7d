// SPDX-License-Identifier: MIT
#include "cli/Name.h"

#include "brindle/neural/RootCostsByNet.h"
#include "brindle/present/CTable.h"
#include "brindle/present/ShownNames.h"
#include "brindle/theory/KeyNames.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle::cli {
namespace {

using TNamesOfSets = std::vector<std::vector<CNamedChord>>;

std::vector<CNamedChord> NamesOf(const std::vector<CNote>& notes, const CNameOptions& options) {
    auto context = options.mContext;
    if (options.mMethod == "both") context.mRootCosts = RootCostsByNet(notes);
    return NameNotes(notes, context);
}

/// All names, with that over the root of --root first.
TNamesOfSets AllNames(const std::vector<CNotesText>& sets, const CNameOptions& options) {
    std::vector<std::vector<CNote>> notes;
    for (const CNotesText& set : sets) notes.push_back(set.mTyped);
    TNamesOfSets names;
    if (options.mProgression) {
        names = NameProgression(notes, options.mContext);
    } else {
        for (const auto& set : notes) names.push_back(NamesOf(set, options));
    }
    for (auto& ofSet : names) {
        std::stable_partition(ofSet.begin(), ofSet.end(), [&](const CNamedChord& name) {
            return name.mRoot.mKeyNr == options.mRootKey.mKeyNr;
        });
        const bool isOfRoot = options.mRootKey.IsUndef() || ofSet.empty() ||
                              ofSet.front().mRoot.mKeyNr == options.mRootKey.mKeyNr;
        if (isOfRoot) continue;
        static_cast<void>(Fail(TStatus::BadInput,
                               fmt::format("these notes have no name over {}; --method net names "
                                           "them over any root",
                                           options.mRoot)));
        ofSet.clear();
    }
    return names;
}

std::vector<std::string> DegreeNames(const std::vector<CChordDegree>& degrees) {
    std::vector<std::string> names;
    for (const CChordDegree& degree : degrees) names.push_back(degree.Name());
    return names;
}

std::string DegreesText(const std::vector<CChordDegree>& degrees) {
    return fmt::format("{}", fmt::join(DegreeNames(degrees), " "));
}

// With the key names of JSON, in ASCII.
Json NamedToJson(const CNamedChord& named, const CNameOptions& options) {
    CChordNamePrefs notePrefs = NamePrefs();
    notePrefs.mOctaveNaming = options.mNaming.Prefs().mOctaveNaming;
    const CChordNamePrefs prefs = options.mNaming.PlayersPrefs();
    return {{"Notes", NotesToJson(named.mNotes, notePrefs)},
            {"Name", NamedChordSymbol(named, prefs, options.mIsExact)},
            {"ExactName", NamedChordSymbol(named, prefs, true)},
            {"RootKeyEnh", KeyEnhToJson(named.mRoot)},
            {"BassKeyEnh", KeyEnhToJson(named.mBass)},
            {"BasicChord", BasicChordName(named.mChord.BasicChord())},
            {"Intervals", IntervalsToJson(named.mChord.mSemitones)},
            {"Omitted", DegreeNames(named.mOmitted)},
            {"Added", DegreeNames(named.mAdded)},
            {"Cost", named.mCost}};
}

std::string NamesJson(const TNamesOfSets& sets, const CNameOptions& options) {
    Json list = Json::array();
    for (const auto& names : sets) {
        if (names.empty()) continue;
        Json json = NamedToJson(names.front(), options);
        json["Candidates"] = Json::array();
        for (const CNamedChord& named : names) {
            json["Candidates"].push_back(NamedToJson(named, options));
        }
        list.push_back(std::move(json));
    }
    return JsonText({{"Chords", list}});
}

std::string NamesText(const TNamesOfSets& sets, const CNameOptions& options) {
    const CChordNamePrefs prefs = options.mNaming.PlayersPrefs();
    const auto keyName = [&](const CKeyEnh& key) {
        return key.IsUndef() ? "-" : KeyNrAndEnhToName(key.mKeyNr, key.mEnh, prefs);
    };
    CTable table({"notes", "name", "root", "bass", "left out", "added", " cost"});
    for (const auto& names : sets) {
        std::string notesAbove;
        const auto count = std::min(names.size(), static_cast<std::size_t>(options.mCandidates));
        for (std::size_t ix = 0; ix < count; ++ix) {
            const CNamedChord& named = names[ix];
            const std::string notes = NotesName(named.mNotes, prefs);
            table.AddRow({notes == notesAbove ? "" : notes,
                          NamedChordSymbol(named, prefs, options.mIsExact), keyName(named.mRoot),
                          keyName(named.mBass), DegreesText(named.mOmitted),
                          DegreesText(named.mAdded), fmt::format("{}", named.mCost)});
            notesAbove = notes;
        }
    }
    return table.Text(PaintOfOutput());
}

}  // namespace

std::string NameAsPlayed(const std::vector<CNotesText>& sets, const CNameOptions& options) {
    const TNamesOfSets names = AllNames(sets, options);
    if (options.mFormat.Format() == TFormat::Json) return NamesJson(names, options);
    return NamesText(names, options);
}

}  // namespace brindle::cli
