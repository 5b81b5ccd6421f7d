// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmonicAnalyse.h"
#include "brindle/chords/CChordHeavy.h"
#include "brindle/musicxml/CChordSetFromMusicXml.h"
#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/musicxml/internal/PlaceChordsOfScore.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <algorithm>
#include <limits>
#include <vector>

namespace brindle {

namespace {

CHarmAnlsChordWithPos ChordOf(const TMusicXMLHarmony& harmony) {
    CChordLite chord;
    chord.SetFromChordHeavy(CChordSetFromMusicXml(harmony, 24, CurrentChordNamePrefs));
    return CHarmAnlsChordWithPos(CHarmAnlsChord(chord), harmony.mPosition);
}

/// Finds the last sign key that starts at or before a position, in any order of sign keys.
class CSignKeyFinder {
public:
    explicit CSignKeyFinder(CHarmAnlsSignKeys& signKeys) : mSignKeys(signKeys) {
        mLowestFromHere.resize(signKeys.size());
        double lowest = std::numeric_limits<double>::infinity();
        for (std::size_t i = signKeys.size(); i-- > 0;) {
            lowest = std::min(lowest, signKeys[i].mPosition);
            mLowestFromHere[i] = lowest;
        }
    }

    [[nodiscard]] CHarmAnlsSignKey* At(double position) const {
        const auto behind =
            std::upper_bound(mLowestFromHere.begin(), mLowestFromHere.end(), position);
        if (behind == mLowestFromHere.begin()) return nullptr;
        return &mSignKeys[static_cast<std::size_t>(behind - mLowestFromHere.begin() - 1)];
    }

private:
    CHarmAnlsSignKeys& mSignKeys;
    std::vector<double> mLowestFromHere;  // ascending
};

}  // namespace

void CHarmonicAnalyse::AnalyseFromMusicXMLFile(const std::string& path, TAnalyse analyse) {
    TMusicXMLDoc doc;
    (void)doc.LoadFromMusicXMLFile(path);
    AnalyseFromMusicXMLDoc(doc, analyse);
}

void PlaceChordsOfScore(const CHarmAnlsChords& chords, double end, CHarmonicAnalyse& analyse) {
    CHarmAnlsSignKeys& signKeys = analyse.mSignKeys;
    if (signKeys.empty()) signKeys.emplace_back();
    const CSignKeyFinder finder(signKeys);
    bool wasPlaced = false;
    for (const CHarmAnlsChordWithPos& chord : chords) {
        if (CHarmAnlsSignKey* signKey = finder.At(chord.mPosition)) {
            if (signKey->mHarmCenters.empty()) signKey->mHarmCenters.emplace_back();
            signKey->mHarmCenters.back().mChords.push_back(chord);
            wasPlaced = true;
        }
    }
    CHarmAnlsCenters& lastCenters = signKeys.back().mHarmCenters;
    if (wasPlaced && !lastCenters.empty() && end != kPosUndef) {
        lastCenters.back().mChords.push_back(CHarmAnlsChordWithPos(CHarmAnlsChord(), end));
    }
}

void CHarmonicAnalyse::AnalyseFromMusicXMLDoc(const TMusicXMLDoc& doc, TAnalyse analyse) {
    mChords.clear();
    mSignKeys.insert(mSignKeys.end(), doc.HarmSignKeys.begin(), doc.HarmSignKeys.end());
    double end = kPosUndef;
    for (const TMusicXMLHarmony& harmony : doc.Harmonies) {
        if (harmony.IsNoChord()) continue;
        mChords.push_back(ChordOf(harmony));
        end = harmony.mPosition + harmony.mDuration;
    }
    PlaceChordsOfScore(mChords, end, *this);
    mChordSequences = doc.ChordSequences;
    Analyse(analyse);
}

}  // namespace brindle
