// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/internal/LibraryFile.h"

#include "brindle/platform/Utf16.h"

#include <algorithm>
#include <cstring>
#include <limits>

namespace brindle {

using namespace LibraryFile;

namespace {

/// The text as it stands in a file; empty if there is none, or none that can be written.
std::string FieldText(std::string_view text) {
    constexpr std::size_t kLongest = std::numeric_limits<std::uint32_t>::max() / 4;
    if (text.empty() || text.size() > kLongest) return {};
    return Utf16FromUtf8(text).value_or("");
}

}  // namespace

std::size_t LibraryFile::StringFieldSize(std::string_view text) {
    return kChunkSizeSize + FieldText(text).size();
}

void CWriter::StringField(std::string_view text) {
    const std::string field = FieldText(text);
    Number32(kChunkSizeSize + field.size());
    Bytes(field);
}

std::optional<std::string> LibraryFile::TakeStringField(std::string_view& bytes) {
    if (bytes.size() < kChunkSizeSize) return std::nullopt;
    const std::size_t size = Number32At(bytes, 0);
    if (size < kChunkSizeSize || size > bytes.size()) return std::nullopt;
    auto text = Utf8FromUtf16(bytes.substr(kChunkSizeSize, size - kChunkSizeSize));
    bytes.remove_prefix(size);
    return text;
}

void CWriter::Byte(unsigned byte) {
    mFits = mFits && mWritten < mSize;
    if (mFits) mBuffer[mWritten++] = static_cast<std::uint8_t>(byte);
}

void CWriter::Number16(unsigned number) {
    Byte(number >> 8);
    Byte(number);
}

void CWriter::Number32(std::size_t number) {
    mFits = mFits && number <= std::numeric_limits<std::uint32_t>::max();
    Number16(static_cast<unsigned>(number >> 16 & 0xFFFF));
    Number16(static_cast<unsigned>(number & 0xFFFF));
}

void CWriter::Bytes(std::string_view bytes) {
    mFits = mFits && bytes.size() <= mSize - mWritten;
    if (!mFits || bytes.empty()) return;
    std::memcpy(mBuffer + mWritten, bytes.data(), bytes.size());
    mWritten += bytes.size();
}

namespace {

/// Reads the strings and the names of a whole tuning chunk.
THeadFault ReadTuningChunk(std::string_view chunk, CLibraryHead& head) {
    // The body must hold what it says itself and what the count of strings asks for.
    const std::size_t bodySize = ByteAt(chunk, kBodySizeAt);
    const std::size_t strings = (ByteAt(chunk, kStringCountAt) & 15) + 1;
    if (std::max(bodySize, strings + kTuningBodySize) > chunk.size() - kChunkSizeSize) {
        return THeadFault::NoTuningChunk;
    }
    if (bodySize == 0) return THeadFault::Damaged;
    head.mShortTuning.fill(0);
    std::memcpy(head.mShortTuning.data(), chunk.data() + kPitchesAt, strings);

    std::string_view names = chunk.substr(kBodySizeAt + bodySize);
    auto tuningName = TakeStringField(names);
    if (!tuningName) return THeadFault::Damaged;
    head.mTuningName = std::move(*tuningName);
    head.mLibraryName = TakeStringField(names);
    return THeadFault::None;
}

}  // namespace

THeadFault LibraryFile::ReadHead(std::string_view bytes, CLibraryHead& head) {
    if (bytes.size() < kHeaderSize || bytes.substr(0, kMagic.size()) != kMagic) {
        return THeadFault::NoLibrary;
    }
    head.mIsReadOnly = (ByteAt(bytes, kReadOnlyAt) & 1) != 0;
    bytes.remove_prefix(kHeaderSize);
    if (bytes.size() < kChunkSizeSize) return THeadFault::NoTuningChunk;
    const std::size_t chunkSize = Number32At(bytes, kChunkSizeAt);
    if (chunkSize <= kStringCountAt || chunkSize > bytes.size()) return THeadFault::NoTuningChunk;
    head.mChordChunks = bytes.substr(chunkSize);
    return ReadTuningChunk(bytes.substr(0, chunkSize), head);
}

}  // namespace brindle
