// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmonicAnalyse.h"
#include "brindle/analysis/ParseStringIntoHarmAnlsChords.h"
#include "brindle/analysis/TChordStringParse.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CSignKeyLite.h"

#include <doctest/doctest.h>

#include <string>
#include <utility>

namespace brindle {

struct CHarmonicAnalyseSteps {
    CHarmonicAnalyse mAnalyse;
    CHarmAnlsChords mChords;

    explicit CHarmonicAnalyseSteps(const std::string& text)
        : mChords(ParseStringIntoHarmAnlsChords::ParseIntoChords(text, TChordStringParse())) {
        mAnalyse.mProgressions = CHarmAnlsProgressions::TonicProgressions();
    }
    [[nodiscard]] CHarmAnlsChords::const_iterator At(int n) const { return mChords.begin() + n; }

    /// The center whose row begins at a chord; empty if there is none.
    [[nodiscard]] std::string CenterAt(int n) const {
        const auto found =
            mAnalyse._FindHarmCenterViaTonicProgression(At(n), mChords, CHarmAnlsSignKey());
        CHECK(found.mFound == !found.mHarmCenter.IsUndef());
        CHECK(found.mChord == (found.mFound ? At(n) : mChords.end()));
        return found.mFound ? found.mHarmCenter.NameLong(ChordNamePrefsNonUTF8) : "";
    }
    /// The first chord of the range that grows around a chord in C major, and the one behind it.
    [[nodiscard]] std::pair<std::ptrdiff_t, std::ptrdiff_t> RangeInCAround(int n) const {
        const CHarmCenterLite center(CSignKeyLite({0, TEnh_n}, TSignKeyType_Major));
        auto first = At(n);
        auto last = first;
        mAnalyse._ExtendRangeOfHarmCenter(center, mChords, first, last);
        return {first - mChords.begin(), last - mChords.begin()};
    }
};

}  // namespace brindle

TEST_CASE("A row of the tonic begins at its first chord, and its last chord is the tonic") {
    const brindle::CHarmonicAnalyseSteps song("Dm7 G7 C F#m7b5 B7 Em Ab");
    const char* const centers[] = {"C Major", "C Major", "", "E Minor", "E Minor", "", ""};
    for (int n = 0; n < 7; ++n) {
        INFO("at chord " << n);
        CHECK(song.CenterAt(n) == centers[n]);
    }
}

TEST_CASE("A range grows over the chords of its key and stops before the first that is foreign") {
    const brindle::CHarmonicAnalyseSteps song("F# Am F C Dm7 G7 E7 C");
    using range = std::pair<std::ptrdiff_t, std::ptrdiff_t>;
    CHECK(song.RangeInCAround(3) == range(1, 6));
    CHECK(song.RangeInCAround(1) == range(1, 6));
    // The end marker, like every rest, is tolerated.
    CHECK(song.RangeInCAround(7) == range(7, 9));
    // The chord where a range begins to grow is not asked for.
    CHECK(song.RangeInCAround(6) == range(1, 9));
}
