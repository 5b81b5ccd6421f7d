// SPDX-License-Identifier: MIT
// The chunk of a fingering in a library file: its writer and its reader.
#include "brindle/guitarchords/GChBasicChord.h"
#include "brindle/guitarchords/internal/LibraryFile.h"

#include <algorithm>

namespace brindle {

using namespace LibraryFile;

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

}  // namespace

bool LibraryFile::ReadChordBody(std::string_view chunk, GChBasicChord& chord) {
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

}  // namespace brindle
