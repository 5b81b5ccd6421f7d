// SPDX-License-Identifier: MIT
#include "brindle/present/ReadingJson.h"

#include "brindle/present/JsonValues.h"
#include "brindle/present/internal/ReadingBars.h"
#include "brindle/present/internal/ReadingNotes.h"

namespace brindle {
namespace {

void WriteIndex(CJsonWriter& json, std::string_view name, std::ptrdiff_t ix) {
    json.Key(name);
    ix < 0 ? json.Null() : json.Integer(ix);
}

void WriteServed(CJsonWriter& json, const CServedDegree& served) {
    json.Key("Serves");
    if (served.mSemitones < 0) {
        json.Null();
        return;
    }
    json.BeginObject().Key("Degree").String(served.Name());
    json.Key("Semitones").Integer(served.mSemitones).EndObject();
}

void WriteNotes(CJsonWriter& json, const CReadSong& song) {
    json.Key("Notes").BeginArray();
    for (const std::string& note : KeyContradictions(song.mSong, song.mReading)) json.String(note);
    json.EndArray();
}

void WriteRegions(CJsonWriter& json, const CSongReading& reading) {
    json.Key("Regions").BeginArray();
    for (const CKeyRegion& region : reading.mRegions) {
        json.BeginObject();
        WriteSignKey(json.Key("SignKey"), region.mKey);
        json.Key("Position").Number(region.mPosition);
        json.Key("EndPosition").Number(region.mEndPosition).EndObject();
    }
    json.EndArray();
}

void WriteChord(CJsonWriter& json, const CReadSong& song, std::size_t ix) {
    const CChordReading& chord = song.mReading.mChords[ix];
    const auto& symbols = song.mSong.mSymbols;
    json.BeginObject().Key("Position").Number(song.mSong.mChords[ix].mPosition);
    json.Key("Symbol").StringOrNull(ix < symbols.size() ? symbols[ix] : "");
    WriteSignKey(json.Key("SignKey"), chord.mKey);
    json.Key("Numeral").StringOrNull(chord.mNumeral);
    json.Key("Function").StringOrNull(NameOf(chord.mFunction));
    json.Key("Relation").StringOrNull(NameOf(chord.mRelation));
    WriteServed(json, chord.mServes);
    WriteIndex(json, "ResolvesTo", chord.mResolvesTo);
    WriteIndex(json, "Under", chord.mUnder);
    json.Key("IsDeceptive").Bool(chord.mDeceptive);
    if (!song.mExplanations.empty()) {
        json.Key("Explanation").StringOrNull(song.mExplanations[ix]);
    }
    json.EndObject();
}

}  // namespace

void WriteReading(CJsonWriter& json, const CReadSong& song) {
    json.Key("Reading").BeginObject();
    WriteSignKey(json.Key("SignKey"), song.mReading.mKey);
    json.Key("Confidence").Number(song.mReading.mConfidence);
    WriteNotes(json, song);
    WriteRegions(json, song.mReading);
    json.Key("Chords").BeginArray();
    for (std::size_t ix = 0; ix < ChordCountOf(song.mSong); ++ix) WriteChord(json, song, ix);
    json.EndArray().EndObject();
}

}  // namespace brindle
