// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Child.h"

#include <string>

namespace brindle {

/// Reads a `note` and makes of it a note in time. A delegate reads one note.
class XMLParserDelegate_RecursiveMuxml_Note final : public XMLParserDelegate_RecursiveMuxml_Child {
public:
    CMuxmlNote EncounteredNote;  ///< the note; moved away when its element has ended
    std::string InstrumentName;  ///< the text of `instrument`; nothing looks at it

    void didStartMyElement(XmlStreamParser& parser, std::string_view name,
                           const XmlAttributes& attributes) override;

    /// Works out pitch, loudness, place and length, joins ties, gathers what is learned about the
    /// part and tells the note to the host. Throws boost::bad_rational when the file told divisions
    /// of 0.
    void encounteredNote();

    // For the table of elements:

    /// The elements of that name below the note; looked for once.
    void FindNotations();
    void FindNotehead();      ///< the first `notehead`, likewise
    void FindNoteheadText();  ///< the first `notehead-text`, likewise
    void FoundTie();          ///< the `type` of the `tie` that is open, up to kMuxmlMaxTies
    /// The side of the ratio of a tuplet that is open now; null outside a tuplet.
    [[nodiscard]] CMuxmlTupletPortion* OpenTupletPortion();

protected:
    void didEndMyElement() override { encounteredNote(); }
    /// Looks the element up in its table; what no row knows goes to the measure.
    void foundTrimmedCharacters(XmlStreamParser& parser, std::string_view text) override;

private:
    enum TDeliver : bool { TDeliver_No = false, TDeliver_Yes = true };

    void SetElements();
    void SetNoteNr();
    void SetVelocities();
    void PlayAsWritten(std::int32_t ticks);
    TDeliver SetPlaceAndJoinTies(std::int32_t& ticks);
    TDeliver SetPlaceOfGraceNote(std::int32_t position, std::int32_t& ticks);
    TDeliver CloseChain(std::int32_t position, std::int32_t& ticks);
    void GatherInfo() const;
    void AdvancePosition(std::int32_t ticks);

    bool mHasLookedForNotehead = false;
    bool mHasLookedForNoteheadText = false;
    bool mHasLookedForNotations = false;
};

}  // namespace brindle
