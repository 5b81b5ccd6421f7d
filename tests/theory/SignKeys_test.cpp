// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include "brindle/theory/CHarmCenterLite.h"
#include "brindle/theory/CSignKeyHeavy.h"
#include "brindle/theory/CSignKeyLite.h"
#include "brindle/theory/CSignKeyNoEnh.h"
#include "brindle/theory/SignKeyCode.h"
#include "brindle/theory/SignKeySigns.h"
#include "brindle/theory/SignKeyStrings.h"
#include "brindle/theory/Trace.h"

#include <doctest/doctest.h>

#include <limits>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

TSignKeyType TypeOf(const json& number) {
    return static_cast<TSignKeyType>(number.get<int>());
}

TSignKeyTypeNoUndef TypeNoUndefOf(const json& number) {
    return static_cast<TSignKeyTypeNoUndef>(number.get<int>());
}

TScaleType ScaleTypeOf(const json& number) {
    return static_cast<TScaleType>(number.get<int>());
}

unsigned char CodeOf(const json& number) {
    return number.get<unsigned char>();
}

CHarmCenterLite CenterOf(const json& form) {
    return CHarmCenterLite(ScaleLiteOf(form));
}

json FormOfCenter(const CHarmCenterLite& center) {
    return FormOf(center.ToScaleLite());
}

/// {"mRootKeyNr": number, "mSignKeyType": number}
CSignKeyNoEnh SignKeyNoEnhOf(const json& form) {
    return {form.at("mRootKeyNr").get<int>(), TypeOf(form.at("mSignKeyType"))};
}

json FormOfNoEnh(const CSignKeyNoEnh& signKey) {
    return {{"mRootKeyNr", signKey.mRootKeyNr},
            {"mSignKeyType", static_cast<int>(signKey.mSignKeyType)}};
}

json DescribeLite(const json& in) {
    const CSignKeyLite signKey = SignKeyLiteOf(in.at(0));
    return {{"Scale", FormOf(signKey.Scale())},
            {"SignsCount", signKey.SignsCount()},
            {"SignsCountAbs", signKey.SignsCountAbs()},
            {"ParallelSignKey", FormOf(signKey.ParallelSignKey())},
            {"IonicSignKey", FormOf(signKey.IonicSignKey())},
            {"ToSignKeyNoEnh", FormOfNoEnh(signKey.ToSignKeyNoEnh())},
            {"ToHarmCenter", FormOfCenter(signKey.ToHarmCenter())},
            {"NameShort", signKey.NameShort(CurrentChordNamePrefs)},
            {"NameLong", signKey.NameLong(CurrentChordNamePrefs)},
            {"AppendJSONString", JSONStringOf(signKey)}};
}

json DescribeNoEnh(const json& in) {
    const CSignKeyNoEnh signKey = SignKeyNoEnhOf(in.at(0));
    return {{"SignKey", FormOf(signKey.SignKey())},
            {"ParallelSignKey", FormOfNoEnh(signKey.ParallelSignKey())},
            {"SignsCount", signKey.SignsCount()},
            {"NameShort", signKey.NameShort(CurrentChordNamePrefs)},
            {"NameLong", signKey.NameLong(CurrentChordNamePrefs)},
            {"AppendJSONString", JSONStringOf(signKey)}};
}

json WithoutName(json signKey) {
    signKey.at("root").erase("name");
    return signKey;
}

/// [spelled root or key number, type]
json DescribeHeavy(const json& in) {
    const TSignKeyTypeNoUndef type = TypeNoUndefOf(in.at(1));
    if (in.at(0).is_number()) {
        const CSignKeyHeavy signKey(in.at(0).get<int>(), type);
        return {{"RootKeyEnh", FormOf(signKey.RootKeyEnh())}, {"SignsCount", signKey.SignsCount()}};
    }
    const CSignKeyHeavy signKey(KeyEnhOf(in.at(0)), type);
    return {{"RootKeyEnh", FormOf(signKey.RootKeyEnh())},
            {"SignKeyType", static_cast<int>(signKey.SignKeyType())},
            {"SignsCount", signKey.SignsCount()},
            {"ParallelSignKey", FormOf(signKey.ParallelSignKey().ToSignKeyLite())},
            {"mEnhOfKeyNr", signKey.EnhOfKeyNr()},
            {"NameLong", signKey.NameLong(CurrentChordNamePrefs)},
            {"AppendJSONString", WithoutName(json::parse(JSONStringOf(signKey)))}};
}

