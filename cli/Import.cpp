// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/Input.h"
#include "cli/Json.h"

#include "brindle/musicxml/ImportScore.h"
#include "brindle/musicxml/MusicXmlParser.h"
#include "brindle/musicxml/MuxmlJsonLines.h"
#include "brindle/musicxml/MuxmlLimits.h"
#include "brindle/musicxml/ScoreContainer.h"
#include "brindle/platform/Alerts.h"
#include "brindle/platform/AtomicFile.h"
#include "brindle/present/ImportMidi.h"
#include "brindle/present/ImportText.h"

#include <fmt/format.h>

#include <functional>
#include <memory>
#include <optional>
#include <utility>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kImportHelp{
    "import",
    "Import a MusicXML score as timed notes",
    "  brindle import song.musicxml\n"
    "  brindle import song.mxl --format ndjson | grep didEncounterNote\n"
    "  brindle import song.mxl --midi song.mid\n",
};

struct CImportOptions {
    std::string mFile;
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

/// One method that calls two.
template <class... Arguments>
std::function<void(Arguments...)> Both(std::function<void(Arguments...)> first,
                                       std::function<void(Arguments...)> second) {
    if (!first || !second) return first ? first : second;
    return [first = std::move(first), second = std::move(second)](Arguments... arguments) {
        first(arguments...);
        second(arguments...);
    };
}

// The methods that an imported score has are called beside those that write lines.
MusicXmlParserDelegate Both(const MusicXmlParserDelegate& lines,
                            const MusicXmlParserDelegate& score) {
    MusicXmlParserDelegate both = lines;
    const auto join = [&](auto method) { both.*method = Both(lines.*method, score.*method); };
    join(&MusicXmlParserDelegate::didEncounterPartStart);
    join(&MusicXmlParserDelegate::didEncounterPartEnd);
    join(&MusicXmlParserDelegate::didEncounterMeasureEnd);
    join(&MusicXmlParserDelegate::didEncounterSignTime);
    join(&MusicXmlParserDelegate::didEncounterSignKey);
    join(&MusicXmlParserDelegate::didEncounterClef);
    join(&MusicXmlParserDelegate::didEncounterTranspose);
    join(&MusicXmlParserDelegate::didEncounterTempoChange);
    join(&MusicXmlParserDelegate::didEncounterDirection);
    join(&MusicXmlParserDelegate::didEncounterNote);
    join(&MusicXmlParserDelegate::didLeaveTieOpen);
    return both;
}

// False with an error; nothing when standard input cannot be read.
std::optional<bool> ImportFrom(const std::string& file, const MusicXmlParserDelegate& host,
                               Error& error) {
    const bool isNamedFile = file != "-";
    const auto bytes = isNamedFile ? ReadWholeFile(file, kMuxmlMaxFileSize) : ReadInput(file);
    if (bytes) {
        const bool isContainer = IsScoreContainer(*bytes) || file.ends_with(".mxl");
        return ImportScore(*bytes, isContainer, kImportTicksPerQuarter, host, error);
    }
    if (!isNamedFile) return std::nullopt;
    // The library tells why it cannot read a file.
    return MusicXmlParser().parseURL(file, std::make_shared<MusicXmlParserDelegate>(host), &error);
}

std::string ResultLine(bool isOk, const Error& error) {
    Json line{{"call", "result"}, {"ok", isOk}};
    if (!isOk) {
        line["domain"] = error.domain;
        line["code"] = error.code;
        line["description"] = error.description;
    }
    return line.dump(-1, ' ', false, Json::error_handler_t::replace) + '\n';
}

TStatus Import(const CImportOptions& options) {
    if (options.mMidiFile == "") return Fail(TStatus::BadUsage, "--midi needs the name of a file");
    const std::string name = options.mFile == "-" ? "standard input" : options.mFile;
    const CAlertsAsErrors alerts(name);
    CImportedScore score;
    std::string output;
    MusicXmlParserDelegate methods = HostFor(score);
    if (options.IsNdjson()) {
        const auto lines = MuxmlJsonLines(
            TMuxmlEnumForm_Word, [&output](const std::string& line) { output += line + '\n'; });
        methods = options.mMidiFile ? Both(lines, methods) : lines;
    }
    Error error;
    const auto isOk = ImportFrom(options.mFile, methods, error);
    if (!isOk) return TStatus::BadInput;
    if (!*isOk) {
        Fail(TStatus::BadInput,
             fmt::format("{}: {}", Printable(name), Printable(error.description)));
    }
    const TStatus status = *isOk && alerts.Count() == 0 ? TStatus::Success : TStatus::BadInput;
    if (options.IsNdjson()) {
        output += ResultLine(*isOk, error);
    } else if (*isOk) {
        output = ImportText(score, PaintOfOutput());
    }
    // The file first: who reads the output may stop before its end.
    if (*isOk && options.mMidiFile &&
        !WriteFileAtomically(*options.mMidiFile, MidiFileBytes(MidiPieceOf(score)))) {
        return Fail(TStatus::BadInput,
                    fmt::format("{} cannot be written", Printable(*options.mMidiFile)));
    }
    return Print(output) == TStatus::Success ? status : TStatus::BadInput;
}

}  // namespace

void AddImport(CCommand& program) {
    CCommand& command = program.AddCommand(kImportHelp);
    const auto options = std::make_shared<CImportOptions>();
    command
        .AddArgument("FILE", options->mFile,
                     "A score in MusicXML, compressed if its name ends in .mxl; - reads standard "
                     "input")
        .Required();
    command.AddChoice("--format", options->mFormat, {"text", "ndjson"}, "Form of the output");
    command.AddFlag("--json", options->mJson, "Short for --format ndjson").Excludes("--format");
    command.AddOption("--midi", "FILE", options->mMidiFile, "Also write the notes to a MIDI file");
    command.OnCall([options] { return Import(*options); });
}

}  // namespace brindle::cli
