// SPDX-License-Identifier: MIT
// Made by tools/make_reading_model.py from data/reading-model.json. The figures were counted and
// fitted by us on annotated chord corpora: When in Rome, Jazz Harmony Treebank, a jazz chord
// corpus, McGill Billboard and Nottingham.

#include "brindle/analysis/internal/ChainTables.h"

namespace brindle {

// In tenths of a point.
// clang-format off

// A kind that stands under a chord so many semitones above it.
constinit const TChainTable<16, 12> kChainMotion{{
    {{ -8,   0,  14,   4,  -1,  -2,  -1,   6,   0,  -4,  -2,   0}},  // triad
    {{ 12,  -6,  -7,   4,   3, -12,  -9,  11,  -4,  -4,   8,  12}},  // maj7
    {{-15,  -8,  21,  -5,  -8,  24,  -2,  -1,  13,   2,   2,  19}},  // dom
    {{ -4,  -8,  -2, -10,   0,  -5,   0,   5,   3,  -1,  -1,  12}},  // min
    {{  7, -15,   6,  12,  -7,  16,   6,  -3,  -1,   6,  -7,   7}},  // min7
    {{  0,   3,   0,  -1,   0,   9,  -4,   0,   2,   0,  -4,   6}},  // hdim
    {{ -3,   0,  -2,  -1,   7,  -3,   0,  16,   0,  -4,  -2,   3}},  // dim
    {{ 12,   4,  -3,  -1,   0,  -2,   0,   0,   0,   7,  -2,   0}},  // open
    {{ -7,  -2,   9,  -8,  -4,  24,  -1,  -6,   4,  -2,  -2,  -2}},  // dom, resolving
    {{  0,  -1,  -4,  -1,  -4,   0,  -1,  -1,  -2,  -2,  -1,  25}},  // dom, substitute
    {{ -1,  -1,  -2,  -2,  -1,  11,  -1,  -2,  -3,  -1,  -4,  -1}},  // min7 before its dom
    {{  0,  -1,   0,  -2,   0,  14,  -1,   0,  -2,   0,  -4,   0}},  // hdim before its dom
    {{  0,  13,   0,   0,  -2,   0,  -3,   0,   0,   0,   0,  -6}},  // dim, leading
    {{  1,   0,  -3,   9,   0,  -2,   0, -10,   0,  -4,   0,   0}},  // triad, resolved
    {{  7,  13, -14, -10,   1,   9,   4,  -7,   3,  -2,  -5,  -1}},  // maj7, resolved
    {{  2,  -4,   9,  -4,   0,  -2,  10,  -8,   6,  -7,  -5,  12}},  // min, resolved
}};

// A kind under a root so many semitones above the tonic of the song.
constinit const TChainTable<16, 12> kChainGoal{{
    {{ -3,  -1,  -9,   7,   0,   0,   0,   7,  -2,   4,   2,   0}},  // triad
    {{ -9,  -5,   2,   1,  -7,  -1,   9,   7,   0,   9,  16, -11}},  // maj7
    {{  8,  -4,   2,  -1,  13,   5,   5,   1,   0,   5,  12,  -2}},  // dom
    {{  2,  -8,  -8,  -4,   7,  -7,   0,   2,  -3,   4,   5,   0}},  // min
    {{  0,  -1,  -6,   2,   7,   4,   0,   6,  -8,   4,  21,  -1}},  // min7
    {{ -2,   0,   2,   0,   0,   0,   0,   7,   4,   0,   0,   0}},  // hdim
    {{ -6,   0,  -2,   0,   9,   0,   0,   9,   0,  -2,   4,   0}},  // dim
    {{ -3,   0,   0,  -3,   0,   0,   0,  13,   0,   0,   9,   0}},  // open
    {{  4,   1,  -7,   2,   0,  11,   0,  -2,   1,   3,  -1,  12}},  // dom, resolving
    {{ -2,   0,   2,   2,   5,   2,   0,   1,   1,   1,   2,   0}},  // dom, substitute
    {{ -2,  -1,   0,   1,   1, -10,   1,   2,   1,   3,   3,   1}},  // min7 before its dom
    {{ -2,   0,   0,  -1,   4,  -1,   0,   4,   0,   2,  -1,   1}},  // hdim before its dom
    {{ -4,   0,   5,   0,   5,  -2,   0,  -2,   0,  -1,   0,   0}},  // dim, leading
    {{  1,   0, -10,   9,   0, -11,   0,  -4,   0,  -2,   7,   0}},  // triad, resolved
    {{ -3,  10,  -8,  -7,   6, -17,   2,  13,   8, -12,   8,  -2}},  // maj7, resolved
    {{ -1,   3,  -7,  10,   0,   5,  -3,  -2,   4,  -5,  -2,   8}},  // min, resolved
}};

// Any chord so many semitones below a chord of this class.
constinit const TChainTable<8, 12> kChainTo{{
    {{ -9,   0,  -2,  17,  -2,  10,   0,  -2,  -1,   0, -11,   2}},  // triad
    {{  5, -14,   0, -13,  19,  19,  -9,  -8,  12,  -9,  -7,  22}},  // maj7
    {{ -3,   0,  13,   0,  -7,  19,  10,  12,   8,   5,  -1,  16}},  // dom
    {{ 11,  -3,  -5,  -7,  -6,  14,   0,   3,   0,   8,  -3,   9}},  // min
    {{ -2,   3,  14, -14, -15,  17,  -7,  -9,  -1,  -9,   2,   8}},  // min7
    {{ -2,  -2,  -4,   0,  -3,   6,  -7,  -5,  -4,  -9,   0,  18}},  // hdim
    {{ -1,   0,   0,   7,  -1,   0,  12,   0,   0,   0,  -3,   8}},  // dim
    {{  0,   3,   0,   0,  -1,  -5,   0,   4,   2,  -1,   0,   1}},  // open
}};

// A kind, a column each, under the next chord, the one that that stands under, and so on.
constinit const TChainTable<6, 16> kChainDepth{{
    {{  6,   7,  15,  17,  13,  11,  10,  14,  10,  13,  26,  26,  13,  -3,  -6,  12}},  // next chord
    {{ -9,  -4,   9, -15,   8,   5,  16,  -6,   6,  -6,  -5,  -4,  -2,   1,  -1,   1}},  // above that
    {{  5,  -3,   4, -15,   6,  -3,  -7,   7,   3,  -3, -11,  -6,  -4,  -9,   1,  12}},  // above that, 2
    {{ -4,   1,   3,   7,   2,  -3,  -3,   0, -10,   8, -12, -10,  -2,   3,  -6,  -9}},  // above that, 3
    {{  7,   3,  -1,  -4, -10,  -1,  -5,   0,   6,  -1,  -3,  -1,  -1,  -1,   2,  -5}},  // above that, 4
    {{  0,   6,   6,  -2,   4,   0,  -1,   0,  -2,  -1,  -3,  -1,  -2,  -1,  13,  -4}},  // above that, 5
}};

// A class that prepares nothing: semitones above the tonic of a major, then of a minor song.
constinit const TChainTable<8, 24> kChainRest{{
    {{ 19,   0,   0,   0,   0,  -5,   0,  -1,   0,   0,   0,   0,   0,   0,   0,   0,   0,   0,   0,   0,  -4,   0,  -5,   0}},  // triad
    {{ 26,  -8,   0,  -2,  -3, -17,   0,   0,  -6,  -1,  -9,   0,   0,  -3,   0,  11,   0,  -1,   0,  -1,  -6,  -2,   0,  -1}},  // maj7
    {{ -5,  -1,  -6,  -2,  -4, -16,  -1,  -7,  -3,  -8,  -6,  -3,  -2,  -4,  -1,  -1,   0,  -3,   0,  -7,  -5,   0,  -2,  -1}},  // dom
    {{ -4,   0,  -3,   0,   0, -13,   0,   0,   0,  -5,   0,   0,  34,   0,   0,   0,   0,  -8,   0,   0,   0,   0,  -1,  -1}},  // min
    {{ -1,  -1,  -9,   0,  -8,  -2,  -2,  -2,   0, -10,  -5,   0,  41,   0, -10,  -1,   0, -15,   0,  -1,   0,   0,   0,   0}},  // min7
    {{  0,   0,  -3,   0,  -1,   0,  -3,  -3,   0,   0,   0,  -1,   0,   0,  -3,   0,   0,   0,   0,   0,   0,  -2,   0,   0}},  // hdim
    {{ -1,  -1,   0, -10,   0,   0,   0,   0,   0,  -1,   0,   0,   0,   0,   0,   0,   0,   0,   0,   0,   0,   0,   0,   0}},  // dim
    {{  0,   0,   0,   0,   0,   0,   0,  -4,   0,  -1,  -6,   0,   0,   0,   0,   0,   0,   0,   0,  -4,   0,   0,  -1,   0}},  // open
}};
// clang-format on

}  // namespace brindle
