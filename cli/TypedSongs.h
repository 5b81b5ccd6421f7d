// SPDX-License-Identifier: MIT
#pragma once

#include "cli/Output.h"
#include "cli/TypedSong.h"

#include <functional>
#include <optional>
#include <string>
#include <variant>
#include <vector>

namespace brindle::cli {

class CCommand;

/// What a command makes of a song: its output, or that it has failed and told why.
using TSongOutput = std::variant<TStatus, std::string>;

/// The songs of a command line. Each word that names a file, or looks as if it should, is a song of
/// its own, as "-" is; the words between are the text of one song.
class CTypedSongs {
public:
    /// Adds TEXT and --file, for texts and scores.
    void AddTo(CCommand& command);
    /// Adds TEXT alone, which has to be told.
    void AddTo(CCommand& command, const std::string& purpose);
    /// Adds FILE, for scores alone.
    void AddFilesTo(CCommand& command);

    /// What is wrong with the words, or with one output of the format for several songs.
    [[nodiscard]] std::optional<std::string> Contradiction(TFormat format) const;

    /// Prints what `show` makes of each song. Of several, texts stand under the names of the songs,
    /// and JSON has a line for each, whose first member is its name. All are read, also behind one
    /// that cannot be.
    [[nodiscard]] TStatus Print(TFormat format,
                                const std::function<TSongOutput(const CTypedSong&)>& show) const;

private:
    [[nodiscard]] std::vector<CSongSource> Sources() const;

    std::vector<std::string> mWords;
    std::vector<std::string> mFiles;
};

/// The line above the text of one of several songs, and a blank one between two of them.
[[nodiscard]] std::string SongHead(std::string_view name, bool isFirst);

/// The JSON of a song on one line: `json` without its white space, and before its members "Song",
/// the name.
[[nodiscard]] std::string JsonLine(std::string_view name, std::string_view json);

}  // namespace brindle::cli
