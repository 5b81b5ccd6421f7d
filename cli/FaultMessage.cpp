// SPDX-License-Identifier: MIT
#include "cli/FaultMessage.h"

#include "cli/Message.h"

#include <algorithm>
#include <array>
#include <optional>
#include <vector>

namespace brindle::cli {
namespace {

/// What stands in {fault} is itself such a sentence.
constexpr std::string_view kInnerFault = "fault";

// Where two fit the first counts. The catalogues have each of them.
constexpr auto kFaultSentences = std::to_array<const char*>({
    // chord symbols
    "\"{text}\" at {place} is not understood",
    "\"{text}\" at {place} is not understood; a flat is a small b",
    "a chord begins with a note A to H, \"{text}\" at {place} is none",
    "the text is empty",
    "\"{text}\" at {place} is no degree of a chord (2 3 4 5 6 7 9 11 13)",
    "\"{text}\" at {place} is one accidental too many",
    "\"{text}\" at {place} needs a number behind it",
    "\"{text}\" at {place} needs a degree behind it",
    "\"{text}\" at {place} closes no bracket",
    "the slash at {place} has no bass note behind it",
    "\"{text}\" at {place} is no bass note",
    "\"{text}\" at {place}: a chord has one bass note, behind the last slash",
    "\"{text}\" at {place} begins a second chord",
    "this repeats a chord and is none by itself",
    // songs
    "\"{text}\" is not understood",
    "\"{text}\" is no length and chord, as in (4,C)",
    "\"{open}\" has no \"{close}\" behind it",
    "there is no bar before this one to repeat",
    "there are no two bars before to repeat",
    "there is no chord before this one",
    "there is no chorus before this one",
    "the choruses make the song too long",
    "its repeated lines make the song too long",
    "its repeats and jumps make the song too long to be played",
    "the song is too long",
    "there are no chords on this line to play again",
    "Do and Fa are D diminished and F augmented, not C and F",
    "there is no segno to go back to, so the song begins again",
    "there is no coda to go to",
    "no D.C. or D.S. plays this again, so nothing goes to the coda from here",
    "nothing tells where to leave for a coda, or there is none",
    "there is no Fine to stop at",
    "this stands behind no repeat and no line of chords",
    "an ending has a number from 1 to 63",
    "a chord is wanted with its length, and no repeat",
    "a time is written as in 3/4",
    "a tempo is a number of beats a minute",
    "bars and chords have a length above 0",
    "no chart stands here",
    "there is no such file",
    "there are no chords in it",
    "this is neither a text nor a score in MusicXML",
    // numerals
    "this is no degree",
    "this sign behind the degree is not understood",
    "what stands in brackets is not understood",
    "nothing is left of the chord",
    "this is too long for a numeral",
    "this is no chord",
    // keys, scales and notes
    "a key begins with a letter A to H, as in \"{text}\"",
    "behind the key stands major or minor, or nothing",
    "a scale begins with a letter A to H, as in \"{text}\"",
    "no scale of this name is known",
    "a note is a key and its octave, as in Eb4, or a number of 0 to 127",
    "behind the key stands its octave, not {text}",
    "{text} is outside of the notes 0 to 127",
    "a chord has at most {count} notes",
    "there are no notes",
    // wishes for songs
    "there is no such key",
    "{text} is neither a chord nor a numeral",
    "a form is letters from A to Z that share {count} bars evenly",
    "a blues has 12 bars, or 24, 36 and so on",
    "{count} bars are more than the {most} of the song",
    // any of these, with what it is about
    "{title}, character {place} of the chart: {fault}",
    "{text}: {fault}",
});

/// What stands in the places of a pattern where all the rest of a text is as it says.
std::optional<std::vector<CFilledPlace>> PlacesIn(std::string_view text, std::string_view pattern) {
    std::vector<CFilledPlace> places;
    while (true) {
        const std::size_t open = pattern.find('{');
        const std::string_view before = pattern.substr(0, open);
        if (!text.starts_with(before)) return std::nullopt;
        text.remove_prefix(before.size());
        if (open == pattern.npos) break;
        pattern.remove_prefix(open);
        const std::size_t close = pattern.find('}');
        const std::string_view name = pattern.substr(1, close - 1);
        pattern.remove_prefix(close + 1);
        const std::string_view behind = pattern.substr(0, pattern.find('{'));
        const bool isLast = behind.size() == pattern.size();
        const std::size_t end =
            isLast ? text.size() - std::min(behind.size(), text.size()) : text.find(behind);
        if (end == text.npos) return std::nullopt;
        places.push_back({name, text.substr(0, end)});
        text.remove_prefix(end);
    }
    if (!text.empty()) return std::nullopt;
    return places;
}

std::optional<std::string> KnownFault(std::string_view english) {
    for (const char* const sentence : kFaultSentences) {
        auto places = PlacesIn(english, sentence);
        if (!places) continue;
        if (places->empty() || places->back().mName != kInnerFault) {
            return Message(sentence, *places);
        }
        const auto inner = KnownFault(places->back().mText);
        if (!inner) continue;
        places->back().mText = *inner;
        return Message(sentence, *places);
    }
    return std::nullopt;
}

}  // namespace

std::string FaultMessage(std::string_view english) {
    return KnownFault(english).value_or(std::string(english));
}

}  // namespace brindle::cli