json WithLeastSigns(const json& in) {
    CSignKeyLite signKey = SignKeyLiteOf(in.at(0));
    signKey.SetRootNoteEnhWithLeastSigns();
    return FormOf(signKey);
}

json FromSigns(const json& in) {
    CSignKeyHeavy signKey;
    signKey.SetFromSignsCountAndType(in.at(0).get<int>(), TypeNoUndefOf(in.at(1)));
    return {{"RootKeyEnh", FormOf(signKey.RootKeyEnh())}, {"SignsCount", signKey.SignsCount()}};
}

unsigned char CodeOfKey(const json& in) {
    const CKeyEnh root = KeyEnhOf(in.at(0));
    if (in.at(1).is_object()) return ToSignKeyInEv(root, SemitonesOf(in.at(1).at("CSemitones")));
    return ToSignKeyInEv(root, TypeOf(in.at(1)));
}

json RootAndTypeOfCode(const json& in) {
    const auto [root, type] = ToRootKeyEnhAndSignKeyType(CodeOf(in.at(0)));
    return {FormOf(root), static_cast<int>(type)};
}

json RootAndMaskOfCode(const json& in) {
    const auto [root, semitones] = ToRootKeyEnhAndSemitones(CodeOf(in.at(0)));
    return {FormOf(root), semitones.Mask()};
}

json AllSignKeys(const json&) {
    json forms = json::array();
    for (const CSignKeyLite& signKey : CSignKeyLite_AllSignKeysPossibleInThornbank()) {
        forms.push_back(FormOf(signKey));
    }
    return forms;
}

/// {"TSignKeyType": n} or {"TSignKeyTypeNoUndef": n}
std::string Printed(const json& in) {
    const json& form = in.at(0);
    if (form.contains("TSignKeyType")) return TraceString(TypeOf(form.at("TSignKeyType")));
    return TraceString(TypeNoUndefOf(form.at("TSignKeyTypeNoUndef")));
}

/// {"CSignKeyLite": text} or {"CSignKeyNoEnh": text}, then the preferences
json ReadSignKey(const json& in) {
    const CChordNamePrefs prefs = NamePrefsOf(in.at(1));
    if (in.at(0).contains("CSignKeyLite")) {
        CSignKeyLite signKey;
        SetFromString(in.at(0).at("CSignKeyLite").get<std::string>(), signKey, prefs);
        return FormOf(signKey);
    }
    CSignKeyNoEnh signKey;
    SetFromString(in.at(0).at("CSignKeyNoEnh").get<std::string>(), signKey, prefs);
    return FormOfNoEnh(signKey);
}

const std::map<std::string, Answer> kAnswersOfTypes = {
    {"FromSignKeyTypeNoUndef",
     [](const json& in) {
         return static_cast<int>(FromSignKeyTypeNoUndef(TypeNoUndefOf(in.at(0))));
     }},
    {"FromSignKeyType",
     [](const json& in) { return static_cast<int>(FromSignKeyType(TypeOf(in.at(0)))); }},
    {"FromSignKeyTypeInCaseOfUndefReturnMajor",
     [](const json& in) {
         return static_cast<int>(FromSignKeyTypeInCaseOfUndefReturnMajor(TypeOf(in.at(0))));
     }},
    {"SemitonesFromSignKeyType",
     [](const json& in) { return SemitonesFromSignKeyType(TypeOf(in.at(0))).Mask(); }},
    {"SemitonesFromSignKeyTypeNoUndef",
     [](const json& in) {
         return SemitonesFromSignKeyTypeNoUndef(TypeNoUndefOf(in.at(0))).Mask();
     }},
    {"SignKeyTypeFromSemitones",
     [](const json& in) {
         return static_cast<int>(SignKeyTypeFromSemitones(SemitonesOf(in.at(0))));
     }},
    {"SignKeyTypeFromScaleType",
     [](const json& in) {
         return static_cast<int>(SignKeyTypeFromScaleType(ScaleTypeOf(in.at(0))));
     }},
    {"SignKeyTypeNoUndefFromScaleType",
     [](const json& in) {
         return static_cast<int>(SignKeyTypeNoUndefFromScaleType(ScaleTypeOf(in.at(0))));
     }},
    {"SignKeyTypeFromString",
     [](const json& in) {
         return static_cast<int>(SignKeyTypeFromString(in.at(0).get<std::string>()));
     }},
    {"SignKeyTypeNoUndefFromString",
     [](const json& in) {
         return static_cast<int>(SignKeyTypeNoUndefFromString(in.at(0).get<std::string>()));
     }},
    {"operator<<", Printed},
    {"StringForInitializerList",
     [](const json& in) { return StringForInitializerList(TypeOf(in.at(0).at("TSignKeyType"))); }},
};

