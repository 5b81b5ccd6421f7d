// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/guitarchords/CFingering.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <vector>

namespace brindle {

/// What the lowest note of a fingering has to be.
enum class TFingeringBass : std::uint8_t {
    /// The tone behind a slash, if there is one; otherwise the root is preferred where the tuning
    /// bears a bass (see BearsBass). On a re-entrant tuning, as that of the ukulele, as if it were
    /// Free.
    Usual,
    Required,  ///< the tone behind the slash, else the root
    Free,      ///< any tone of the chord
};

/// Highest fret of a search.
inline constexpr int kFingeringMostFrets = 24;
/// The position from which on a hand spans mSpanUpTheNeck.
inline constexpr int kFingeringUpTheNeck = 7;
/// Most strings of a search.
inline constexpr int kFingeringMostStrings = 12;

/// What a hand and its player allow. Values out of their ranges are taken as the nearest.
struct CFingeringOptions {
    /// Fret of the capodaster, 0 to kFingeringMostFrets; frets are counted from it.
    int mCapo = 0;
    /// The last fret of the neck, not counted from the capodaster. 1 to kFingeringMostFrets.
    int mHighestFret = 15;
    /// So many frets lie under the hand, 2 to 7, below position 7.
    int mSpan = 4;
    /// The same from position 7 on, since frets are narrower there.
    int mSpanUpTheNeck = 5;
    /// A bit for each string that may be muted.
    std::uint32_t mMutable = 0xFFFF;
    /// Most muted strings between ones that sound, 0 to 2.
    int mMostInnerMutes = 1;
    /// Whether the tones may be left out that players leave out: see OmittableTones.
    bool mMayOmitTones = true;
    /// Whether the root may be left out, too, for a player who has somebody at the bass.
    bool mMayOmitRoot = false;
    /// What the lowest note has to be.
    TFingeringBass mBass = TFingeringBass::Usual;
    /// Most fingerings that are wanted, the best ones. At most 1000.
    std::size_t mLimit = 100;
};

/// Finds how a chord can be held on an instrument of 3 to 12 strings, the best first: low on the
/// neck and with open strings, whole chords before those that leave something out, the root (or
/// what stands behind the slash) as the lowest note, then what is easy.
///
/// Each fingering sounds the tones of the chord without mOmitted, and its bass, and nothing else.
/// Each pressed string has a finger of its own or lies under a barre; four fingers are enough, and
/// no barre lies over a string that is open or muted. None for an undefined chord, an invalid
/// tuning and more than 12 strings.
///
/// The search goes through all positions of the hand and in each from string to string, and leaves
/// a way as soon as it needs a fifth finger or too few strings remain for the tones that are
/// missing. On many strings it may leave out shapes: it looks at a limited number in each position.
/// The short string of a banjo is open or muted.
[[nodiscard]] std::vector<CFingering> FindFingerings(const CChordLite& chord,
                                                     const GChShortTuning& tuning,
                                                     const CFingeringOptions& options = {});

/// How one hand holds frets (of each string: kMutedString, 0 open, from 1 pressed), with its
/// fingers and difficulty; nothing if it cannot, or if the tuning has another number of strings.
[[nodiscard]] std::optional<CFingering> FingeringOfFrets(std::span<const int> frets,
                                                         const GChShortTuning& tuning,
                                                         int capo = 0);

/// The same with all that FindFingerings tells of a fingering of this chord, its place in the order
/// of a player among it. What sounds is not checked against the chord.
[[nodiscard]] std::optional<CFingering> FingeringForChord(std::span<const int> frets,
                                                          const CChordLite& chord,
                                                          const GChShortTuning& tuning,
                                                          const CFingeringOptions& options = {});

/// The tones of a chord that players leave out: the perfect fifth of a chord of four tones and
/// more, the ninth and eleventh below a thirteenth, the eleventh above a major third, and of a
/// chord named after its eleventh the third.
[[nodiscard]] CSemitones OmittableTones(CSemitones semitones);

}  // namespace brindle
