// SPDX-License-Identifier: MIT
#include "brindle/musicxml/ScoreContainer.h"
#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/musicxml/internal/PlayedScore.h"
#include "brindle/musicxml/internal/ScoreReader.h"
#include "brindle/platform/AtomicFile.h"
#include "brindle/platform/Error.h"
#include "brindle/platform/Utf8.h"

#include <fmt/format.h>

#include <algorithm>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

namespace brindle {

namespace {

constexpr std::string_view kDomain = "brindle.musicxml";

enum TLoadFault : int {
    LoadFault_File = 1,
    LoadFault_Container = 2,
    LoadFault_Score = 3,
    LoadFault_Endless = 4,
};

bool Fail(Error* error, TLoadFault fault, std::string description) {
    if (error != nullptr) *error = {std::string(kDomain), fault, std::move(description)};
    return false;
}

std::string_view WithoutLeadingWhite(std::string_view bytes) {
    return bytes.substr(std::min(bytes.find_first_not_of(" \t\r\n"), bytes.size()));
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
TScoreReading ReadScoreInAnyEncoding(std::string_view bytes) {
    TScoreReading reading = ReadScore(WithoutLeadingWhite(bytes));
    if (!reading.mError) return reading;
    if (const auto text = FromLatin1(WithoutLeadingWhite(bytes))) {
        TScoreReading other = ReadScore(*text);
        if (!other.mError) return other;
    }
    return reading;
}

std::string TextOf(const XmlError& error) {
    if (error.mLine <= 0) return error.mDescription;
    return fmt::format("{}:{}: {}", error.mLine, error.mColumn, error.mDescription);
}

}  // namespace

bool TMusicXMLDoc::LoadAsPlayed(const std::string& path, Error* error) {
    const std::optional<std::string> bytes = ReadWholeFile(path);
    if (bytes) return LoadAsPlayedFromBytes(*bytes, error);
    *this = TMusicXMLDoc();
    return Fail(error, LoadFault_File, "the file cannot be read");
}

bool TMusicXMLDoc::LoadAsPlayedFromBytes(std::string_view bytes, Error* error) {
    *this = TMusicXMLDoc();
    std::optional<std::string> unpacked;
    if (IsScoreContainer(bytes)) {
        unpacked = ScoreInContainer(bytes);
        if (!unpacked) return Fail(error, LoadFault_Container, "no score in the container");
        bytes = *unpacked;
    }
    const TScoreReading reading = ReadScoreInAnyEncoding(bytes);
    if (reading.mError) return Fail(error, LoadFault_Score, TextOf(*reading.mError));
    Title = reading.mScore.mTitle;
    const bool isWhole = LayOutAsPlayed(reading.mScore, *this) && !reading.mWasCut;
    return isWhole || Fail(error, LoadFault_Endless, "the song is too long to be played");
}

}  // namespace brindle
