// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/ReadHarmony.h"
#include "brindle/theory/CSignKeyLite.h"

#include <optional>
#include <string_view>

namespace brindle {

struct CSong;

/// The key that a song states, "F# minor", "B♭", "Am", "A-"; nothing for any other text.
[[nodiscard]] std::optional<CSignKeyLite> ReadStatedKey(std::string_view text);

/// A key that begins to hold; what is no key changes nothing.
void AppendStatedKey(std::string_view text, double position, CSong& song);
void AppendStatedKey(const CSignKeyLite& key, double position, CSong& song);

/// How the seventh of the last chord is spelled; what is undefined needs no entry.
void StateSeventh(TSeventhSpelling seventh, CSong& song);

}  // namespace brindle
