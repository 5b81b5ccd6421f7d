// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CIntvlSet.h"
#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CNote.h"
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/CScaleLite.h"
#include "brindle/theory/CSignKeyLite.h"

#include <nlohmann/json.hpp>
#include <sstream>
#include <string>

/// The forms in which the files of tests/data/expected write our records.
namespace brindle::test {

inline TEnh EnhOf(const nlohmann::json& number) {
    return static_cast<TEnh>(number.get<int>());
}

/// [keyNr, enh]
inline CKeyEnh KeyEnhOf(const nlohmann::json& pair) {
    return {pair.at(0).get<int>(), EnhOf(pair.at(1))};
}

inline nlohmann::json FormOf(const CKeyEnh& keyEnh) {
    return {keyEnh.mKeyNr, static_cast<int>(keyEnh.mEnh)};
}

/// [noteNr, enh], taken as they stand
inline CNote NoteOf(const nlohmann::json& pair) {
    CNote note;
    note.mNoteNr = pair.at(0).get<std::int64_t>();
    note.mEnh = EnhOf(pair.at(1));
    return note;
}

inline nlohmann::json FormOf(const CNote& note) {
    return {note.mNoteNr, static_cast<int>(note.mEnh)};
}

inline CSemitones SemitonesOf(const nlohmann::json& mask) {
    return CSemitones(mask.get<std::uint64_t>());
}

/// [[keyNr, enh], TScaleType]
inline CScaleHeavy ScaleOf(const nlohmann::json& form) {
    return {KeyEnhOf(form.at(0)), static_cast<TScaleType>(form.at(1).get<int>())};
}

/// {"mRootKeyEnh": [keyNr, enh], "mSemitones": mask}
inline CScaleLite ScaleLiteOf(const nlohmann::json& form) {
    return {KeyEnhOf(form.at("mRootKeyEnh")), SemitonesOf(form.at("mSemitones"))};
}

inline nlohmann::json FormOf(const CScaleLite& scale) {
    return {{"mRootKeyEnh", FormOf(scale.mRootKeyEnh)}, {"mSemitones", scale.mSemitones.Mask()}};
}

/// {"mRootKeyEnh": [keyNr, enh], "mSignKeyType": number}
inline CSignKeyLite SignKeyLiteOf(const nlohmann::json& form) {
    return {KeyEnhOf(form.at("mRootKeyEnh")),
            static_cast<TSignKeyType>(form.at("mSignKeyType").get<int>())};
}

inline nlohmann::json FormOf(const CSignKeyLite& signKey) {
    return {{"mRootKeyEnh", FormOf(signKey.mRootKeyEnh)},
            {"mSignKeyType", static_cast<int>(signKey.mSignKeyType)}};
}

/// {"root": [keyNr, enh], "bass": [keyNr, enh], "semitones": mask}
inline CChordLite ChordLiteOf(const nlohmann::json& form) {
    return {KeyEnhOf(form.at("root")), KeyEnhOf(form.at("bass")),
            SemitonesOf(form.at("semitones"))};
}

inline nlohmann::json FormOf(const CChordLite& chord) {
    return {{"root", FormOf(chord.mRootKeyEnh)},
            {"bass", FormOf(chord.mBassKeyEnh)},
            {"semitones", chord.mSemitones.Mask()}};
}

/// [interval, ...], in any number and range
inline CIntvlSet IntvlSetOf(const nlohmann::json& members) {
    CIntvlSet intvls;
    for (const nlohmann::json& member : members) intvls.insert(member.get<int>());
    return intvls;
}

/// The fields that differ from their defaults.
inline CChordNamePrefs NamePrefsOf(const nlohmann::json& fields) {
    CChordNamePrefs prefs;
    const auto read = [&fields](const char* name, auto& field) {
        if (fields.contains(name)) fields.at(name).get_to(field);
    };
    read("mHForB", prefs.mHForB);
    read("mBForBFlat", prefs.mBForBFlat);
    read("mGermanNames", prefs.mGermanNames);
    read("mAsciiAccidentals", prefs.mAsciiAccidentals);
    read("mSolfege", prefs.mSolfege);
    read("mLocalizeSolfege", prefs.mLocalizeSolfege);
    read("mOctaveNaming", prefs.mOctaveNaming);
    read("mLowerCaseMinorRoot", prefs.mLowerCaseMinorRoot);
    read("mChordPrefB", prefs.mChordPrefB);
    read("mOmitBassOption", prefs.mOmitBassOption);
    read("mChordPrefC", prefs.mChordPrefC);
    read("mChordPrefD", prefs.mChordPrefD);
    read("mCommaParts", prefs.mCommaParts);
    read("mChordPrefE", prefs.mChordPrefE);
    read("mOptionBrackets", prefs.mOptionBrackets);
    read("mChordPrefF", prefs.mChordPrefF);
    read("mNoSpaceBetweenNameParts", prefs.mNoSpaceBetweenNameParts);
    read("mNoSpaceAroundSlash", prefs.mNoSpaceAroundSlash);
    read("mSlashText", prefs.mSlashText);
    return prefs;
}

template <class T>
std::string JSONStringOf(const T& value) {
    std::ostringstream stream;
    value.AppendJSONString(stream);
    return stream.str();
}

}  // namespace brindle::test
