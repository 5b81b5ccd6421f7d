// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include "brindle/analysis/CHarmonicAnalyse.h"
#include "brindle/analysis/TChordStringParse.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

/// List of [keyNr, enh, type, position], the position a number or "Undef".
CHarmAnlsSignKeys SignKeysOf(const json& form) {
    CHarmAnlsSignKeys signKeys;
    for (const json& in : form) {
        CHarmAnlsSignKey& signKey = signKeys.emplace_back();
        signKey.mSignKey = {{in.at(0).get<int>(), EnhOf(in.at(1))},
                            static_cast<TSignKeyType>(in.at(2).get<int>())};
        if (in.at(3).is_number()) signKey.mPosition = in.at(3).get<double>();
    }
    return signKeys;
}

json Analysis(const json& in) {
    CHarmonicAnalyse analysis;
    analysis.AnalyseFromChordString(in.at(0).get<std::string>(), SignKeysOf(in.at(1)),
                                    static_cast<TAnalyse>(in.at(2).get<int>()),
                                    TChordStringParse{});
    return JSONStringOf(analysis);
}

}  // namespace

TEST_CASE("Each route finds its sign keys, centers and functions in a chord text") {
    for (const char* file : {"analysis_json_tonic", "analysis_json_cadence",
                             "analysis_json_weights", "analysis_json_sign_keys"}) {
        CheckExpected(file, {{"CHarmonicAnalyse::AnalyseFromChordString", Analysis}});
    }
}
