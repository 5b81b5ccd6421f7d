// SPDX-License-Identifier: MIT
#include "brindle/musicxml/TMusicXMLDoc.h"

#include "brindle/musicxml/MusicXmlParserHarmonyDelegate.h"
#include "brindle/platform/AtomicFile.h"
#include "brindle/platform/XmlStreamParser.h"

namespace brindle {

void TMusicXMLDoc::clear() {
    Title.clear();
    HarmSignKeys.clear();
    Harmonies.clear();
}

bool TMusicXMLDoc::LoadFromMusicXMLFile(const std::string& path) {
    return LoadFromMusicXML(ReadWholeFile(path).value_or(std::string()));
}

bool TMusicXMLDoc::LoadFromMusicXML(std::string_view bytes) {
    clear();
    XmlStreamParser parser;
    MusicXmlParserHarmonyDelegate delegate;
    parser.setDelegate(&delegate);
    const bool isWellFormed = parser.parse(bytes);
    *this = delegate.takeDoc();
    return isWellFormed && !delegate.WasCut();
}

}  // namespace brindle
