// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/internal/HandOf.h"

#include <algorithm>
#include <cstddef>

namespace brindle {
namespace {

// What makes a hand work. The order of easy and hard shapes in method books decides: Em below Am
// and C, these below F and Bb with their barres.
constexpr int kEffortOfFinger = 40;
constexpr int kEffortOfBarre = 90;         // of two strings
constexpr int kEffortOfBarredString = 10;  // each further one
constexpr int kEffortAtNut = 40;           // a wide barre where the strings are stiffest
constexpr int kEffortOfOtherBarre = 30;    // of a finger that is not the index
constexpr int kEffortOfBentFinger = 250;   // a barre that must not touch the string above it
constexpr int kEffortOfStretch = 90;       // each fret that lies between two neighbouring fingers
constexpr int kEffortOfWideHand = 100;     // each fret beyond three under the hand
constexpr int kEffortOfInnerMute = 90;
constexpr int kWideBarre = 4;
// Where four fingers hold four strings and more, the index lies across neighbours at the lowest
// fret rather than taking a second finger there, as in xx3211, unless it would damp an open string.
constexpr int kSavedByIndex = 70;
constexpr int kManyPressed = 4;
constexpr int kNarrowFrets = 7;  // from here on a stretch is half as wide

/// Strings at the same fret that one finger may cover.
struct CRow {
    int mFret = 0;
    int mMinString = 0;
    int mMaxString = 0;
    int mCount = 0;  // of the strings that it holds
};

/// The most rows that can be held.
constexpr int kMostRows = kGChMaxStrings;

struct CRows {
    std::array<CRow, kMostRows> mRows{};
    int mCount = 0;

