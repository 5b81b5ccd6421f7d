// SPDX-License-Identifier: MIT
#include "cli/TypedSong.h"

#include "cli/Input.h"
#include "cli/Message.h"
#include "cli/Output.h"

#include "brindle/platform/Ascii.h"
#include "brindle/song/ReadSong.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle::cli {
namespace {

bool IsBlank(std::string_view text) {
    return text.find_first_not_of(" \t\r\n\v\f") == text.npos;
}

std::string_view LastDot(std::string_view name) {
    const std::size_t dot = name.rfind('.');
    return dot == name.npos ? std::string_view() : name.substr(dot);
}

bool HasScoreName(std::string_view name) {
    std::string ending(LastDot(name));
    std::transform(ending.begin(), ending.end(), ending.begin(), Ascii::ToLower);
    return ending == ".musicxml" || ending == ".xml" || ending == ".mxl";
}

std::nullopt_t FailForScore(const CTypedSong& typed, const CTextFault& fault) {
    TellScoreFault(typed.mText, typed.mName, FaultWithPlace(fault));
    return std::nullopt;
}

}  // namespace

bool HasScoreBytes(std::string_view bytes) {
    return IsScore(SongFormatOf(bytes));
}

void TellScoreFault(std::string_view bytes, const std::string& name, std::string_view reason) {
    const std::string shown = Printable(name);
    const std::string fault = Printable(reason);
    Fail(TStatus::BadInput, HasScoreBytes(bytes)
                                ? fmt::format("{}: {}", shown, fault)
                                : Message("{name} is no score in MusicXML: {reason}",
                                          {{"name", shown}, {"reason", fault}}));
}

TStatus FailWithoutChords(const CTypedSong& song) {
    const std::string name = Printable(song.mName);
    if (name.empty()) return Fail(TStatus::BadInput, Message("the song has no chords"));
    if (!song.mIsScore) {
        return Fail(TStatus::BadInput, Message("{name} has no chords", {{"name", name}}));
    }
    return Fail(TStatus::BadInput,
                Message("{name} has no chord symbols; {call} names chords from its notes",
                        {{"name", name}, {"call", "brindle harmonies --from-notes"}}));
}

std::vector<CSongSource> SongSources(const std::vector<std::string>& words) {
    // Between chords "-" is one of their signs.
    const bool hasInput = std::all_of(words.begin(), words.end(), [](const std::string& word) {
        return word == "-" || IsFileName(word);
    });
    std::vector<CSongSource> sources;
    bool isText = false;
    for (const std::string& word : words) {
        if (hasInput || IsFileName(word)) {
            sources.push_back({word, {}});
            isText = false;
        } else if (isText) {
            sources.back().mText += ' ' + word;
        } else {
            sources.push_back({{}, word});
            isText = true;
        }
    }
    return sources;
}

std::optional<CTypedSong> ReadTypedSong(const CSongSource& source) {
    CTypedSong song;
    song.mName = source.mFile == "-" ? "standard input" : source.mFile;
    auto text = source.mFile.empty() ? source.mText : ReadTextInput(source.mFile);
    if (!text) return std::nullopt;
    song.mText = std::move(*text);
    song.mIsScore =
        HasScoreName(source.mFile) || (!source.mFile.empty() && HasScoreBytes(song.mText));
    if (IsBlank(song.mText)) {
        Fail(TStatus::BadInput,
             song.mName.empty() ? Message("the song is empty")
                                : Message("{name} is empty", {{"name", Printable(song.mName)}}));
        return std::nullopt;
    }
    return song;
}

std::optional<CSong> ReadScore(const CTypedSong& typed) {
    // What is called a score is read as one, whatever it looks like.
    const bool isSeen = HasScoreBytes(typed.mText);
    CSong song =
        ReadSong(typed.mText, {.mFormat = isSeen ? TSongFormat_Auto : TSongFormat_MusicXml});
    if (song.HasFault()) return FailForScore(typed, song.mFaults.front());
    return song;
}

std::optional<TMusicXMLDoc> ReadHarmonies(const CTypedSong& typed, TLeadSheetTiming timing) {
    CLeadSheetReading read = ReadLeadSheet(typed.mText, timing);
    if (read.mFault) return FailForScore(typed, *read.mFault);
    return std::move(read.mSheet);
}

}  // namespace brindle::cli
