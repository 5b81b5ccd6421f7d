// SPDX-License-Identifier: MIT
#include "brindle/musicxml/ImportScore.h"

#include "brindle/musicxml/MusicXmlParser.h"
#include "brindle/musicxml/ScoreContainer.h"

#include <memory>
#include <optional>
#include <stdexcept>
#include <string>

namespace brindle {
namespace {

using THost = std::shared_ptr<const MusicXmlParserDelegate>;

// A container without a usable list of its files has a score nevertheless.
bool ImportContainer(MusicXmlParser& parser, std::string_view bytes, const THost& host,
                     Error& error) {
    if (const auto score = ScoreInContainer(bytes)) return parser.parseBytes(*score, host, &error);
    // The parser's reason may speak of a file that is not made here.
    std::string unused;
    error = MusicXmlParser::unpackCompressedMusicXML(bytes, unused).value_or(Error{});
    error.description = ContainerFault(bytes);
    return false;
}

}  // namespace

bool ImportScore(std::string_view bytes, bool isContainer, std::int32_t ticksPerQuarter,
                 const MusicXmlParserDelegate& host, Error& error) {
    MusicXmlParser parser;
    parser.MidiTicksPerQuarter = ticksPerQuarter;
    const auto shared = std::make_shared<const MusicXmlParserDelegate>(host);
    try {
        return isContainer ? ImportContainer(parser, bytes, shared, error)
                           : parser.parseBytes(bytes, shared, &error);
    } catch (const std::domain_error& exception) {
        // Divisions of 0 leave no unit in which places in the bar could be told.
        error = {"", 0, exception.what()};
        return false;
    }
}

}  // namespace brindle
