// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>

namespace brindle {

// The limits of an import of timed notes. No score that was written for players comes near them;
// they keep a file that was made to do harm from taking all time or memory. Further limits:
// elements are nested 256 deep at most and a text has kXmlMaxTextLength bytes, else the file is not
// well-formed; a compressed file holds kZipMaxUnpackedSize bytes and kZipMaxEntries files, else it
// cannot be decompressed.

/// Bytes of a file, compressed or not. A longer one is an error.
inline constexpr std::size_t kMuxmlMaxFileSize = std::size_t{256} << 20;

/// Elements that are looked through once more because parts repeat an identifier, in all of an
/// import; 64 bytes of their texts count as one more. Beyond it such a part is read like one whose
/// identifier is unknown.
inline constexpr std::size_t kMuxmlMaxRepeatedElements = 10'000'000;

/// Instruments in the list of parts. Those that follow belong to no part.
inline constexpr std::size_t kMuxmlMaxInstruments = 50'000;
/// Bytes of the identifier of an instrument that are compared with those of parts.
inline constexpr std::size_t kMuxmlMaxInstrumentIdLength = 64;
/// Instruments that all parts of an import get together; 64 bytes of their texts count as one more.
/// Beyond it parts get none.
inline constexpr std::size_t kMuxmlMaxPartInstruments = 1'000'000;

/// Bytes of a word that an attribute brings, such as the name of a font. The rest is cut off.
inline constexpr std::size_t kMuxmlMaxWordLength = 1'000;

/// Summands of a time signature such as 3+2 that are kept one by one. All are added.
inline constexpr std::size_t kMuxmlMaxSummands = 1'000;

/// Clefs of a part that are told again at its end. Further ones are told once only.
inline constexpr std::size_t kMuxmlMaxClefs = 100'000;

/// Ties of a note. Further ones are not looked at.
inline constexpr std::size_t kMuxmlMaxTies = 1'000;
/// Notes in ties that are open at the same time. Beyond it no tie is opened, and a note in the
/// midst of one only adds its length.
inline constexpr std::size_t kMuxmlMaxPendingNotes = 100'000;

/// Different transpositions that are counted in a part. Notes under further ones are not counted.
inline constexpr std::size_t kMuxmlMaxTransposes = 1'000;

/// Nodes and bytes of lyrics that are copied to the closing notes of ties in an import. Beyond it,
/// and from the first part that repeats an identifier, none are copied.
inline constexpr std::size_t kMuxmlMaxLyricCopies = 16'000'000;

/// Alerts of one import. Further ones are not shown.
inline constexpr std::int32_t kMuxmlMaxAlerts = 20;

}  // namespace brindle
