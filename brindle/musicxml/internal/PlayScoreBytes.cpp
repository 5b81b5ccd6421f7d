// SPDX-License-Identifier: MIT
#include "brindle/musicxml/ScoreContainer.h"
#include "brindle/musicxml/internal/PlayedScore.h"
#include "brindle/musicxml/internal/ScoreReader.h"
#include "brindle/platform/Utf8.h"

#include <algorithm>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

namespace brindle {

namespace {

std::string_view WithoutByteOrderMark(std::string_view bytes) {
    constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";
    if (bytes.starts_with(kByteOrderMark)) bytes.remove_prefix(kByteOrderMark.size());
    return bytes;
}

std::string_view LeadingWhite(std::string_view bytes) {
    return bytes.substr(0, bytes.find_first_not_of(" \t\r\n"));
}

/// The place of a fault that was found behind `white`.
void MoveBehind(std::string_view white, XmlError& error) {
    if (error.mLine <= 0) return;
    const std::size_t lastLine = white.rfind('\n') + 1;  // 0 if there is none
    if (error.mLine == 1) error.mColumn += static_cast<int>(white.size() - lastLine);
    error.mLine += static_cast<int>(std::count(white.begin(), white.end(), '\n'));
}

// The bytes as UTF-8 if they are Latin-1 with letters that UTF-8 does not know.
std::optional<std::string> FromLatin1(std::string_view bytes) {
    bool isUtf8 = true;
    for (std::string_view rest = bytes; !rest.empty() && isUtf8;) {
        const std::size_t length = Utf8Length(rest);
        isUtf8 = length > 0;
        rest.remove_prefix(length);
    }
    if (isUtf8 || bytes.find('\0') != bytes.npos) return std::nullopt;
    std::string text;
    text.reserve(bytes.size());
    for (const char c : bytes) {
        const auto byte = static_cast<unsigned char>(c);
        if (byte < 0x80) {
            text += c;
        } else {
            text += static_cast<char>(0xC0 | byte >> 6);
            text += static_cast<char>(0x80 | (byte & 0x3F));
        }
    }
    return text;
}

// Some scores say UTF-8, or nothing, and are Latin-1.
CScoreReading ReadScoreInAnyEncoding(std::string_view bytes) {
    bytes = WithoutByteOrderMark(bytes);
    const std::string_view white = LeadingWhite(bytes);
    const std::string_view score = bytes.substr(white.size());
    CScoreReading reading = ReadScore(score);
    if (!reading.mError) return reading;
    if (const auto text = FromLatin1(score)) {
        CScoreReading other = ReadScore(*text);
        if (!other.mError) return other;
    }
    MoveBehind(white, *reading.mError);
    return reading;
}

CScoreFault FaultOf(TLoadFault fault, std::string description) {
    return {{std::string(kLoadFaultDomain), fault, std::move(description)}};
}

CScoreFault FaultOf(const XmlError& error) {
    CScoreFault fault = FaultOf(LoadFault_Score, error.mDescription);
    if (error.mLine <= 0) return fault;
    fault.mLine = static_cast<std::size_t>(error.mLine);
    fault.mColumn = static_cast<std::size_t>(error.mColumn);
    return fault;
}

}  // namespace

CPlayedScore PlayScoreBytes(std::string_view bytes) {
    CPlayedScore played;
    std::optional<std::string> unpacked;
    if (IsScoreContainer(bytes)) {
        unpacked = ScoreInContainer(bytes);
        if (!unpacked) {
            played.mFault = FaultOf(LoadFault_Container, ContainerFault(bytes));
            return played;
        }
        bytes = *unpacked;
    }
    CScoreReading reading = ReadScoreInAnyEncoding(bytes);
    if (reading.mError) {
        played.mFault = FaultOf(*reading.mError);
        return played;
    }
    played.mWritten = std::move(reading.mScore);
    played.mDoc.Title = played.mWritten.mTitle;
    if (!LayOutAsPlayed(played) || reading.mWasCut) {
        played.mFault = FaultOf(LoadFault_Endless, "the song is too long to be played");
    }
    return played;
}

}  // namespace brindle
