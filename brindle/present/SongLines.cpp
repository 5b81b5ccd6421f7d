// SPDX-License-Identifier: MIT
#include "brindle/present/SongLines.h"

#include "brindle/present/CJsonWriter.h"
#include "brindle/present/ReadingJson.h"
#include "brindle/song/ReadSongHarmony.h"

#include <algorithm>
#include <utility>

namespace brindle {
namespace {

CSong WithFault(CSong song, std::string fault) {
    song.mFaults.push_back({.mText = std::move(fault)});
    return song;
}

CSong ReadSource(const CSourceOfSong& source) {
    if (!source.mFault.empty()) return WithFault({}, source.mFault);
    CSong song = source.mSong.mRead();
    if (song.mChords.size() < 2) {
        return song.HasFault() ? song : WithFault(std::move(song), "there are no chords in it");
    }
    if (song.mChords.size() - 1 <= kMostChordsOfLine) return song;
    song.mChords.clear();
    return WithFault(std::move(song), "it has more than " + std::to_string(kMostChordsOfLine) +
                                          " chords, as no song has");
}

void WriteSource(CJsonWriter& json, const CSourceOfSong& source) {
    json.Key("Path").String(source.mPath);
    json.Key("Member").StringOrNull(source.mMember);
    json.Key("Number").Integer(static_cast<std::int64_t>(source.mNumber));
    json.Key("Songs").Integer(static_cast<std::int64_t>(source.mCount));
}

void WriteFault(CJsonWriter& json, const CSong& song) {
    json.Key("Fault");
    const auto fault = std::find_if(song.mFaults.begin(), song.mFaults.end(),
                                    [](const CSongFault& f) { return !f.mIsNote; });
    if (fault == song.mFaults.end()) {
        json.Null();
        return;
    }
    const auto writeOrNull = [&](std::string_view name, std::size_t number) {
        json.Key(name);
        number == 0 ? json.Null() : json.Integer(static_cast<std::int64_t>(number));
    };
    json.BeginObject().Key("Text").String(fault->mText);
    writeOrNull("Line", fault->mLine);
    writeOrNull("Column", fault->mLine == 0 ? 0 : fault->mColumn);
    json.EndObject();
}

void WriteSong(CJsonWriter& json, const CSong& song) {
    json.Key("Title").StringOrNull(song.mTitle);
    json.Key("Makers").StringOrNull(song.mMakers);
    json.Key("Style").StringOrNull(song.mStyle);
    json.Key("BeatsPerBar");
    song.mChords.empty() ? json.Null() : json.Number(song.mBeatsPerBar);
    json.Key("Length");
    song.mChords.empty() ? json.Null() : json.Number(song.mChords.back().mPosition);
}

std::size_t WeightOf(const CSourceOfSong& source) {
    return source.mSong.mByteCount + source.mPath.size() + source.mMember.size();
}

}  // namespace

CSongLine SongLine(const CSourceOfSong& source, const CReadingOptions& options) {
    CSong song = ReadSource(source);
    // A song that was read leniently has chords beside its faults.
    const bool hasReading = song.mChords.size() >= 2;
    if (!hasReading) song.mChords.clear();
    CJsonWriter json;
    json.BeginObject();
    WriteSource(json, source);
    WriteSong(json, song);
    WriteFault(json, song);
    if (hasReading) {
        const CSongReading reading = ReadSongHarmony(song, options);
        WriteReading(json, {song, reading});
    } else {
        json.Key("Reading").Null();
    }
    json.EndObject();
    return {JsonOnOneLine(std::move(json).Text()), !hasReading};
}

void WriteSongLines(const CSongLineSteps& steps, const CParallelOptions& parallel,
                    const CReadingOptions& options) {
    const CParallelSteps<CSourceOfSong, CSongLine> work{
        .mNext = steps.mNext,
        .mWork = [&options](CSourceOfSong& source) { return SongLine(source, options); },
        .mTake = steps.mTake,
        .mWeightOfPiece = WeightOf,
        .mWeightOfResult = [](const CSongLine& line) { return line.mText.size(); },
        .mPulse = steps.mPulse};
    WorkInParallel(work, parallel);
}

}  // namespace brindle
