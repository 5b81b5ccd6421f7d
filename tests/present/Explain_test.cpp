// SPDX-License-Identifier: MIT
#include "brindle/present/Explain.h"
#include "Catalogue.h"

#include "brindle/platform/Localization.h"
#include "brindle/present/TonalityName.h"
#include "brindle/present/internal/Sentences.h"
#include "brindle/song/ReadSong.h"
#include "brindle/song/ReadSongHarmony.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <array>
#include <set>

namespace brindle::test {
namespace {

std::map<std::string, std::string> catalogueInUse;

std::string FromCatalogue(const std::string& key) {
    const auto found = catalogueInUse.find(key);
    return found == catalogueInUse.end() ? key : found->second;
}

/// Sentences come in one language as long as this lives.
class CSpeaking {
public:
    explicit CSpeaking(const std::string& language) {
        catalogueInUse = ReadCatalogue(language);
        SetLocalizer(&FromCatalogue);
    }
    ~CSpeaking() { SetLocalizer(nullptr); }
    CSpeaking(const CSpeaking&) = delete;
    CSpeaking& operator=(const CSpeaking&) = delete;
};

std::string Sentence(std::string_view text, std::size_t ix, CSignKeyLite key = {}) {
    const CSong song = ReadSong(text);
    CReadingOptions options;
    options.mStatedKey = key;
    return Explain(song, ReadSongHarmony(song, options)).at(ix);
}

struct CExplained {
    std::string_view mSong;
    std::size_t mChord;
    std::string_view mSentence;
};

// clang-format off
constexpr auto kExplained = std::to_array<CExplained>({
    {"C F G7 C", 3, "C is the tonic of C major."},
    {"C Am F G7 C", 1, "Am is vi in C major, with the function of a tonic."},
    {"C Am Dm F C", 2, "Dm is ii in C major, with the function of a subdominant."},
    {"C F G7 C", 2, "G7 is the dominant of C major, which follows."},
    {"C F G7 Am F G7 C", 2, "G7 is the dominant of C major, but Am follows instead of the tonic: a deceptive cadence."},
    {"C F G7 Cm F G7 C", 2, "G7 is the dominant of C major and resolves to Cm, with the other third."},
    {"Am Dm E7 A", 2, "E7 is the dominant of A minor and resolves to A, with the other third."},
    {"C5 F5 G5 C5", 2, "G5 is the dominant of C major, which follows."},
    {"Am Dm G#dim7 A", 2, "G#dim7 is the leading-tone chord of A minor and resolves to A, with the other third."},
    {"Cmaj7 Am7 Dm7 Db7 Cm7", 3, "Db7 is the tritone substitute for the dominant of C major and resolves to Cm7, with the other third."},
    {"C F C/G G7 C", 2, "C/G is a cadential six-four chord, which delays the dominant G7."},
    {"C E7 Am F G7 C", 1, "E7 is the dominant of A minor, which follows."},
    {"C A7 D7 G7 C", 1, "A7 is the dominant of D7, the next dominant."},
    {"Cmaj7 Am7 Dm7 G7 Cmaj7", 2, "Dm7 is the second degree of C major and prepares the dominant G7."},
    {"Cmaj7 Em7b5 A7 Dm7 G7 Cmaj7", 1, "Em7b5 is the second degree of D minor and prepares the dominant A7."},
    {"Cmaj7 Am7 Dm7 Db7 Cmaj7", 2, "Dm7 is the second degree of C major and prepares Db7, which stands in for the dominant."},
    {"Cmaj7 Am7 Dm7 Db7 Cmaj7", 3, "Db7 is the tritone substitute for the dominant of C major, which follows."},
    {"C F Bdim7 C", 2, "Bdim7 is the leading-tone chord of C major, which follows."},
    {"C F F#dim7 G7 C", 2, "F#dim7 is a passing diminished chord: the bass moves by semitones from F to G7."},
    {"C Am F#dim7 G7 C", 2, "F#dim7 is the leading-tone chord of G7, the next dominant."},
    {"Cmaj7 Em7 Ebdim7 Dm7 G7 Cmaj7", 2, "Ebdim7 is a passing diminished chord: the bass moves by semitones from Em7 to Dm7."},
    {"C Cdim7 C F G7 C", 1, "Cdim7 is a diminished chord that ornaments C and shares a tone with it."},
    {"Cmaj7 Fm7 Bb7 Cmaj7 Dm7 G7 Cmaj7", 1, "Fm7 is the minor fourth degree of C major and prepares the backdoor dominant Bb7."},
    {"Cmaj7 Fm7 Bb7 Cmaj7 Dm7 G7 Cmaj7", 2, "Bb7 is the backdoor dominant of C major, on the lowered seventh degree, and goes to Cmaj7."},
    {"C G7 C F C", 3, "F is the subdominant of C major and moves to the tonic C without a dominant: a plagal step."},
    {"Dm A7 Dm Gm Dm/A A7 Dm", 3, "Gm is the subdominant of D minor."},
    {"C F Fm C G7 C", 2, "Fm is iv in C major, borrowed from C minor."},
    {"Am Dm Bb/D E7 Am", 2, "Bb/D is the Neapolitan sixth chord of A minor."},
    {"Cm Ab7 G7 Cm", 1, "Ab7 is the German sixth of C minor and opens to G7."},
    {"C7 F7 C7 C7 F7 F7 C7 C7 G7 F7 C7 C7", 0, "C7 is the tonic of C major, with the seventh of the blues, which needs no resolution."},
    {"C7 F7 C7 C7 F7 F7 C7 C7 G7 F7 C7 C7", 1, "F7 is the subdominant of C major, with the seventh of the blues, which needs no resolution."},
    {"G B C Cm G B C Cm G", 1, "B is a chromatic mediant of G major: its root lies a third from the tonic."},
    {"C D F C D F C", 1, "D is II in C major, with the function of a subdominant."},
    {"C B7 F G7 C", 1, "B7 is the dominant of E minor, which does not follow."},
    {"Dm7 G7 Dm7 G7 Em7 A7 Em7 A7 Am7 D7 Abm7 Db7 Cmaj7", 10, "Abm7 is the related second of Db7, a fifth above it."},
    {"Am B7b5/F E Am", 1, "B7b5/F is the French sixth of A minor and opens to E."},
    {"C Dm7 G7 Em7 A7 Dm7 G7 C", 2, "G7 is the dominant of C major and goes on to Em7."},
    {"Am Ammaj7 Am7 Am6 Dm E7 Am", 2, "Am7 keeps the root of Ammaj7 while one voice moves."},
});

struct CTranslated {
    std::string_view mLanguage;
    std::string_view mSong;
    std::size_t mChord;
    std::string_view mSentence;
};

constexpr auto kTranslated = std::to_array<CTranslated>({
    {"de", "C E7 Am F G7 C", 1, "E7 ist die Dominante von a-Moll, das folgt."},
    {"fr", "C E7 Am F G7 C", 1, "E7 est la dominante de la mineur, qui suit."},
    {"es", "C E7 Am F G7 C", 1, "E7 es la dominante de la menor, que le sigue."},
    {"de", "Am Dm E7 A", 2, "E7 ist die Dominante von a-Moll und l\xC3\xB6st sich in A auf, mit der anderen Terz."},
    {"fr", "Am Dm E7 A", 2, "E7 est la dominante de la mineur et se r\xC3\xA9sout sur A, avec l\xE2\x80\x99" "autre tierce."},
    {"es", "Am Dm E7 A", 2, "E7 es la dominante de la menor y resuelve en A, con la otra tercera."},
    {"de", "Bb Eb F7 Bb", 0, "Bb ist die Tonika von B-Dur."},
    {"fr", "Bb Eb F7 Bb", 0, "Bb est la tonique de si b\xC3\xA9mol majeur."},
    {"es", "Bb Eb F7 Bb", 0, "Bb es la t\xC3\xB3nica de si bemol mayor."},
    {"de", "Bm Em F#7 Bm", 0, "Bm ist die Tonika von h-Moll."},
    {"de", "Cm Ab7 G7 Cm", 1, "Ab7 ist der \xC3\xBC" "berm\xC3\xA4\xC3\x9Fige Quintsextakkord von c-Moll und \xC3\xB6" "ffnet sich nach G7."},
});
// clang-format on

std::set<std::string> PlacesIn(std::string_view text) {
    std::set<std::string> places;
    while (true) {
        const std::size_t open = text.find('{');
        const std::size_t close = text.find('}');
        if (open == text.npos || close == text.npos) return places;
        places.insert(std::string(text.substr(open, close - open + 1)));
        text.remove_prefix(close + 1);
    }
}

TEST_CASE("Each relation has a sentence that is true of it") {
    const CSpeaking english("en");
    for (const CExplained& row : kExplained) {
        CAPTURE(row.mSong);
        CHECK(Sentence(row.mSong, row.mChord) == row.mSentence);
    }
}

TEST_CASE("Sentences come in the words of a language, with its names of keys") {
    for (const CTranslated& row : kTranslated) {
        const CSpeaking speaking{std::string(row.mLanguage)};
        CAPTURE(row.mSong);
        CHECK(Sentence(row.mSong, row.mChord) == row.mSentence);
    }
}

TEST_CASE("Every sentence and every key is in each catalogue, with the same places to fill") {
    std::vector<std::string> texts = EnglishTonalityNames();
    for (const std::string_view sentence : kSentences) texts.emplace_back(sentence);
    for (const char* const language : {"de", "fr", "es"}) {
        const auto catalogue = ReadCatalogue(language);
        for (const std::string& text : texts) {
            CAPTURE(language);
            CAPTURE(text);
            const auto found = catalogue.find(text);
            REQUIRE(found != catalogue.end());
            CHECK(found->second != text);
            CHECK(PlacesIn(found->second) == PlacesIn(text));
        }
    }
}

TEST_CASE("No sentence leaves a place open, in any order of chords") {
    const CSpeaking english("en");
    const std::array<std::string_view, 10> symbols{"C",  "F#7", "Bbm7",  "Ebdim7", "Am7b5",
                                                   "G7", "Db",  "Fmaj7", "N.C.",   "D7/F#"};
    std::string text;
    std::size_t number = 1;
    for (int i = 0; i < 600; ++i) {
        number = (number * 48271) % 2147483647;
        text += std::string(symbols[number % symbols.size()]) + ' ';
    }
    const CSong song = ReadSong(text);
    const auto sentences = Explain(song, ReadSongHarmony(song));
    REQUIRE(sentences.size() == song.mChords.size());
    for (std::size_t ix = 0; ix + 1 < sentences.size(); ++ix) {
        CAPTURE(sentences[ix]);
        CHECK(sentences[ix].empty() == song.mChords[ix].IsUndef());
        CHECK(sentences[ix].find_first_of("{}") == std::string::npos);
        CHECK(sentences[ix].find("  ") == std::string::npos);
        CHECK(sentences[ix].find(" .") == std::string::npos);
    }
}

}  // namespace
}  // namespace brindle::test
