// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsProgression.h"

#include "brindle/analysis/internal/NativeText.h"
#include "brindle/theory/CScaleLite.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <array>
#include <iterator>
#include <ostream>
#include <utility>

namespace brindle {

namespace {

std::int64_t StepsBetween(std::int32_t from, std::int32_t to) {
    return std::int64_t{to} - std::int64_t{from};
}

/// Number of chords from `it` up to the last real chord, negative behind it. A list without real
/// chords has room for nothing.
std::ptrdiff_t Fit(const CHarmAnlsChords& chords, CHarmAnlsProgression::chord_iterator it) {
    const auto last = chords.LastNonUndefChord();
    if (last == chords.end()) return 0;
    return std::distance(it, last) + 1;
}

TEnh WorkOutEnhWithLeastSigns(int keyNr, CSemitones semitones) {
    CScaleLite scale{{keyNr, TEnh_n}, semitones};
    scale.SetRootKeyEnhWithLeastSigns();
    return scale.mRootKeyEnh.mEnh;
}

/// Spelling is slow, and a song can ask for the same few keys at every third chord.
TEnh EnhWithLeastSigns(int keyNr, CSemitones semitones) {
    using TEnhOfKeys = std::array<TEnh, 12>;
    const auto allKeys = [](CSemitones mode) {
        TEnhOfKeys enhs{};
        for (int key = 0; key < 12; ++key) {
            enhs[static_cast<std::size_t>(key)] = WorkOutEnhWithLeastSigns(key, mode);
        }
        return enhs;
    };
    static const TEnhOfKeys major = allKeys(kSemitonesMajor);
    static const TEnhOfKeys minor = allKeys(kSemitonesNaturalMinor);
    if (semitones == kSemitonesMajor) return major[static_cast<std::size_t>(keyNr)];
    if (semitones == kSemitonesNaturalMinor) return minor[static_cast<std::size_t>(keyNr)];
    return WorkOutEnhWithLeastSigns(keyNr, semitones);
}

/// Takes the spelling of a chord root, or the one with the least signs if that has none.
void TakeEnh(CHarmCenterLite& center, TEnh enh) {
    center.mRootKeyEnh.mEnh =
        enh != TEnh_Undef ? enh : EnhWithLeastSigns(center.mRootKeyEnh.mKeyNr, center.mSemitones);
}

}  // namespace

void CHarmAnlsProgressionEl::AppendJSONString(std::ostream& stream) const {
    PlainText::Write(stream, R"({"RootDistToHarmCenter":)");
    PlainText::WriteInteger(stream, mRootDistToHarmCenter, 2);
    PlainText::Write(stream, R"(, "BassDistToHarmCenter":)");
    PlainText::WriteInteger(stream, mBassDistToHarmCenter, 2);
    PlainText::Write(stream, R"(, "SemitonesMatch":)");
    mSemitonesMatch.AppendJSONString(stream);
    PlainText::Write(stream, "}");
}

CHarmAnlsProgression::CHarmAnlsProgression(std::vector<CHarmAnlsProgressionEl> elements,
                                           std::int32_t priority, TSignKeyType signKeyType)
    : std::vector<CHarmAnlsProgressionEl>(std::move(elements)),
      mPriority(priority),
      mSignKeyType(signKeyType) {}

bool CHarmAnlsProgression::MatchesHarmChordsFrom(const CHarmAnlsChords& chords,
                                                 chord_iterator it) const {
    if (empty() || chords.empty()) return false;
    if (Fit(chords, it) < std::ssize(*this)) return false;
    if (it == chords.end()) return true;
    auto chord = it;
    for (auto element = begin(); element != end() && chord != chords.end(); ++element, ++chord) {
        if (!element->mSemitonesMatch.Matches(chord->mSemitones)) return false;
        if (element == begin() || chord == chords.begin()) continue;
        const auto wanted =
            StepsBetween(std::prev(element)->mRootDistToHarmCenter, element->mRootDistToHarmCenter);
        const auto played =
            StepsBetween(std::prev(chord)->mRootKeyEnh.mKeyNr, chord->mRootKeyEnh.mKeyNr);
        if (FoldIntoOctave(wanted) != FoldIntoOctave(played)) return false;
    }
    return true;
}

bool CHarmAnlsProgression::MatchesHarmChordsBackwardsFrom(const CHarmAnlsChords& chords,
                                                          chord_iterator it) const {
    if (empty() || chords.empty()) return false;
    if (std::distance(chords.begin(), it) + 1 < std::ssize(*this)) return false;
    return MatchesHarmChordsFrom(chords, it - (std::ssize(*this) - 1));
}

bool CHarmAnlsProgression::MatchesAsGoodAs(const CHarmAnlsProgression& other) const {
    return mPriority == other.mPriority && size() == other.size();
}

CHarmCenterLite CHarmAnlsProgression::HarmCenterFromProgressionAndChord(
    chord_iterator it, const CHarmAnlsChords& chords, TMatchDirection direction) const {
    switch (direction) {
        case TMatchDirection_Forward:
            return HarmCenterCalculatedFromFoundProgressionLastChord(it, chords);
        case TMatchDirection_Backward:
            // Kept: `it` counts as the first chord, though a backward match begins before it.
            return HarmCenterCalculatedFromFoundProgressionFirstChord(it, chords);
    }
    return CHarmCenterLite_Undef;
}

CHarmCenterLite CHarmAnlsProgression::HarmCenterCalculatedFromFoundProgressionNthChord(
    std::size_t n, chord_iterator it, const CHarmAnlsChords& chords) const {
    if (n >= size() || static_cast<std::ptrdiff_t>(n) >= std::distance(it, chords.end())) {
        return CHarmCenterLite_Undef;
    }
    const auto chord = it + static_cast<std::ptrdiff_t>(n);
    const std::int32_t rootDist = (*this)[n].mRootDistToHarmCenter;
    const int key = FoldIntoOctave(StepsBetween(rootDist, chord->mRootKeyEnh.mKeyNr));
    CHarmCenterLite center{{key, TEnh_n}, SemitonesFromSignKeyType(mSignKeyType)};
    _SetEnhForHarmCenter(center, it, chords, rootDist, chord);
    return center;
}

CHarmCenterLite CHarmAnlsProgression::HarmCenterCalculatedFromFoundProgressionLastChord(
    chord_iterator it, const CHarmAnlsChords& chords) const {
    if (empty()) return CHarmCenterLite_Undef;
    return HarmCenterCalculatedFromFoundProgressionNthChord(size() - 1, it, chords);
}

CHarmCenterLite CHarmAnlsProgression::HarmCenterCalculatedFromFoundProgressionFirstChord(
    chord_iterator it, const CHarmAnlsChords& chords) const {
    return HarmCenterCalculatedFromFoundProgressionNthChord(0, it, chords);
}

CHarmAnlsProgression::chord_iterator CHarmAnlsProgression::HarmCenterChordsBegin(
    chord_iterator it, const CHarmAnlsChords& chords, TMatchDirection direction) const {
    switch (direction) {
        case TMatchDirection_Forward:
            return it;
        case TMatchDirection_Backward: {
            const std::ptrdiff_t before = empty() ? 0 : std::ssize(*this) - 1;
            return it - std::min(before, std::distance(chords.begin(), it));
        }
    }
    return chords.end();
}

void CHarmAnlsProgression::_SetEnhForHarmCenter(CHarmCenterLite& center, chord_iterator it,
                                                const CHarmAnlsChords& chords,
                                                std::int32_t rootDist, chord_iterator chord) const {
    if (rootDist == 0) {
        TakeEnh(center, chord->mRootKeyEnh.mEnh);
        return;
    }
    if (std::distance(it, chords.end()) < std::ssize(*this)) return;
    const auto matchEnd = it + std::ssize(*this);
    const auto tonic = std::find_if(it, matchEnd, [&](const CHarmAnlsChord& other) {
        return other.mRootKeyEnh.mKeyNr == center.mRootKeyEnh.mKeyNr;
    });
    TakeEnh(center, tonic != matchEnd ? tonic->mRootKeyEnh.mEnh : TEnh_Undef);
}

void CHarmAnlsProgression::AppendJSONString(std::ostream& stream) const {
    NativeText::WriteList(stream, *this);
}

std::ostream& operator<<(std::ostream& stream, const CHarmAnlsProgressionEl& element) {
    element.AppendJSONString(stream);
    return stream;
}

std::ostream& operator<<(std::ostream& stream, const CHarmAnlsProgression& progression) {
    progression.AppendJSONString(stream);
    return stream;
}

}  // namespace brindle
