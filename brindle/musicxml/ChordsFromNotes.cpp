// SPDX-License-Identifier: MIT
#include "brindle/musicxml/ChordsFromNotes.h"
#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/chords/internal/CheapestPath.h"
#include "brindle/chords/internal/NamedChords.h"
#include "brindle/musicxml/internal/WindowChords.h"

#include <algorithm>

namespace brindle {
namespace {

constexpr std::size_t kOwnChords = 8;
constexpr std::size_t kNeighboursChords = 4;
/// Chords last: a new one needs a reason.
constexpr int kChange = 20;

using TWindowChoices = std::vector<std::vector<CWindowChord>>;

void AddChordsOfWindow(const CNoteWindow& window, const CSignKeyLite& key,
                       const std::vector<CWindowChord>& chords,
                       std::vector<CWindowChord>& choices) {
    for (std::size_t ix = 0; ix < std::min(chords.size(), kNeighboursChords); ++ix) {
        const auto isSame = [&](const CWindowChord& own) { return own.IsSameChord(chords[ix]); };
        if (std::any_of(choices.begin(), choices.end(), isSame)) continue;
        CWindowChord& added = choices.emplace_back(chords[ix]);
        added.mCost = CostOfWindowChord(window, added.mRoot, added.mType, key);
    }
}

/// The likeliest chords of each window, and those of its neighbours, which may last.
TWindowChoices ChoicesOfWindows(const std::vector<CNoteWindow>& windows, const CSignKeyLite& key) {
    TWindowChoices own;
    for (const CNoteWindow& window : windows) {
        own.push_back(window.IsSilent() ? std::vector<CWindowChord>()
                                        : LikeliestChords(window, key, kOwnChords));
    }
    TWindowChoices all = own;
    for (std::size_t ix = 0; ix < all.size(); ++ix) {
        if (windows[ix].IsSilent()) continue;
        for (const std::size_t reach : {1U, 2U}) {
            if (ix >= reach) AddChordsOfWindow(windows[ix], key, own[ix - reach], all[ix]);
            if (ix + reach < own.size())
                AddChordsOfWindow(windows[ix], key, own[ix + reach], all[ix]);
        }
    }
    return all;
}

int CostOfNextChord(const CWindowChord& chord, const CWindowChord& next) {
    if (chord.IsSameChord(next)) return 0;
    const auto up = static_cast<std::size_t>(FoldIntoOctave(next.mRoot - chord.mRoot));
    const auto from = NamingFamilyOf(kNamingTypes[chord.mType].mTones);
    const auto to = NamingFamilyOf(kNamingTypes[next.mType].mTones);
    return kChange + (kNextRootCosts[from][up] + kPreviousRootCosts[to][up]) * 4 / 10;
}

/// The chord of each window; those of silent windows mean nothing.
std::vector<CWindowChord> ChordsOf(const std::vector<CNoteWindow>& windows,
                                   const CSignKeyLite& key) {
    const TWindowChoices choices = ChoicesOfWindows(windows, key);
    const auto costOf = [](const CWindowChord& chord) { return chord.mCost; };
    const auto path = CheapestPath(choices, costOf, CostOfNextChord);
    std::vector<CWindowChord> chords;
    for (std::size_t ix = 0; ix < choices.size(); ++ix) {
        chords.push_back(choices[ix].empty() ? CWindowChord() : choices[ix][path[ix]]);
    }
    return chords;
}

/// The tones of a chord over the bass of its window, spelled as the score has them.
std::vector<CNote> NotesOf(const CNamingCandidate& candidate, const CNoteWindow& window) {
    std::vector<CNote> notes{
        {window.mBass, window.mSpellings[static_cast<std::size_t>(window.mBass % 12)]}};
    for (int tone = 0; tone < 12; ++tone) {
        if (!HasTone(candidate.mTones, tone)) continue;
        const int key = (candidate.mRoot + tone) % 12;
        const std::int64_t above = FoldIntoOctave(key - window.mBass);
        if (above == 0 || window.mShares[static_cast<std::size_t>(key)] <= 0.0) continue;
        const bool hasRoom = window.mBass + above <= 127;
        notes.emplace_back(window.mBass + above - (hasRoom ? 0 : 12),
                           window.mSpellings[static_cast<std::size_t>(key)]);
    }
    return notes;
}

CNamedChord Named(const CWindowChord& chord, const CNoteWindow& window, const CSignKeyLite& key) {
    const CNamingCandidate candidate = CandidateOf(chord, window);
    CNamingOptions options;
    options.mKey = key;
    return NamedChords({&candidate, 1}, NotesOf(candidate, window), options).front();
}

CSignKeyLite KeyOf(const std::vector<CNoteWindow>& windows,
                   const std::vector<CWindowChord>& chords) {
    CHarmAnlsChords song;
    for (std::size_t ix = 0; ix < windows.size(); ++ix) {
        const CChordLite chord =
            windows[ix].IsSilent() ? CChordLite() : Named(chords[ix], windows[ix], {}).mChord;
        song.emplace_back(chord, windows[ix].mPosition);
    }
    if (!windows.empty()) song.emplace_back(CChordLite(), windows.back().mEndPosition);
    return FindKeys(song).mKey;
}

}  // namespace

CChordsFromNotes ChordsFromNotes(const CScoreNotes& score, const CChordsFromNotesOptions& options) {
    const auto windows = NoteWindows(score, options.mEvery != TChordEvery::Bar);
    CChordsFromNotes result;
    result.mKey = options.mKey;
    if (result.mKey.IsUndef()) result.mKey = KeyOf(windows, ChordsOf(windows, {}));
    const auto chords = ChordsOf(windows, result.mKey);
    const CWindowChord* before = nullptr;
    for (std::size_t ix = 0; ix < windows.size(); ++ix) {
        const CNoteWindow& window = windows[ix];
        const bool mayLast = options.mEvery == TChordEvery::Change && before != nullptr;
        const bool lasts = mayLast && (window.IsSilent() || before->IsSameChord(chords[ix]));
        if (lasts) {
            CChordFromNotes& chord = result.mChords.back();
            chord.mLength = window.mEndPosition - chord.mPosition;
        } else if (!window.IsSilent()) {
            result.mChords.push_back({window.mPosition, window.mEndPosition - window.mPosition,
                                      Named(chords[ix], window, result.mKey)});
            before = &chords[ix];
        }
    }
    return result;
}

}  // namespace brindle
