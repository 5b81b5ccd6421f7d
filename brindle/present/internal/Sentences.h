// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

namespace brindle {

/// The sentences that explain chords. A new one gets its translations in data/locale.
enum TSentence : std::uint8_t {
    TSentence_Tonic,
    TSentence_TonicFunction,
    TSentence_SubdominantFunction,
    TSentence_DominantFunction,
    TSentence_NoFunction,
    TSentence_SixFour,
    TSentence_Deceptive,
    TSentence_Dominant,
    TSentence_DominantFollowed,
    TSentence_DominantLater,
    TSentence_DominantOfDominant,
    TSentence_DominantElsewhere,
    TSentence_DominantUnresolved,
    TSentence_Substitute,
    TSentence_SubstituteFollowed,
    TSentence_SubstituteLater,
    TSentence_SubstituteOfDominant,
    TSentence_SubstituteElsewhere,
    TSentence_SubstituteUnresolved,
    TSentence_LeadingTone,
    TSentence_LeadingToneFollowed,
    TSentence_LeadingToneLater,
    TSentence_LeadingToneOfDominant,
    TSentence_LeadingToneElsewhere,
    TSentence_LeadingToneUnresolved,
    TSentence_SecondOfDominant,
    TSentence_SecondOfSubstitute,
    TSentence_RelatedSecond,
    TSentence_PassingBySteps,
    TSentence_PassingTo,
    TSentence_Passing,
    TSentence_CommonTone,
    TSentence_BackdoorDominant,
    TSentence_BackdoorSecond,
    TSentence_Plagal,
    TSentence_PlagalLater,
    TSentence_Subdominant,
    TSentence_Borrowed,
    TSentence_ChromaticMediant,
    TSentence_Neapolitan,
    TSentence_NeapolitanSixth,
    TSentence_GermanSixth,
    TSentence_GermanSixthTo,
    TSentence_ItalianSixth,
    TSentence_ItalianSixthTo,
    TSentence_FrenchSixth,
    TSentence_FrenchSixthTo,
    TSentence_BluesTonic,
    TSentence_BluesSubdominant,
    TSentence_LineCliche,
    TSentence_LineClicheBegin,
};

/// In English, by TSentence; the keys of the catalogues. What stands in braces is filled in.
// clang-format off
inline constexpr auto kSentences = std::to_array<std::string_view>({
    "{chord} is the tonic of {key}.",
    "{chord} is {numeral} in {key}, with the function of a tonic.",
    "{chord} is {numeral} in {key}, with the function of a subdominant.",
    "{chord} is {numeral} in {key}, with the function of a dominant.",
    "{chord} is {numeral} in {key}.",
    "{chord} is a cadential six-four chord, which delays the dominant {target}.",
    "{chord} is the dominant of {served}, but {next} follows instead of the tonic: a deceptive cadence.",
    "{chord} is the dominant of {served}.",
    "{chord} is the dominant of {served}, which follows.",
    "{chord} is the dominant of {served} and resolves to {target} later.",
    "{chord} is the dominant of {target}, the next dominant.",
    "{chord} is the dominant of {served} and goes on to {target}.",
    "{chord} is the dominant of {served}, which does not follow.",
    "{chord} is the tritone substitute for the dominant of {served}.",
    "{chord} is the tritone substitute for the dominant of {served}, which follows.",
    "{chord} is the tritone substitute for the dominant of {served} and resolves to {target} later.",
    "{chord} is the tritone substitute for the dominant of {target}, the next dominant.",
    "{chord} is the tritone substitute for the dominant of {served} and goes on to {target}.",
    "{chord} is the tritone substitute for the dominant of {served}, which does not follow.",
    "{chord} is the leading-tone chord of {served}.",
    "{chord} is the leading-tone chord of {served}, which follows.",
    "{chord} is the leading-tone chord of {served} and resolves to {target} later.",
    "{chord} is the leading-tone chord of {target}, the next dominant.",
    "{chord} is the leading-tone chord of {served} and goes on to {target}.",
    "{chord} is the leading-tone chord of {served}, which does not follow.",
    "{chord} is the second degree of {served} and prepares the dominant {target}.",
    "{chord} is the second degree of {served} and prepares {target}, which stands in for the dominant.",
    "{chord} is the related second of {target}, a fifth above it.",
    "{chord} is a passing diminished chord: the bass moves by semitones from {previous} to {next}.",
    "{chord} is a passing diminished chord on the way to {next}.",
    "{chord} is a passing diminished chord.",
    "{chord} is a diminished chord that ornaments {next} and shares a tone with it.",
    "{chord} is the backdoor dominant of {key}, on the lowered seventh degree, and goes to {target}.",
    "{chord} is the minor fourth degree of {key} and prepares the backdoor dominant {target}.",
    "{chord} is the subdominant of {key} and moves to the tonic {target} without a dominant: a plagal step.",
    "{chord} is the subdominant of {key} and returns to the tonic {target} later.",
    "{chord} is the subdominant of {key}.",
    "{chord} is {numeral} in {key}, borrowed from {parallel}.",
    "{chord} is a chromatic mediant of {key}: its root lies a third from the tonic.",
    "{chord} is the Neapolitan chord of {key}, on the lowered second degree.",
    "{chord} is the Neapolitan sixth chord of {key}.",
    "{chord} is the German sixth of {served}.",
    "{chord} is the German sixth of {served} and opens to {target}.",
    "{chord} is the Italian sixth of {served}.",
    "{chord} is the Italian sixth of {served} and opens to {target}.",
    "{chord} is the French sixth of {served}.",
    "{chord} is the French sixth of {served} and opens to {target}.",
    "{chord} is the tonic of {key}, with the seventh of the blues, which needs no resolution.",
    "{chord} is the subdominant of {key}, with the seventh of the blues, which needs no resolution.",
    "{chord} keeps the root of {previous} while one voice moves.",
    "{chord} keeps its root in {next} while one voice moves.",
});
// clang-format on

[[nodiscard]] constexpr std::string_view SentenceOf(TSentence sentence) {
    return kSentences[static_cast<std::size_t>(sentence)];
}

}  // namespace brindle
