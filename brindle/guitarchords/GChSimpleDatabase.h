// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChDatabase.h"

#include <memory>
#include <string_view>

namespace brindle {

/// A database for showing: a factory package and a user's package in one, or a single library.
class GChSimpleDatabase : public GChDatabase {
public:
    /// initWithFactoryDatabase:andUserDatabase: reads the user's package first, so that its tunings
    /// win, and makes it if it is missing. Null if a path is empty.
    [[nodiscard]] static std::unique_ptr<GChSimpleDatabase> makeWithFactoryDatabase(
        std::string_view factoryPath, std::string_view userPath);
    /// initWithLibraryFileAtPath:defaultTuningName: null if the file cannot be read or is damaged.
    [[nodiscard]] static std::unique_ptr<GChSimpleDatabase> makeWithLibraryFileAtPath(
        std::string_view path, std::string_view defaultTuningName);

    /// Always views. The list for a library is made once and comes back as the caller left it while
    /// the same library is asked for.
    ///
    /// Kept: without a library the list also comes back after a change of the active tuning.
    [[nodiscard]] std::shared_ptr<GChChordList> allChordsFilteringLibrary(
        const std::shared_ptr<GChLibrary>& library, bool createRanges) override;

private:
    GChSimpleDatabase() = default;

    std::shared_ptr<GChChordList> mFilteredChords;
    std::shared_ptr<GChLibrary> mLastFilter;
};

}  // namespace brindle
