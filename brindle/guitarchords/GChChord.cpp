// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/GChChord.h"

#include "brindle/guitarchords/GChHarmonyStrings.h"
#include "brindle/guitarchords/GChPitches.h"
#include "brindle/guitarchords/GChTuning.h"
#include "brindle/guitarchords/internal/SoundingFrets.h"
#include "brindle/theory/KeyIntervals.h"

#include <nlohmann/json.hpp>

#include <algorithm>

namespace brindle {

namespace {

int KeyUnderCapodaster(int key, int capodasterOffset) {
    if (key < 0) return -1;
    return FoldIntoOctave(std::int64_t{key} + std::max(capodasterOffset, 0));
}

}  // namespace

std::optional<GChChord> GChChord::make(std::shared_ptr<GChBasicChord> chord,
                                       int /*transposeIndex*/) {
    if (chord == nullptr) return std::nullopt;
    return GChChord(std::move(chord));
}

int GChChord::pitchForStringIndex(int stringIndex, int capodasterOffset) const {
    if (stringIndex < 0 || stringIndex >= kGChMaxStrings) return -1;
    return SoundingPitch(
        GChPitchForStringIndexInShortTuning(stringIndex, mBasicChord->shortTuning()),
        maxAbsFretIndexPlusOneForStringIndex(stringIndex), capodasterOffset);
}

std::string GChChord::stringFromPitches(int capodasterOffset) const {
    std::string text;
    for (int i = 0; i < numberOfStrings(); ++i) {
        const int pitch = pitchForStringIndex(i, capodasterOffset);
        if (pitch >= 0) text += GChMidiPitchDefaultName(pitch) + ' ';
    }
    return text;
}

int GChChord::rootNote(int capodasterOffset) const {
    return KeyUnderCapodaster(mBasicChord->rootNote(), capodasterOffset);
}

int GChChord::bassNote(int capodasterOffset) const {
    return KeyUnderCapodaster(mBasicChord->bassNote(), capodasterOffset);
}

bool GChChord::isSimilarToChord(const GChChord& other) const {
    const std::shared_ptr<GChTuning> mine = gchTuning();
    const std::shared_ptr<GChTuning> theirs = other.gchTuning();
    if (mine == nullptr || theirs == nullptr || !mine->isEqualToTuning(*theirs)) return false;
    for (int i = 0; i < numberOfStrings(); ++i) {
        if (pitchForStringIndex(i, 0) != other.pitchForStringIndex(i, 0)) return false;
    }
    return true;
}

std::string GChChord::chordName(int capodasterOffset) const {
    const int root = rootNote(capodasterOffset);
    if (!userName().empty()) return GChUserChordName(root, userName());
    // The root is -1 to 11, which always has a name.
    return GChHarmonyStringFromChord(this, root, mRootEnhType, capodasterOffset).value_or("");
}

std::string GChChord::chordNameWithIndex(bool withIndex, int capodasterOffset) const {
    const std::string name = chordName(capodasterOffset);
    return withIndex ? name + " (" + std::to_string(transposeIndex()) + ")" : name;
}

nlohmann::json GChChord::propertyList() const {
    return {{"basicChord", mBasicChord->propertyList()},
            {"rootEnhType", mRootEnhType},
            {"bassEnhType", mBassEnhType}};
}

std::string GChUserChordName(int root, std::string_view userName) {
    if (root < 0) return std::string(userName);
    return std::string(GChOctPitchDefaultName(root)) + ' ' + std::string(userName);
}

}  // namespace brindle
