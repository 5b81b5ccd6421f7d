// SPDX-License-Identifier: MIT
// In place of platform/ZipContainer.cpp: in a browser JavaScript unzips, see src/unzip.ts.
#include "brindle/platform/ZipContainer.h"

#include "brindle/platform/internal/FilePlace.h"

#include <emscripten.h>

#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <memory>

// All files behind each other: length of the name, name, length of the contents, contents. Null for
// what cannot be unzipped. `packed` receives the length of it all.
// clang-format off
EM_JS(char*, brindle_unzip, (const char* bytes, size_t size, size_t* packed), {
    const files = Module["unzip"](HEAPU8.slice(bytes, bytes + size));
    if (!files) return 0;
    const parts = [];
    files.forEach((file) => parts.push(new TextEncoder().encode(file[0]), file[1]));
    const length = parts.reduce((sum, part) => sum + 4 + part.length, 0);
    const place = _malloc(length + 1);
    if (!place) return 0;
    const view = new DataView(HEAPU8.buffer);
    let at = place;
    parts.forEach((part) => {
        view.setUint32(at, part.length, true);
        HEAPU8.set(part, at + 4);
        at += 4 + part.length;
    });
    view.setUint32(packed, length, true);
    return place;
})
// clang-format on

namespace brindle {

namespace {

std::string_view TakePart(std::string_view& rest) {
    std::uint32_t size = 0;
    std::memcpy(&size, rest.data(), sizeof size);
    const std::string_view part = rest.substr(sizeof size, size);
    rest.remove_prefix(sizeof size + size);
    return part;
}

}  // namespace

std::optional<FileNode> UnpackZip(std::string_view bytes) {
    std::size_t size = 0;
    const std::unique_ptr<char, decltype(&std::free)> packed(
        brindle_unzip(bytes.data(), bytes.size(), &size), std::free);
    if (!packed) return std::nullopt;
    FileNode root;
    root.mIsFolder = true;
    for (std::string_view rest(packed.get(), size); !rest.empty();) {
        const std::string_view path = TakePart(rest);
        const std::string_view contents = TakePart(rest);
        FileNode* const place = PlaceFor(root, path);
        if (place == nullptr) return std::nullopt;
        if (!path.empty() && path.back() != '/') place->mContents = contents;
    }
    return root;
}

}  // namespace brindle
