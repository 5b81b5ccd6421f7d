// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmonicAnalyse.h"

#include "brindle/analysis/CHarmCenterWeightAnalysis.h"
#include "brindle/analysis/ParseStringIntoHarmAnlsChords.h"
#include "brindle/analysis/TChordStringParse.h"
#include "brindle/platform/PlainText.h"

#include <fstream>
#include <iterator>
#include <sstream>
#include <utility>

namespace brindle {

namespace {

/// The whole file; empty if it cannot be read.
std::string ContentOf(const std::string& path) {
    const std::ifstream file(path);
    std::ostringstream content;
    if (file.is_open()) content << file.rdbuf();
    return content.str();
}

/// The open mode from the numbers that the standard libraries give its flags.
std::ios::openmode OpenModeOf(unsigned number) {
    constexpr std::pair<unsigned, std::ios::openmode> flags[] = {
        {1, std::ios::app}, {2, std::ios::ate},  {4, std::ios::binary},
        {8, std::ios::in},  {16, std::ios::out}, {32, std::ios::trunc},
    };
    std::ios::openmode mode = std::ios::out;
    for (const auto& [bit, flag] : flags) {
        if ((number & bit) != 0) mode |= flag;
    }
    return mode;
}

}  // namespace

void CHarmonicAnalyse::AnalyseFromChords(const CHarmAnlsChords& chords,
                                         const CHarmAnlsSignKeys& signKeys, TAnalyse analyse) {
    _FillAnalyserWithSignKeysAndChords(signKeys, chords);
    Analyse(analyse);
}

void CHarmonicAnalyse::AnalyseFromChordString(std::string_view text,
                                              const CHarmAnlsSignKeys& signKeys, TAnalyse analyse,
                                              const TChordStringParse& parse) {
    _FillAnalyserWithSignKeysAndChordString(signKeys, text, parse);
    Analyse(analyse);
}

void CHarmonicAnalyse::AnalyseFromChordStringFile(const std::string& path,
                                                  const CHarmAnlsSignKeys& /*signKeys*/,
                                                  TAnalyse /*analyse*/,
                                                  const TChordStringParse& /*parse*/) {
    AnalyseFromChordString(ContentOf(path), {}, TAnalyse_TonicProgressions, TChordStringParse{});
}

void CHarmonicAnalyse::Analyse(TAnalyse analyse) {
    _FindAndInsertHarmCenters(analyse);
    _MergeAdjacentSameSignKeys();
    _MergeAdjacentSameHarmCenters();
    _FillSignKeysAndCentersAndSetHarmFunctions();
}

void CHarmonicAnalyse::_FindAndInsertHarmCenters(TAnalyse analyse) {
    if (analyse == TAnalyse_TonicProgressions) {
        mProgressions = CHarmAnlsProgressions::TonicProgressions();
        _FindAndInsertHarmCentersUsingTonicProgressions(TOnlyUndefCenters_No);
    } else if (analyse == TAnalyse_CadenceProgressions) {
        mProgressions = CHarmAnlsProgressions::CadenceProgressions();
        _FindAndInsertHarmCentersUsingCadenceProgressions(TOnlyUndefCenters_No);
    } else if (analyse != TAnalyse_CenterWeights) {
        return;
    }
    _FindAndInsertHarmCentersUsingCenterWeightAnalysis({}, TOnlyUndefCenters_No);
}

CHarmAnlsSignKeys::iterator CHarmonicAnalyse::FillManually_AppendSignKey(
    const CHarmAnlsSignKey& signKey) {
    return mSignKeys.insert(mSignKeys.end(), signKey);
}

CHarmAnlsCenters::iterator CHarmonicAnalyse::FillManually_AppendHarmCenterInSignKey(
    CHarmAnlsSignKeys::iterator signKey, const CHarmAnlsCenter& center) {
    return signKey->mHarmCenters.insert(signKey->mHarmCenters.end(), center);
}

CHarmAnlsChords::iterator CHarmonicAnalyse::FillManually_AppendChordInHarmCenter(
    CHarmAnlsCenters::iterator center, const CHarmAnlsChordWithPos& chord) {
    return center->mChords.insert(center->mChords.end(), chord);
}

void CHarmonicAnalyse::ListAllHarmChords(CHarmAnlsChords& chords) const {
    CHarmAnlsChords all;
    for (const CHarmAnlsSignKey& signKey : mSignKeys) {
        for (const CHarmAnlsCenter& center : signKey.mHarmCenters) {
            all.insert(all.end(), center.mChords.begin(), center.mChords.end());
        }
    }
    chords = std::move(all);
}

void CHarmonicAnalyse::AppendJSONString(std::ostream& stream) const {
    PlainText::Write(stream, R"({"HarmSignKeys":)");
    PlainText::EndLine(stream);
    mSignKeys.AppendJSONString(stream);
    PlainText::Write(stream, "}");
}

void CHarmonicAnalyse::WriteAnalysisResultToFile(const std::string& path, unsigned openMode) const {
    std::ofstream stream(path, OpenModeOf(openMode));
    AppendJSONString(stream);
    stream.close();
}

void CHarmonicAnalyse::_FillAnalyserWithSignKeysAndChords(const CHarmAnlsSignKeys& signKeys,
                                                          const CHarmAnlsChords& chords) {
    mChords = chords;
    _FillAnalyserWithSignKeysOrCreateDefault(signKeys);
}

void CHarmonicAnalyse::_FillAnalyserWithSignKeysAndChordString(const CHarmAnlsSignKeys& signKeys,
                                                               std::string_view text,
                                                               const TChordStringParse& parse) {
    mChords = ParseStringIntoHarmAnlsChords::ParseIntoChords(text, parse);
    _FillAnalyserWithSignKeysOrCreateDefault(signKeys);
}

void CHarmonicAnalyse::_FillAnalyserWithSignKeysOrCreateDefault(const CHarmAnlsSignKeys& signKeys) {
    mSignKeys = signKeys;
    if (mSignKeys.empty()) mSignKeys.emplace_back();
    CHarmAnlsSignKey& last = mSignKeys.back();
    if (last.mHarmCenters.empty()) {
        CHarmAnlsCenter& center = last.mHarmCenters.emplace_back();
        center.mPosition = last.mPosition;
        center.mHarmCenter = {last.mSignKey.mRootKeyEnh,
                              SemitonesFromSignKeyType(last.mSignKey.mSignKeyType)};
    }
    last.mHarmCenters.back().mChords = mChords;
}

void CHarmonicAnalyse::_MergeAdjacentSameSignKeys() {
    mSignKeys.MergeAdjacentSameSignKeys();
}

void CHarmonicAnalyse::_MergeAdjacentSameHarmCenters() {
    mSignKeys.MergeAdjacentSameHarmCenters();
}

void CHarmonicAnalyse::_FillSignKeysAndCentersAndSetHarmFunctions() {
    for (CHarmAnlsSignKey& signKey : mSignKeys) {
        if (signKey.IsUndef()) {
            // Taken even if it is undefined.
            const CHarmCenterLite center = signKey.mHarmCenters.FindMostOccurentHarmCenter();
            signKey.mSignKey = {center.mRootKeyEnh, SignKeyTypeFromSemitones(center.mSemitones)};
        }
        for (CHarmAnlsCenter& center : signKey.mHarmCenters) {
            center.IfUndefFillWithHarmSignKey(signKey);
            center.AnalyseHarmFunctionsOfChords();
        }
    }
}

}  // namespace brindle
