// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Child.h"

#include <optional>

namespace brindle {

/// Reads a `measure`: its bounds in time, its attributes, `backup` and `forward`. Notes and sounds
/// have delegates of their own.
///
/// The end of a bar follows from the time signature and not from what the bar holds, so that a
/// faulty bar cannot shift what follows.
class XMLParserDelegate_RecursiveMuxml_Measure final
    : public XMLParserDelegate_RecursiveMuxml_Child {
public:
    CMuxmlMeasure EncounteredMeasure;      ///< the measure of this delegate; complete at its end
    CMuxmlSignTime EncounteredSignTime;    ///< the last `time` of it
    CMuxmlSignKey EncounteredSignKey;      ///< the last `key` of it
    CMuxmlClef EncounteredClef;            ///< the last `clef` of it
    CMuxmlTranspose EncounteredTranspose;  ///< the last `transpose` of it

    void didStartMyElement(XmlStreamParser& parser, std::string_view name,
                           const XmlAttributes& attributes) override;
    void didStartElement(XmlStreamParser& parser, std::string_view name,
                         const XmlAttributes& attributes) override;

    /// Sets the cursors to its elements, finds what an upbeat lacks, and tells the host its begin.
    void encounteredMeasureStart(const XmlAttributes& attributes);
    /// Moves the position to the begin of the next bar, and tells the host the measure.
    void encounteredMeasureEnd();
    /// Puts it in force and tells the host.
    void encounteredSignTime();
    /// The same, with the transposition under which the key sounds.
    void encounteredSignKey();
    /// The same; it is also told again at the end of the part.
    void encounteredClef();
    /// Puts it in force and tells the host.
    void encounteredTranspose();
    /// Tells the host the next `direction` of the measure at the current position.
    void encounteredDirection();

    /// For the table of elements.
    void FoundDivisions(XmlStreamParser& parser, std::string_view text);

protected:
    void didEndMyElement() override { encounteredMeasureEnd(); }
    void didEndInnerElement(std::string_view name) override;
    /// Reads `attributes`, and the `duration` of `backup` and `forward`.
    void foundTrimmedCharacters(XmlStreamParser& parser, std::string_view text) override;

private:
    void _encounteredMeasureStart_detectIncompleteFirstBar();
    std::int32_t
    _encounteredMeasureStart_detectIncompleteFirstBar_barLengthOfFirstSignTimeAsDuration();
    [[nodiscard]] std::int32_t _findMaxPosInCurrentPartMeasureAsDuration() const;
    [[nodiscard]] std::int32_t _NextBarStart() const;
    void FindElementsOfMeasure();
    /// The text of an element inside `attributes`.
    void FoundInAttributes(XmlStreamParser& parser, std::string_view text);
    void FoundDuration(std::string_view text);
    [[nodiscard]] const std::optional<CMuxmlTranspose>& FirstTransposeOfMeasure();

    std::vector<XmlNode> mBarlines;
    bool mHasLookedForTranspose = false;
    std::optional<CMuxmlTranspose> mFirstTranspose;
    XmlNode mFirstStaffDetails;
};

}  // namespace brindle
