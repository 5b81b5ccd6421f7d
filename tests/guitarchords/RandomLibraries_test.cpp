// SPDX-License-Identifier: MIT
// The writer and the reader of library files agree on whatever a file can hold, and the reader
// survives whatever it is given.
#include "tests/guitarchords/LibraryForms.h"

#include <doctest/doctest.h>

#include <random>

using namespace brindle;
using namespace brindle::test;

namespace {

constexpr int kLibraries = 10'000;
constexpr unsigned kSeed = 7;

class CRandomLibraries {
public:
    std::shared_ptr<GChLibrary> Next() {
        mTuning = std::make_shared<GChTuning>(RandomTuning());
        mTuning->setTuningName(RandomText());
        const auto library = mTuning->createLibraryWithPath({});
        library->setLibraryName(RandomText());
        library->setIsReadOnlyLibrary(Below(2) == 1);
        for (int i = Below(6); i > 0; --i) library->addBasicChord(RandomChord());
        return library;
    }

    int Below(int end) { return static_cast<int>(mRandom() % static_cast<unsigned>(end)); }

private:
    GChShortTuning RandomTuning() {
        GChShortTuning tuning{};
        const auto strings = static_cast<std::size_t>(3 + Below(14));
        for (std::size_t i = 0; i < strings; ++i) {
            tuning[i] = static_cast<std::uint8_t>(1 + Below(127));
        }
        return tuning;
    }

    std::string RandomText() {
        static constexpr const char* kLetters[] = {
            "a", "Z", " ", "\xC3\xA9", "\xE2\x99\xAF", "\xE5\xBC\xA6", "\xF0\x9F\x8E\xB8"};
        std::string text;
        for (int i = Below(9); i > 0; --i) text += kLetters[Below(7)];
        return text;
    }

    std::shared_ptr<GChBasicChord> RandomChord() {
        const auto chord = std::make_shared<GChBasicChord>(mTuning->shortTuning());
        chord->setRootNote(Below(13) - 1);
        chord->setBassNote(Below(13) - 1);
        chord->setChordType(Below(256));
        chord->setDifficultyLevel(Below(8));
        chord->setIsMutedMask(Below(256));
        chord->setIsFavoriteMask(static_cast<std::uint32_t>(mRandom()));
        chord->setUserName(RandomText());
        const int lowest = Below(25);
        for (int i = 1 + Below(15); i > 0; --i) {
            const int string = Below(16);
            const std::uint8_t type = Below(4) == 0 ? 1 : 0;
            chord->addChordElem(nullptr, Below(6), lowest + Below(8), string,
                                string + Below(16 - string), type);
        }
        return chord;
    }

    std::mt19937 mRandom{kSeed};
    std::shared_ptr<GChTuning> mTuning;
};

bool IsSame(const GChChordElem& written, const GChChordElem& read) {
    auto expected =
        GChChordElem::make(written.fingerNumber(), written.absFretIndex(), written.coveredMinStr(),
                           written.coveredMaxStr(), written.isReal() ? 0 : 64);
    return expected && read.isEqualToChordElem(*expected);
}

bool IsSame(const GChBasicChord& written, const GChBasicChord& read) {
    return written.rootNote() == read.rootNote() && written.bassNote() == read.bassNote() &&
           written.chordType() == read.chordType() &&
           written.difficultyLevel() == read.difficultyLevel() &&
           written.isMutedMask() == read.isMutedMask() &&
           written.isFavoriteMask() == read.isFavoriteMask() &&
           written.userName() == read.userName() && written.shortTuning() == read.shortTuning() &&
           std::equal(written.chordElems().begin(), written.chordElems().end(),
                      read.chordElems().begin(), read.chordElems().end(),
                      [](const auto& a, const auto& b) { return IsSame(a, b); });
}

bool IsSame(const GChLibrary& written, const GChLibrary& read) {
    return written.libraryName() == read.libraryName() &&
           written.isReadOnlyLibrary() == read.isReadOnlyLibrary() &&
           written.gchTuning()->tuningName() == read.gchTuning()->tuningName() &&
           written.gchTuning()->isEqualToTuning(*read.gchTuning()) &&
           std::equal(written.basicChords().begin(), written.basicChords().end(),
                      read.basicChords().begin(), read.basicChords().end(),
                      [](const auto& a, const auto& b) { return IsSame(*a, *b); });
}

}  // namespace

TEST_CASE("What the writer writes the reader reads") {
    CRandomLibraries libraries;
    for (int i = 0; i < kLibraries; ++i) {
        const auto written = libraries.Next();
        GChDatabase database;
        const std::string bytes = written->wholeLibraryFileContent();
        REQUIRE_MESSAGE(database.readOneRegularFile(bytes, {}), "library " << i << " of seed 7");
        const auto read = database.allLibrariesForAnyTuning().front();
        REQUIRE_MESSAGE(IsSame(*written, *read), "library " << i << " of seed 7");
    }
}

TEST_CASE("Damaged files are survived, and what was read can be written") {
    CRandomLibraries libraries;
    for (int i = 0; i < kLibraries; ++i) {
        std::string bytes = libraries.Next()->wholeLibraryFileContent();
        for (int faults = 1 + libraries.Below(4); faults > 0; --faults) {
            const int at = libraries.Below(static_cast<int>(bytes.size()));
            bytes[static_cast<std::size_t>(at)] = static_cast<char>(libraries.Below(256));
        }
        bytes.resize(bytes.size() - static_cast<std::size_t>(libraries.Below(3)));
        GChDatabase database;
        database.readOneRegularFile(bytes, {});
        for (const auto& library : database.allLibrariesForAnyTuning()) {
            GChDatabase again;
            CHECK(again.readOneRegularFile(library->wholeLibraryFileContent(), {}));
            CHECK(again.allLibrariesForAnyTuning()[0]->numberOfChords() ==
                  library->numberOfChords());
        }
    }
}
