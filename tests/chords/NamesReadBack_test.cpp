// SPDX-License-Identifier: MIT
// A printed chord name is read back as the same chord: for each type of the catalogue, each spelled
// root and each style of naming that chord symbols can have. What cannot be read back stands in a
// list here, with the reason.
#include "brindle/chords/CChordHeavy.h"
#include "brindle/chords/CChordLite.h"
#include "brindle/chords/CChordTypes.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/KeyNames.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <set>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {
namespace {

enum class TSigns { Utf8, Ascii, German };
enum class TJoin { Slashes, Brackets, Commas, CommasAndBrackets };

CChordNamePrefs Style(TSigns signs, bool hForB, bool bForBFlat, TJoin join) {
    CChordNamePrefs prefs;
    prefs.mAsciiAccidentals = signs == TSigns::Ascii ? 1 : 0;
    prefs.mGermanNames = signs == TSigns::German;
    prefs.mHForB = hForB;
    prefs.mBForBFlat = bForBFlat;
    prefs.mOptionBrackets = join == TJoin::Brackets || join == TJoin::CommasAndBrackets ? 1 : 0;
    prefs.mCommaParts = join == TJoin::Commas || join == TJoin::CommasAndBrackets;
    return prefs;
}

// What makes no difference to reading, each with each style: how a major seventh is written, roots
// of minor chords in lower case, blanks.
std::vector<CChordNamePrefs> Variants(const CChordNamePrefs& style) {
    std::vector<CChordNamePrefs> variants;
    for (const int majorSeventh : {0, 1, 2}) {
        CChordNamePrefs prefs = style;
        prefs.mChordPrefC = majorSeventh;
        prefs.mLowerCaseMinorRoot = majorSeventh == 1;
        prefs.mNoSpaceBetweenNameParts = majorSeventh == 2 ? 0 : 1;
        variants.push_back(prefs);
    }
    return variants;
}

// Syllables are no chord symbols: Re is D and an "e" to the reader.
std::vector<CChordNamePrefs> ReadableStyles() {
    std::vector<CChordNamePrefs> styles;
    for (const TSigns signs : {TSigns::Utf8, TSigns::Ascii, TSigns::German}) {
        for (const bool hForB : {false, true}) {
            for (const bool bForBFlat : {false, true}) {
                for (const TJoin join :
                     {TJoin::Slashes, TJoin::Brackets, TJoin::Commas, TJoin::CommasAndBrackets}) {
                    styles.push_back(Style(signs, hForB, bForBFlat, join));
                }
            }
        }
    }
    return styles;
}

std::vector<CKeyEnh> SpelledRoots() {
    std::vector<CKeyEnh> roots;
    for (int keyNr = 0; keyNr < 12; ++keyNr) {
        for (const TEnh enh : {TEnh_bb, TEnh_b, TEnh_n, TEnh_s, TEnh_ss}) {
            if (IsSensefulEnhForKeyNr(keyNr, enh)) roots.push_back({keyNr, enh});
        }
    }
    return roots;
}

// The list of what is not read back. Each row tells for which names it holds, and for which types.

using TFits = bool (*)(const CChordNamePrefs& prefs, const CKeyEnh& root);

bool Always(const CChordNamePrefs&, const CKeyEnh&) {
    return true;
}

bool HasSignOfMoreBytes(const CChordNamePrefs& prefs, const CKeyEnh& root) {
    const std::string name = KeyNrAndEnhToName(root.mKeyNr, root.mEnh, prefs);
    return name.find(kUtf8Flat) != name.npos || name.find(kUtf8Sharp) != name.npos;
}

bool HasOptionsBehindSlashes(const CChordNamePrefs& prefs, const CKeyEnh&) {
    return prefs.mOptionBrackets != 1;
}

bool HasCommas(const CChordNamePrefs& prefs, const CKeyEnh&) {
    return prefs.mCommaParts;
}

bool HasOtherEndingThanIs(const CChordNamePrefs& prefs, const CKeyEnh& root) {
    if (!prefs.mGermanNames || KeyNrAndEnhToName(root.mKeyNr, root.mEnh, prefs) == "B") {
        return false;
    }
    return root.mEnh == TEnh_bb || root.mEnh == TEnh_b || root.mEnh == TEnh_ss;
}

bool HasLetterOfAnotherKey(const CChordNamePrefs& prefs, const CKeyEnh& root) {
    const bool isB = KeyNrAndEnhToName(root.mKeyNr, root.mEnh, {}).front() == 'B';
    return prefs.mBForBFlat && !prefs.mHForB && isB && !(root == CKeyEnh{10, TEnh_b});
}

struct CNotReadBack {
    const char* mReason;
    TFits mFits;
    std::vector<std::string_view> mTypes;  // names of the catalogue; empty for all

