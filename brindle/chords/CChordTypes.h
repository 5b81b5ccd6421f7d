// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CIntvlSet.h"

#include <cstdint>
#include <string>
#include <utility>
#include <vector>

namespace brindle {

class CChordHeavy;

/// What identifies a chord type in stored data. The numbers never change and have gaps.
using CChordTypeId = std::int32_t;

/// A named chord shape that a user picks from a list.
struct CChordType {
    CChordTypeId mId = 0;  ///< see CChordTypeId; 0 for none
    std::string mName;     ///< in English, "minor 7 b5"
    /// Above the root; a ninth (14) is not a second (2).
    CIntvlSet mIntvls;
    /// 0; for the host.
    int mHostValue = 0;

    CChordType() = default;
    /// A type of these fields; the host value is 0.
    CChordType(CChordTypeId id, std::string name, CIntvlSet intvls)
        : mId(id), mName(std::move(name)), mIntvls(std::move(intvls)) {}
};

/// A list of chord types. Its functions give the first row that fits, or the end.
class CChordTypeVec : public std::vector<CChordType> {
public:
    using std::vector<CChordType>::vector;

    /// The row with this id.
    [[nodiscard]] const_iterator FindChordTypeForId(CChordTypeId id) const;
    /// The same, to change it.
    [[nodiscard]] iterator FindChordTypeForId(CChordTypeId id);
    /// Exactly these intervals, not folded into the octave.
    [[nodiscard]] const_iterator FindChordTypeForIntvls(const CIntvlSet& intvls) const;
};

/// Which of the two lists of CChordTypes a row is in.
enum TChordTypeVec : std::int32_t {
    TChordTypeVec_None = 0,     ///< in neither
    TChordTypeVec_BuiltIn = 1,  ///< the rows that are always there
    TChordTypeVec_User = 2,     ///< the rows of the host
};

/// The catalogue of chord types: the built-in rows in a fixed order, and the rows of the host.
class CChordTypes {
public:
    /// A list and a row of it. The row means nothing when the list is TChordTypeVec_None.
    using TFound = std::pair<TChordTypeVec, CChordTypeVec::const_iterator>;

    /// The 30 built-in rows and no user rows.
    CChordTypes();

    /// The rows that are always there.
    [[nodiscard]] const CChordTypeVec& BuiltIn() const { return mBuiltIn; }
    /// The rows of the host.
    [[nodiscard]] const CChordTypeVec& User() const { return mUser; }
    /// The same, to change them.
    [[nodiscard]] CChordTypeVec& User() { return mUser; }

    /// The row with an id; the end of the list if there is none.
    [[nodiscard]] CChordTypeVec::const_iterator ChordTypeBuiltInFromId(CChordTypeId id) const;
    /// The same among the rows of the host.
    [[nodiscard]] CChordTypeVec::iterator ChordTypeUserFromId(CChordTypeId id);
    /// The same, to read it only.
    [[nodiscard]] CChordTypeVec::const_iterator ChordTypeUserFromId(CChordTypeId id) const;

    // These look in the built-in rows first.

    /// The row with this id.
    [[nodiscard]] TFound ChordTypeFromId(CChordTypeId id) const;
    /// The row of exactly these intervals, not folded into the octave.
    [[nodiscard]] TFound FindChordTypeVecAndChordTypeFromIntvls(const CIntvlSet& intvls) const;
    /// The row of the intervals of a chord, as its wrap interval counts them.
    [[nodiscard]] TFound FindChordTypeVecAndChordTypeFromChord(const CChordHeavy& chord) const;

private:
    [[nodiscard]] TFound _Found(CChordTypeVec::const_iterator builtIn,
                                CChordTypeVec::const_iterator user) const;

    CChordTypeVec mBuiltIn;
    CChordTypeVec mUser;
};

/// The one catalogue of the program. A host may add user rows; nothing locks it.
[[nodiscard]] CChordTypes& _s_chordTypes();

}  // namespace brindle
