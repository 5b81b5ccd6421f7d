// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"

namespace brindle::cli {

void CFormatOptions::AddTo(CCommand& command, const std::vector<std::string>& formats) {
    command.AddChoice("--format", mFormat, formats, "Form of the output");
    command.AddFlag("--json", mJson, "Short for --format json").Excludes("--format");
}

TFormat CFormatOptions::Format() const {
    if (mJson || mFormat == "json") return TFormat::Json;
    if (mFormat == "native") return TFormat::Native;
    if (mFormat == "chords") return TFormat::Chords;
    return mFormat == "svg" ? TFormat::Svg : TFormat::Text;
}

}  // namespace brindle::cli
