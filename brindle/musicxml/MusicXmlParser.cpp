// SPDX-License-Identifier: MIT
#include "brindle/musicxml/MusicXmlParser.h"

#include "brindle/musicxml/MuxmlLimits.h"
#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml.h"
#include "brindle/platform/AtomicFile.h"
#include "brindle/platform/Localization.h"
#include "brindle/platform/XmlDocument.h"
#include "brindle/platform/XmlStreamParser.h"
#include "brindle/platform/ZipContainer.h"

#include <fmt/format.h>

#include <array>
#include <string_view>
#include <system_error>
#include <utility>
#include <variant>

namespace brindle {

namespace {

constexpr const char* kErrorDomain = "org.thornbank.host10";
constexpr int kCode = 259;
constexpr const char* kXmlDomain = "NSXMLParserErrorDomain";
constexpr const char* kFileDomain = "NSCocoaErrorDomain";
constexpr int kFileUnreadable = 256;

constexpr const char* kNoMusicXml = "File is not a MusicXML File";
constexpr const char* kNotDecompressed = "Could not decompress (compressed MusicXML file)";
constexpr const char* kNoFullPath =
    "Compressed MusicXML file seems to be malformed (could not find ‘full-path’)";
constexpr const char* kNoTemporaryFile = "Could not create temporary conversion file";

constexpr const char* kTemporaryName = "ThornbankMusicXMLImport.xml";

Error LocalError(const char* description) {
    return {kErrorDomain, kCode, LocalizedString(description)};
}

Error ErrorFrom(const XmlError& error) {
    return {kXmlDomain, error.mCode,
            fmt::format("Line {}, column {}: {}", error.mLine, error.mColumn, error.mDescription)};
}

Error UnreadableFile(const std::filesystem::path& url) {
    std::error_code code;
    const auto size = std::filesystem::file_size(url, code);
    const bool isTooLarge = !code && size > kMuxmlMaxFileSize;
    return {kFileDomain, kFileUnreadable,
            isTooLarge ? fmt::format("The file is larger than {} MiB", kMuxmlMaxFileSize >> 20)
                       : "The file could not be read"};
}

std::optional<std::filesystem::path> TemporaryFile() {
    std::error_code error;
    const std::filesystem::path folder = std::filesystem::temp_directory_path(error);
    if (error) return std::nullopt;
    return folder / kTemporaryName;
}

// A container and the name of the score in it.
struct CPacked {
    FileNode mContainer;
    std::string mFullPath;

    // Null when there is none. Kept: the path is one name, so that a score in a folder of the
    // container is not found.
    [[nodiscard]] const std::string* Score() const {
        const FileNode* const score = mContainer.Child(mFullPath);
        return score == nullptr || score->mIsFolder ? nullptr : &score->mContents;
    }
};

// Whether the element is, or stands inside, a rootfile of the rootfiles of a container. Asked of
// each element in its turn, as the path "//container//rootfiles//rootfile" takes a library of paths
// quadratic time.
bool IsInRootFile(XmlNode node) {
    constexpr std::array<std::string_view, 3> kNames{"rootfile", "rootfiles", "container"};
    std::size_t found = 0;
    for (; node && found < kNames.size(); node = node.parent()) {
        if (node.name() == kNames[found]) ++found;
    }
    return found == kNames.size();
}

std::optional<std::string> FullPath(const FileNode& container) {
    const FileNode* const folder = container.Child("META-INF");
    const FileNode* const list = folder == nullptr ? nullptr : folder->Child("container.xml");
    if (list == nullptr) return std::nullopt;
    const auto document = XmlDocument::FromBytes(list->mContents);
    if (!std::holds_alternative<XmlDocument>(document)) return std::nullopt;
    const XmlNode root = std::get<XmlDocument>(document).rootElement();
    for (XmlNode node = root; node; node = node.nextBelow(root)) {
        auto path = node.attribute("full-path");
        if (path && IsInRootFile(node)) return path;
    }
    return std::nullopt;
}

std::optional<Error> Unpack(std::string_view bytes, CPacked& packed) {
    auto container = UnpackZip(bytes);
    if (!container) return LocalError(kNotDecompressed);
    auto fullPath = FullPath(*container);
    if (!fullPath) return LocalError(kNoFullPath);
    packed = {*std::move(container), *std::move(fullPath)};
    return std::nullopt;
}

}  // namespace

bool MusicXmlParser::assignLocalError(const Error& error, Error* outError) {
    if (outError != nullptr) *outError = error;
    return false;
}

bool MusicXmlParser::parseURL(
    const std::filesystem::path& url,
    const std::shared_ptr<const brindle::MusicXmlParserDelegate>& delegate, Error* error) {
    MusicXmlParserDelegate = delegate;
    mUnpackedBytes.reset();
    std::filesystem::path source = url;
    if (const auto failure = wrapCompressedMusicXMLFile(&source)) {
        return assignLocalError(*failure, error);
    }
    const auto bytes = mUnpackedBytes ? std::exchange(mUnpackedBytes, std::nullopt)
                                      : ReadWholeFile(source, kMuxmlMaxFileSize);
    if (!bytes) return assignLocalError(UnreadableFile(source), error);
    return parseBytes(*bytes, delegate, error);
}

bool MusicXmlParser::parseBytes(
    std::string_view bytes, const std::shared_ptr<const brindle::MusicXmlParserDelegate>& delegate,
    Error* error) {
    MusicXmlParserDelegate = delegate;
    const auto document = XmlDocument::FromBytes(bytes);
    if (const auto* const fault = std::get_if<XmlError>(&document)) {
        return assignLocalError(ErrorFrom(*fault), error);
    }
    const auto& tree = std::get<XmlDocument>(document);
    const std::string_view root = tree.rootElement().name();
    if (!root.starts_with("score-partwise") && !root.starts_with("score-timewise")) {
        return assignLocalError(LocalError(kNoMusicXml), error);
    }
    XmlStreamParser parser;
    XMLParserDelegate_RecursiveMuxml rootDelegate(MidiTicksPerQuarter, tree);
    rootDelegate.MusicXmlParserDelegate = delegate;
    rootDelegate.Trace = Trace;
    parser.setDelegate(&rootDelegate);
    parser.parse(bytes);
    if (const auto& fault = parser.parserError()) {
        return assignLocalError(ErrorFrom(*fault), error);
    }
    return true;
}

std::optional<Error> MusicXmlParser::unpackCompressedMusicXML(std::string_view bytes,
                                                              std::string& score) {
    CPacked packed;
    if (auto failure = Unpack(bytes, packed)) return failure;
    if (packed.Score() == nullptr) return LocalError(kNoTemporaryFile);
    score = *packed.Score();
    return std::nullopt;
}

std::optional<Error> MusicXmlParser::wrapCompressedMusicXMLFile(std::filesystem::path* url) {
    if (url == nullptr || url->extension() != std::string(".") + kMusicXMLFileExtCompressed_mxl) {
        return std::nullopt;
    }
    CPacked packed;
    const auto bytes = ReadWholeFile(*url, kMuxmlMaxFileSize);
    if (auto failure = Unpack(bytes.value_or(std::string()), packed)) return failure;
    const auto temporaryFile = TemporaryFile();
    if (!temporaryFile) return LocalError(kNoTemporaryFile);
    *url = *temporaryFile;
    const std::string* const score = packed.Score();
    if (score == nullptr || !WritePrivateFileAtomically(*url, *score)) {
        return LocalError(kNoTemporaryFile);
    }
    mUnpackedBytes = *score;
    return std::nullopt;
}

}  // namespace brindle
