// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmonicAnalyse.h"
#include "brindle/analysis/TChordStringParse.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <sstream>
#include <string_view>

namespace {

constexpr std::size_t kLongestText = 65536;

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size > kLongestText) return 0;
    const std::string_view text(reinterpret_cast<const char*>(data), size);
    for (const auto route :
         {brindle::TAnalyse_None, brindle::TAnalyse_TonicProgressions,
          brindle::TAnalyse_CadenceProgressions, brindle::TAnalyse_CenterWeights}) {
        brindle::CHarmonicAnalyse analyse;
        analyse.AnalyseFromChordString(text, {}, route, {});
        std::ostringstream stream;
        analyse.AppendJSONString(stream);
        if (stream.str().empty()) std::abort();
    }
    return 0;
}
