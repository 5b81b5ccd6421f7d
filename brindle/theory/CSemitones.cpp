// SPDX-License-Identifier: MIT
#include "brindle/theory/CSemitones.h"

#include "brindle/platform/PlainText.h"
#include "brindle/theory/CIntvlSet.h"

#include <optional>
#include <ostream>

namespace brindle {

namespace {

/// Whether the search for the nearest member goes down; none for an unknown direction.
std::optional<bool> GoesLeft(TQuantizeDirection direction, int stepsLeft, int stepsRight) {
    switch (direction) {
        case TQuantizeDirection_ClosestTieRight:
            return stepsLeft < stepsRight;
        case TQuantizeDirection_ClosestTieLeft:
            return stepsLeft <= stepsRight;
        case TQuantizeDirection_Right:
            return false;
        case TQuantizeDirection_Left:
            return true;
    }
    return std::nullopt;
}

}  // namespace

bool CSemitones::HasTheseOrMoreIntvls(const CIntvlSet& intvls) const {
    return !intvls.empty() &&
           std::all_of(intvls.begin(), intvls.end(), [this](int intvl) { return HasIntvl(intvl); });
}

bool CSemitones::HasExactlyTheseIntvls(const CIntvlSet& intvls) const {
    return intvls.size() == static_cast<std::size_t>(size()) && HasTheseOrMoreIntvls(intvls);
}

CIntvlSet CSemitones::IntvlSet() const {
    CIntvlSet intvls;
    intvls.SetFromSemitones(*this);
    intvls.SetWrapIntvl(12);
    return intvls;
}

int CSemitones::QuantizeToActiveSemitonesAsIntvl(int ix, TQuantizeSemitonesOptions options) const {
    const std::uint64_t octave = mMask & kOctaveMask;
    if (octave == 0 || ix < 0 || ix > 11) return kIntvlUndef;
    if (HasIntvl(ix)) return 0;

    CSemitones fromIx = *this;
    fromIx.RotateRootToIx(ix);
    const int stepsRight = std::countr_zero(fromIx.Mask());
    const int stepsLeft = 13 - static_cast<int>(std::bit_width(fromIx.Mask()));
    const std::optional<bool> left = GoesLeft(options.mDirection, stepsLeft, stepsRight);
    if (!left) return kIntvlUndef;

    const int intvl = *left ? -stepsLeft : stepsRight;
    switch (options.mWrapAtOctave) {
        case TWrapAtOctave_No:
            return intvl;
        case TWrapAtOctave_Yes:
            return FoldIntoOctave(ix + intvl) - ix;
    }
    return kIntvlUndef;
}

int CSemitones::QuantizeToActiveSemitonwAsIndex(int ix, TQuantizeDirection direction) const {
    const int intvl = QuantizeToActiveSemitonesAsIntvl(ix, {direction, TWrapAtOctave_Yes});
    return intvl == kIntvlUndef ? ix : ix + intvl;
}

void CSemitones::AddIntvls(const CIntvlSet& intvls) {
    for (const int intvl : intvls) AddIntvl(intvl);
}

void CSemitones::EraseIntvls(const CIntvlSet& intvls) {
    for (const int intvl : intvls) EraseIntvl(intvl);
}

void CSemitones::SetFromIntvlSet(const CIntvlSet& intvls) {
    Reset();
    AddIntvls(intvls);
}

std::uint64_t CSemitones::VectorBoolToInt(const std::vector<bool>& bits) {
    std::uint64_t mask = 0;
    for (std::size_t n = 0; n < bits.size() && n < 64; ++n) {
        mask |= std::uint64_t{bits[n]} << n;
    }
    return mask;
}

void CSemitones::ToVectorBool(std::vector<bool>& out) const {
    if (mMask > 4096) return;
    out.resize(12);
    for (std::size_t n = 0; n < 12; ++n) out[n] = (mMask >> n & 1) != 0;
}

void CSemitones::AppendJSONString(std::ostream& stream) const {
    char list[] = "[0,0,0,0,0,0,0,0,0,0,0,0]";
    for (int ix = 0; ix < 12; ++ix) {
        if (HasIntvl(ix)) list[1 + 2 * ix] = '1';
    }
    PlainText::Write(stream, list);
}

std::ostream& operator<<(std::ostream& stream, const CSemitones& semitones) {
    return stream << semitones.Mask();
}

}  // namespace brindle
