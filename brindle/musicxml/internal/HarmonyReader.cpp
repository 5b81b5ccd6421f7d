// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/HarmonyReader.h"

#include "brindle/musicxml/internal/KindWords.h"
#include "brindle/platform/ReadNumber.h"
#include "brindle/platform/XmlStreamParser.h"

#include <utility>

namespace brindle {

namespace {

using enum TScoreElement;

constexpr std::string_view kNoChordRoot = "N.C.";
constexpr std::string_view kNoChordKind = "none";

}  // namespace

CHarmonyReader::CHarmonyReader(const XmlAttributes& attributes)
    : mIsAlternate(attributes.Value("type") == "alternate") {}

void CHarmonyReader::Started(TScoreElement element, const XmlAttributes& attributes) {
    if (element == Root) ++mRootCount;
    if (mRootCount > 1) return;
    if (element == Kind) {
        mKindText = attributes.Value("text");
    } else if (element == Degree) {
        mHarmony.mDegrees.emplace_back();
    }
}

void CHarmonyReader::Ended(TScoreElement element, std::string_view text) {
    if (mRootCount > 1) return;
    if (element == RootStep) {
        mHarmony.mRoot.mStep = text;
    } else if (element == RootAlter) {
        mHarmony.mRoot.mAlter = ReadInteger(text);
    } else if (element == BassStep) {
        mHarmony.mBass.mStep = text;
    } else if (element == BassAlter) {
        mHarmony.mBass.mAlter = ReadInteger(text);
    } else if (element == Kind) {
        mHarmony.mKind = text;
    } else if (!mHarmony.mDegrees.empty()) {
        TMusicXMLDegree& degree = mHarmony.mDegrees.back();
        if (element == DegreeValue) {
            degree.mValue = text;
        } else if (element == DegreeAlter) {
            degree.mAlter = ReadInteger(text);
        } else if (element == DegreeType) {
            degree.mType = text;
        }
    }
}

std::optional<TMusicXMLHarmony> CHarmonyReader::Take() {
    if (mIsAlternate) return std::nullopt;
    SetKind(mHarmony, mKindText);
    if (mHarmony.mKind == kNoChordKind) mHarmony.mRoot = {std::string(kNoChordRoot), 0};
    return std::move(mHarmony);
}

}  // namespace brindle
