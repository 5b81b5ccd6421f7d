// SPDX-License-Identifier: MIT
// Any bytes as a compressed score: it is unpacked within the limits, and the score is imported.

#include "brindle/musicxml/MusicXmlParser.h"
#include "brindle/platform/Alerts.h"

#include <boost/rational.hpp>

#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>

using namespace brindle;

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    SetAlertHandler([](const TAlert&) {});
    std::string score;
    const char* const bytes = reinterpret_cast<const char*>(data);
    if (MusicXmlParser::unpackCompressedMusicXML({bytes, size}, score)) return 0;
    try {
        MusicXmlParser().parseBytes(score, std::make_shared<MusicXmlParserDelegate>());
    } catch (const boost::bad_rational&) {  // divisions of 0
    }
    return 0;
}
