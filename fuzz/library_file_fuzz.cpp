// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/GChDatabase.h"
#include "brindle/guitarchords/GChHarmonyStrings.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

namespace {

constexpr std::size_t kNamedChords = 4;

void Require(bool holds) {
    if (!holds) std::abort();
}

}  // namespace

/// The bytes are a library file: what is read of it can be shown, named, written and read again.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    brindle::GChDatabase database;
    database.readOneRegularFile({reinterpret_cast<const char*>(data), size}, {});
    for (const auto& library : database.allLibrariesForAnyTuning()) {
        std::size_t named = 0;
        for (const auto& basicChord : library->basicChords()) {
            const auto chord = brindle::GChChord::make(basicChord, 0);
            Require(chord && !chord->chordElems().empty());
            Require(chord->stringFromPitches(0).size() <= 16 * 5);
            if (named++ >= kNamedChords) continue;
            Require(brindle::GChProposedRootNoteFromChord(&*chord, 0) >= 0);
        }
        brindle::GChDatabase again;
        Require(again.readOneRegularFile(library->wholeLibraryFileContent(), {}));
        Require(again.allLibrariesForAnyTuning().front()->numberOfChords() ==
                library->numberOfChords());
    }
    return 0;
}
