// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/CHarmAnlsProgressions.h"
#include "brindle/analysis/CHarmAnlsSignKeys.h"
#include "brindle/analysis/CHarmCopy.h"
#include "brindle/analysis/TAnalyse.h"

#include <cstdint>
#include <iosfwd>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

struct CHarmCenterWeightAnalysisParams;
struct TChordStringParse;
struct TMusicXMLDoc;

/// Harmonic analysis: takes a chord sequence, and the sign keys if the score states them, and finds
/// the harmonic centers and the function of each chord.
///
/// An entry fills the object, runs to its end and leaves the result in `mSignKeys`: sign keys, in
/// them centers, in them chords. The next entry replaces it. No entry reports a failure: what
/// cannot be read gives undefined chords or an empty analysis. One thread at a time.
class CHarmonicAnalyse {
public:
    /// The input as a flat list. The analysis works on the copies in the centers.
    CHarmAnlsChords mChords;
    /// Before the run the given sign keys, afterwards the result.
    CHarmAnlsSignKeys mSignKeys;
    /// From a lead sheet: the numbers of the harmonies that stand at measures with a slash.
    std::vector<std::uint64_t> mChordSequences;
    /// The table of the last run by tonic progressions or cadences.
    CHarmAnlsProgressions mProgressions;

    /// Analyses a chord list. Without sign keys one is made that is undefined; all chords go to the
    /// last center of the last one.
    void AnalyseFromChords(const CHarmAnlsChords& chords, const CHarmAnlsSignKeys& signKeys,
                           TAnalyse analyse);
    /// Analyses a chord text such as "Dm7 G7 | C".
    void AnalyseFromChordString(std::string_view text, const CHarmAnlsSignKeys& signKeys,
                                TAnalyse analyse, const TChordStringParse& parse);
    /// Analyses a file of chord text, always by tonic progressions, without sign keys and with the
    /// default settings: the other arguments are ignored. An unreadable file is an empty text.
    void AnalyseFromChordStringFile(const std::string& path, const CHarmAnlsSignKeys& signKeys,
                                    TAnalyse analyse, const TChordStringParse& parse);
    /// Analyses a plain MusicXML file as TMusicXMLDoc::LoadFromMusicXMLFile reads it. Sign keys are
    /// added to those that the object holds.
    void AnalyseFromMusicXMLFile(const std::string& path, TAnalyse analyse);
    /// Analyses a lead sheet that was loaded before, in the same way.
    void AnalyseFromMusicXMLDoc(const TMusicXMLDoc& doc, TAnalyse analyse);
    /// Analyses what the object holds. May be called again on its own result.
    void Analyse(TAnalyse analyse);

    /// Appends a copy and returns the iterator to it. The caller keeps the order of time.
    CHarmAnlsSignKeys::iterator FillManually_AppendSignKey(const CHarmAnlsSignKey& signKey);
    /// The same in a sign key of this object.
    CHarmAnlsCenters::iterator FillManually_AppendHarmCenterInSignKey(
        CHarmAnlsSignKeys::iterator signKey, const CHarmAnlsCenter& center);
    /// The same in a center of this object.
    CHarmAnlsChords::iterator FillManually_AppendChordInHarmCenter(
        CHarmAnlsCenters::iterator center, const CHarmAnlsChordWithPos& chord);

    /// Replaces `chords` with the chords of all centers of all sign keys.
    void ListAllHarmChords(CHarmAnlsChords& chords) const;
    /// Replaces `chords` with those of `mChords`, each as long as the next one begins after it; the
    /// length of the last is undefined, and so are all distances.
    void ListAllHarmChordsWithLength(CHarmAnlsChordsWithLength& chords) const;

    /// Replaces `copies` with the passages of `mChords` that repeat earlier ones, by position. A
    /// bar has four beats here. Spelling, bass and length of each chord must agree.
    void FindHarmCopies(CHarmCopies& copies) const;

    // The steps of FindHarmCopies.