const std::map<std::string, Answer> kAnswersOfCodes = {
    {"ToSignKeyType",
     [](const json& in) { return static_cast<int>(ToSignKeyType(CodeOf(in.at(0)))); }},
    {"ToSemitones", [](const json& in) { return ToSemitones(CodeOf(in.at(0))).Mask(); }},
    {"ToRootKeyEnhAndSignKeyType", RootAndTypeOfCode},
    {"ToRootKeyEnhAndSemitones", RootAndMaskOfCode},
    {"ToSignKeyInEv", CodeOfKey},
    {"ToSignKeyInEvDeprecated",
     [](const json& in) { return ToSignKeyInEvDeprecated(SignKeyLiteOf(in.at(0))); }},
    {"CSignKeyLite_AllSignKeysPossibleInThornbank", AllSignKeys},
    {"MinimalSignsCountForSignKeyWithKeyNrAndSignKeyType",
     [](const json& in) {
         return MinimalSignsCountForSignKeyWithKeyNrAndSignKeyType(in.at(0).get<int>(),
                                                                   TypeOf(in.at(1)));
     }},
    {"SignsCountForSignKeyWithKeyEnhAndSignKeyType",
     [](const json& in) {
         return SignsCountForSignKeyWithKeyEnhAndSignKeyType(KeyEnhOf(in.at(0)), TypeOf(in.at(1)));
     }},
    {"SignsCountAbsForSignKeyWithKeyEnhAndSignKeyType",
     [](const json& in) {
         return SignsCountAbsForSignKeyWithKeyEnhAndSignKeyType(KeyEnhOf(in.at(0)),
                                                                TypeOf(in.at(1)));
     }},
};

const std::map<std::string, Answer> kAnswersOfSignKeys = {
    {"CSignKeyLite", DescribeLite},
    {"CSignKeyLite::SetRootNoteEnhWithLeastSigns", WithLeastSigns},
    {"CSignKeyLite::DistToSignKeyRoot",
     [](const json& in) { return SignKeyLiteOf(in.at(0)).DistToSignKeyRoot(in.at(1).get<int>()); }},
    {"CSignKeyLite::KeyNrToSignKeyKeyNr",
     [](const json& in) {
         return SignKeyLiteOf(in.at(0)).KeyNrToSignKeyKeyNr(in.at(1).get<int>());
     }},
    {"CSignKeyLite::SignKeyKeyNrToKeyNr",
     [](const json& in) {
         return SignKeyLiteOf(in.at(0)).SignKeyKeyNrToKeyNr(in.at(1).get<int>());
     }},
    {"CSignKeyLite::NameShort",
     [](const json& in) { return SignKeyLiteOf(in.at(0)).NameShort(NamePrefsOf(in.at(1))); }},
    {"CSignKeyLite::AppendJSONString",
     [](const json& in) { return JSONStringOf(SignKeyLiteOf(in.at(0))); }},
    {"CSignKeyNoEnh", DescribeNoEnh},
    {"CSignKeyNoEnh::FromJSONDict",
     [](const json& in) { return FormOfNoEnh(CSignKeyNoEnh::FromJSONDict(in.at(0))); }},
    {"CSignKeyHeavy", DescribeHeavy},
    {"CSignKeyHeavy::FromJSONDict",
     [](const json& in) { return FormOf(CSignKeyHeavy::FromJSONDict(in.at(0)).ToSignKeyLite()); }},
    {"CSignKeyHeavy::SetFromSignsCountAndType", FromSigns},
    {"SetFromString", ReadSignKey},
};

