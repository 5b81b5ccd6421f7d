// SPDX-License-Identifier: MIT
#include "cli/TypedSongs.h"

#include "cli/CCommand.h"
#include "cli/Input.h"
#include "cli/Message.h"
#include "cli/Progress.h"

#include "brindle/platform/JsonString.h"
#include "brindle/present/CJsonWriter.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle::cli {
namespace {

/// What a song is called: its file, or the beginning of its text.
std::string SongName(const CTypedSong& song) {
    constexpr std::size_t shownCharacters = 60;
    if (!song.mName.empty()) return Printable(song.mName);
    const std::string text = Printable(song.mText);
    const std::string shown = FirstCharacters(text, shownCharacters);
    return shown.size() < text.size() ? shown + "..." : shown;
}

/// The output of one of several songs.
std::string OneOfSeveral(const CTypedSong& song, TFormat format, std::string_view output,
                         bool isFirst) {
    if (format == TFormat::Json) return JsonLine(SongName(song), output) + '\n';
    return SongHead(SongName(song), isFirst).append(output);
}

}  // namespace

void CTypedSongs::AddTo(CCommand& command) {
    command.AddArgument("TEXT", mWords,
                        "Chord text, or the names of files with texts or scores; - reads standard "
                        "input");
    command.AddListOption("--file", "PATH", mFiles,
                          "Read a chord text or a score from a file; may be told several times");
}

void CTypedSongs::AddTo(CCommand& command, const std::string& purpose) {
    command.AddArgument("TEXT", mWords, purpose).Required();
}

void CTypedSongs::AddFilesTo(CCommand& command) {
    command.AddArgument("FILE", mFiles, "Scores in MusicXML; - reads standard input").Required();
}

std::vector<CSongSource> CTypedSongs::Sources() const {
    std::vector<CSongSource> sources = SongSources(mWords);
    for (const std::string& file : mFiles) sources.push_back({file, {}});
    return sources;
}

std::optional<std::string> CTypedSongs::Contradiction(TFormat format) const {
    if (mWords.empty() && mFiles.empty()) {
        return Message("a song is needed: a TEXT, a file, or - for standard input");
    }
    const bool isOfOne = format == TFormat::Svg || format == TFormat::Native;
    const std::size_t count = isOfOne ? Sources().size() : 1;
    if (count == 1) return std::nullopt;
    return fmt::format("--format {} is for one song, and {} are told",
                       format == TFormat::Svg ? "svg" : "native", count);
}

TStatus CTypedSongs::Print(TFormat format,
                           const std::function<TSongOutput(const CTypedSong&)>& show) const {
    const std::vector<CSongSource> sources = Sources();
    CProgress progress(sources.size());
    TStatus status = TStatus::Success;
    bool isFirst = true;
    for (const CSongSource& source : sources) {
        progress.Step(source.mFile.empty() ? source.mText : source.mFile);
        const auto song = ReadTypedSong(source);
        const TSongOutput output = song ? show(*song) : TSongOutput(TStatus::BadInput);
        if (output.index() == 0) {
            status = std::max(status, std::get<0>(output));
            continue;
        }
        const std::string& text = std::get<1>(output);
        const TStatus printed =
            cli::Print(sources.size() == 1 ? text : OneOfSeveral(*song, format, text, isFirst));
        if (printed != TStatus::Success) return printed;
        isFirst = false;
    }
    return status;
}

std::string SongHead(std::string_view name, bool isFirst) {
    const std::string head = PaintOfOutput().Strong(fmt::format("==> {} <==", name));
    return fmt::format("{}{}\n", isFirst ? "" : "\n", head);
}

std::string JsonLine(std::string_view name, std::string_view json) {
    std::string line = "{\"Song\":" + JsonString(name);
    const std::size_t first = json.find('{') + 1;
    const bool isEmpty = json.find_first_not_of(" \n", first) == json.find('}', first);
    if (!isEmpty) line += ',';
    line += JsonOnOneLine(json.substr(first));
    line.pop_back();
    return line;
}

}  // namespace brindle::cli