    /// Replaces `sequences` with all sequences of two or more chords that stand at two or more
    /// places, sorted.
    void GenerateVectorWithRepeatingSequenceIndices(THarmRepeatingSequences& sequences,
                                                    CHarmAnlsChordsWithLength chords) const;
    /// Replaces `indices` with the later places of the chord at `start`. Kept: the last chord of
    /// the list is not looked at.
    void FindRecurringChordIndices(std::vector<std::uint64_t>& indices,
                                   CHarmAnlsChordsWithLength chords, std::uint64_t start) const;
    /// Appends `start` unless it is there or less than `length` behind an entry.
    void InsertRangeStartIfNoCollision(std::vector<std::uint64_t>& indices, std::uint64_t start,
                                       std::uint64_t length) const;
    /// Appends the copies in a passage: `chords`, whose first is number `start` of the list that
    /// the sequences count from, and begins at `position` in beats.
    void RecursiveFillWithSequences(const CHarmAnlsChordsWithLength& chords,
                                    const THarmRepeatingSequences& sequences, std::uint64_t start,
                                    std::int32_t position, CHarmCopies& copies) const;

    /// Writes the result as JSON text. Not strict JSON: each list ends with a comma.
    void AppendJSONString(std::ostream& stream) const;
    /// Writes the JSON text to a file. `openMode`: 1 append, 2 at the end, 4 binary, 8 also input,
    /// 32 truncate, or 0. A file that cannot be written is not reported.
    void WriteAnalysisResultToFile(const std::string& path, unsigned openMode) const;

private:
    /// Looks at the steps one by one in a test.
    friend struct CHarmonicAnalyseSteps;

    /// Whether a tonic progression begins at a chord, its center, and where it begins.
    struct CFoundHarmCenter {
        bool mFound = false;
        CHarmCenterLite mHarmCenter;
        CHarmAnlsChords::const_iterator mChord;
    };

    void _FillAnalyserWithSignKeysAndChords(const CHarmAnlsSignKeys& signKeys,
                                            const CHarmAnlsChords& chords);
    void _FillAnalyserWithSignKeysAndChordString(const CHarmAnlsSignKeys& signKeys,
                                                 std::string_view text,
                                                 const TChordStringParse& parse);
    void _FillAnalyserWithSignKeysOrCreateDefault(const CHarmAnlsSignKeys& signKeys);

    /// The route of `analyse`, and then the weights; nothing without a route.
    void _FindAndInsertHarmCenters(TAnalyse analyse);
    void _FindAndInsertHarmCentersUsingTonicProgressions(TOnlyUndefCenters onlyUndef);
    void _FindAndInsertHarmCenterUsingTonicProgressions_ForSignKey(CHarmAnlsSignKey& signKey,
                                                                   TOnlyUndefCenters onlyUndef);
    void _FindAndInsertHarmCentersUsingCadenceProgressions(TOnlyUndefCenters onlyUndef);
    void _FindAndInsertHarmCentersUsingCadenceProgression_ForSignKey(CHarmAnlsSignKey& signKey,
                                                                     TOnlyUndefCenters onlyUndef);
    /// The settings are not read: the weights always work with fixed ones.
    void _FindAndInsertHarmCentersUsingCenterWeightAnalysis(
        const CHarmCenterWeightAnalysisParams& params, TOnlyUndefCenters onlyUndef);
    /// The sign key is not read.
    [[nodiscard]] CFoundHarmCenter _FindHarmCenterViaTonicProgression(
        CHarmAnlsChords::const_iterator chord, const CHarmAnlsChords& chords,
        const CHarmAnlsSignKey& signKey) const;
    /// Grows first..last (both chords of `chords`) over the chords that fit the center; `last`
    /// ends one behind the range.
    void _ExtendRangeOfHarmCenter(const CHarmCenterLite& center, const CHarmAnlsChords& chords,
                                  CHarmAnlsChords::const_iterator& first,
                                  CHarmAnlsChords::const_iterator& last) const;

    void _MergeAdjacentSameSignKeys();
    void _MergeAdjacentSameHarmCenters();
    void _FillSignKeysAndCentersAndSetHarmFunctions();
};

/// Writes the JSON text, for debugging.
std::ostream& operator<<(std::ostream& stream, const CHarmonicAnalyse& analyse);

}  // namespace brindle
