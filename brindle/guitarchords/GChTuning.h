// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChShortTuning.h"

#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

class GChLibrary;

/// A tuning of a database with the libraries of fingerings that were made for it, which it owns.
/// Made by std::make_shared, since its libraries refer back to it.
class GChTuning : public std::enable_shared_from_this<GChTuning> {
public:
    /// initWithShortTuning1: an invalid tuning leaves it without strings.
    explicit GChTuning(const GChShortTuning& shortTuning);
    GChTuning(const GChTuning&) = delete;
    GChTuning& operator=(const GChTuning&) = delete;

    /// Whether it has strings, 3 to 16.
    [[nodiscard]] bool isValid() const { return GChIsValidShortTuning(mShortTuning); }
    /// The pitches of its strings; all 0 for an invalid tuning.
    [[nodiscard]] const GChShortTuning& shortTuning() const { return mShortTuning; }
    /// 3 to 16; 0 for an invalid tuning.
    [[nodiscard]] int numberOfStrings() const;
    /// Empty for none.
    [[nodiscard]] const std::string& tuningName() const { return mTuningName; }
    /// An empty name is none.
    void setTuningName(std::string_view name) { mTuningName = name; }
    /// The fret of a capodaster, for the host; 0 at first.
    [[nodiscard]] int capodasterOffset() const { return mCapodasterOffset; }
    /// For the host.
    void setCapodasterOffset(int offset) { mCapodasterOffset = offset; }
    /// Rises by one with each tuning made in this process.
    [[nodiscard]] std::int64_t runTimeID() const { return mRunTimeID; }

    /// The same strings at the same pitches, other than GChIsEqualShortTuning.
    [[nodiscard]] bool isEqualToTuning(const GChTuning& other) const;
    /// "E2 A2 D3 G3 B3 E4".
    [[nodiscard]] std::string tuningPitchesString() const;

    /// In the order in which they were made or read.
    [[nodiscard]] const std::vector<std::shared_ptr<GChLibrary>>& tuningLibraries() const {
        return mTuningLibraries;
    }
    /// Adds an empty library; an empty path is a library without a file.
    std::shared_ptr<GChLibrary> createLibraryWithPath(const std::filesystem::path& path);
    /// False if it is not one of these.
    bool removeLibrary(const std::shared_ptr<GChLibrary>& library);
    /// Of all libraries.
    [[nodiscard]] std::size_t numberOfChords() const { return numberOfBasicChords(); }
    /// The same number: fingerings are not transposed.
    [[nodiscard]] std::size_t numberOfBasicChords() const;

private:
    GChShortTuning mShortTuning{};
    std::vector<std::shared_ptr<GChLibrary>> mTuningLibraries;
    std::string mTuningName;
    int mCapodasterOffset = 0;
    std::int64_t mRunTimeID;
};

}  // namespace brindle
