// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/GChLibrary.h"

#include <algorithm>
#include <atomic>
#include <utility>

namespace brindle {

namespace {

std::int64_t NextRunTimeIDOfLibrary() {
    static constinit std::atomic<std::int64_t> last = 0;
    return ++last;
}

}  // namespace

GChLibrary::GChLibrary(const std::shared_ptr<GChTuning>& tuning, std::filesystem::path path)
    : mGchTuning(tuning), mLibraryPath(std::move(path)), mRunTimeID(NextRunTimeIDOfLibrary()) {}

void GChLibrary::addChordRangePriv(const std::shared_ptr<GChBasicChord>& chord) {
    if (chord == nullptr) return;
    chord->setLibrary(shared_from_this());
    mBasicChords.push_back(chord);
}

void GChLibrary::deleteChordRange(const std::shared_ptr<GChBasicChord>& chord) {
    const auto found = std::find(mBasicChords.begin(), mBasicChords.end(), chord);
    if (found == mBasicChords.end()) return;
    // The argument may be the very element that goes.
    const std::shared_ptr<GChBasicChord> deleted = *found;
    mBasicChords.erase(found);
    deleted->setLibrary(nullptr);
}

void GChLibrary::replaceChordRange2(const std::shared_ptr<GChBasicChord>& chord,
                                    const std::shared_ptr<GChBasicChord>& withChord) {
    const auto found = std::find(mBasicChords.begin(), mBasicChords.end(), chord);
    if (withChord == nullptr || found == mBasicChords.end()) return;
    (*found)->setLibrary(nullptr);
    withChord->setLibrary(shared_from_this());
    *found = withChord;
}

}  // namespace brindle