const std::map<std::string, Answer> kAnswersOfCenters = {
    {"CHarmCenterLite",
     [](const json& in) {
         return FormOfCenter(CHarmCenterLite(SignKeyLiteOf(in.at(0).at("CSignKeyLite"))));
     }},
    {"CHarmCenterLite::NameShort",
     [](const json& in) { return CenterOf(in.at(0)).NameShort(NamePrefsOf(in.at(1))); }},
    {"CHarmCenterLite::NameLong",
     [](const json& in) { return CenterOf(in.at(0)).NameLong(NamePrefsOf(in.at(1))); }},
    {"CHarmCenterLite::KeyNrToHarmCenterKeyNr",
     [](const json& in) { return CenterOf(in.at(0)).KeyNrToHarmCenterKeyNr(in.at(1).get<int>()); }},
    {"CHarmCenterLite::HarmCenterKeyNrToKeyNr",
     [](const json& in) { return CenterOf(in.at(0)).HarmCenterKeyNrToKeyNr(in.at(1).get<int>()); }},
};

CSignKeyLite LeastSigns(CKeyEnh root, TSignKeyType type) {
    CSignKeyLite signKey(root, type);
    signKey.SetRootNoteEnhWithLeastSigns();
    return signKey;
}

}  // namespace

TEST_CASE("A sign key knows its signature, its relative key and its name in all its forms") {
    std::map<std::string, Answer> answers = kAnswersOfTypes;
    answers.insert(kAnswersOfCodes.begin(), kAnswersOfCodes.end());
    answers.insert(kAnswersOfSignKeys.begin(), kAnswersOfSignKeys.end());
    answers.insert(kAnswersOfCenters.begin(), kAnswersOfCenters.end());
    CheckExpected("theory-sign-keys", answers);
}

TEST_CASE("With as many sharps as flats a sign key keeps the spelling that it was given") {
    struct CRow {
        CKeyEnh mGiven;
        TSignKeyType mType;
        CKeyEnh mSpelled;
    };
    const CRow rows[] = {
        {CKeyEnh_Fis, TSignKeyType_Major, CKeyEnh_Fis},
        {CKeyEnh_Gb, TSignKeyType_Major, CKeyEnh_Gb},
        {CKeyEnh_Dis, TSignKeyType_Minor, CKeyEnh_Dis},
        {CKeyEnh_Eb, TSignKeyType_Minor, CKeyEnh_Eb},
        {{6, TEnh_Undef}, TSignKeyType_Major, CKeyEnh_Fis},
        {{3, TEnh_Undef}, TSignKeyType_Minor, CKeyEnh_Eb},
        {CKeyEnh_Gis, TSignKeyType_Major, CKeyEnh_Ab},
        // Two steps of respelling away: B double sharp and C sharp have seven sharps, D flat five
        // flats.
        {CKeyEnh_Bx, TSignKeyType_Major, CKeyEnh_Db},
        // F double flat counts three flats, as E flat does.
        {CKeyEnh_Fbb, TSignKeyType_Major, CKeyEnh_Fbb},
        {CKeyEnh_Undef, TSignKeyType_Major, CKeyEnh_Undef},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mGiven);
        CAPTURE(row.mType);
        CHECK(LeastSigns(row.mGiven, row.mType) == CSignKeyLite(row.mSpelled, row.mType));
    }
}

