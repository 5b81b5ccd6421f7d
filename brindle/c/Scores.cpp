// SPDX-License-Identifier: MIT
#include "brindle/c/internal/Border.h"

#include "brindle/musicxml/ImportScore.h"
#include "brindle/musicxml/MuxmlJsonLines.h"
#include "brindle/musicxml/ScoreContainer.h"
#include "brindle/platform/Alerts.h"
#include "brindle/present/ImportMidi.h"
#include "brindle/present/ImportedScore.h"
#include "brindle/present/ShownText.h"

#include <string>

using namespace brindle::border;

namespace {

// Imports a score for a host of methods; the status tells how that went.
brindle_status Import(std::string_view bytes, const brindle::MusicXmlParserDelegate& host) {
    const brindle::CMutedAlerts quiet;
    brindle::Error error;
    const bool isContainer = brindle::IsScoreContainer(bytes);
    if (ImportScore(bytes, isContainer, brindle::kImportTicksPerQuarter, host, error)) {
        return BRINDLE_OK;
    }
    return Fail(BRINDLE_ERROR_INPUT, brindle::Printable(error.description));
}

}  // namespace

brindle_status brindle_score_json_lines(const void* bytes, size_t size, char** lines) {
    if (lines == nullptr) return FailForNull("lines");
    *lines = nullptr;
    if (bytes == nullptr && size > 0) return FailForNull("bytes");
    return Guarded([&] {
        std::string text;
        const auto host =
            brindle::MuxmlJsonLines(brindle::TMuxmlEnumForm_Word,
                                    [&text](const std::string& line) { text += line + '\n'; });
        const brindle_status status = Import(BytesOf(bytes, size), host);
        return status == BRINDLE_OK ? GiveText(text, lines) : status;
    });
}

brindle_status brindle_score_midi(const void* bytes, size_t size, char** midi, size_t* midi_size) {
    if (midi == nullptr || midi_size == nullptr) return FailForNull("midi or midi_size");
    *midi = nullptr;
    *midi_size = 0;
    if (bytes == nullptr && size > 0) return FailForNull("bytes");
    return Guarded([&] {
        brindle::CImportedScore score;
        const brindle_status status = Import(BytesOf(bytes, size), HostFor(score));
        if (status != BRINDLE_OK) return status;
        return GiveText(MidiFileBytes(MidiPieceOf(score)), midi, midi_size);
    });
}
