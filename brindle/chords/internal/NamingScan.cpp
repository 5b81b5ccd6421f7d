// SPDX-License-Identifier: MIT
// How notes are named. Over each of the twelve roots they are held against 95 chord types; a type
// fits if it has all their tones and lacks none that it cannot do without. Its cost says how rare
// it is over that bass, what is left out, and how rare such a chord is in the key and beside its
// neighbours. What fits no type is spelled out. If the bass is foreign to the chord, the notes
// above it are named as well. Costs are tenths of -log2 of a share, so that they may be added.
#include "brindle/chords/internal/NamingScan.h"
#include "brindle/chords/internal/SpelledOutChord.h"

#include <algorithm>
#include <bit>

namespace brindle {
namespace {

constexpr int kBassAtMost = 100;
constexpr int kForeignBass = 17;
constexpr int kNoExtension = 5;
constexpr int kNoFifth = 27;
constexpr int kNoThird = 75;
constexpr int kNoRoot = 60;
constexpr int kSpelledOut = 100;
constexpr int kOption = 20;
constexpr int kSpelledOutOverBass = 20;
constexpr int kImpossible = 1'000'000;
constexpr TToneMask kRoot = 0x001;
constexpr TToneMask kTonesOfFifth = 0x080;
constexpr TToneMask kOctave = 0xFFF;

constexpr int OfCommonness(int cost) {
    return cost * 4 / 10;
}

/// A set of types: bit n of word w is type 64 w + n.
struct CTypeSet {
    std::array<std::uint64_t, 2> mWords{};

    constexpr void Insert(std::size_t type) { mWords[type / 64] |= std::uint64_t{1} << type % 64; }
    friend constexpr CTypeSet operator&(const CTypeSet& a, const CTypeSet& b) {
        return {{a.mWords[0] & b.mWords[0], a.mWords[1] & b.mWords[1]}};
    }
};
static_assert(kNamingTypes.size() <= 128);

/// The types that fit six tones, for each set of the tones 0 to 5 and of the tones 6 to 11. What is
/// in the sets of both halves fits them all, so that a search looks at few types.
constexpr auto kTypesOfHalf = [] {
    std::array<std::array<CTypeSet, 64>, 2> halves{};
    for (std::size_t type = 0; type < kNamingTypes.size(); ++type) {
        const TToneMask mine = kNamingTypes[type].mTones;
        const TToneMask needed = NeededTones(kNamingTypes[type]);
        for (unsigned half = 0; half < 2; ++half) {
            const TToneMask foreign = ~mine >> 6 * half & 63U;
            const TToneMask neededHere = needed >> 6 * half & 63U;
            for (TToneMask tones = 0; tones < 64; ++tones) {
                const bool fits = (tones & foreign) == 0 && (neededHere & ~tones) == 0;
                if (fits) halves[half][tones].Insert(type);
            }
        }
    }
    return halves;
}();

CTypeSet TypesThatFit(TToneMask tones) {
    return kTypesOfHalf[0][tones & 63U] & kTypesOfHalf[1][tones >> 6];
}

constexpr TToneMask TonesAbove(int root, TToneMask keys) {
    return (keys >> root | keys << (12 - root)) & kOctave;
}

/// What it costs that a type which fits does not sound as a whole. `sounding` tones do.
int CostOfLeftOut(const CNamingType& type, TToneMask tones, int sounding) {
    TToneMask gone = type.mTones & ~tones;
    if (gone == 0) return 0;
    if (sounding < 2) return kImpossible;
    int cost = 0;
    for (TToneMask left = gone & type.mOptional; left != 0; left &= left - 1) cost += kNoExtension;
    gone &= ~type.mOptional;
    const bool hasRoot = (gone & kRoot) == 0;
    if (!hasRoot) cost += sounding < 3 ? kImpossible : kNoRoot;
    if (HasTone(gone, type.mThird)) cost += hasRoot ? kNoThird : kImpossible;
    if ((gone & kTonesOfFifth) != 0) {
        const bool isTooLittle = sounding == 2 && type.mThird < 0;
        cost += isTooLittle ? kImpossible : kNoFifth;
    }
    return cost;
}

class CScan {
public:
    CScan(const CNoteKeys& keys, const CNamingOptions& options)
        : mOptions(options),
          mHasContext(!options.mKey.IsUndef() || options.mPreviousRoot != kKeyNrUndef ||
                      options.mNextRoot != kKeyNrUndef),
          mBass(keys.mBass) {
        for (int root = 0; root < 12; ++root) {
            const int rootAboveBass = FoldIntoOctave(root - mBass);
            mBest[static_cast<std::size_t>(root)] = {.mCost = kImpossible,
                                                     .mIsInverted = rootAboveBass != 0,
                                                     .mRootAboveBass = rootAboveBass,
                                                     .mRoot = root};
        }
        const bool isBassOnly = options.mBass == TBassUse::Only && keys.mAbove != 0;
        const TToneMask withoutBass = keys.mAll & ~(TToneMask{1} << mBass);
        const bool isOneSet = isBassOnly || options.mBass == TBassUse::None || withoutBass == 0;
        mIsBassOpen = isBassOnly || options.mBass == TBassUse::None;
        Look(isBassOnly ? keys.mAbove : keys.mAll, false);
        if (!isOneSet) Look(withoutBass, true);
    }

    [[nodiscard]] const std::array<CNamingCandidate, 12>& Best() const { return mBest; }

private:
    void Look(TToneMask keys, bool isForeign) {
        mSounding = std::popcount(keys);
        for (int root = 0; root < 12; ++root) LookOver(root, TonesAbove(root, keys), isForeign);
    }

