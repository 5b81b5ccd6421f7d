// SPDX-License-Identifier: MIT
#include "brindle/song/ReadLeadSheet.h"

#include "brindle/musicxml/ScoreContainer.h"
#include "brindle/musicxml/internal/PlayedScore.h"
#include "brindle/platform/XmlStreamParser.h"

#include <string>
#include <utility>

namespace brindle {
namespace {

CTextFault FaultOfSheet(const CScoreFault& fault) {
    return {fault.mLine, fault.mColumn, fault.mError.description};
}

CLeadSheetReading ReadPlayedSheet(std::string_view bytes) {
    CPlayedScore played = PlayScoreBytes(bytes);
    if (played.mFault) return {{}, FaultOfSheet(*played.mFault)};
    return {std::move(played.mDoc), std::nullopt};
}

// The native reading tells only that it has failed; what reads its XML, or reads it as played,
// tells why. The latter is more lenient: it reads on behind blanks and wrong encodings.
CTextFault NativeFault(std::string_view bytes) {
    XmlStreamParser parser;
    if (!IsScoreContainer(bytes) && !parser.parse(bytes)) {
        const XmlError& fault = *parser.parserError();
        return {static_cast<std::size_t>(fault.mLine), static_cast<std::size_t>(fault.mColumn),
                fault.mDescription};
    }
    auto played = ReadPlayedSheet(bytes);
    return played.mFault ? *played.mFault : CTextFault{.mText = "the score cannot be laid out"};
}

CLeadSheetReading ReadNativeSheet(std::string_view bytes) {
    std::optional<std::string> unpacked;
    if (IsScoreContainer(bytes)) {
        unpacked = ScoreInContainer(bytes);
        if (!unpacked) return {{}, NativeFault(bytes)};
        bytes = *unpacked;
    }
    TMusicXMLDoc sheet;
    if (!sheet.LoadFromMusicXML(bytes)) return {{}, NativeFault(bytes)};
    return {std::move(sheet), std::nullopt};
}

}  // namespace

CLeadSheetReading ReadLeadSheet(std::string_view bytes, TLeadSheetTiming timing) {
    return timing == TLeadSheetTiming::Played ? ReadPlayedSheet(bytes) : ReadNativeSheet(bytes);
}

}  // namespace brindle
