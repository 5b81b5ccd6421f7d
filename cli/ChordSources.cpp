// SPDX-License-Identifier: MIT
#include "cli/ChordSources.h"

#include "cli/Input.h"

#include "brindle/platform/AtomicFile.h"
#include "brindle/song/LearnSong.h"

#include <fmt/format.h>

#include <algorithm>
#include <filesystem>
#include <utility>

namespace brindle::cli {
namespace {

namespace fs = std::filesystem;

constexpr std::size_t kMaxFileBytes = std::size_t{64} << 20;

CChordSource Failed(std::string error) {
    return {{}, std::move(error)};
}

CChordSource FromSong(const CSong& song) {
    CChordSource source{ChordSequencesOf(song), {}};
    if (source.mSequences.empty()) source.mError = "no chords";
    if (HasEndlessChord(song)) source.mError = "a length is no number, or too large";
    return source;
}

std::string FaultText(const CSongFault& fault) {
    if (fault.mLine == 0) return fault.mText;
    return fmt::format("line {}, column {}: {}", fault.mLine, fault.mColumn, fault.mText);
}

}  // namespace

CChordSource ReadChordSource(const std::string& path, const CTypedChords& reading) {
    std::error_code error;
    const bool isInput = path == "-";
    if (!isInput && !fs::exists(path, error)) return Failed("no such file");
    const auto bytes = isInput ? ReadInput(path) : ReadWholeFile(path, kMaxFileBytes);
    if (!bytes) return Failed("it cannot be read, or is larger than 64 MiB");
    const CSong song = reading.ReadSource(*bytes);
    const auto fault = std::find_if(song.mFaults.begin(), song.mFaults.end(),
                                    [](const CSongFault& f) { return !f.mIsNote; });
    const bool isGivenUp = fault != song.mFaults.end() && !reading.IsLenient();
    return isGivenUp ? Failed(FaultText(*fault)) : FromSong(song);
}

}  // namespace brindle::cli
