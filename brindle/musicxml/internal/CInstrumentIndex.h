// SPDX-License-Identifier: MIT
#pragma once

// Internal to musicxml/: finds the instruments whose identifier holds that of a part.

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace brindle::muxml {

/// Texts in which a shorter text is looked for anywhere.
///
/// All ends of all texts are kept sorted, so that those that begin with what is looked for stand
/// together. Going through all texts for each part would take too long for scores of thousands of
/// parts.
class CInstrumentIndex {
public:
    CInstrumentIndex() = default;
    /// Only the first kMuxmlMaxInstruments identifiers and kMuxmlMaxInstrumentIdLength bytes of
    /// each are looked at.
    explicit CInstrumentIndex(std::vector<std::string> ids);

    /// The places of the identifiers that hold the text, ascending; not many more than `limit`
    /// are looked at.
    [[nodiscard]] std::vector<std::size_t> Holding(std::string_view text, std::size_t limit) const;

private:
    struct CEnd {
        std::uint32_t mId;
        std::uint32_t mBegin;
    };

    [[nodiscard]] std::string_view TextOf(const CEnd& end) const {
        return std::string_view(mIds[end.mId]).substr(end.mBegin);
    }

    std::vector<std::string> mIds;
    std::vector<CEnd> mEnds;  ///< sorted by their texts
};

}  // namespace brindle::muxml
