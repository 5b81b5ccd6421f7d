// SPDX-License-Identifier: MIT
#include "brindle/present/Explain.h"

#include "brindle/platform/Localization.h"
#include "brindle/present/CTable.h"
#include "brindle/present/ShownText.h"
#include "brindle/present/TonalityName.h"
#include "brindle/present/internal/CChordsAround.h"
#include "brindle/present/internal/ReadingBars.h"
#include "brindle/present/internal/Sentences.h"
#include "brindle/theory/KeyIntervals.h"

#include <fmt/format.h>

#include <algorithm>
#include <string_view>

namespace brindle {
namespace {

/// The ways in which a chord that wants to go somewhere gets there, or not. In the order of the
/// sentences of a kind.
enum TWay : std::uint8_t {
    TWay_Untold,
    TWay_Followed,
    TWay_OtherThird,
    TWay_Later,
    TWay_OfDominant,
    TWay_Elsewhere,
    TWay_Unresolved,
};

constexpr bool AreInOrder(TSentence first, TSentence unresolved) {
    return static_cast<int>(unresolved) - static_cast<int>(first) == TWay_Unresolved;
}
static_assert(AreInOrder(TSentence_Dominant, TSentence_DominantUnresolved));
static_assert(AreInOrder(TSentence_Substitute, TSentence_SubstituteUnresolved));
static_assert(AreInOrder(TSentence_LeadingTone, TSentence_LeadingToneUnresolved));

/// One chord, and which sentence is true of it.
class CChordToExplain {
public:
    CChordToExplain(const CChordsAround& around, std::size_t ix)
        : mAround(around), mIx(ix), mReading(around.Reading(ix)), mServed(ServedKey(mReading)) {}

    [[nodiscard]] TSentence Sentence() const;
    /// What stands for a word in braces; empty for an unknown one.
    [[nodiscard]] std::string Word(std::string_view name) const;

private:
    [[nodiscard]] std::ptrdiff_t Target() const { return mReading.mResolvesTo; }
    [[nodiscard]] std::ptrdiff_t Next() const { return mAround.Next(mIx); }
    [[nodiscard]] int Tonic() const { return mReading.mKey.mRootKeyEnh.mKeyNr; }
    [[nodiscard]] int ServedRoot() const { return mServed.mRootKeyEnh.mKeyNr; }
    [[nodiscard]] bool HasTarget() const { return Target() >= 0; }
    [[nodiscard]] bool IsTargetNext() const { return HasTarget() && Target() == Next(); }
    [[nodiscard]] bool IsAtTarget(TChordRelation relation) const {
        return HasTarget() &&
               mAround.Reading(static_cast<std::size_t>(Target())).mRelation == relation;
    }
    [[nodiscard]] bool IsTargetTonic() const {
        return HasTarget() && mAround.Root(Target()) == Tonic();
    }

    [[nodiscard]] TWay Way() const;
    [[nodiscard]] TWay WayToServed() const;
    [[nodiscard]] TSentence Leading(TSentence plain) const {
        return static_cast<TSentence>(static_cast<int>(plain) + Way());
    }
    [[nodiscard]] TSentence ByFunction() const;
    [[nodiscard]] TSentence Dominant() const;
    [[nodiscard]] TSentence Second() const;
    [[nodiscard]] TSentence Passing() const;
    [[nodiscard]] TSentence Plagal() const;
    [[nodiscard]] TSentence AugmentedSixth() const;
    [[nodiscard]] TSentence LineCliche() const;

