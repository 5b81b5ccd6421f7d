// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChBasicChord.h"

#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

class GChTuning;

/// A list of fingerings for one tuning, kept in one file. It owns its fingerings, which refer back
/// to it. Made by GChTuning::createLibraryWithPath.
class GChLibrary : public std::enable_shared_from_this<GChLibrary> {
public:
    /// An empty library. The tuning is not owned, and createLibraryWithPath adds it to its list.
    GChLibrary(const std::shared_ptr<GChTuning>& tuning, std::filesystem::path path);
    GChLibrary(const GChLibrary&) = delete;
    GChLibrary& operator=(const GChLibrary&) = delete;

    /// Null when the tuning is gone.
    [[nodiscard]] std::shared_ptr<GChTuning> gchTuning() const { return mGchTuning.lock(); }
    /// Empty for none.
    [[nodiscard]] const std::string& libraryName() const { return mLibraryName; }
    /// An empty name is none.
    void setLibraryName(std::string_view name) { mLibraryName = name; }
    /// Of its file; empty for a library that was never saved.
    [[nodiscard]] const std::filesystem::path& libraryPath() const { return mLibraryPath; }
    /// Kept in the file and left to the host.
    [[nodiscard]] bool isReadOnlyLibrary() const { return mIsReadOnlyLibrary; }
    /// Nothing here keeps to it but GChDatabase::allUserLibrariesForAnyTuning.
    void setIsReadOnlyLibrary(bool isReadOnly) { mIsReadOnlyLibrary = isReadOnly; }
    /// Rises by one with each library made in this process.
    [[nodiscard]] std::int64_t runTimeID() const { return mRunTimeID; }

    /// In the order in which they were added, none of them null.
    [[nodiscard]] const std::vector<std::shared_ptr<GChBasicChord>>& basicChords() const {
        return mBasicChords;
    }
    /// How many there are.
    [[nodiscard]] std::size_t numberOfChords() const { return mBasicChords.size(); }
    /// Appends the chord, which belongs to this library from now on.
    void addChordRangePriv(const std::shared_ptr<GChBasicChord>& chord);
    /// The same.
    void addBasicChord(const std::shared_ptr<GChBasicChord>& chord) { addChordRangePriv(chord); }
    /// The chord belongs to no library then. Nothing happens if it is not one of these.
    void deleteChordRange(const std::shared_ptr<GChBasicChord>& chord);
    /// replaceChordRange2:withChord: puts a chord in the place of another. Nothing happens if that
    /// is not one of these.
    void replaceChordRange2(const std::shared_ptr<GChBasicChord>& chord,
                            const std::shared_ptr<GChBasicChord>& withChord);

    // Its file (the layout is in internal/LibraryFile.h)

    /// 0 when the tuning is gone. A name that is no UTF-8 counts and is written as a missing one.
    [[nodiscard]] std::size_t tuningChunkSize() const;
    /// writeTuningChunkToBuffer:remLength: the size of the chunk, 0 if it does not fit.
    std::size_t writeTuningChunkToBuffer(std::uint8_t* buffer, std::size_t remLength) const;
    /// The bytes of the whole file; empty on failure.
    [[nodiscard]] std::string wholeLibraryFileContent() const;
    /// readChordChunksFromBuffer:withLength:dbChordCount: adds the chords of the chunks, numbered
    /// from the counter on. False at the first bad chunk; the chords before it stay.
    bool readChordChunksFromBuffer(const std::uint8_t* buffer, std::size_t length,
                                   std::int32_t& dbChordCount);
    /// updateLibraryFile: replaces its file as a whole. A library without a path gets a new file in
    /// the folder of the package, unless that is empty; one whose file is gone is not written.
    /// False when the file could not be written; then the old one is as it was.
    bool updateLibraryFile(const std::filesystem::path& packagePath);

private:
    std::weak_ptr<GChTuning> mGchTuning;
    std::vector<std::shared_ptr<GChBasicChord>> mBasicChords;
    std::string mLibraryName;
    std::filesystem::path mLibraryPath;
    bool mIsReadOnlyLibrary = false;
    std::int64_t mRunTimeID;
};

}  // namespace brindle
