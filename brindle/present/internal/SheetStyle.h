// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/LeadSheetSvg.h"
#include "brindle/theory/CSignKeyLite.h"

#include <string>
#include <string_view>
#include <vector>

namespace brindle::LeadSheet {

/// The style classes of the colors of a key: behind its chords, and of its name.
[[nodiscard]] std::string BandStyle(const CSignKeyLite& key);
[[nodiscard]] std::string NameStyle(const CSignKeyLite& key);

/// "E♭ major"; empty for no key.
[[nodiscard]] std::string NameOfKey(const CSignKeyLite& key);

/// The <style> element for a sheet in these keys. Each key is to be there once.
[[nodiscard]] std::string StyleElement(const std::vector<CSignKeyLite>& keys, TSheetTheme theme);

/// Colors that do not belong to a key. Texts: "ink" and "quiet"; lines: "bar", "arc", "dot"
/// (dotted) and "thin"; shapes: "ink", "quiet", "paper". Fonts: "sym" of chord symbols, "num" of
/// numerals, "ttl" of the title, "ita" of remarks.

}  // namespace brindle::LeadSheet
