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
    GChLibrary(const std::shared_ptr<GChTuning>& tuning, std::filesystem::path path);
    GChLibrary(const GChLibrary&) = delete;
    GChLibrary& operator=(const GChLibrary&) = delete;

    /// Null when the tuning is gone.
    [[nodiscard]] std::shared_ptr<GChTuning> gchTuning() const { return mGchTuning.lock(); }
    /// Empty for none.
    [[nodiscard]] const std::string& libraryName() const { return mLibraryName; }
    void setLibraryName(std::string_view name) { mLibraryName = name; }
    /// Of its file; empty for a library that was never saved.
    [[nodiscard]] const std::filesystem::path& libraryPath() const { return mLibraryPath; }
    void setLibraryPath(std::filesystem::path path) { mLibraryPath = std::move(path); }
    /// Kept in the file and left to the host.
    [[nodiscard]] bool isReadOnlyLibrary() const { return mIsReadOnlyLibrary; }
    void setIsReadOnlyLibrary(bool isReadOnly) { mIsReadOnlyLibrary = isReadOnly; }
    /// Rises by one with each library made in this process.
    [[nodiscard]] std::int64_t runTimeID() const { return mRunTimeID; }

    [[nodiscard]] const std::vector<std::shared_ptr<GChBasicChord>>& basicChords() const {
        return mBasicChords;
    }
    [[nodiscard]] std::size_t numberOfChords() const { return mBasicChords.size(); }
    /// Appends the chord, which belongs to this library from now on.
    void addChordRangePriv(const std::shared_ptr<GChBasicChord>& chord);
    void addBasicChord(const std::shared_ptr<GChBasicChord>& chord) { addChordRangePriv(chord); }
    /// The chord belongs to no library then. Nothing happens if it is not one of these.
    void deleteChordRange(const std::shared_ptr<GChBasicChord>& chord);
    /// replaceChordRange2:withChord: puts a chord in the place of another. Nothing happens if that
    /// is not one of these.
    void replaceChordRange2(const std::shared_ptr<GChBasicChord>& chord,
                            const std::shared_ptr<GChBasicChord>& withChord);

private:
    std::weak_ptr<GChTuning> mGchTuning;
    std::vector<std::shared_ptr<GChBasicChord>> mBasicChords;
    std::string mLibraryName;
    std::filesystem::path mLibraryPath;
    bool mIsReadOnlyLibrary = false;
    std::int64_t mRunTimeID;
};

}  // namespace brindle
