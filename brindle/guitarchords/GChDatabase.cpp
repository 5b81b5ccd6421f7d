// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/GChDatabase.h"

#include "brindle/platform/Resources.h"

#include <algorithm>

namespace brindle {

namespace {

template <class TList, class TItem>
bool Contains(const TList& list, const TItem& item) {
    return std::find(list.begin(), list.end(), item) != list.end();
}

bool Differs(const std::optional<GChChord>& edited, const std::optional<GChChord>& original,
             bool includeFavoriteMask) {
    if (!edited) return false;
    if (!original) return true;
    return !edited->basicChord()->isEqualToChordRange(*original->basicChord(), includeFavoriteMask);
}

std::shared_ptr<GChBasicChord> BasicChordOf(const std::optional<GChChord>& chord) {
    return chord ? chord->basicChord() : nullptr;
}

}  // namespace

GChDatabase::GChDatabase(bool withDiskData, std::string_view defaultTuningName)
    : mLocalizedDefaultTuningName(defaultTuningName) {
    if (!withDiskData) return;
    readFromDbPackageAtPath((ResourceFolder() / kGChFactoryPackagePath).string());
    if (!readFromDbPackageAtPath(kGChUserPackagePath) &&
        GChCreateDbPackageAtPath(kGChUserPackagePath)) {
        readFromDbPackageAtPath(kGChUserPackagePath);
    }
    setDefaultUserPackagePath(kGChUserPackagePath);
}

bool GChDatabase::setActiveTuning(const std::shared_ptr<GChTuning>& tuning) {
    if (!Contains(mTunings, tuning)) return false;
    if (tuning == mActiveTuning) return true;
    mActiveTuning = tuning;
    _EndEditing();
    return true;
}

std::shared_ptr<GChTuning> GChDatabase::tuningWithDefaultGuitarTuning() {
    return tuningWithShortTuning(kGChStandardGuitar, mLocalizedDefaultTuningName.empty()
                                                         ? kGChDefaultTuningName
                                                         : mLocalizedDefaultTuningName);
}

std::shared_ptr<GChTuning> GChDatabase::tuningWithShortTuning(const GChShortTuning& shortTuning,
                                                              std::string_view tuningName) {
    for (const auto& tuning : mTunings) {
        if (GChIsEqualShortTuning(tuning->shortTuning(), shortTuning)) return tuning;
    }
    if (!GChIsValidShortTuning(shortTuning)) return nullptr;
    mTunings.push_back(std::make_shared<GChTuning>(shortTuning));
    mTunings.back()->setTuningName(tuningName);
    return mTunings.back();
}

std::shared_ptr<GChTuning> GChDatabase::tuningWithRuntimeID(std::int64_t id) const {
    const auto found = std::find_if(mTunings.begin(), mTunings.end(),
                                    [&](const auto& tuning) { return tuning->runTimeID() == id; });
    return found == mTunings.end() ? nullptr : *found;
}

void GChDatabase::removeLibrary(const std::shared_ptr<GChLibrary>& library) {
    // The argument may be a reference into the list that it is taken out of.
    const std::shared_ptr<GChLibrary> removed = library;
    for (const auto& tuning : mTunings) {
        if (!tuning->removeLibrary(removed)) continue;
        if (!removed->libraryPath().empty()) mFilesToDelete.push_back(removed->libraryPath());
    }
}

void GChDatabase::removeTuning(const std::shared_ptr<GChTuning>& tuning) {
    const std::shared_ptr<GChTuning> removed = tuning;
    if (std::erase(mTunings, removed) == 0) return;
    for (const auto& library : removed->tuningLibraries()) {
        if (!library->libraryPath().empty()) mFilesToDelete.push_back(library->libraryPath());
    }
    if (removed != mActiveTuning) return;
    mActiveTuning = nullptr;
    _EndEditing();
}

std::vector<std::shared_ptr<GChLibrary>> GChDatabase::allLibrariesForAnyTuning() const {
    std::vector<std::shared_ptr<GChLibrary>> libraries;
    for (const auto& tuning : mTunings) {
        const auto& own = tuning->tuningLibraries();
        libraries.insert(libraries.end(), own.begin(), own.end());
    }
    return libraries;
}

std::vector<std::shared_ptr<GChLibrary>> GChDatabase::allUserLibrariesForAnyTuning() const {
    auto libraries = allLibrariesForAnyTuning();
    std::erase_if(libraries, [](const auto& library) { return library->isReadOnlyLibrary(); });
    return libraries;
}

void GChDatabase::deleteChord1Range(const std::shared_ptr<GChBasicChord>& chord) {
    const auto library = chord == nullptr ? nullptr : chord->gchLibrary();
    if (library != nullptr) library->deleteChordRange(chord);
}

void GChDatabase::replaceChord1Range1(const std::shared_ptr<GChBasicChord>& chord,
                                      const std::shared_ptr<GChBasicChord>& withChord) {
    const auto library = chord == nullptr ? nullptr : chord->gchLibrary();
    if (library != nullptr) library->replaceChordRange2(chord, withChord);
}

std::shared_ptr<GChChordList> GChDatabase::allChordsFilteringLibrary(
    const std::shared_ptr<GChLibrary>& library, bool createRanges) {
    std::vector<std::shared_ptr<GChBasicChord>> chords;
    if (mActiveTuning != nullptr) {
        for (const auto& own : mActiveTuning->tuningLibraries()) {
            if (library != nullptr && own != library) continue;
            chords.insert(chords.end(), own->basicChords().begin(), own->basicChords().end());
        }
    }
    if (!createRanges) return std::make_shared<GChChordList>(std::move(chords));
    std::vector<GChChord> views;
    views.reserve(chords.size());
    for (auto& chord : chords) views.push_back(*GChChord::make(std::move(chord), 0));
    return std::make_shared<GChChordList>(std::move(views));
}

std::size_t GChDatabase::numberOfActiveBasicChords() const {
    return mActiveTuning == nullptr ? 0 : mActiveTuning->numberOfBasicChords();
}

void GChDatabase::setOriginalChord(std::optional<GChChord> chord) {
    mOriginalChord = std::move(chord);
    mSourceLibrary = mOriginalChord ? mOriginalChord->gchLibrary() : nullptr;
}

std::shared_ptr<GChBasicChord> GChDatabase::editedBasicChord() const {
    return BasicChordOf(mEditedChord);
}

std::shared_ptr<GChBasicChord> GChDatabase::originalBasicChord() const {
    return BasicChordOf(mOriginalChord);
}

bool GChDatabase::editedChordHasChanges() const {
    return Differs(mEditedChord, mOriginalChord, true);
}

bool GChDatabase::basicChordWasChanged() const {
    return Differs(mEditedChord, mOriginalChord, false);
}

bool GChDatabase::editedChordIsEmpty() const {
    return !mEditedChord || mEditedChord->chordElems().empty();
}

void GChDatabase::_EndEditing() {
    mEditedChord.reset();
    setOriginalChord(std::nullopt);
    mChordNotInLibrary = false;
}

}  // namespace brindle
