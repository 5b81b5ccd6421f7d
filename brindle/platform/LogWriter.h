// SPDX-License-Identifier: MIT
#pragma once

#include <fstream>
#include <string>
#include <string_view>

namespace brindle {

/// A small log file for a host's own use; nothing in the library writes to one. Each entry is a
/// line. Writing to a log that is not open does nothing. Holds an open file, so it is not copied.
class LogWriter {
public:
    /// Starts a new file with a heading that tells the time. False when it cannot be opened.
    bool open(const std::string& path);
    /// Goes on at the end of a file. False when it cannot be opened.
    bool open_for_append(const std::string& path);
    /// Ends the file; nothing if none is open.
    void close();

    /// The time, a separator and the text.
    void append(std::string_view text);
    /// The text alone.
    void append_plain(std::string_view text);
    /// The time alone.
    void append_timestamp();

    /// The local time as `asctime` writes it, without its line end: "Wed Jun 30 21:49:08 1993".
    [[nodiscard]] static std::string get_time();

private:
    std::ofstream mFile;
};

}  // namespace brindle
