// SPDX-License-Identifier: MIT
// Any bytes as a score: the import ends, and all that it tells a host can be written down.

#include "brindle/musicxml/MusicXmlParser.h"
#include "brindle/musicxml/MuxmlJsonLines.h"
#include "brindle/platform/Alerts.h"

#include <boost/rational.hpp>

#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>

using namespace brindle;

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    SetAlertHandler([](const CAlert&) {});
    std::size_t written = 0;
    const auto host = std::make_shared<MusicXmlParserDelegate>(MuxmlJsonLines(
        TMuxmlEnumForm_Word, [&written](const std::string& line) { written += line.size(); }));
    try {
        MusicXmlParser().parseBytes({reinterpret_cast<const char*>(data), size}, host);
    } catch (const boost::bad_rational&) {  // divisions of 0
    }
    return 0;
}
