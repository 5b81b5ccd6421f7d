// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChShortTuning.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace brindle {
class GChBasicChord;
}

/// The layout of a library file, for its writer and its reader.
///
/// All numbers are big-endian. A string field is a 32-bit size that counts itself, then the text in
/// UTF-16 behind a byte-order mark; a missing text has the size 4.
namespace brindle::LibraryFile {

// Header
inline constexpr std::string_view kMagic = "gchT";
inline constexpr std::size_t kReadOnlyAt = 7;   // 1: read-only; the bytes around it are 0
inline constexpr std::size_t kHeaderSize = 12;  // then the tuning chunk, then the chord chunks

// Each chunk
inline constexpr std::size_t kChunkSizeAt = 0;  // 32 bits, counts itself
inline constexpr std::size_t kBodySizeAt = 4;   // of the fixed part of a chunk, counted from here
inline constexpr std::size_t kChunkSizeSize = 4;

// Tuning chunk with n strings
inline constexpr std::size_t kTuningBodySize = 4;  // and n
inline constexpr std::size_t kStringCountAt = 5;   // (n - 1) & 15
inline constexpr std::size_t kCapodasterAt = 7;    // the offset & 15
inline constexpr std::size_t kPitchesAt = 8;       // n bytes, then two string fields: the name of
                                                   // the tuning and that of the library

// Chord chunk with m elements
inline constexpr std::size_t kChordBodySize = 12;  // and 2 m
inline constexpr std::size_t kNotesAt = 6;         // root + 1, and 16 times (bass + 1)
inline constexpr std::size_t kLowestFretAt = 7;    // lowest fret, and 32 times the difficulty
inline constexpr std::size_t kChordTypeAt = 8;     // 16 bits: m, and 16 times the chord type
inline constexpr std::size_t kMuteBitsAt = 10;     // 16 bits, bit i for string i
inline constexpr std::size_t kFavoritesAt = 12;    // 32 bits
inline constexpr std::size_t kElementsAt = 16;     // m times 2 bytes, then the user's name
inline constexpr std::size_t kElementSize = 2;
inline constexpr std::size_t kMostElements = 15;
// Of an element, byte 0: fret above the lowest one in bits 0 to 2, finger in 3 to 5, point type in
// 6 and 7; byte 1: lowest string in bits 0 to 3, highest in 4 to 7.

/// The size that a string field takes in a file; 4 for a text that is no UTF-8.
[[nodiscard]] std::size_t StringFieldSize(std::string_view text);

/// Writes numbers and texts one behind another into a buffer and never behind its end.
class CWriter {
public:
    CWriter(std::uint8_t* buffer, std::size_t size) : mBuffer(buffer), mSize(size) {}

    void Byte(unsigned byte);
    void Number16(unsigned number);
    void Number32(std::size_t number);
    void Bytes(std::string_view bytes);
    void StringField(std::string_view text);

    /// The count of bytes written, 0 if something did not fit.
    [[nodiscard]] std::size_t Written() const { return mFits ? mWritten : 0; }

private:
    std::uint8_t* mBuffer;
    std::size_t mSize;
    std::size_t mWritten = 0;
    bool mFits = true;
};

// Reading: the caller has checked that the bytes are there.

[[nodiscard]] inline unsigned ByteAt(std::string_view bytes, std::size_t offset) {
    return static_cast<unsigned char>(bytes[offset]);
}
[[nodiscard]] inline unsigned Number16At(std::string_view bytes, std::size_t offset) {
    return ByteAt(bytes, offset) << 8 | ByteAt(bytes, offset + 1);
}
[[nodiscard]] inline std::uint32_t Number32At(std::string_view bytes, std::size_t offset) {
    return std::uint32_t{Number16At(bytes, offset)} << 16 | Number16At(bytes, offset + 2);
}

/// Takes a string field from the start of the bytes, where it is checked. Nothing if its size or
/// its text is wrong; empty for a missing text.
[[nodiscard]] std::optional<std::string> TakeStringField(std::string_view& bytes);

/// What the beginning of a file tells.
struct CLibraryHead {
    bool mIsReadOnly = false;
    GChShortTuning mShortTuning{};
    std::string mTuningName;
    /// Nothing if the field is damaged.
    std::optional<std::string> mLibraryName;
    std::string_view mChordChunks;
};

/// Why the beginning of a file is not read.
enum class THeadFault { None, NoLibrary, NoTuningChunk, Damaged };

/// Reads header and tuning chunk. The result refers to `bytes`.
[[nodiscard]] THeadFault ReadHead(std::string_view bytes, CLibraryHead& head);

/// Reads a whole chord chunk without its name. False if the chunk ends before its fields do.
[[nodiscard]] bool ReadChordBody(std::string_view chunk, GChBasicChord& chord);

}  // namespace brindle::LibraryFile
