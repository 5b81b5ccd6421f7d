// SPDX-License-Identifier: MIT
#include "brindle/theory/CIntvlSet.h"

#include "brindle/theory/CSemitones.h"
#include "brindle/theory/KeyIntervals.h"

#include <cstdint>
#include <utility>

namespace brindle {

namespace {

/// The list up to the value that ends it.
std::span<const int> UpToEnd(std::span<const int> intvls) {
    const auto end = std::find_if(intvls.begin(), intvls.end(),
                                  [](int intvl) { return intvl < 0 || intvl > 127; });
    return intvls.first(static_cast<std::size_t>(end - intvls.begin()));
}

/// The true remainder, 0 to modulus - 1.
int Remainder(std::int64_t value, std::int64_t modulus) {
    return static_cast<int>((value % modulus + modulus) % modulus);
}

}  // namespace

bool CIntvlSet::HasIntvl(int intvl) const {
    return intvl != kIntvlUndef && contains(intvl);
}

bool CIntvlSet::HasIntvlInAnyOctave(int intvl) const {
    if (intvl == kIntvlUndef) return false;
    return std::any_of(begin(), end(), [&](int member) {
        return member >= 0 && member < mWrapIntvl &&
               FoldIntoOctave(member) == FoldIntoOctave(intvl);
    });
}

bool CIntvlSet::HasIntvls(std::span<const int> intvls) const {
    const auto listed = UpToEnd(intvls);
    return std::all_of(listed.begin(), listed.end(), [this](int intvl) { return HasIntvl(intvl); });
}

bool CIntvlSet::HasExactTheseIntvls(std::span<const int> intvls) const {
    CIntvlSet listed(intvls);
    listed.SetWrapIntvl(mWrapIntvl);
    return listed == *this && HasIntvls(intvls);
}

bool CIntvlSet::HasExactlyTheseIntvlsInAnyOctave(std::span<const int> intvls) const {
    const auto listed = UpToEnd(intvls);
    CIntvlSet listedSet(listed);
    listedSet.SetWrapIntvl(mWrapIntvl);
    const auto isHere = [this](int intvl) { return HasIntvlInAnyOctave(intvl); };
    const auto isListed = [&](int member) { return listedSet.HasIntvlInAnyOctave(member); };
    return std::all_of(listed.begin(), listed.end(), isHere) &&
           std::all_of(begin(), end(), isListed);
}

bool CIntvlSet::HasOtherStackedThirdsOptionThan(int option) const {
    constexpr CSemitones kStackedThirds{0, 3, 4, 7};
    return std::any_of(begin(), end(), [&](int member) {
        const int semitone = FoldIntoOctave(member);
        return !kStackedThirds.HasIntvl(semitone) && semitone != option;
    });
}

int CIntvlSet::Intvl(int n) const {
    if (n < 0 || static_cast<std::size_t>(n) >= size()) return kIntvlUndef;
    return *nth(static_cast<std::size_t>(n));
}

CIntvlSet CIntvlSet::Inversion(int n) const {
    if (size() < 2) return *this;
    const std::int64_t newRoot = Intvl(Remainder(n, static_cast<std::int64_t>(size())));
    const std::int64_t largest = *rbegin();
    const std::int64_t span = largest <= 12 ? 12 : (largest + 11) / 12 * 12;

    boost::container::small_vector<int, 24> turned;
    for (const int member : *this) turned.push_back(Remainder(member + span - newRoot, span));
    return CIntvlSet(CMySet<int>(turned.begin(), turned.end()));
}

CSemitones CIntvlSet::ToSemitones() const {
    CSemitones semitones;
    semitones.SetFromIntvlSet(*this);
    return semitones;
}

void CIntvlSet::SetIntvls(std::span<const int> intvls) {
    // No need to count to 128 members: there are only that many values.
    const auto listed = UpToEnd(intvls);
    CMySet<int>::operator=(CMySet<int>(listed.begin(), listed.end()));
}

void CIntvlSet::SetFromSemitones(CSemitones semitones) {
    clear();
    for (int semitone = 0; semitone < 12; ++semitone) {
        if (semitones.HasIntvl(semitone)) insert(end(), semitone);
    }
}

void CIntvlSet::SetWrapIntvl(int wrapIntvl) {
    mWrapIntvl = wrapIntvl;
    if (wrapIntvl < 1 || empty() || (*begin() >= 0 && *rbegin() < wrapIntvl)) return;
    auto members = extract_sequence();
    for (int& member : members) member = Remainder(member, wrapIntvl);
    CMySet<int>::operator=(CMySet<int>(members.begin(), members.end()));
}

void CIntvlSet::EraseIntvlInAnyOct(int intvl) {
    const auto isErased = [&](int member) {
        const bool isAbove = member > intvl && member <= mWrapIntvl;
        return member == intvl || (isAbove && (std::int64_t{member} - intvl) % 12 == 0);
    };
    auto members = extract_sequence();
    members.erase(std::remove_if(members.begin(), members.end(), isErased), members.end());
    adopt_sequence(boost::container::ordered_unique_range, std::move(members));
}

CIntvlSet ConvertKeyNrSetToIntvlSet(const CMySet<int>& keyNrs, int root) {
    if (root == kKeyNrUndef) return CIntvlSet(CMySet<int>(), 12);
    CMySet<int> intvls;
    for (const int keyNr : keyNrs) intvls.insert(FoldIntoOctave(std::int64_t{keyNr} - root));
    return CIntvlSet(intvls, 12);
}

CMySet<int> ConvertIntvlSetToKeyNrSet(const CIntvlSet& intvls, int root) {
    CMySet<int> keyNrs;
    if (root == kKeyNrUndef) return keyNrs;
    for (const int intvl : intvls) keyNrs.insert(FoldIntoOctave(std::int64_t{root} + intvl));
    return keyNrs;
}

}  // namespace brindle
