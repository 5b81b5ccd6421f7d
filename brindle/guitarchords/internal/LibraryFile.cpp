// SPDX-License-Identifier: MIT
// The library file: each chunk has its writer and behind it its reader.
#include "brindle/guitarchords/internal/LibraryFile.h"

#include "brindle/guitarchords/GChLibrary.h"
#include "brindle/guitarchords/GChTuning.h"
#include "brindle/platform/Utf16.h"

#include <algorithm>
#include <cstring>
#include <limits>

namespace brindle {

using namespace LibraryFile;

// String field

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

// Header and tuning chunk

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

THeadFault LibraryFile::ReadHead(std::string_view bytes, TLibraryHead& head) {
    if (bytes.size() < kHeaderSize || bytes.substr(0, kMagic.size()) != kMagic) {
        return THeadFault::NoLibrary;
    }
    head.mIsReadOnly = (ByteAt(bytes, kReadOnlyAt) & 1) != 0;
    bytes.remove_prefix(kHeaderSize);
    if (bytes.size() < kChunkSizeSize) return THeadFault::NoTuningChunk;
    const std::size_t chunkSize = Number32At(bytes, kChunkSizeAt);
    if (chunkSize <= kStringCountAt || chunkSize > bytes.size()) return THeadFault::NoTuningChunk;
    head.mChordChunks = bytes.substr(chunkSize);
    const std::string_view chunk = bytes.substr(0, chunkSize);

    // The body must hold what it says itself and what the count of strings asks for.
    const std::size_t bodySize = ByteAt(chunk, kBodySizeAt);
    const std::size_t strings = (ByteAt(chunk, kStringCountAt) & 15) + 1;
    if (std::max(bodySize, strings + kTuningBodySize) > chunkSize - kChunkSizeSize) {
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

// Chord chunk

namespace {

/// A key number as a nibble: 0 for none.
unsigned NibbleOfNote(int note) {
    return note >= 0 && note < 12 ? static_cast<unsigned>(note + 1) : 0;
}

std::size_t WrittenElements(const GChBasicChord& chord) {
    return std::min(chord.chordElemCount(), kMostElements);
}

int LowestWrittenFret(const GChBasicChord& chord) {
    int lowest = 127;
    for (std::size_t i = 0; i < WrittenElements(chord); ++i) {
        lowest = std::min(lowest, chord.chordElems()[i].absFretIndex());
    }
    return lowest;
}

unsigned MuteBits(const GChBasicChord& chord) {
    unsigned bits = 0;
    for (int i = 0; i < kGChMaxStrings; ++i) {
        if (chord.isMutedForStringIndex(i)) bits |= 1u << i;
    }
    return bits;
}

}  // namespace

std::size_t GChBasicChord::chordChunkSize() const {
    return kChunkSizeSize + kChordBodySize + kElementSize * WrittenElements(*this) +
           StringFieldSize(mUserName);
}

std::size_t GChBasicChord::writeChordChunkToBuffer(std::uint8_t* buffer,
                                                   std::size_t remLength) const {
    const auto count = static_cast<unsigned>(WrittenElements(*this));
    const int lowestFret = LowestWrittenFret(*this);
    const auto type = static_cast<unsigned>(mChordType);
    CWriter writer(buffer, remLength);
    writer.Number32(chordChunkSize());
    writer.Byte(static_cast<unsigned>(kChordBodySize + kElementSize * count));
    writer.Byte(0);
    writer.Byte(NibbleOfNote(mRootNote) | NibbleOfNote(mBassNote) << 4);
    writer.Byte((static_cast<unsigned>(lowestFret) & 31) | (mDifficultyLevel & 7u) << 5);
    writer.Number16((count | type << 4) & 0xFFFF);
    writer.Number16(MuteBits(*this));
    writer.Number32(mIsFavoriteMask);
    for (unsigned i = 0; i < count; ++i) {
        const GChChordElem& elem = mChordElems[i];
        const auto fret = static_cast<unsigned>(elem.absFretIndex() - lowestFret);
        const auto finger = static_cast<unsigned>(elem.fingerNumber());
        writer.Byte((fret & 7) | (finger & 7) << 3 | (elem.fingerPointType() & 3u) << 6);
        writer.Byte((static_cast<unsigned>(elem.coveredMinStr()) & 15) |
                    (static_cast<unsigned>(elem.coveredMaxStr()) & 15) << 4);
    }
    writer.StringField(mUserName);
    return writer.Written();
}

namespace {

/// Adds the elements of a chunk that holds them; those that cannot exist are left out.
void ReadElements(std::string_view chunk, std::size_t count, GChBasicChord& chord) {
    const unsigned lowestFret = ByteAt(chunk, kLowestFretAt) & 31;
    for (std::size_t i = 0; i < count; ++i) {
        const unsigned point = ByteAt(chunk, kElementsAt + kElementSize * i);
        const unsigned strings = ByteAt(chunk, kElementsAt + kElementSize * i + 1);
        // Kept: the type comes back as 64, so that an optional point is one no more.
        chord.addChordElem(nullptr, static_cast<int>(point >> 3 & 7),
                           static_cast<int>((point & 7) + lowestFret),
                           static_cast<int>(strings & 15), static_cast<int>(strings >> 4),
                           static_cast<std::uint8_t>(point & 64));
    }
}

/// Reads a whole chunk without its name. False if the chunk ends before its fields do.
bool ReadChordBody(std::string_view chunk, GChBasicChord& chord) {
    if (chunk.size() < kElementsAt) return false;
    const std::size_t count = Number16At(chunk, kChordTypeAt) & 15;
    if (chunk.size() < kElementsAt + kElementSize * count) return false;
    ReadElements(chunk, count, chord);
    for (int i = 0; i < kGChMaxStrings; ++i) {
        chord.setMuted((Number16At(chunk, kMuteBitsAt) >> i & 1) != 0, i);
    }
    chord.setDifficultyLevel(static_cast<int>(ByteAt(chunk, kLowestFretAt) >> 5));
    chord.setRootNote(static_cast<int>(ByteAt(chunk, kNotesAt) & 15) - 1);
    chord.setBassNote(static_cast<int>(ByteAt(chunk, kNotesAt) >> 4) - 1);
    chord.setChordType(static_cast<int>(Number16At(chunk, kChordTypeAt) >> 4));
    chord.setIsFavoriteMask(Number32At(chunk, kFavoritesAt));
    return true;
}

}  // namespace

bool GChLibrary::readChordChunksFromBuffer(const std::uint8_t* buffer, std::size_t length,
                                           std::int32_t& dbChordCount) {
    const std::shared_ptr<GChTuning> tuning = gchTuning();
    if (tuning == nullptr) return false;
    std::string_view rest(reinterpret_cast<const char*>(buffer), length);
    while (rest.size() > kChunkSizeSize) {
        const std::size_t chunkSize = Number32At(rest, kChunkSizeAt);
        if (chunkSize < kChunkSizeSize || chunkSize > rest.size()) return false;
        const std::string_view chunk = rest.substr(0, chunkSize);
        rest.remove_prefix(chunkSize);
        if (chunkSize == kChunkSizeSize) continue;
        const std::size_t bodySize = ByteAt(chunk, kBodySizeAt);
        if (bodySize == 0) return false;
        if (bodySize > chunkSize - kChunkSizeSize) continue;

        const auto chord = std::make_shared<GChBasicChord>(tuning->shortTuning());
        if (!ReadChordBody(chunk, *chord)) return false;
        std::string_view name = chunk.substr(kBodySizeAt + bodySize);
        const auto userName = TakeStringField(name);
        if (!userName) return false;
        if (chord->chordElems().empty()) continue;
        chord->setDbChordID(dbChordCount);
        dbChordCount = static_cast<std::int32_t>(static_cast<std::uint32_t>(dbChordCount) + 1);
        chord->setUserName(*userName);
        addChordRangePriv(chord);
    }
    return true;
}

// The whole file

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
