// SPDX-License-Identifier: MIT
#pragma once

namespace brindle {

class CHarmAnlsChords;
class CHarmonicAnalyse;

/// Puts the chords of a score, without its rests, into the sign keys of `analyse`, with the end
/// marker behind the last one; without sign keys into an undefined one. A chord before all sign
/// keys stands in none.
void PlaceChordsOfScore(const CHarmAnlsChords& chords, double end, CHarmonicAnalyse& analyse);

}  // namespace brindle
