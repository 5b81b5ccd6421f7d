// SPDX-License-Identifier: MIT
// The catalogues of translated texts, in each of their languages.
#include "brindle/platform/Localization.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/KeyNames.h"

#include <doctest/doctest.h>

#include <clocale>
#include <cstdlib>
#include <filesystem>
#include <string>

#include <unistd.h>

namespace brindle {
namespace {

namespace fs = std::filesystem;

// A system has the locales that its owner wants, and often none but the plain one. That one under
// the name of another makes it possible to ask for any language.
class CLanguage {
public:
    explicit CLanguage(const std::string& name) {
        const fs::path plain = "/usr/lib/locale/C.utf8";
        REQUIRE(fs::is_directory(plain));
        mFolder = fs::temp_directory_path() / ("brindle_locales_" + std::to_string(getpid()));
        fs::create_directories(mFolder);
        fs::copy(plain, mFolder / (name + ".utf8"), fs::copy_options::recursive);
        setenv("LOCPATH", mFolder.c_str(), 1);
        unsetenv("LANGUAGE");
        REQUIRE(std::setlocale(LC_MESSAGES, (name + ".UTF-8").c_str()) != nullptr);
        SetLocalizationFolder(BRINDLE_CATALOGUES);
    }
    CLanguage(const CLanguage&) = delete;
    CLanguage& operator=(const CLanguage&) = delete;
    ~CLanguage() {
        std::setlocale(LC_MESSAGES, "C");
        unsetenv("LOCPATH");
        std::error_code ignored;
        fs::remove_all(mFolder, ignored);
    }

private:
    fs::path mFolder;
};

std::string LocalizedKey(int keyNr, TEnh enh) {
    CChordNamePrefs prefs;
    prefs.mSolfege = true;
    prefs.mLocalizeSolfege = true;
    return KeyNrAndEnhToName(keyNr, enh, prefs);
}

std::string ScaleName(TScaleType type) {
    return CScaleHeavy::LocalizedNameForScaleType(type).value_or("");
}

constexpr const char* kOtherTexts[] = {
    "File is not a MusicXML File",
    "Could not decompress (compressed MusicXML file)",
    "Compressed MusicXML file seems to be malformed (could not find ‘full-path’)",
    "Could not create temporary conversion file",
    "MusicXML Parsing Error",
    "Parsing error %zd, Description: %@, Line: %zd, Column: %zd",
    "MusicXML Validation Error",
    "Validation error %zd, Description: %@, Line: %zd, Column: %zd",
    "GChStr_6StrgsGuitarRegTuning",
};

TEST_CASE("Names of scales and syllables come in the language of the user") {
    struct CCase {
        const char* mLanguage;
        const char* mDorian;
        const char* mHarmonicMinor;
        const char* mRe;
        const char* mTiFlat;
        const char* mNotMusicXML;
    };
    // clang-format off
    const CCase cases[] = {
        {"de_DE", "Dorisch",  "Harmonisches Moll",  "Re", "Si♭", "Die Datei ist keine MusicXML-Datei"},
        {"fr_FR", "Dorienne", "Mineure harmonique", "Ré", "Si♭", "Le fichier n’est pas un fichier MusicXML"},
        {"es_ES", "Dórica",   "Menor armónica",     "Re", "Si♭", "El archivo no es un archivo MusicXML"},
        {"it_IT", "Dorian",   "Harmonic Minor",     "Re", "Ti♭", "File is not a MusicXML File"},
    };
    // clang-format on
    for (const CCase& test : cases) {
        CAPTURE(test.mLanguage);
        const CLanguage language(test.mLanguage);
        CHECK(ScaleName(st_dorian) == test.mDorian);
        CHECK(ScaleName(st_min_harm) == test.mHarmonicMinor);
        CHECK(LocalizedKey(2, TEnh_n) == test.mRe);
        CHECK(LocalizedKey(10, TEnh_b) == test.mTiFlat);
        CHECK(LocalizedString(kOtherTexts[0]) == test.mNotMusicXML);
    }
    CHECK(ScaleName(st_dorian) == "Dorian");
}

TEST_CASE("Each catalogue has every text") {
    std::string english[st_Count];
    for (int type = 1; type < st_Count; ++type) {
        english[type] = ScaleName(static_cast<TScaleType>(type));
    }
    for (const char* name : {"de_AT", "fr_CA", "es_MX"}) {
        CAPTURE(name);
        const CLanguage language(name);
        for (int type = 1; type < st_Count; ++type) {
            CAPTURE(english[type]);
            CHECK(ScaleName(static_cast<TScaleType>(type)) != english[type]);
        }
        for (const char* text : kOtherTexts) {
            CAPTURE(text);
            CHECK(LocalizedString(text) != text);
        }
    }
}

}  // namespace
}  // namespace brindle