    const CChordsAround& mAround;
    std::size_t mIx;
    const CChordReading& mReading;
    CSignKeyLite mServed;
};

// To the next chord, which has the root that is served: C or Cm behind G7.
TWay CChordToExplain::WayToServed() const {
    const bool isDominant =
        IsAtTarget(TChordRelation_Dominant) || IsAtTarget(TChordRelation_SubstituteDominant);
    if (IsTargetNext() && isDominant) return TWay_OfDominant;
    return mAround.HasOtherThird(Next(), mServed) ? TWay_OtherThird : TWay_Followed;
}

TWay CChordToExplain::Way() const {
    const bool isNextServed = Next() >= 0 && mAround.Root(Next()) == ServedRoot();
    if (isNextServed) return WayToServed();
    if (IsTargetNext()) return TWay_Elsewhere;
    if (HasTarget()) return mAround.Root(Target()) == ServedRoot() ? TWay_Later : TWay_Untold;
    return mReading.mServes.IsTonic() ? TWay_Untold : TWay_Unresolved;
}

TSentence CChordToExplain::ByFunction() const {
    switch (mReading.mFunction) {
        case THarmFunction_Tonic:
            return TSentence_TonicFunction;
        case THarmFunction_Subdominant:
            return TSentence_SubdominantFunction;
        case THarmFunction_Dominant:
            return TSentence_DominantFunction;
        case THarmFunction_None:
        case THarmFunction_Undef:
            break;
    }
    return TSentence_NoFunction;
}

TSentence CChordToExplain::Dominant() const {
    const bool isSixFour =
        mReading.mServes.IsTonic() && mAround.Root(static_cast<std::ptrdiff_t>(mIx)) == Tonic();
    if (isSixFour) return HasTarget() ? TSentence_SixFour : ByFunction();
    if (mReading.mDeceptive && Next() >= 0) return TSentence_Deceptive;
    return Leading(TSentence_Dominant);
}

TSentence CChordToExplain::Second() const {
    if (!HasTarget()) return ByFunction();
    const int up = FoldIntoOctave(mAround.Root(static_cast<std::ptrdiff_t>(mIx)) - ServedRoot());
    if (up != 2) return TSentence_RelatedSecond;
    return IsAtTarget(TChordRelation_SubstituteDominant) ? TSentence_SecondOfSubstitute
                                                         : TSentence_SecondOfDominant;
}

TSentence CChordToExplain::Passing() const {
    const std::ptrdiff_t previous = mAround.Previous(mIx);
    if (Next() < 0) return TSentence_Passing;
    if (previous < 0) return TSentence_PassingTo;
    const int bass = mAround.Bass(static_cast<std::ptrdiff_t>(mIx));
    const int step = FoldIntoOctave(mAround.Bass(Next()) - bass);
    const int stepBefore = FoldIntoOctave(bass - mAround.Bass(previous));
    const bool isBySteps = step == stepBefore && (step == 1 || step == 11);
    return isBySteps ? TSentence_PassingBySteps : TSentence_PassingTo;
}

TSentence CChordToExplain::Plagal() const {
    // Over a cadential six-four chord the dominant is there already.
    if (!IsTargetTonic() || IsAtTarget(TChordRelation_Dominant)) return TSentence_Subdominant;
    return IsTargetNext() ? TSentence_Plagal : TSentence_PlagalLater;
}

TSentence CChordToExplain::AugmentedSixth() const {
    switch (mAround.SixthChord(mIx)) {
        case TSixthChord_French:
            return HasTarget() ? TSentence_FrenchSixthTo : TSentence_FrenchSixth;
        case TSixthChord_Italian:
            return HasTarget() ? TSentence_ItalianSixthTo : TSentence_ItalianSixth;
        case TSixthChord_German:
            break;
    }
    return HasTarget() ? TSentence_GermanSixthTo : TSentence_GermanSixth;
}

TSentence CChordToExplain::LineCliche() const {
    const std::ptrdiff_t previous = mAround.Previous(mIx);
    const bool isKept =
        previous >= 0 && mAround.Root(previous) == mAround.Root(static_cast<std::ptrdiff_t>(mIx));
    return isKept ? TSentence_LineCliche : TSentence_LineClicheBegin;
}

TSentence CChordToExplain::Sentence() const {
    switch (mReading.mRelation) {
        case TChordRelation_Undef:
        case TChordRelation_None:
            return ByFunction();
        case TChordRelation_Tonic:
            return TSentence_Tonic;
        case TChordRelation_Dominant:
            return Dominant();
        case TChordRelation_RelatedSecond:
            return Second();
        case TChordRelation_SubstituteDominant:
            return Leading(TSentence_Substitute);
        case TChordRelation_LeadingDiminished:
            return Leading(TSentence_LeadingTone);
        case TChordRelation_PassingDiminished:
            return Passing();
        case TChordRelation_CommonToneDiminished:
            return Next() >= 0 ? TSentence_CommonTone : TSentence_NoFunction;
        case TChordRelation_Backdoor:
            if (!HasTarget()) return ByFunction();
            return mReading.mFunction == THarmFunction_Dominant ? TSentence_BackdoorDominant
                                                                : TSentence_BackdoorSecond;
        case TChordRelation_Plagal:
            return Plagal();
        case TChordRelation_Borrowed:
            return TSentence_Borrowed;
        case TChordRelation_ChromaticMediant:
            return TSentence_ChromaticMediant;
        case TChordRelation_Neapolitan:
            return mAround.IsNeapolitanSixth(mIx) ? TSentence_NeapolitanSixth
                                                  : TSentence_Neapolitan;
        case TChordRelation_AugmentedSixth:
            return AugmentedSixth();
        case TChordRelation_Blues:
            return mReading.mFunction == THarmFunction_Tonic ? TSentence_BluesTonic
                                                             : TSentence_BluesSubdominant;
        case TChordRelation_LineCliche:
            return LineCliche();
    }
    return ByFunction();
}

/// The major key of a minor one on the same root, and back.
CSignKeyLite OtherTypeOf(const CSignKeyLite& key) {
    const bool isMinor = key.mSignKeyType == TSignKeyType_Minor;
    return {key.mRootKeyEnh, isMinor ? TSignKeyType_Major : TSignKeyType_Minor};
}

std::string CChordToExplain::Word(std::string_view name) const {
    if (name == "chord") return mAround.Symbol(static_cast<std::ptrdiff_t>(mIx));
    if (name == "numeral") return mReading.mNumeral;
    if (name == "key") return TonalityName(mReading.mKey);
    if (name == "served") return TonalityName(mServed);
    if (name == "parallel") return TonalityName(OtherTypeOf(mReading.mKey));
    if (name == "target") return mAround.Symbol(Target());
    if (name == "previous") return mAround.Symbol(mAround.Previous(mIx));
    if (name == "next") return mAround.Symbol(Next());
    return {};
}

/// The pattern with the words in braces filled in.
std::string Filled(std::string_view pattern, const CChordToExplain& chord) {
    std::string text;
    while (!pattern.empty()) {
        const std::size_t open = pattern.find('{');
        const std::size_t close = pattern.find('}', open);
        if (close == pattern.npos) break;
        text += pattern.substr(0, open);
        text += chord.Word(pattern.substr(open + 1, close - open - 1));
        pattern.remove_prefix(close + 1);
    }
    return text += pattern;
}

}  // namespace

std::vector<std::string> Explain(const CSong& song, const CSongReading& reading) {
    const CChordsAround around(song, reading);
    std::vector<std::string> sentences(song.mChords.size());
    for (std::size_t ix = 0; ix < sentences.size(); ++ix) {
        if (!around.HasChord(ix)) continue;
        const CChordToExplain chord(around, ix);
        const std::string english(SentenceOf(chord.Sentence()));
        sentences[ix] = Filled(LocalizedString(english), chord);
    }
    return sentences;
}

std::string ExplanationsText(const CSong& song, const std::vector<std::string>& sentences,
                             const CPaint& paint) {
    const bool hasAny = std::any_of(sentences.begin(), sentences.end(),
                                    [](const std::string& sentence) { return !sentence.empty(); });
    if (!hasAny) return {};
    const CBars bars = BarsOfSong(song);
    CTable table({" bar", "what each chord does"});
    std::string_view before;
    for (std::size_t ix = 0; ix < sentences.size(); ++ix) {
        if (sentences[ix].empty() || sentences[ix] == before) continue;
        before = sentences[ix];
        table.AddRow(
            {fmt::format("{}", bars.BarOf(song.mChords[ix].mPosition)), Printable(sentences[ix])});
    }
    return '\n' + table.Text(paint);
}

}  // namespace brindle
