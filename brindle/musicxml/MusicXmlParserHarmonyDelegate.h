// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/musicxml/TMusicXMLMeasure.h"
#include "brindle/platform/XmlStreamParser.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace brindle {

/// Gathers the harmonies of a MusicXML text, measure by measure, and at the end of the document
/// lays them out in playing order.
class MusicXmlParserHarmonyDelegate : public XmlStreamDelegate {
public:
    /// From the index of one measure to that of another.
    using TMeasurePairs = std::vector<std::pair<std::int32_t, std::int32_t>>;

    /// `parserDidStartDocument:`
    void didStartDocument(XmlStreamParser& parser) override;
    /// `parserDidEndDocument:`
    void didEndDocument(XmlStreamParser& parser) override;
    /// `parser:didStartElement:namespaceURI:qualifiedName:attributes:`
    void didStartElement(XmlStreamParser& parser, std::string_view name,
                         const XmlAttributes& attributes) override;
    /// `parser:didEndElement:namespaceURI:qualifiedName:`
    void didEndElement(XmlStreamParser& parser, std::string_view name) override;
    /// `parser:foundCharacters:`
    void foundCharacters(XmlStreamParser& parser, std::string_view text) override;

    /// A copy of the song; complete when the document has ended.
    [[nodiscard]] TMusicXMLDoc getDoc() const { return musicXMLDoc; }
    /// The song itself; an empty one stays behind.
    [[nodiscard]] TMusicXMLDoc takeDoc() { return std::move(musicXMLDoc); }
    /// Copies of the written measures, those of all parts one behind the other.
    [[nodiscard]] std::vector<TMusicXMLMeasure> getMeasures() const { return measures; }
    /// From each coda sign to the next one, in the order of the file.
    [[nodiscard]] TMeasurePairs getCodaPairs() const { return codaPairs; }
    /// From each "D.S. al Coda" to the last segno before it.
    [[nodiscard]] TMeasurePairs getSegnoPairs() const { return segnoPairs; }
    /// Whether the song was cut at one of the limits of TMusicXMLDoc.h.
    [[nodiscard]] bool WasCut() const { return mWasCut; }

private:
    [[nodiscard]] std::int32_t LastMeasureIndex() const;
    void StartedRepeat(const XmlAttributes& attributes);
    void FoundMode(std::string_view text);
    void FoundWords(std::string_view text);
    void FoundHarmonyText(TMusicXMLHarmony& harmony, std::string_view text);

    std::int32_t divisions = 0;
    std::int32_t beatsNumerator = 0;
    std::int32_t beatsDenominator = 0;
    std::int32_t lastSegno = -1;
    std::int32_t lastCoda = -1;
    std::int32_t fifths = -1;
    std::string currentElementName;
    std::string currentElementParentName;
    std::int64_t ixLastRepetitionStart = 0;
    std::vector<TMusicXMLMeasure> measures;
    /// From a coda sign to the next one.
    TMeasurePairs codaPairs;
    /// From a measure with "D.S. al Coda" to the segno before it.
    TMeasurePairs segnoPairs;
    TMusicXMLDoc musicXMLDoc;
    bool mWasCut = false;
};

}  // namespace brindle