TEST_CASE("A sign key without a spelling takes the code of its default spelling") {
    CHECK(ToSignKeyInEv({3, TEnh_Undef}, TSignKeyType_Minor) == 17);
    CHECK(ToSignKeyInEv({3, TEnh_n}, TSignKeyType_Major) == 4);
    // G sharp major would have eight sharps.
    CHECK(ToSignKeyInEv(CKeyEnh_Gis, TSignKeyType_Major) == 15);
    CHECK(_ToSignKeyInEv_GuessEnhWithLeastSignes(CKeyEnh_Gis, TSignKeyType_Major) == 3);
    CHECK(ToSignKeyInEvDeprecated({CKeyEnh_Gis, TSignKeyType_Major}) == 3);
    CHECK(ToSignKeyInEvDeprecated(CSignKeyLite_Undef) == 255);
    CHECK(ToSignKeyInEv({-5, TEnh_b}, static_cast<TSignKeyType>(7)) == 15);
}

TEST_CASE("Any number of signs ends on a key") {
    for (const int signs :
         {std::numeric_limits<int>::min(), -1000003, 1000003, std::numeric_limits<int>::max()}) {
        CAPTURE(signs);
        CSignKeyHeavy signKey;
        signKey.SetFromSignsCountAndType(signs, TSignKeyTypeNoUndef_Minor);
        CHECK_FALSE(signKey.IsUndef());
    }
}

TEST_CASE(
    "Each sign is one fifth from the key with one sign less, past the end of the circle, too") {
    struct CRow {
        TSignKeyTypeNoUndef mType;
        CKeyEnh mWithoutSigns;
        int mFifth;
    };
    const CRow rows[] = {{TSignKeyTypeNoUndef_Major, CKeyEnh_C, 7},
                         {TSignKeyTypeNoUndef_Major, CKeyEnh_C, -7},
                         {TSignKeyTypeNoUndef_Minor, CKeyEnh_A, 7},
                         {TSignKeyTypeNoUndef_Minor, CKeyEnh_A, -7}};
    for (const CRow& row : rows) {
        CKeyEnh root = row.mWithoutSigns;
        for (int signs = 0; signs < 200; ++signs, root.AddToThis(row.mFifth)) {
            CAPTURE(signs);
            CSignKeyHeavy signKey;
            signKey.SetFromSignsCountAndType(row.mFifth < 0 ? -signs : signs, row.mType);
            CHECK(signKey.RootKeyEnh() == CSignKeyHeavy(root, row.mType).RootKeyEnh());
        }
    }
    CSignKeyHeavy signKey;
    signKey.SetFromSignsCountAndType(31, TSignKeyTypeNoUndef_Major);
    CHECK(signKey.RootKeyEnh() == CKeyEnh_Cis);  // as 7 and 19 fifths lead there, too
}

TEST_CASE("A word that is no type means major, and a sign in UTF-8 reads as it looks") {
    struct CRow {
        const char* mText;
        CSignKeyLite mSignKey;
    };
    const CRow rows[] = {
        {"B♭m", {CKeyEnh_Bb, TSignKeyType_Minor}},
        {"F♯ Minor", {CKeyEnh_Fis, TSignKeyType_Minor}},
        {"C m ", {CKeyEnh_C, TSignKeyType_Minor}},
        {"Cmx", {CKeyEnh_C, TSignKeyType_Major}},
        {"Cma", {CKeyEnh_C, TSignKeyType_Major}},
        {"C minorish", {CKeyEnh_C, TSignKeyType_Major}},
        {"minor", {CKeyEnh_Undef, TSignKeyType_Minor}},
        {"", {CKeyEnh_Undef, TSignKeyType_Major}},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mText);
        CHECK(CSignKeyLite(row.mText) == row.mSignKey);
    }
}

TEST_CASE("Dictionaries of the wrong form read as undefined sign keys") {
    for (const char* text : {"null", "[]", "7", "{}", R"({"RootKeyNr":[],"Type":1})",
                             R"({"RootKeyNr":1e300})", R"({"RootKeyNr":12,"Type":"minor"})"}) {
        CAPTURE(text);
        CHECK(CSignKeyNoEnh::FromJSONDict(json::parse(text)).mRootKeyNr == kKeyNrUndef);
    }
    for (const char* text : {"null", "[]", "{}", R"({"root":3})", R"({"root":{"nr":{}},"type":0})",
                             R"({"root":{"enh":7}})", R"({"root":{"nr":255}})"}) {
        CAPTURE(text);
        CHECK(CSignKeyHeavy::FromJSONDict(json::parse(text)).IsUndef());
    }
}
