// SPDX-License-Identifier: MIT
// Any text as a song model file: one that is read can be asked and written again as it was.

#include "brindle/song/NextChords.h"
#include "brindle/song/SongModelFile.h"

#include <cstddef>
#include <cstdint>
#include <string_view>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    using namespace brindle;
    const CSongModelReading read =
        ReadSongModel(std::string_view(reinterpret_cast<const char*>(data), size));
    if (!read.mFault.empty()) return 0;
    const CSongModelReading again = ReadSongModel(SongModelText(read.mModel));
    if (!again.mFault.empty() || again.mModel.Songs() != read.mModel.Songs()) __builtin_trap();
    (void)NextChords(read.mModel, {}, {CSignKeyLite("C major"), 3});
    return 0;
}