    [[nodiscard]] bool Holds(const CChordNamePrefs& prefs, const CKeyEnh& root,
                             const CChordType& type) const {
        const bool isOfTypes =
            mTypes.empty() || std::find(mTypes.begin(), mTypes.end(), type.mName) != mTypes.end();
        return isOfTypes && mFits(prefs, root);
    }
};

// Those with "m", "aug" or "dim" in their names.
const std::vector<std::string_view> kWithWordForTheTriad{
    "minor",        "minor 7",   "minor 7 b5", "minor maj7", "minor add9", "minor 6",
    "minor 6 add9", "minor b13", "dim",        "dim 7",      "aug",        "aug 7"};

const std::vector<CNotReadBack> kNotReadBack{
    {"a sign of more than one byte on the root hides the word for the triad: G♭m is read as G♭",
     HasSignOfMoreBytes, kWithWordForTheTriad},
    {"a flat option behind a slash is read as a bass: C7/b9 is C7 over B flat",
     HasOptionsBehindSlashes,
     {"7 b9", "7 b13", "maj7 b5", "maj7 b9", "maj7 b5 #9", "minor 7 b5"}},
    {"a flat ninth is read with a minor seventh: C ma7(b9) has both sevenths", Always, {"maj7 b9"}},
    {"the word for the triad is not looked for behind a comma: C,m, is read as C", HasCommas,
     kWithWordForTheTriad},
    {"of the German endings only -is is read: Es as E, Fisis as Fis", HasOtherEndingThanIs, {}},
    {"with B for B flat and no H, the name of B is read as B flat", HasLetterOfAnotherKey, {}},
};

// Symbols are read with the same preferences.
bool IsReadBack(const CChordType& type, const CKeyEnh& root, const std::string& name,
                const CChordNamePrefs& prefs) {
    const CChordLite read(name, prefs);
    return read.mRootKeyEnh.mKeyNr == root.mKeyNr && !read.HasBassNote() &&
           read.mSemitones == type.mIntvls.ToSemitones();
}

class CReadBackCheck {
public:
    void Check(const CChordType& type, const CKeyEnh& root, const CChordNamePrefs& prefs) {
        const CChordHeavy chord(root, type.mIntvls, CKeyEnh_Undef);
        const std::string name = chord.NameWithSlash(prefs);
        bool isListed = false;
        for (std::size_t row = 0; row < kNotReadBack.size(); ++row) {
            if (!kNotReadBack[row].Holds(prefs, root, type)) continue;
            isListed = true;
            mRowsInUse.insert(row);
        }
        if (IsReadBack(type, root, name, prefs) != isListed) return;
        INFO(type.mName << " on key " << root.mKeyNr << ", printed as " << name);
        FAIL_CHECK((isListed ? "is listed, but read back" : "is not read back"));
    }

    [[nodiscard]] std::size_t CountRowsInUse() const { return mRowsInUse.size(); }

private:
    std::set<std::size_t> mRowsInUse;
};

TEST_CASE("A printed chord type is read back as the same chord, but for those listed") {
    CReadBackCheck check;
    for (const CChordNamePrefs& style : ReadableStyles()) {
        for (const CChordNamePrefs& prefs : Variants(style)) {
            for (const CKeyEnh& root : SpelledRoots()) {
                for (const CChordType& type : _s_chordTypes().BuiltIn()) {
                    check.Check(type, root, prefs);
                }
            }
        }
    }
    CHECK(check.CountRowsInUse() == kNotReadBack.size());
}

TEST_CASE("In letters with ASCII signs and options in brackets only a flat ninth is lost") {
    const CChordNamePrefs prefs = Style(TSigns::Ascii, false, false, TJoin::Brackets);
    CChordType flatFifth(0, "7 b5", CIntvlSet{0, 4, 6, 10});
    CHECK(CChordHeavy(CKeyEnh_Fis, flatFifth.mIntvls, CKeyEnh_Undef).Name(prefs) == "F#7(b5)");
    CHECK(IsReadBack(flatFifth, CKeyEnh_Fis, "F#7(b5)", prefs));
    CHECK_FALSE(IsReadBack(flatFifth, CKeyEnh_Fis, "F#7/b5", prefs));
    CHECK_FALSE(IsReadBack(flatFifth, CKeyEnh_Fis, "F#7", prefs));
}

}  // namespace
}  // namespace brindle
