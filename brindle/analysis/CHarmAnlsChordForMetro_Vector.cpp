// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsChordForMetro.h"
#include "brindle/platform/PlainText.h"
#include "brindle/theory/MakeSensefulEnh.h"

#include <algorithm>
#include <nlohmann/json.hpp>
#include <optional>
#include <ostream>

namespace brindle {

namespace {

// Places of the vector.
constexpr std::size_t kUndefPlace = 0;
constexpr std::size_t kEADGBEPlace = 1;
constexpr std::size_t kWildcardPlace = 2;
constexpr std::size_t kRootPlace = 3;
constexpr std::size_t kBasicChordPlace = 15;
constexpr std::size_t kSemitonesPlace = 22;
constexpr std::size_t kBassPlace = 34;
static_assert(kBassPlace + 12 == CHarmAnlsChordForMetro::VectorSize);

constexpr int kBasicChordCount = 7;
constexpr CSemitones kAllSemitones(4095);

void SetPlace(std::vector<float>& vector, std::size_t first, int ix, int count = 12) {
    if (ix >= 0 && ix < count) vector[first + static_cast<std::size_t>(ix)] = 1.0F;
}

/// The first set place of `count` from `first` on, counted from there.
std::optional<int> FirstSetPlace(std::span<const float> vector, std::size_t first, int count = 12) {
    for (int ix = 0; ix < count; ++ix) {
        if (vector[first + static_cast<std::size_t>(ix)] == 1.0F) return ix;
    }
    return std::nullopt;
}

CKeyEnh KeyWithUsualSpelling(int keyNr) {
    return {keyNr, MakeSensefulEnhForKeyNr(keyNr, TEnh_Undef, TMakeSensefulEnh_AssumingCMajor)};
}

std::optional<CHarmAnlsChordForMetro> ChordOfSpecialPlaces(std::span<const float> vector) {
    const auto withAllSemitones = [](int keyNr) {
        return CHarmAnlsChordForMetro(CChordLite({keyNr, TEnh_n}, CKeyEnh_Undef, kAllSemitones));
    };
    if (vector[kUndefPlace] == 1.0F) return CHarmAnlsChordForMetro();
    if (vector[kEADGBEPlace] == 1.0F) return withAllSemitones(4);
    if (vector[kWildcardPlace] == 1.0F) return withAllSemitones(0);
    return std::nullopt;
}

/// The numbers of an array; empty, and so no vector, if one of its entries is none.
std::vector<float> FloatsOf(const nlohmann::json& array) {
    std::vector<float> floats;
    for (const nlohmann::json& entry : array) {
        if (!entry.is_number()) return {};
        floats.push_back(entry.get<float>());
    }
    return floats;
}

}  // namespace

std::vector<float> CHarmAnlsChordForMetro::GetChordVectorRepresentation() const {
    std::vector<float> vector(VectorSize, 0.0F);
    if (IsEADGBE()) {
        vector[kEADGBEPlace] = 1.0F;
    } else if (IsUndef()) {
        vector[kUndefPlace] = 1.0F;
    } else if (IsWildcard()) {
        vector[kWildcardPlace] = 1.0F;
    } else {
        SetPlace(vector, kRootPlace, mRootKeyEnh.mKeyNr);
        SetPlace(vector, kBasicChordPlace, static_cast<int>(BasicChord()) - 1, kBasicChordCount);
        CSemitones basicChord;
        basicChord.AddSemitonesFromBasicChord(BasicChord());
        for (int semitone = 0; semitone < 12; ++semitone) {
            if ((mSemitones - basicChord).HasIntvl(semitone)) {
                SetPlace(vector, kSemitonesPlace, semitone);
            }
        }
        if (HasBassNote() && mBassKeyEnh.mKeyNr != mRootKeyEnh.mKeyNr) {
            SetPlace(vector, kBassPlace, mBassKeyEnh.mKeyNr);
        }
    }
    return vector;
}

void CHarmAnlsChordForMetro::SetFromChordVectorRepresentation(std::span<const float> vector) {
    const bool isVector = vector.size() == VectorSize &&
                          std::all_of(vector.begin(), vector.end(),
                                      [](float entry) { return entry == 0.0F || entry == 1.0F; });
    if (!isVector) return;
    if (const auto special = ChordOfSpecialPlaces(vector)) {
        static_cast<CHarmAnlsChord&>(*this) = *special;
        return;
    }
    const auto root = FirstSetPlace(vector, kRootPlace);
    if (!root) return;
    mRootKeyEnh = KeyWithUsualSpelling(*root);
    if (const auto basicChord = FirstSetPlace(vector, kBasicChordPlace, kBasicChordCount)) {
        mSemitones.SetFromBasicChord(static_cast<TBasicChord>(*basicChord + 1));
    }
    for (int semitone = 0; semitone < 12; ++semitone) {
        if (vector[kSemitonesPlace + static_cast<std::size_t>(semitone)] == 1.0F) {
            mSemitones.AddIntvl(semitone);
        }
    }
    if (const auto bass = FirstSetPlace(vector, kBassPlace)) {
        mBassKeyEnh = KeyWithUsualSpelling(*bass);
    }
}

void CHarmAnlsChordForMetro::AppendJSONClassSubstring(std::ostream& stream) const {
    if (!mWriteVectorRep) {
        CChordLite::AppendJSONClassSubstring(stream);
        return;
    }
    PlainText::Write(stream, R"("VectorRep":[)");
    const char* separator = "";
    for (const float place : GetChordVectorRepresentation()) {
        PlainText::Write(stream, separator);
        PlainText::WriteFixed(stream, double{place});
        separator = ", ";
    }
    PlainText::Write(stream, "]");
}

void CHarmAnlsChordForMetro::AppendJSONString(std::ostream& stream) const {
    PlainText::Write(stream, "{");
    AppendJSONClassSubstring(stream);
    PlainText::Write(stream, "}");
}

void CHarmAnlsChordForMetro::FromDictionary(const nlohmann::json& dictionary) {
    static_cast<CHarmAnlsChord&>(*this) = CHarmAnlsChord_Undef;
    if (dictionary.is_object()) {
        const auto vector = dictionary.find("VectorRep");
        if (vector != dictionary.end() && vector->is_array()) {
            SetFromChordVectorRepresentation(FloatsOf(*vector));
            return;
        }
    }
    static_cast<CChordLite&>(*this) = CChordLite::FromDictionary(dictionary);
}

}  // namespace brindle
