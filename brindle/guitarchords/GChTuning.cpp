// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/GChTuning.h"

#include "brindle/guitarchords/GChLibrary.h"
#include "brindle/guitarchords/GChPitches.h"

#include <algorithm>
#include <atomic>

namespace brindle {

namespace {

std::int64_t NextRunTimeIDOfTuning() {
    static constinit std::atomic<std::int64_t> last = 0;
    return ++last;
}

}  // namespace

GChTuning::GChTuning(const GChShortTuning& shortTuning) : mRunTimeID(NextRunTimeIDOfTuning()) {
    if (GChIsValidShortTuning(shortTuning)) mShortTuning = shortTuning;
}

int GChTuning::numberOfStrings() const {
    return GChNumberOfStringsInShortTuning(mShortTuning);
}

bool GChTuning::isEqualToTuning(const GChTuning& other) const {
    return GChPitchArrayFromShortTuning(mShortTuning) ==
           GChPitchArrayFromShortTuning(other.mShortTuning);
}

std::string GChTuning::tuningPitchesString() const {
    std::string text;
    for (const int pitch : GChPitchArrayFromShortTuning(mShortTuning)) {
        text += (text.empty() ? "" : " ") + GChMidiPitchDefaultName(pitch);
    }
    return text;
}

std::shared_ptr<GChLibrary> GChTuning::createLibraryWithPath(const std::filesystem::path& path) {
    mTuningLibraries.push_back(std::make_shared<GChLibrary>(shared_from_this(), path));
    return mTuningLibraries.back();
}

bool GChTuning::removeLibrary(const std::shared_ptr<GChLibrary>& library) {
    return std::erase(mTuningLibraries, library) > 0;
}

std::size_t GChTuning::numberOfBasicChords() const {
    std::size_t count = 0;
    for (const auto& library : mTuningLibraries) count += library->basicChords().size();
    return count;
}

}  // namespace brindle
