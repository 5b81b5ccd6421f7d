// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/Input.h"
#include "cli/Json.h"
#include "cli/Progress.h"
#include "cli/TypedSong.h"
#include "cli/TypedSongs.h"

#include "brindle/musicxml/ImportScore.h"
#include "brindle/musicxml/MusicXmlParser.h"
#include "brindle/musicxml/MuxmlJsonLines.h"
#include "brindle/musicxml/MuxmlLimits.h"
#include "brindle/musicxml/ScoreContainer.h"
#include "brindle/platform/Alerts.h"
#include "brindle/platform/AtomicFile.h"
#include "brindle/platform/JsonString.h"
#include "brindle/present/ImportMidi.h"
#include "brindle/present/ImportText.h"

#include <fmt/format.h>

#include <algorithm>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kImportHelp{
    "import",
    "Import a MusicXML score as timed notes",
    "  brindle import song.musicxml\n"
    "  brindle import song.mxl --format ndjson | grep didEncounterNote\n"
    "  brindle import song.mxl --midi song.mid\n"
    "  brindle import scores/*.musicxml --json >scores.ndjson\n",
};

struct CImportOptions {
    std::vector<std::string> mFiles;
    std::string mFormat = "text";
    bool mJson = false;
    std::optional<std::string> mMidiFile;

    [[nodiscard]] bool IsNdjson() const { return mJson || mFormat == "ndjson"; }
};

/// Shows alerts as errors of the program while it lives, and counts them.
class CAlertsAsErrors {
public:
    explicit CAlertsAsErrors(const std::string& name) {
        SetAlertHandler([this, name](const CAlert& alert) {
            ++mCount;
            Fail(TStatus::BadInput,
                 fmt::format("{}: {}: {}", Printable(name), Printable(alert.messageText),
                             Printable(alert.informativeText)));
        });
    }
    CAlertsAsErrors(const CAlertsAsErrors&) = delete;
    CAlertsAsErrors& operator=(const CAlertsAsErrors&) = delete;
    ~CAlertsAsErrors() { SetAlertHandler({}); }

    [[nodiscard]] int Count() const { return mCount; }

private:
    int mCount = 0;
};

/// False with an error. A terminal shows how many bars of all parts have been read.
bool ImportWithProgress(std::string_view bytes, const std::string& file,
                        const MusicXmlParserDelegate& host, Error& error) {
    CCountProgress progress(InputName(file), "bars");
    MusicXmlParserDelegate counter;
    counter.didEncounterMeasureStart = [&progress](std::int32_t) { progress.CountOne(); };
    const bool isContainer = IsScoreContainer(bytes) || file.ends_with(".mxl");
    return ImportScore(bytes, isContainer, kImportTicksPerQuarter, TellBoth(host, counter), error);
}

std::string HeadOf(const std::string& name, bool isFirst, const CImportOptions& options) {
    if (options.mFiles.size() == 1) return {};
    if (!options.IsNdjson()) return SongHead(name, isFirst);
    const Json line{{"call", "song"}, {"name", name}};
    return DumpJson(line) + '\n';
}

// The file first: who reads the output may stop before its end.
TStatus WriteMidi(const CImportedScore& score, const std::string& file) {
    if (WriteFileAtomically(file, MidiFileBytes(MidiPieceOf(score)))) return TStatus::Success;
    return FailToWrite(file);
}

/// What a score gives, and how its import ended: it may have a fault behind what it gives.
struct CImported {
    TStatus mStatus = TStatus::BadInput;
    std::optional<std::string> mOutput;
};

/// Of a file that cannot be read lines of JSON have the error that hosts get of the library.
CImported Unread(const std::string& file, const CImportOptions& options) {
    if (!options.IsNdjson() || file == "-") return {};
    Error error;
    const bool isOk =
        MusicXmlParser().parseURL(file, std::make_shared<MusicXmlParserDelegate>(), &error);
    return {TStatus::BadInput, MuxmlResultLine(isOk, error) + '\n'};
}

CImported ImportFile(const std::string& file, const CImportOptions& options) {
    const std::string name = InputName(file);
    const auto bytes = ReadInput(file, file == "-" ? kMostInputBytes : kMuxmlMaxFileSize);
    if (!bytes) return Unread(file, options);
    const CAlertsAsErrors alerts(name);
    CImportedScore score;
    std::string output;
    MusicXmlParserDelegate methods = HostFor(score);
    if (options.IsNdjson()) {
        const auto lines = MuxmlJsonLines(
            TMuxmlEnumForm_Word, [&output](const std::string& line) { output += line + '\n'; });
        methods = options.mMidiFile ? TellBoth(lines, methods) : lines;
    }
    Error error;
    const bool isOk = ImportWithProgress(*bytes, file, methods, error);
    if (!isOk) TellScoreFault(*bytes, name, error.description);
    if (isOk && options.mMidiFile && WriteMidi(score, *options.mMidiFile) != TStatus::Success) {
        return {};
    }
    const TStatus status = isOk && alerts.Count() == 0 ? TStatus::Success : TStatus::BadInput;
    if (options.IsNdjson()) return {status, output + MuxmlResultLine(isOk, error) + '\n'};
    if (!isOk) return {};
    return {status, ImportText(score, PaintOfOutput())};
}

TStatus Import(const CImportOptions& options) {
    if (options.mMidiFile == "") return Fail(TStatus::BadUsage, "--midi needs the name of a file");
    if (options.mMidiFile && options.mFiles.size() > 1) {
        return Fail(TStatus::BadUsage,
                    fmt::format("--midi is for one score, and {} are told", options.mFiles.size()));
    }
    CProgress progress(options.mFiles.size());
    TStatus status = TStatus::Success;
    bool isFirst = true;
    for (const std::string& file : options.mFiles) {
        progress.Step(file);
        const CImported imported = ImportFile(file, options);
        status = std::max(status, imported.mStatus);
        if (!imported.mOutput) continue;
        const TStatus printed =
            Print(HeadOf(InputName(file), isFirst, options) + *imported.mOutput);
        if (printed != TStatus::Success) return printed;
        isFirst = false;
    }
    return status;
}

}  // namespace

void AddImport(CCommand& program) {
    CCommand& command = program.AddCommand(kImportHelp);
    const auto options = std::make_shared<CImportOptions>();
    command
        .AddArgument("FILE", options->mFiles,
                     "Scores in MusicXML, compressed if the name ends in .mxl; - reads standard "
                     "input")
        .Required();
    command.AddChoice("--format", options->mFormat, {"text", "ndjson"}, "Form of the output");
    command.AddFlag("--json", options->mJson, "Short for --format ndjson").Excludes("--format");
    command.AddOption("--midi", "FILE", options->mMidiFile, "Also write the notes to a MIDI file");
    command.OnCall([options] { return Import(*options); });
}

}  // namespace brindle::cli
