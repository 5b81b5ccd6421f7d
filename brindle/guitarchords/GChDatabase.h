// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChBasicChord.h"
#include "brindle/guitarchords/GChChord.h"
#include "brindle/guitarchords/GChLibrary.h"
#include "brindle/guitarchords/GChTuning.h"

#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace brindle {

struct FileNode;

/// The name that stands in files for the standard tuning.
inline constexpr std::string_view kGChDefaultTuningName = "Default Guitar Tuning";

/// Where the user's package lies unless the host says otherwise.
inline constexpr std::string_view kGChUserPackagePath =
    "~/Library/Application Support/Thornbank/Chord Grids/GuitarChords.gchdb";
/// Where the factory package lies within the resources, see ResourceFolder.
inline constexpr std::string_view kGChFactoryPackagePath = "Chord Grids/GuitarChords.gchdb";

/// A list of fingerings as views or as they are.
using GChChordList =
    std::variant<std::vector<GChChord>, std::vector<std::shared_ptr<GChBasicChord>>>;

/// Tunings with their libraries of fingerings, as they are kept in packages, and the fingering that
/// a user is editing. A package is a folder with one file for each library.
///
/// It belongs to one thread.
class GChDatabase {
public:
    GChDatabase() = default;
    /// initWithDiskData:defaultTuningName: with the flag reads the factory package and the user's,
    /// which is made if it is missing. `defaultTuningName` stands for kGChDefaultTuningName when
    /// files are read; empty for none.
    GChDatabase(bool withDiskData, std::string_view defaultTuningName);
    GChDatabase(const GChDatabase&) = delete;
    GChDatabase& operator=(const GChDatabase&) = delete;
    virtual ~GChDatabase() = default;

    // Tunings and libraries

    /// Those that were read or asked for, in that order.
    [[nodiscard]] const std::vector<std::shared_ptr<GChTuning>>& tunings() const {
        return mTunings;
    }
    /// The tuning whose fingerings are shown; null until one is set.
    [[nodiscard]] const std::shared_ptr<GChTuning>& activeTuning() const { return mActiveTuning; }
    /// False for a tuning that is not in this database. A change ends editing.
    bool setActiveTuning(const std::shared_ptr<GChTuning>& tuning);
    /// The standard guitar under its localized name, which is added if it is missing.
    std::shared_ptr<GChTuning> tuningWithDefaultGuitarTuning();
    /// tuningWithShortTuning:tuningName: the first tuning that is the same up to octaves, else a
    /// new one; null if it is invalid.
    std::shared_ptr<GChTuning> tuningWithShortTuning(const GChShortTuning& shortTuning,
                                                     std::string_view tuningName);
    /// See GChTuning::runTimeID; null if there is none.
    [[nodiscard]] std::shared_ptr<GChTuning> tuningWithRuntimeID(std::int64_t id) const;
    /// Takes a library out; its file goes at the next updateDatabaseFiles.
    void removeLibrary(const std::shared_ptr<GChLibrary>& library);
    /// The same for a tuning and all its libraries. Without the active one none is active.
    void removeTuning(const std::shared_ptr<GChTuning>& tuning);
    /// Tuning by tuning.
    [[nodiscard]] std::vector<std::shared_ptr<GChLibrary>> allLibrariesForAnyTuning() const;
    /// Without those that are read-only.
    [[nodiscard]] std::vector<std::shared_ptr<GChLibrary>> allUserLibrariesForAnyTuning() const;

    // Fingerings

    /// By the library of the chord; nothing happens if it has none.
    static void deleteChord1Range(const std::shared_ptr<GChBasicChord>& chord);
    /// replaceChord1Range1:withChord:
    static void replaceChord1Range1(const std::shared_ptr<GChBasicChord>& chord,
                                    const std::shared_ptr<GChBasicChord>& withChord);
    /// allChordsFilteringLibrary:createRanges: the fingerings of the active tuning, or only those
    /// of a library of it; of another library none. With the flag as views. Never null.
    [[nodiscard]] virtual std::shared_ptr<GChChordList> allChordsFilteringLibrary(
        const std::shared_ptr<GChLibrary>& library, bool createRanges);
    /// In all libraries of the active tuning; 0 without one.
    [[nodiscard]] std::size_t numberOfActiveChords() const { return numberOfActiveBasicChords(); }
    /// The same number: fingerings are not transposed.
    [[nodiscard]] std::size_t numberOfActiveBasicChords() const;

    // Editing

