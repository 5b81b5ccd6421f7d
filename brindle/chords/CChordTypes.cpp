// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordTypes.h"
#include "brindle/chords/CChordHeavy.h"

#include <algorithm>

namespace brindle {

namespace {

// Kept: the eleventh and the thirteenth of the sevenths stand in the first octave, the ninths in
// the second. Look-ups find rows by exactly these intervals.
CChordTypeVec BuiltInRows() {
    // clang-format off
    return {
        //id  name            intervals
        {  1, "major",        {0, 4, 7}},
        {  9, "minor",        {0, 3, 7}},
        { 34, "sus2",         {0, 2, 7}},
        { 33, "sus4",         {0, 5, 7}},
        {  3, "7",            {0, 4, 7, 10}},
        {119, "7 b9",         {0, 4, 7, 10, 13}},
        {120, "7 #9",         {0, 4, 7, 10, 15}},
        {118, "7 11",         {0, 4, 5, 7, 10}},
        { 25, "7 13",         {0, 4, 7, 9, 10}},
        { 27, "7 b13",        {0, 4, 7, 8, 10}},
        { 28, "9",            {0, 4, 7, 10, 14}},
        {  5, "add9",         {0, 4, 7, 14}},
        {  2, "6",            {0, 4, 7, 9}},
        {  7, "6 add9",       {0, 4, 7, 9, 14}},
        { 20, "maj7",         {0, 4, 7, 11}},
        { 22, "maj7 b5",      {0, 4, 6, 11}},
        { 26, "maj7 b9",      {0, 4, 7, 11, 13}},
        {101, "maj7 b5 #9",   {0, 4, 6, 11, 15}},
        {121, "maj7 13",      {0, 4, 7, 9, 11}},
        { 11, "minor 7",      {0, 3, 7, 10}},
        { 12, "minor 7 b5",   {0, 3, 6, 10}},
        { 16, "minor maj7",   {0, 3, 7, 11}},
        { 13, "minor add9",   {0, 3, 7, 14}},
        { 10, "minor 6",      {0, 3, 7, 9}},
        {104, "minor 6 add9", {0, 3, 7, 9, 14}},
        {100, "minor b13",    {0, 3, 7, 8}},
        { 18, "dim",          {0, 3, 6}},
        { 19, "dim 7",        {0, 3, 6, 9}},
        {  8, "aug",          {0, 4, 8}},
        { 30, "aug 7",        {0, 4, 8, 10}},
    };
    // clang-format on
}

}  // namespace

CChordTypeVec::const_iterator CChordTypeVec::FindChordTypeForId(CChordTypeId id) const {
    return std::find_if(begin(), end(), [id](const CChordType& row) { return row.mId == id; });
}

CChordTypeVec::iterator CChordTypeVec::FindChordTypeForId(CChordTypeId id) {
    return std::find_if(begin(), end(), [id](const CChordType& row) { return row.mId == id; });
}

CChordTypeVec::const_iterator CChordTypeVec::FindChordTypeForIntvls(const CIntvlSet& intvls) const {
    return std::find_if(begin(), end(),
                        [&](const CChordType& row) { return row.mIntvls == intvls; });
}

CChordTypes::CChordTypes() : mBuiltIn(BuiltInRows()) {}

CChordTypeVec::const_iterator CChordTypes::ChordTypeBuiltInFromId(CChordTypeId id) const {
    return mBuiltIn.FindChordTypeForId(id);
}

CChordTypeVec::iterator CChordTypes::ChordTypeUserFromId(CChordTypeId id) {
    return mUser.FindChordTypeForId(id);
}

CChordTypeVec::const_iterator CChordTypes::ChordTypeUserFromId(CChordTypeId id) const {
    return mUser.FindChordTypeForId(id);
}

CChordTypes::TFound CChordTypes::ChordTypeFromId(CChordTypeId id) const {
    return _Found(ChordTypeBuiltInFromId(id), ChordTypeUserFromId(id));
}

CChordTypes::TFound CChordTypes::FindChordTypeVecAndChordTypeFromIntvls(
    const CIntvlSet& intvls) const {
    return _Found(mBuiltIn.FindChordTypeForIntvls(intvls), mUser.FindChordTypeForIntvls(intvls));
}

CChordTypes::TFound CChordTypes::FindChordTypeVecAndChordTypeFromChord(
    const CChordHeavy& chord) const {
    return FindChordTypeVecAndChordTypeFromIntvls(chord.IntvlSet());
}

CChordTypes::TFound CChordTypes::_Found(CChordTypeVec::const_iterator builtIn,
                                        CChordTypeVec::const_iterator user) const {
    if (builtIn != mBuiltIn.end()) return {TChordTypeVec_BuiltIn, builtIn};
    if (user != mUser.end()) return {TChordTypeVec_User, user};
    return {TChordTypeVec_None, user};
}

CChordTypes& _s_chordTypes() {
    static CChordTypes chordTypes;
    return chordTypes;
}

}  // namespace brindle
