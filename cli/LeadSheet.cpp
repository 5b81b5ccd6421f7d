// SPDX-License-Identifier: MIT
#include "cli/LeadSheet.h"

#include "cli/Input.h"
#include "cli/Message.h"
#include "cli/Output.h"

#include "brindle/musicxml/ScoreContainer.h"
#include "brindle/platform/Ascii.h"
#include "brindle/platform/Error.h"
#include "brindle/platform/XmlStreamParser.h"
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

std::optional<TMusicXMLDoc> Unreadable(const CTypedSong& song, std::string_view reason) {
    TellScoreFault(song.mText, song.mName, reason);
    return std::nullopt;
}

// The library tells only that it cannot read a plain score; what reads its XML, or reads it in the
// other way, tells why. The other way is more lenient: it reads on behind blanks and wrong
// encodings.
std::string FaultOf(std::string_view bytes) {
    XmlStreamParser parser;
    if (!IsScoreContainer(bytes) && !parser.parse(bytes)) {
        const XmlError& fault = *parser.parserError();
        return fmt::format("{}:{}: {}", fault.mLine, fault.mColumn, fault.mDescription);
    }
    Error error;
    if (TMusicXMLDoc().LoadAsPlayedFromBytes(bytes, &error)) return "the score cannot be laid out";
    return error.description;
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

std::optional<TMusicXMLDoc> ReadLeadSheet(const CTypedSong& song, TTiming timing) {
    TMusicXMLDoc sheet;
    if (timing == TTiming::Played) {
        Error error;
        if (!sheet.LoadAsPlayedFromBytes(song.mText, &error)) {
            return Unreadable(song, error.description);
        }
        return sheet;
    }
    std::optional<std::string> unpacked;
    if (IsScoreContainer(song.mText)) {
        unpacked = ScoreInContainer(song.mText);
        if (!unpacked) return Unreadable(song, FaultOf(song.mText));
    }
    const std::string& bytes = unpacked ? *unpacked : song.mText;
    if (!sheet.LoadFromMusicXML(bytes)) return Unreadable(song, FaultOf(bytes));
    return sheet;
}

std::optional<CSheetSong> ReadPlayedSheet(const CTypedSong& song) {
    CSheetSong sheet = ReadSheetSong(song.mText);
    if (!sheet.mSong.HasFault()) return sheet;
    const CSongFault& fault = sheet.mSong.mFaults.front();
    const std::string place =
        fault.mLine > 0 ? fmt::format("{}:{}: ", fault.mLine, fault.mColumn) : "";
    TellScoreFault(song.mText, song.mName, place + fault.mText);
    return std::nullopt;
}

}  // namespace brindle::cli
