// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CSong.h"
#include "brindle/song/ReadSong.h"

#include <nanobind/nanobind.h>

#include <cstddef>
#include <memory>
#include <string>
#include <vector>

namespace brindle::python {

/// A tuple that is made when it is first asked for and then kept. Used under Python's lock alone.
class CLazyTuple {
public:
    template <class TMake>
    const nanobind::object& Get(const TMake& make) const {
        if (!mTuple.is_valid()) mTuple = make();
        return mTuple;
    }

private:
    mutable nanobind::object mTuple;
};

struct CSourceSong;
using CSourceSongPtr = std::shared_ptr<CSourceSong>;

/// A song with what it was read from, so that it can be sent to another process.
struct CSourceSong {
    CSong mSong;
    std::string mSource;
    CSongOptions mOptions;
    CSourceSongPtr mFrom;     ///< the song that was read, of one that was transposed; else null
    std::vector<int> mSteps;  ///< semitones by which that was transposed, one call after the other
    bool mIsWritten = false;  ///< by a model, which tells repeats that its source does not
    CLazyTuple mChords;
};

/// Whether they were read, transposed and stated alike, so that they tell the same.
[[nodiscard]] bool IsSameSong(const CSourceSong& a, const CSourceSong& b);

/// The repeats of a song as plain numbers.
[[nodiscard]] nanobind::list RepeatsOf(const CSong& song);

/// SongError with the place of the first fault for a song that was not understood; one that was
/// read leniently is used as it is.
void CheckUnderstood(const CSourceSong& source);

/// Without the end marker.
[[nodiscard]] inline std::size_t ChordCount(const CSong& song) {
    return song.mChords.empty() ? 0 : song.mChords.size() - 1;
}

[[nodiscard]] inline double LengthOfChord(const CSong& song, std::size_t index) {
    return song.mChords[index + 1].mPosition - song.mChords[index].mPosition;
}

/// "" for one without a symbol.
[[nodiscard]] inline const std::string& SymbolOfChord(const CSong& song, std::size_t index) {
    static const std::string none;
    return index < song.mSymbols.size() ? song.mSymbols[index] : none;
}

/// Lets `type` be indexed and run through; `chordsOf` gives the tuple of its chords, whose record
/// is `record`.
template <class T, class TChordsOf>
void BindSequence(nanobind::class_<T>& type, const std::string& record, TChordsOf chordsOf) {
    namespace nb = nanobind;
    const auto element = [chordsOf](const T& self, const nb::object& index) {
        return nb::object(chordsOf(self)[index]);
    };
    const std::string name = "brindle._records." + record;
    type.def(
        "__iter__", [chordsOf](const T& self) { return nb::iter(chordsOf(self)); },
        nb::sig(("def __iter__(self) -> collections.abc.Iterator[" + name + "]").c_str()));
    type.def(
        "__getitem__",
        [element](const T& self, const nb::int_& index) { return element(self, index); },
        nb::arg("index"), nb::sig(("def __getitem__(self, index: int, /) -> " + name).c_str()));
    type.def(
        "__getitem__",
        [element](const T& self, const nb::slice& slice) { return element(self, slice); },
        nb::arg("slice"),
        nb::sig(("def __getitem__(self, slice: slice, /) -> tuple[" + name + ", ...]").c_str()));
}

}  // namespace brindle::python
