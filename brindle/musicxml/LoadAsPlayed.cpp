// SPDX-License-Identifier: MIT
#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/musicxml/internal/PlayedScore.h"
#include "brindle/platform/AtomicFile.h"

#include <fmt/format.h>

#include <optional>
#include <string>
#include <utility>

namespace brindle {

namespace {

// The description has the place in front.
Error ErrorOf(CScoreFault fault) {
    if (fault.mLine > 0) {
        fault.mError.description =
            fmt::format("{}:{}: {}", fault.mLine, fault.mColumn, fault.mError.description);
    }
    return std::move(fault.mError);
}

}  // namespace

bool TMusicXMLDoc::LoadAsPlayed(const std::string& path, Error* error) {
    const std::optional<std::string> bytes = ReadWholeFile(path);
    if (bytes) return LoadAsPlayedFromBytes(*bytes, error);
    *this = TMusicXMLDoc();
    if (error != nullptr) {
        *error = {std::string(kLoadFaultDomain), LoadFault_File, "the file cannot be read"};
    }
    return false;
}

bool TMusicXMLDoc::LoadAsPlayedFromBytes(std::string_view bytes, Error* error) {
    CPlayedScore played = PlayScoreBytes(bytes);
    *this = std::move(played.mDoc);
    if (played.mFault && error != nullptr) *error = ErrorOf(std::move(*played.mFault));
    return !played.mFault;
}

}  // namespace brindle