    void LookOver(int root, TToneMask tones, bool isForeign) {
        CNamingCandidate& best = mBest[static_cast<std::size_t>(root)];
        const int bass = FoldIntoOctave(mBass - root);
        const int base =
            mOptions.mRootCosts[static_cast<std::size_t>(root)] + (isForeign ? kForeignBass : 0);
        const TToneMask shunned = isForeign ? TToneMask{1} << bass : 0;
        const CTypeSet types = TypesThatFit(tones);
        for (std::size_t word = 0; word < 2; ++word) {
            for (std::uint64_t left = types.mWords[word]; left != 0; left &= left - 1) {
                const std::size_t ix = word * 64 + static_cast<std::size_t>(std::countr_zero(left));
                const CNamingType& type = kNamingTypes[ix];
                if ((type.mTones & shunned) != 0) continue;
                const int cost = base + Rarity(ix, bass) + CostOfLeftOut(type, tones, mSounding);
                Offer(best, tones, static_cast<int>(ix), cost);
            }
        }
        const bool isPossible = (tones & kRoot) != 0 && base + kSpelledOut <= best.mCost;
        if (isPossible) Offer(best, tones, kSpelledOutType, base + CostOfSpelledOut(tones, bass));
    }

    /// `cost` is without that of the context.
    void Offer(CNamingCandidate& best, TToneMask tones, int type, int cost) const {
        if (cost > best.mCost) return;
        CNamingCandidate offer = best;
        offer.mType = type;
        offer.mTones = tones;
        offer.mCost = cost + (mHasContext ? CostOfContext(offer) : 0);
        if (offer.mCost < best.mCost || (offer.mCost == best.mCost && type < best.mType)) {
            best = offer;
        }
    }

    [[nodiscard]] int Rarity(std::size_t type, int bass) const {
        const CNamingTypeRow& row = kNamingTypeRows[type];
        if (mIsBassOpen) return OfCommonness(row.mCost);
        return OfCommonness(std::min<int>(row.mCostOverBass[static_cast<std::size_t>(bass)],
                                          row.mCost + kBassAtMost));
    }

    [[nodiscard]] int CostOfSpelledOut(TToneMask tones, int bass) const {
        const bool isOverBass = bass != 0 && mOptions.mBass != TBassUse::None;
        return kSpelledOut + kOption * CSpelledOutChord(tones).OptionsCount() +
               (isOverBass ? kSpelledOutOverBass : 0);
    }

    [[nodiscard]] int CostOfContext(const CNamingCandidate& offer) const {
        const bool hasNext = mOptions.mNextRoot != kKeyNrUndef;
        const bool hasPrevious = mOptions.mPreviousRoot != kKeyNrUndef;
        // One neighbour alone tells little.
        const int weight = hasNext && hasPrevious ? 8 : 2;
        const auto motion = [&](int tableCost) { return tableCost * weight / 10; };
        int cost = CostInKey(offer);
        if (hasNext) cost += motion(NextRootCost(offer, mOptions.mNextRoot));
        if (hasPrevious) cost += motion(PreviousRootCost(offer, mOptions.mPreviousRoot));
        return cost;
    }

    [[nodiscard]] int CostInKey(const CNamingCandidate& offer) const {
        if (mOptions.mKey.IsUndef()) return 0;
        const bool isMinor = mOptions.mKey.mSignKeyType == TSignKeyType_Minor;
        const int degree = FoldIntoOctave(offer.mRoot - mOptions.mKey.mRootKeyEnh.mKeyNr);
        const auto& table = isMinor ? kMinorKeyCosts : kMajorKeyCosts;
        return table[offer.Family()][static_cast<std::size_t>(degree)] * 4 / 10;
    }

    const CNamingOptions& mOptions;
    bool mHasContext;
    int mBass;
    bool mIsBassOpen = false;
    int mSounding = 0;
    std::array<CNamingCandidate, 12> mBest;
};

}  // namespace

CNoteKeys NoteKeysOf(std::span<const CNote> notes) {
    CNoteKeys keys;
    std::int64_t lowest = -1;
    for (const CNote& note : notes) {
        if (note.IsUndef()) continue;
        const TToneMask key = TToneMask{1} << note.KeyNr();
        keys.mAll |= key;
        if (lowest >= 0 && note.mNoteNr == lowest) continue;
        if (lowest < 0 || note.mNoteNr < lowest) {
            if (lowest >= 0) keys.mAbove |= TToneMask{1} << keys.mBass;
            lowest = note.mNoteNr;
            keys.mBass = note.KeyNr();
        } else {
            keys.mAbove |= key;
        }
    }
    return keys;
}

CNamingCandidates::CNamingCandidates(const CNoteKeys& keys, const CNamingOptions& options) {
    if (keys.mAll == 0) return;
    const CScan scan(keys, options);
    for (const CNamingCandidate& candidate : scan.Best()) {
        if (candidate.mCost < kImpossible) mCandidates[mCount++] = candidate;
    }
    std::sort(mCandidates.begin(), mCandidates.begin() + static_cast<std::ptrdiff_t>(mCount));
}

int NextRootCost(const CNamingCandidate& chord, int nextRoot) {
    const int step = FoldIntoOctave(nextRoot - chord.mRoot);
    return kNextRootCosts[chord.Family()][static_cast<std::size_t>(step)];
}

int PreviousRootCost(const CNamingCandidate& chord, int previousRoot) {
    const int step = FoldIntoOctave(chord.mRoot - previousRoot);
    return kPreviousRootCosts[chord.Family()][static_cast<std::size_t>(step)];
}

}  // namespace brindle