    /// The fingering that the user is editing; nothing for none.
    [[nodiscard]] const std::optional<GChChord>& editedChord() const { return mEditedChord; }
    /// Replaces it and nothing else.
    void setEditedChord(std::optional<GChChord> chord) { mEditedChord = std::move(chord); }
    /// For the host to go back to; nothing here reads it.
    [[nodiscard]] const std::optional<GChChord>& undoChord() const { return mUndoChord; }
    /// For the host.
    void setUndoChord(std::optional<GChChord> chord) { mUndoChord = std::move(chord); }
    /// What the edited chord was before; nothing for a new one.
    [[nodiscard]] const std::optional<GChChord>& originalChord() const { return mOriginalChord; }
    /// Notes its library as the source library.
    void setOriginalChord(std::optional<GChChord> chord);
    /// Null when it is gone.
    [[nodiscard]] std::shared_ptr<GChLibrary> sourceLibrary() const {
        return mSourceLibrary.lock();
    }
    /// Null without such a chord.
    [[nodiscard]] std::shared_ptr<GChBasicChord> editedBasicChord() const;
    /// That of the original chord, in the same way.
    [[nodiscard]] std::shared_ptr<GChBasicChord> originalBasicChord() const;
    /// For the host, until the active tuning changes.
    [[nodiscard]] bool chordNotInLibrary() const { return mChordNotInLibrary; }
    /// For the host.
    void setChordNotInLibrary(bool isNotInLibrary) { mChordNotInLibrary = isNotInLibrary; }
    /// Whether the edited chord differs from the original, or there is no original.
    [[nodiscard]] bool editedChordHasChanges() const;
    /// The same without a look at the favorites.
    [[nodiscard]] bool basicChordWasChanged() const;
    /// No edited chord, or one without elements.
    [[nodiscard]] bool editedChordIsEmpty() const;
    /// The edited chord.
    [[nodiscard]] const std::optional<GChChord>& additionalChordToDisplay() const {
        return mEditedChord;
    }
    /// Whether there is an edited chord.
    [[nodiscard]] bool hasAdditionalChordToDisplay() const {
        return additionalChordToDisplay().has_value();
    }

    // Files (in GChDatabase_Files.cpp). Reading never fails as a whole: what is damaged is skipped
    // or read as far as it goes.

    /// The folder of the package that new libraries go to; empty for none.
    [[nodiscard]] const std::filesystem::path& defaultUserPackagePath() const {
        return mDefaultUserPackagePath;
    }
    /// Where new libraries are saved. Becomes empty unless a folder is there; a "~" is expanded.
    void setDefaultUserPackagePath(std::string_view path);
    /// What stands for kGChDefaultTuningName when files are read from now on; empty for none.
    void setLocalizedDefaultTuningName(std::string_view name) {
        mLocalizedDefaultTuningName = name;
    }
    /// What updateDatabaseFiles removes.
    [[nodiscard]] const std::vector<std::filesystem::path>& filesToDelete() const {
        return mFilesToDelete;
    }

    /// readOneRegularFile:libraryPath: adds the library in the bytes of a file. False for bytes
    /// that are no library and for a damaged one; true also for one without a tuning chunk. An
    /// empty path is a library without a file.
    ///
    /// A tuning that lies an octave off joins the one that is there and takes its pitches.
    bool readOneRegularFile(std::string_view bytes, const std::filesystem::path& libraryPath);
    /// readLibraryFromFileWrapper:packagePath: adds the libraries of a package in the order of
    /// their file names. True.
    bool readLibraryFromFileWrapper(const FileNode& package,
                                    const std::filesystem::path& packagePath);
    /// readFromDbPackageAtPath: adds a package. False if there is no folder; a "~" is expanded.
    bool readFromDbPackageAtPath(std::string_view path);
    /// readFromDbPackageWrapper:packagePath: the same instead of all that was there.
    bool readFromDbPackageWrapper(const FileNode& package,
                                  const std::filesystem::path& packagePath);
    /// importFromDbPackagesAtPaths: adds copies of the libraries of packages. False if one of these
    /// is missing.
    bool importFromDbPackagesAtPaths(const std::vector<std::string>& paths);
    /// writeLibrariesToDbPackageWrapper: a package of the user's libraries, or of all.
    [[nodiscard]] FileNode writeLibrariesToDbPackageWrapper(bool onlyUserLibraries) const;
    /// writeLibraries:toNewDbPackagePath: replaces a package as a whole, and nothing else: false if
    /// the folder there holds other files, and when it could not be written.
    static bool writeLibraries(const std::vector<std::shared_ptr<GChLibrary>>& libraries,
                               std::string_view toNewDbPackagePath);
    /// Saves each library, then removes the files of those that were taken out. False if a library
    /// could not be saved; its file is as it was.
    bool updateDatabaseFiles();

private:
    void _EndEditing();

    std::vector<std::shared_ptr<GChTuning>> mTunings;
    std::shared_ptr<GChTuning> mActiveTuning;
    std::filesystem::path mDefaultUserPackagePath;
    std::vector<std::filesystem::path> mFilesToDelete;
    std::string mLocalizedDefaultTuningName;
    std::optional<GChChord> mEditedChord;
    std::optional<GChChord> mUndoChord;
    std::optional<GChChord> mOriginalChord;
    std::weak_ptr<GChLibrary> mSourceLibrary;
    bool mChordNotInLibrary = false;
    std::int32_t mChordCounter = 0;
};

/// Makes a package without libraries, and the folders that it lies in. What stands at the path is
/// replaced only if it is an empty folder or a package without libraries; false otherwise, and when
/// it could not be written. A "~" is expanded.
[[nodiscard]] bool GChCreateDbPackageAtPath(std::string_view path);

/// Whether a path leads to a package: a folder with the file that each package has, or with a
/// library. readFromDbPackageAtPath takes any folder. A "~" is expanded.
[[nodiscard]] bool GChIsDbPackageAtPath(std::string_view path);

}  // namespace brindle
