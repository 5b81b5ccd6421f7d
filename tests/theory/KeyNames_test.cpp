// SPDX-License-Identifier: MIT
#include "brindle/theory/KeyNames.h"

#include "brindle/platform/Localization.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/Trace.h"
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

Answer NameBy(std::string (*name)(int, TEnh, const CChordNamePrefs&)) {
    return [name](const json& in) {
        return name(in.at(0).get<int>(), EnhOf(in.at(1)), NamePrefsOf(in.at(2)));
    };
}

Answer PieceBy(std::string_view (*piece)(const CChordNamePrefs&)) {
    return [piece](const json& in) { return std::string(piece(NamePrefsOf(in.at(0)))); };
}

std::string ItalianOf(const std::string& syllable) {
    return syllable == "Ti" ? "Si" : syllable;
}

/// Each translation holds the syllable that is looked up next.
std::string NextSyllableOf(const std::string& syllable) {
    return syllable == "Do" ? "ReRe" : syllable == "Re" ? "Mi" : syllable;
}

}  // namespace

TEST_CASE("The preferences of each name are those that a host finds") {
    const std::string plain = TraceString(CChordNamePrefs());
    CHECK(plain ==
          "CChordNamePrefs: HForB 0, BForBFlat 0, GermanNames 0, AsciiAccidentals 0, Solfege 0, "
          "LocalizeSolfege 0, OctaveNaming 0, LowerCaseMinorRoot 0, ChordPrefB 1, "
          "OmitBassOption 1, ChordPrefC 0, ChordPrefD 0, CommaParts 0, ChordPrefE 4, "
          "OptionBrackets 0, ChordPrefF 0, NoSpaceBetweenNameParts 1, NoSpaceAroundSlash 1, "
          "SlashText /");
    CHECK(TraceString(CurrentChordNamePrefs) == plain);
    CHECK(TraceString(CurrentChordNamePrefs_Fernhill) ==
          "CChordNamePrefs: HForB 0, BForBFlat 0, GermanNames 0, AsciiAccidentals 0, Solfege 0, "
          "LocalizeSolfege 0, OctaveNaming 0, LowerCaseMinorRoot 0, ChordPrefB 1, "
          "OmitBassOption 1, ChordPrefC 0, ChordPrefD 0, CommaParts 1, ChordPrefE 4, "
          "OptionBrackets 0, ChordPrefF 0, NoSpaceBetweenNameParts 0, NoSpaceAroundSlash 0, "
          "SlashText /");
    CHECK(ChordNamePrefsNonUTF8.mAsciiAccidentals == 1);
}

TEST_CASE("Keys are named in letters, syllables and German under every mix of preferences") {
    test::CheckExpected(
        "theory-key-names",
        {
            {"KeyNrAndEnhToName", NameBy(KeyNrAndEnhToName)},
            {"KeyNrToNameIgnoringEnh", NameBy(KeyNrToNameIgnoringEnh)},
            {"SharpAsUTF8OrNot", PieceBy(SharpAsUTF8OrNot)},
            {"FlatAsUTF8OrNot", PieceBy(FlatAsUTF8OrNot)},
            {"OptionalSpaceBetweenNameParts", PieceBy(OptionalSpaceBetweenNameParts)},
            {"OptionalSpaceAroundSlash", PieceBy(OptionalSpaceAroundSlash)},
            {"ConvertUtf8SharpAndFlatToAscii",
             [](const json& in) {
                 auto text = in.at(0).get<std::string>();
                 ConvertUtf8SharpAndFlatToAscii(text);
                 return text;
             }},
        });
}

TEST_CASE("A key name is read with its accidental in all languages") {
    test::CheckExpected("theory-key-reading",
                        {
                            {"CKeyEnh::SetFromString",
                             [](const json& in) -> json {
                                 CKeyEnh keyEnh;
                                 int consumed = -1;
                                 keyEnh.SetFromString(in.at(0).get<std::string>(), &consumed,
                                                      NamePrefsOf(in.at(1)));
                                 return {{"CKeyEnh", test::FormOf(keyEnh)}, {"consumed", consumed}};
                             }},
                        });
}

TEST_CASE("Every key in one accidental's reach is read back from its name") {
    for (const CChordNamePrefs& prefs : {CurrentChordNamePrefs, ChordNamePrefsNonUTF8}) {
        for (const CKeyEnh& keyEnh : CKeyEnh_AllUpToOneAccidental) {
            const std::string name = KeyNrAndEnhToName(keyEnh.mKeyNr, keyEnh.mEnh, prefs);
            CAPTURE(name);
            CKeyEnh read;
            read.SetFromString(name, nullptr, prefs);
            CHECK(read == keyEnh);
        }
    }
}

TEST_CASE("A torn sign is no accidental, and a key name may end the text") {
    struct CCase {
        std::string_view mText;
        CKeyEnh mKeyEnh;
        int mConsumed;
    };
    using namespace std::string_view_literals;
    const CCase cases[] = {
        {"C\xE2\x99"sv, CKeyEnh_C, 1},
        {"C\xE2\x99\xAF"sv, CKeyEnh_Cis, 2},
        {"D\xE2\x99\xAD\xE2\x99\xAD"sv, CKeyEnh_Dbb, 3},
        {"\xE2\x99\xAD"sv, CKeyEnh_B, 1},  // a lone flat reads as the letter b
        {"E\0b"sv, CKeyEnh_E, 1},
        {"\0E"sv, CKeyEnh_Undef, 0},
    };
    for (const CCase& test : cases) {
        CAPTURE(test.mText);
        CKeyEnh keyEnh;
        int consumed = -1;
        keyEnh.SetFromString(test.mText, &consumed, CurrentChordNamePrefs);
        CHECK(keyEnh == test.mKeyEnh);
        CHECK(consumed == test.mConsumed);
    }
}

TEST_CASE("Syllables are translated where a translation is known, in their order") {
    CChordNamePrefs prefs = ChordNamePrefsNonUTF8;
    prefs.mSolfege = true;
    prefs.mLocalizeSolfege = true;
    CHECK(KeyNrAndEnhToName(10, TEnh_b, prefs) == "Tib");  // no catalogue

    SetLocalizer(ItalianOf);
    CHECK(KeyNrAndEnhToName(10, TEnh_b, prefs) == "Sib");
    CHECK(KeyNrToNameIgnoringEnh(11, TEnh_n, prefs) == "Si");
    SetLocalizer(NextSyllableOf);
    CHECK(KeyNrAndEnhToName(0, TEnh_n, prefs) == "MiMi");
    SetLocalizer(nullptr);
}
