// SPDX-License-Identifier: MIT
// The file of a library as bytes: its tuning, its chords, the whole.
#include "brindle/guitarchords/GChLibrary.h"
#include "brindle/guitarchords/GChTuning.h"
#include "brindle/guitarchords/internal/LibraryFile.h"

namespace brindle {

using namespace LibraryFile;

namespace {

enum class TChordChunk { Damaged, Empty, Read };

/// Takes a chunk, its size included, from the start of the bytes, which hold at least its size.
std::optional<std::string_view> TakeChunk(std::string_view& bytes) {
    const std::size_t size = Number32At(bytes, kChunkSizeAt);
    if (size < kChunkSizeSize || size > bytes.size()) return std::nullopt;
    const std::string_view chunk = bytes.substr(0, size);
    bytes.remove_prefix(size);
    return chunk;
}

TChordChunk ReadChord(std::string_view chunk, GChBasicChord& chord) {
    if (chunk.size() == kChunkSizeSize) return TChordChunk::Empty;
    const std::size_t bodySize = ByteAt(chunk, kBodySizeAt);
    if (bodySize == 0) return TChordChunk::Damaged;
    if (bodySize > chunk.size() - kChunkSizeSize) return TChordChunk::Empty;
    if (!ReadChordBody(chunk, chord)) return TChordChunk::Damaged;
    std::string_view name = chunk.substr(kBodySizeAt + bodySize);
    const auto userName = TakeStringField(name);
    if (!userName) return TChordChunk::Damaged;
    chord.setUserName(*userName);
    return chord.chordElems().empty() ? TChordChunk::Empty : TChordChunk::Read;
}

}  // namespace

std::size_t GChLibrary::tuningChunkSize() const {
    const std::shared_ptr<GChTuning> tuning = gchTuning();
    if (tuning == nullptr) return 0;
    const auto strings = static_cast<std::size_t>(tuning->numberOfStrings());
    return kChunkSizeSize + kTuningBodySize + strings + StringFieldSize(tuning->tuningName()) +
           StringFieldSize(mLibraryName);
}

std::size_t GChLibrary::writeTuningChunkToBuffer(std::uint8_t* buffer,
                                                 std::size_t remLength) const {
    const std::shared_ptr<GChTuning> tuning = gchTuning();
    if (tuning == nullptr) return 0;
    const auto strings = static_cast<unsigned>(tuning->numberOfStrings());
    CWriter writer(buffer, remLength);
    writer.Number32(tuningChunkSize());
    writer.Byte(kTuningBodySize + strings);
    writer.Byte((strings - 1) & 15);
    writer.Byte(0);
    writer.Byte(static_cast<unsigned>(tuning->capodasterOffset()) & 15);
    for (unsigned i = 0; i < strings; ++i) writer.Byte(tuning->shortTuning()[i]);
    writer.StringField(tuning->tuningName());
    writer.StringField(mLibraryName);
    return writer.Written();
}

bool GChLibrary::readChordChunksFromBuffer(const std::uint8_t* buffer, std::size_t length,
                                           std::int32_t& dbChordCount) {
    const std::shared_ptr<GChTuning> tuning = gchTuning();
    if (tuning == nullptr) return false;
    std::string_view rest(reinterpret_cast<const char*>(buffer), length);
    while (rest.size() > kChunkSizeSize) {
        const auto chunk = TakeChunk(rest);
        if (!chunk) return false;
        const auto chord = std::make_shared<GChBasicChord>(tuning->shortTuning());
        switch (ReadChord(*chunk, *chord)) {
            case TChordChunk::Damaged:
                return false;
            case TChordChunk::Empty:
                break;
            case TChordChunk::Read:
                chord->setDbChordID(dbChordCount);
                dbChordCount =
                    static_cast<std::int32_t>(static_cast<std::uint32_t>(dbChordCount) + 1);
                addChordRangePriv(chord);
        }
    }
    return true;
}

std::string GChLibrary::wholeLibraryFileContent() const {
    std::size_t size = kHeaderSize + tuningChunkSize();
    for (const auto& chord : mBasicChords) size += chord->chordChunkSize();
    std::string content(size, '\0');
    content.replace(0, kMagic.size(), kMagic);
    content[kReadOnlyAt] = mIsReadOnlyLibrary ? 1 : 0;
    std::size_t at = kHeaderSize;
    // Gives false when a chunk could not be written.
    const auto append = [&](auto write) {
        const std::size_t written =
            write(reinterpret_cast<std::uint8_t*>(content.data()) + at, size - at);
        at += written;
        return written > 0;
    };
    bool ok = append([this](auto* to, auto room) { return writeTuningChunkToBuffer(to, room); });
    for (const auto& chord : mBasicChords) {
        ok = ok &&
             append([&](auto* to, auto room) { return chord->writeChordChunkToBuffer(to, room); });
    }
    return ok ? content : std::string();
}

}  // namespace brindle