    [[nodiscard]] std::span<const CRow> All() const {
        return {mRows.data(), static_cast<std::size_t>(mCount)};
    }
};

/// The lowest pressed fret; 0 if there is none.
int LowestFret(std::span<const std::int8_t> frets) {
    int lowest = 0;
    for (const int fret : frets) {
        if (fret > 0 && (lowest == 0 || fret < lowest)) lowest = fret;
    }
    return lowest;
}

/// The rows of one fret, from the lowest string.
void AddRows(std::span<const std::int8_t> frets, int fret, bool mayLieUnder, CRows& rows) {
    CRow row;
    const auto endRow = [&] {
        if (row.mCount > 0) rows.mRows[static_cast<std::size_t>(rows.mCount++)] = row;
        row = {};
    };
    for (std::size_t i = 0; i < frets.size(); ++i) {
        const int string = static_cast<int>(i);
        if (frets[i] == fret) {
            if (row.mCount == 0) row = {fret, string, string, 0};
            row.mMaxString = string;
            ++row.mCount;
        } else if (!(mayLieUnder && frets[i] > fret)) {
            endRow();
        }
    }
    endRow();
}

CRows RowsOf(std::span<const std::int8_t> frets, int lowest) {
    CRows rows;
    const int highest = *std::max_element(frets.begin(), frets.end());
    for (int fret = lowest; fret <= highest; ++fret) AddRows(frets, fret, fret == lowest, rows);
    return rows;
}

/// Puts the fingers down on the strings of a row, one each or one on all. False without a finger
/// for each.
bool Place(const CRow& row, bool isBarre, std::span<const std::int8_t> frets, CHand& hand) {
    const auto add = [&](int min, int max) {
        if (hand.mCount == kHandFingers) return false;
        hand.mPlaces[static_cast<std::size_t>(hand.mCount++)] = {
            0, static_cast<std::int8_t>(row.mFret), static_cast<std::int8_t>(min),
            static_cast<std::int8_t>(max)};
        return true;
    };
    if (isBarre) return add(row.mMinString, row.mMaxString);
    for (int string = row.mMinString; string <= row.mMaxString; ++string) {
        if (frets[static_cast<std::size_t>(string)] == row.mFret && !add(string, string)) {
            return false;
        }
    }
    return true;
}

/// Numbers the fingers, which stand by fret and string: each takes the one that lies over its fret,
/// as far as enough are left for those behind. One or two fingers at the second fret of open chords
/// leave the index over the first fret, as in Em.
void NumberFingers(CHand& hand, bool hasOpen) {
    if (hand.mCount == 0) return;
    const int lowest = hand.mPlaces[0].mFret;
    const bool isAtNut = hasOpen && lowest == 2 && hand.mCount <= 2 && !hand.mPlaces[0].IsBarre();
    const int position = isAtNut ? 1 : lowest;
    int last = 0;
    for (int i = 0; i < hand.mCount; ++i) {
        CFingerPlace& place = hand.mPlaces[static_cast<std::size_t>(i)];
        const int left = hand.mCount - 1 - i;
        const int wanted = std::min(place.mFret - position + 1, kHandFingers - left);
        last = std::max(last + 1, wanted);
        place.mFinger = static_cast<std::int8_t>(last);
    }
}

/// Whether a barre ends beside a string that sounds below it.
bool IsBent(const CFingerPlace& barre, std::span<const std::int8_t> frets) {
    const auto above = static_cast<std::size_t>(barre.mMaxString) + 1;
    return barre.mFinger > 1 && above < frets.size() && frets[above] >= 0 &&
           frets[above] < barre.mFret;
}

int EffortOfBarre(const CFingerPlace& barre) {
    const int strings = barre.mMaxString - barre.mMinString + 1;
    int effort = kEffortOfBarre + kEffortOfBarredString * (strings - 2);
    if (barre.mFret == 1 && strings >= kWideBarre) effort += kEffortAtNut;
    return barre.mFinger == 1 ? effort : effort + kEffortOfOtherBarre;
}

void MeasureReach(CHand& hand) {
    for (int i = 1; i < hand.mCount; ++i) {
        const CFingerPlace& below = hand.mPlaces[static_cast<std::size_t>(i - 1)];
        const CFingerPlace& place = hand.mPlaces[static_cast<std::size_t>(i)];
        const int stretch = place.mFret - below.mFret - (place.mFinger - below.mFinger);
        hand.mStretch += std::max(0, stretch) * (below.mFret >= kNarrowFrets ? 1 : 2);
    }
    const int last = std::max(hand.mCount - 1, 0);
    const int width = hand.mPlaces[static_cast<std::size_t>(last)].mFret - hand.mPlaces[0].mFret;
    hand.mExtraWidth = std::max(0, width - 2);
}

void MeasureBarres(CHand& hand, std::span<const std::int8_t> frets) {
    for (const CFingerPlace& place :
         std::span(hand.mPlaces).first(static_cast<std::size_t>(hand.mCount))) {
        if (!place.IsBarre()) continue;
        ++hand.mBarres;
        if (IsBent(place, frets)) ++hand.mBentBarres;
    }
}

int EffortOfMutes(std::span<const std::int8_t> frets) {
    int effort = 0;
    int mutes = 0;
    bool hasSounded = false;
    for (const int fret : frets) {
        if (fret < 0) {
            mutes += hasSounded ? 1 : 0;
            continue;
        }
        effort += kEffortOfInnerMute * mutes;
        mutes = 0;
        hasSounded = true;
    }
    return effort;
}

int EffortOf(const CHand& hand, std::span<const std::int8_t> frets) {
    int effort = kEffortOfFinger * hand.mCount + kEffortOfBentFinger * hand.mBentBarres +
                 kEffortOfStretch * hand.mStretch / 2 + kEffortOfWideHand * hand.mExtraWidth +
                 EffortOfMutes(frets);
    for (const CFingerPlace& place :
         std::span(hand.mPlaces).first(static_cast<std::size_t>(hand.mCount))) {
        if (place.IsBarre()) effort += EffortOfBarre(place);
    }
    return effort;
}

bool IsIndexBarreOfMany(const CHand& hand, std::span<const std::int8_t> frets) {
    const CFingerPlace& index = hand.mPlaces[0];
    if (hand.mCount == 0 || !index.IsBarre()) return false;
    const auto pressed =
        std::count_if(frets.begin(), frets.end(), [](int fret) { return fret > 0; });
    const auto above = frets.subspan(static_cast<std::size_t>(index.mMaxString) + 1);
    return pressed >= kManyPressed && (above.empty() || above.front() != 0);
}

/// By which of the ways to hold the same frets one is chosen.
int ChoiceOf(const CHand& hand, std::span<const std::int8_t> frets) {
    return hand.mEffort - (IsIndexBarreOfMany(hand, frets) ? kSavedByIndex : 0);
}

constexpr int kEffortOfStep = 60;
constexpr int kHardest = 9;

}  // namespace

int DifficultyOf(const CHand& hand) {
    return std::min(kHardest, hand.mEffort / kEffortOfStep);
}

std::optional<CHand> HandOf(std::span<const std::int8_t> frets) {
    const int lowest = LowestFret(frets);
    if (lowest == 0) return CHand{.mEffort = EffortOfMutes(frets)};
    const CRows rows = RowsOf(frets, lowest);
    if (rows.mCount > kHandFingers) return std::nullopt;
    const bool hasOpen = std::find(frets.begin(), frets.end(), 0) != frets.end();
    std::optional<CHand> easiest;
    int best = 0;
    for (unsigned barres = 0; barres < 1U << rows.mCount; ++barres) {
        CHand hand;
        bool isHeld = true;
        for (int i = 0; i < rows.mCount && isHeld; ++i) {
            const CRow& row = rows.mRows[static_cast<std::size_t>(i)];
            const bool isBarre = (barres >> i & 1U) != 0;
            // A single string under a barre is the same as under a finger.
            isHeld = (!isBarre || row.mCount > 1) && Place(row, isBarre, frets, hand);
        }
        if (!isHeld) continue;
        NumberFingers(hand, hasOpen);
        MeasureReach(hand);
        MeasureBarres(hand, frets);
        hand.mEffort = EffortOf(hand, frets);
        const int choice = ChoiceOf(hand, frets);
        if (easiest && choice >= best) continue;
        easiest = hand;
        best = choice;
    }
    return easiest;
}

}  // namespace brindle
