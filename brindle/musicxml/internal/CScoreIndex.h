// SPDX-License-Identifier: MIT
#pragma once

// Internal to musicxml/: what an import asks of the whole document, found in one walk over it.

#include "brindle/musicxml/CMuxmlPart.h"
#include "brindle/musicxml/CMuxmlSignTime.h"
#include "brindle/musicxml/MuxmlLimits.h"
#include "brindle/musicxml/internal/CInstrumentIndex.h"
#include "brindle/platform/XmlDocument.h"

#include <cstddef>
#include <cstdint>
#include <functional>
#include <map>
#include <string>
#include <string_view>

namespace brindle::muxml {

class CScoreIndex {
public:
    CScoreIndex() = default;
    explicit CScoreIndex(const XmlNode& root);

    [[nodiscard]] XmlNode PartList() const { return mPartList; }
    /// The number of parts that the list of a partwise score names.
    [[nodiscard]] std::int32_t ScorePartCount() const { return mScorePartCount; }
    /// Beats and beat type of the first `time` of the document, whatever part it belongs to; 4/4
    /// when there is none.
    [[nodiscard]] const CMuxmlSignTime& FirstSignTime() const { return mFirstSignTime; }
    [[nodiscard]] bool HasChord() const { return mHasChord; }

    /// The first `part` with the identifier. An empty handle for the empty identifier, when there
    /// is none, or when parts with repeated identifiers have been looked through too often; the
    /// list of parts then does not know the identifier either.
    [[nodiscard]] XmlNode TakePart(std::string_view id);
    /// The first entry of the identifier in the list of parts.
    [[nodiscard]] XmlNode ScorePart(std::string_view id) const;
    /// The instruments whose identifiers hold that of the part.
    [[nodiscard]] CMuxmlScoreInstruments TakeInstruments(std::string_view partId);

    /// How much may still be copied for the lyrics of ties.
    std::size_t mLyricRoom = kMuxmlMaxLyricCopies;

private:
    struct CIndexedPart {
        XmlNode mPart;
        /// Of the part and of its entry in the list; weighed when the identifier is repeated.
        std::size_t mWeight = 0;
        bool mIsTaken = false;
    };

    void Visit(const XmlNode& node);
    void ReadPartList(const XmlNode& root);

    XmlNode mPartList;
    XmlNode mFirstTime;
    CMuxmlSignTime mFirstSignTime;
    bool mHasChord = false;
    std::int32_t mScorePartCount = 0;
    std::map<std::string, CIndexedPart, std::less<>> mParts;
    std::map<std::string, XmlNode, std::less<>> mScoreParts;
    CMuxmlScoreInstruments mInstruments;
    CInstrumentIndex mInstrumentIndex;
    std::size_t mRepeatRoom = kMuxmlMaxRepeatedElements;
    std::size_t mInstrumentRoom = kMuxmlMaxPartInstruments;
};

}  // namespace brindle::muxml
