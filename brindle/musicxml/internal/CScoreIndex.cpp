// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/CScoreIndex.h"

#include "brindle/musicxml/XPathHelpers.h"

#include <algorithm>
#include <utility>

namespace brindle::muxml {

namespace {

std::string TextBelow(const XmlNode& node, std::string_view name) {
    return node.firstDescendant(name).stringValue();
}

CMuxmlScoreInstrument InstrumentFrom(const XmlNode& element) {
    CMuxmlScoreInstrument instrument;
    instrument.mID = element.attribute("id").value_or(std::string());
    instrument.mInstrumentName = TextBelow(element, "instrument-name");
    // Kept: the name of this element is misspelled, so that scores never have it.
    instrument.mInstrumentAbbreviation = TextBelow(element, "instrument-abbrevation");
    instrument.mInstrumentSound = LowercaseString(TextBelow(element, "instrument-sound"));
    instrument.mXML = element;
    return instrument;
}

constexpr std::size_t kBytesLikeAnElement = 64;

std::size_t WeightOf(const XmlNode& element) {
    std::size_t weight = 1 + element.stringValue().size() / kBytesLikeAnElement;
    for (XmlNode node = element.firstChild(); node; node = node.nextBelow(element)) ++weight;
    return weight;
}

std::size_t WeightOf(const CMuxmlScoreInstrument& instrument) {
    const std::size_t bytes = instrument.mID.size() + instrument.mInstrumentName.size() +
                              instrument.mInstrumentAbbreviation.size() +
                              instrument.mInstrumentSound.size();
    return 1 + bytes / kBytesLikeAnElement;
}

}  // namespace

CScoreIndex::CScoreIndex(const XmlNode& root) {
    Visit(root);
    for (XmlNode node = root.firstChild(); node; node = node.nextBelow(root)) Visit(node);
    for (XmlNode node = mFirstTime.firstChild(); node; node = node.nextSibling()) {
        mFirstSignTime.SetElementFromString(node.name(), node.stringValue());
    }
    ReadPartList(root);
}

void CScoreIndex::Visit(const XmlNode& node) {
    const std::string_view name = node.name();
    if (name == "part") {
        const std::string id = node.attribute("id").value_or(std::string());
        if (!id.empty()) mParts.try_emplace(id, CIndexedPart{node});
    } else if (name == "part-list") {
        if (!mPartList) mPartList = node;
    } else if (name == "time") {
        if (!mFirstTime) mFirstTime = node;
    } else if (name == "chord") {
        mHasChord = true;
    }
}

void CScoreIndex::ReadPartList(const XmlNode& root) {
    for (XmlNode node = mPartList.firstChild(); node; node = node.nextSibling()) {
        if (node.name() != "score-part") continue;
        const std::string id = node.attribute("id").value_or(std::string());
        if (!id.empty()) mScoreParts.try_emplace(id, node);
    }
    for (XmlNode list = root.firstChild(); list; list = list.nextSibling()) {
        if (root.name() != "score-partwise" || list.name() != "part-list") continue;
        for (XmlNode node = list.firstChild(); node; node = node.nextSibling()) {
            if (node.name() == "score-part") ++mScorePartCount;
        }
    }
    std::vector<std::string> ids;
    for (const XmlNode& element : mPartList.descendants("score-instrument")) {
        if (ids.size() == kMuxmlMaxInstruments) break;
        mInstruments.push_back(InstrumentFrom(element));
        ids.push_back(mInstruments.back().mID);
    }
    mInstrumentIndex = CInstrumentIndex(std::move(ids));
}

XmlNode CScoreIndex::TakePart(std::string_view id) {
    const auto it = mParts.find(id);
    if (it == mParts.end()) return {};
    CIndexedPart& part = it->second;
    if (!std::exchange(part.mIsTaken, true)) return part.mPart;
    mLyricRoom = 0;
    if (part.mWeight == 0) part.mWeight = WeightOf(part.mPart) + WeightOf(ScorePart(id));
    if (part.mWeight > mRepeatRoom) {
        mScoreParts.erase(it->first);
        return {};
    }
    mRepeatRoom -= part.mWeight;
    return part.mPart;
}

XmlNode CScoreIndex::ScorePart(std::string_view id) const {
    const auto it = mScoreParts.find(id);
    return it == mScoreParts.end() ? XmlNode() : it->second;
}

CMuxmlScoreInstruments CScoreIndex::TakeInstruments(std::string_view partId) {
    CMuxmlScoreInstruments instruments;
    for (const std::size_t place : mInstrumentIndex.Holding(partId, mInstrumentRoom)) {
        mInstrumentRoom -= std::min(mInstrumentRoom, WeightOf(mInstruments[place]));
        if (mInstrumentRoom == 0) break;
        instruments.push_back(mInstruments[place]);
    }
    return instruments;
}

}  // namespace brindle::muxml
