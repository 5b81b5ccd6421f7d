// SPDX-License-Identifier: MIT
#include "cli/ChordSources.h"

#include "cli/Input.h"
#include "cli/LeadSheet.h"

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/chords/CChordHeavy.h"
#include "brindle/musicxml/CChordSetFromMusicXml.h"
#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/platform/AtomicFile.h"
#include "brindle/platform/Error.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <filesystem>
#include <sstream>
#include <utility>

namespace brindle::cli {
namespace {

namespace fs = std::filesystem;

constexpr std::size_t kMaxFileBytes = std::size_t{64} << 20;

/// Gathers chords and cuts them at silence.
class CSequences {
public:
    void Add(const CChordLite& chord, double length) {
        // Model files hold two digits.
        const double rounded = std::round(length * 100.0) / 100.0;
        if (!std::isfinite(rounded)) mSource.mError = "a length is no number, or too large";
        if (!(rounded > 0.0) || !std::isfinite(rounded)) return;
        const int bass = chord.HasBassNote() ? chord.mBassKeyEnh.mKeyNr : -1;
        mSource.mSequences.back().emplace_back(
            CHarmAnlsChord(chord, chord.mRootKeyEnh.mKeyNr, bass), rounded);
    }
    void Cut() {
        if (!mSource.mSequences.back().empty()) mSource.mSequences.emplace_back();
    }
    [[nodiscard]] TChordSource Finish() {
        if (mSource.mSequences.back().empty()) mSource.mSequences.pop_back();
        if (mSource.mSequences.empty() && mSource.mError.empty()) mSource.mError = "no chords";
        return std::move(mSource);
    }

private:
    TChordSource mSource{{{}}, {}};
};

TChordSource Failed(std::string error) {
    return {{}, std::move(error)};
}

TChordSource FromLeadSheet(std::string_view bytes) {
    TMusicXMLDoc doc;
    Error error;
    if (!doc.LoadAsPlayedFromBytes(bytes, &error)) return Failed(error.description);
    CSequences sequences;
    for (const TMusicXMLHarmony& harmony : doc.Harmonies) {
        CChordLite chord;
        if (!IsNoChord(harmony)) {
            chord.SetFromChordHeavy(CChordSetFromMusicXml(harmony, 24, CurrentChordNamePrefs));
        }
        if (chord.IsUndef()) {
            sequences.Cut();
        } else {
            sequences.Add(chord, harmony.mDuration);
        }
    }
    return sequences.Finish();
}

TChordSource FromChordStrings(const std::string& text) {
    CSequences sequences;
    std::istringstream lines(text);
    for (std::string line; std::getline(lines, line);) {
        std::erase_if(line, [](char c) { return c == ' ' || c == '\t' || c == '\r'; });
        if (line.empty()) continue;
        for (const CHarmAnlsChordWithLength& chord : HarmChordsFromChordString(line)) {
            if (IsUndefinedForMarkov(chord)) {
                sequences.Cut();
            } else {
                sequences.Add(chord, chord.mLength);
            }
        }
        sequences.Cut();
    }
    return sequences.Finish();
}

TChordSource FromChordText(const std::string& text, const TChordStringParse& parse,
                           const CTypedChords& reading) {
    const TChordSong song = reading.ReadSong(text, parse);
    if (!song.mFaults.empty() && !reading.IsLenient()) {
        const CChordSheetFault& fault = song.mFaults.front();
        return Failed(
            fmt::format("line {}, column {}: {}", fault.mLine, fault.mColumn, fault.mText));
    }
    const CHarmAnlsChords& chords = song.mChords;
    CSequences sequences;
    for (std::size_t ix = 0; ix + 1 < chords.size(); ++ix) {
        if (chords[ix].IsUndef()) {
            sequences.Cut();
        } else {
            sequences.Add(chords[ix], chords[ix + 1].mPosition - chords[ix].mPosition);
        }
    }
    return sequences.Finish();
}

bool HasKnownEnding(const fs::path& path) {
    constexpr auto endings = std::to_array<std::string_view>({".xml", ".musicxml", ".mxl", ".txt"});
    return std::find(endings.begin(), endings.end(), path.extension().string()) != endings.end();
}

void AddFolder(const std::string& folder, std::vector<TFoundFile>& files) {
    const std::size_t before = files.size();
    std::error_code error;
    const auto skip = fs::directory_options::skip_permission_denied;
    for (fs::recursive_directory_iterator entry(folder, skip, error), end; entry != end;
         entry.increment(error)) {
        if (entry->is_regular_file(error) && HasKnownEnding(entry->path())) {
            files.push_back({entry->path().string(), false});
        }
    }
    std::sort(files.begin() + static_cast<std::ptrdiff_t>(before), files.end(),
              [](const TFoundFile& a, const TFoundFile& b) { return a.mPath < b.mPath; });
}

}  // namespace

TChordSource ReadChordSource(const std::string& path, const TChordStringParse& parse,
                             const CTypedChords& reading) {
    std::error_code error;
    if (!fs::exists(path, error)) return Failed("no such file");
    const auto bytes = ReadWholeFile(path, kMaxFileBytes);
    if (!bytes) return Failed("it cannot be read, or is larger than 64 MiB");
    if (HasScoreBytes(*bytes)) return FromLeadSheet(*bytes);
    const std::string text = FoldAccidentals(*bytes);
    const std::size_t begin = text.find_first_not_of(" \t\r\n");
    return begin != text.npos && text[begin] == '(' ? FromChordStrings(text)
                                                    : FromChordText(*bytes, parse, reading);
}

std::vector<TFoundFile> FindChordSources(const std::vector<std::string>& paths) {
    std::vector<TFoundFile> files;
    for (const std::string& path : paths) {
        std::error_code error;
        if (fs::is_directory(path, error)) {
            AddFolder(path, files);
        } else {
            files.push_back({path, true});
        }
    }
    return files;
}

}  // namespace brindle::cli
