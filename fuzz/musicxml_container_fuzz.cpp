// SPDX-License-Identifier: MIT
// The members of a compressed score: each begins with a line "@@NAME". The archive is made of them,
// so that what is mutated is names and contents; it is unpacked, and the score is imported.

#include "brindle/musicxml/MusicXmlParser.h"
#include "brindle/platform/Alerts.h"

#include <zip.h>
#include <boost/rational.hpp>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <memory>
#include <string>
#include <string_view>

namespace {

using namespace brindle;

constexpr std::string_view kMember = "@@";

void Require(bool holds) {
    if (!holds) std::abort();
}

// A name that stands there already, or is none, is left out.
void AddMember(zip_t* archive, std::string_view text) {
    const std::size_t line = std::min(text.find('\n'), text.size());
    const std::string name(text.substr(0, line));
    text.remove_prefix(std::min(text.size(), line + 1));
    zip_source_t* const content = zip_source_buffer(archive, text.data(), text.size(), 0);
    const zip_int64_t index = zip_file_add(archive, name.c_str(), content, ZIP_FL_ENC_GUESS);
    if (index < 0) {
        zip_source_free(content);
        return;
    }
    zip_set_file_compression(archive, static_cast<zip_uint64_t>(index), ZIP_CM_STORE, 0);
}

void AddMembers(zip_t* archive, std::string_view text) {
    while (text.starts_with(kMember)) {
        text.remove_prefix(kMember.size());
        const std::size_t end = std::min(text.find("\n@@"), text.size());
        AddMember(archive, text.substr(0, end));
        text.remove_prefix(std::min(text.size(), end + 1));
    }
}

std::string BytesOf(zip_source_t* source) {
    zip_stat_t stat;
    if (zip_source_stat(source, &stat) != 0 || zip_source_open(source) != 0) return {};
    std::string bytes(static_cast<std::size_t>(stat.size), '\0');
    Require(zip_source_read(source, bytes.data(), bytes.size()) ==
            static_cast<zip_int64_t>(bytes.size()));
    zip_source_close(source);
    return bytes;
}

// Empty for no members.
std::string ArchiveOf(std::string_view text) {
    zip_source_t* const source = zip_source_buffer_create(nullptr, 0, 0, nullptr);
    zip_t* const archive = zip_open_from_source(source, ZIP_CREATE | ZIP_TRUNCATE, nullptr);
    Require(archive != nullptr);
    zip_source_keep(source);
    AddMembers(archive, text);
    std::string bytes;
    if (zip_close(archive) == 0) {
        bytes = BytesOf(source);
    } else {
        zip_discard(archive);
    }
    zip_source_free(source);
    return bytes;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    constexpr std::size_t kMostBytes = 16384;
    if (size > kMostBytes) return 0;
    SetAlertHandler([](const CAlert&) {});
    const std::string archive = ArchiveOf({reinterpret_cast<const char*>(data), size});
    std::string score;
    if (MusicXmlParser::unpackCompressedMusicXML(archive, score)) return 0;
    try {
        MusicXmlParser().parseBytes(score, std::make_shared<MusicXmlParserDelegate>());
        MusicXmlParser().parseBytes(archive, std::make_shared<MusicXmlParserDelegate>());
    } catch (const boost::bad_rational&) {  // divisions of 0
    }
    return 0;
}
