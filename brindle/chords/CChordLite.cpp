// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordLite.h"

#include "brindle/platform/DictionaryValues.h"
#include "brindle/platform/PlainText.h"

#include <nlohmann/json.hpp>
#include <ostream>

namespace brindle {

namespace {

/// The key under `name`, or the unspelled key under the name that older texts have for it.
CKeyEnh KeyEnhOf(const nlohmann::json& dictionary, const char* name, const char* olderName) {
    const auto it = dictionary.find(name);
    if (it != dictionary.end() && it->is_object()) {
        return CKeyEnh::JSONDeserializer_Helper::CKeyEnhFromJSONDictionary(*it);
    }
    return {IntegerIn(dictionary, olderName).value_or(0), TEnh_Undef};
}

// The fields of the hash code, by the lowest bit of each.
constexpr int kHashRootKeyNr = 24;
constexpr int kHashRootEnh = 28;
constexpr int kHashBassKeyNr = 32;
constexpr int kHashBassEnh = 36;

std::uint64_t HashField(int value, int lowestBit) {
    return static_cast<std::uint64_t>(std::int64_t{value}) << lowestBit;
}

}  // namespace

CChordLite CChordLite::FromDictionary(const nlohmann::json& dictionary) {
    CChordLite chord;
    chord.mRootKeyEnh = KeyEnhOf(dictionary, "RootKeyEnh", "RootKeyNr");
    chord.mBassKeyEnh = KeyEnhOf(dictionary, "BassKeyEnh", "BassKeyNr");
    chord.mSemitones =
        CSemitones(static_cast<std::uint32_t>(IntegerIn(dictionary, "Semitones").value_or(0)));
    return chord;
}

std::int64_t CChordLite::GetChordHashCode() const {
    // A sum, not a union of bits: the negative TEnh_bbb borrows from the field above it.
    const std::uint64_t code = mSemitones.Mask() + HashField(mRootKeyEnh.mKeyNr, kHashRootKeyNr) +
                               HashField(mRootKeyEnh.mEnh, kHashRootEnh) +
                               HashField(mBassKeyEnh.mKeyNr, kHashBassKeyNr) +
                               HashField(mBassKeyEnh.mEnh, kHashBassEnh);
    return static_cast<std::int64_t>(code);
}

void CChordLite::SetFromChordHashCode(std::int64_t code) {
    const auto field = [code](int lowestBit) { return static_cast<int>(code >> lowestBit & 0xF); };
    mSemitones = CSemitones(static_cast<std::uint64_t>(code) & 0xFFFFFF);
    mRootKeyEnh = {field(kHashRootKeyNr), static_cast<TEnh>(field(kHashRootEnh))};
    mBassKeyEnh = {field(kHashBassKeyNr), static_cast<TEnh>(field(kHashBassEnh))};
}

bool CChordLite::IsNoChordYield() const {
    return mRootKeyEnh == CChordLite_NoChordYield.mRootKeyEnh;
}

bool CChordLite::IsNoChordForce() const {
    return mRootKeyEnh == CChordLite_NoChordForce.mRootKeyEnh;
}

void CChordLite::SetUndef() {
    mRootKeyEnh = CChordLite_Undef.mRootKeyEnh;
}

void CChordLite::SetNoChordYield() {
    mRootKeyEnh = CChordLite_NoChordYield.mRootKeyEnh;
}

void CChordLite::SetNoChordForce() {
    mRootKeyEnh = CChordLite_NoChordForce.mRootKeyEnh;
}

void CChordLite::AppendJSONClassSubstring(std::ostream& stream) const {
    PlainText::Write(stream, R"("RootKeyEnh":)");
    mRootKeyEnh.AppendJSONString(stream);
    PlainText::Write(stream, R"(, "BassKeyEnh":)");
    mBassKeyEnh.AppendJSONString(stream);
    PlainText::Write(stream, R"(, "Semitones":)");
    PlainText::WriteUnsigned(stream, mSemitones.Mask());
}

void CChordLite::AppendJSONString(std::ostream& stream) const {
    PlainText::Write(stream, "{");
    AppendJSONClassSubstring(stream);
    PlainText::Write(stream, "}");
}

bool CChordLite::EqualExceptRootAndBass(const CChordLite& other) const {
    return mSemitones == other.mSemitones;
}

bool CChordLite::EqualWithoutEnh(const CChordLite& other) const {
    return mRootKeyEnh.mKeyNr == other.mRootKeyEnh.mKeyNr &&
           mBassKeyEnh.mKeyNr == other.mBassKeyEnh.mKeyNr && mSemitones == other.mSemitones;
}

bool CChordLite::EqualWithoutDir(const CChordLite& other) const {
    return *this == other;
}

bool CChordLite::EqualIncludingDir(const CChordLite& other) const {
    return EqualWithoutDir(other) && mRootDir == other.mRootDir && mBassDir == other.mBassDir;
}

}  // namespace brindle
