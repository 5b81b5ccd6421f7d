// SPDX-License-Identifier: MIT
#include "brindle/musicxml/ScoreContainer.h"

#include "brindle/platform/Ascii.h"
#include "brindle/platform/XmlStreamParser.h"
#include "brindle/platform/ZipContainer.h"

#include <algorithm>
#include <utility>

namespace brindle {

namespace {

constexpr std::string_view kMetaFolder = "META-INF";
constexpr std::string_view kContainerFile = "container.xml";

/// Finds the first file that a container.xml names.
class CRootFileFinder : public XmlStreamDelegate {
public:
    void didStartElement(XmlStreamParser&, std::string_view name,
                         const XmlAttributes& attributes) override {
        if (mPath.empty() && name == "rootfile") mPath = attributes.Value("full-path");
    }
    void didEndElement(XmlStreamParser&, std::string_view) override {}
    void foundCharacters(XmlStreamParser&, std::string_view) override {}

    std::string mPath;
};

const FileNode* FileAt(const FileNode& root, std::string_view path) {
    const FileNode* node = &root;
    while (node != nullptr && !path.empty()) {
        const std::size_t slash = std::min(path.find('/'), path.size());
        const std::string_view name = path.substr(0, slash);
        path.remove_prefix(std::min(slash + 1, path.size()));
        if (!name.empty() && name != ".") node = node->Child(name);
    }
    return node == nullptr || node->mIsFolder ? nullptr : node;
}

const FileNode* NamedFile(const FileNode& root) {
    const FileNode* meta = root.Child(kMetaFolder);
    const FileNode* container = meta == nullptr ? nullptr : meta->Child(kContainerFile);
    if (container == nullptr) return nullptr;
    XmlStreamParser parser;
    CRootFileFinder finder;
    parser.setDelegate(&finder);
    if (!parser.parse(container->mContents)) return nullptr;
    return finder.mPath.empty() ? nullptr : FileAt(root, finder.mPath);
}

bool EndsWith(std::string_view name, std::string_view ending) {
    return name.size() > ending.size() &&
           std::equal(ending.rbegin(), ending.rend(), name.rbegin(),
                      [](char a, char b) { return a == Ascii::ToLower(b) || a == b; });
}

// Names that begin with a point or an underline are notes of file systems, not scores.
const FileNode* FirstScoreFile(const FileNode& folder) {
    for (const auto& [name, node] : folder.mChildren) {
        if (name == kMetaFolder || name.empty() || name[0] == '.' || name[0] == '_') continue;
        if (node.mIsFolder) {
            if (const FileNode* found = FirstScoreFile(node)) return found;
        } else if (EndsWith(name, ".xml") || EndsWith(name, ".musicxml")) {
            return &node;
        }
    }
    return nullptr;
}

}  // namespace

bool IsScoreContainer(std::string_view bytes) {
    return bytes.substr(0, 2) == "PK";
}

std::optional<std::string> ScoreInContainer(std::string_view bytes) {
    const std::optional<FileNode> root = UnpackZip(bytes);
    if (!root) return std::nullopt;
    const FileNode* file = NamedFile(*root);
    if (file == nullptr) file = FirstScoreFile(*root);
    if (file == nullptr) return std::nullopt;
    return file->mContents;
}

std::string ContainerFault(std::string_view bytes) {
    // A library without readers of scores says so of any text.
    XmlStreamParser parser;
    if (!parser.parse("<score/>")) return parser.parserError()->mDescription;
    return UnpackZip(bytes) ? "no score in the container" : "the container cannot be unpacked";
}

}  // namespace brindle
