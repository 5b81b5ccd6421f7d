// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/ScoreWords.h"

#include "brindle/musicxml/internal/WrittenScore.h"
#include "brindle/platform/Ascii.h"
#include "brindle/platform/ReadNumber.h"

#include <algorithm>
#include <array>
#include <initializer_list>
#include <string>

namespace brindle {

namespace {

constexpr std::size_t kMostEndingNumbers = 64;
constexpr std::size_t kMostWords = 64;

// Lower case, and the sign of multiplication as the "x" that it is meant for.
std::string FoldedScoreWords(std::string_view words) {
    constexpr std::string_view times = "\u00D7";
    std::string folded;
    for (std::size_t i = 0; i < words.size(); ++i) {
        const char c = words[i];
        if (words.substr(i, times.size()) == times) {
            folded += 'x';
            i += times.size() - 1;
        } else {
            folded += Ascii::ToLower(c);
        }
    }
    return folded;
}

// Runs of letters and runs of digits: "D.C.alfine" is d, c, alfine and "3x" is 3, x.
std::vector<std::string> TokensOf(std::string_view words) {
    const std::string text = FoldedScoreWords(words);
    std::vector<std::string> tokens;
    for (std::size_t i = 0; i < text.size() && tokens.size() < kMostWords;) {
        std::size_t end = i;
        if (Ascii::IsDigit(text[i])) {
            while (end < text.size() && Ascii::IsDigit(text[end])) ++end;
        } else {
            // A letter of another script is no border: "verso" is one word with any accents.
            while (end < text.size() &&
                   (Ascii::IsSmallLetter(text[end]) || (text[end] & 0x80) != 0))
                ++end;
        }
        if (end > i) tokens.push_back(text.substr(i, end - i));
        i = std::max(end, i + 1);
    }
    return tokens;
}

/// The words of one direction, asked for phrases.
class CPhrases {
public:
    explicit CPhrases(std::string_view words) : mTokens(TokensOf(words)) {}

    [[nodiscard]] const std::vector<std::string>& Tokens() const { return mTokens; }

    /// Whether these words stand in a row, written apart or as one.
    [[nodiscard]] bool Has(std::initializer_list<std::string_view> phrase) const {
        for (std::size_t i = 0; i < mTokens.size(); ++i) {
            if (LengthAt(i, phrase) > 0) return true;
        }
        return false;
    }
    /// Whether the phrase is all there is.
    [[nodiscard]] bool Are(std::initializer_list<std::string_view> phrase) const {
        return !mTokens.empty() && LengthAt(0, phrase) == mTokens.size();
    }
    [[nodiscard]] bool HasAny(
        std::initializer_list<std::initializer_list<std::string_view>> phrases) const {
        return std::any_of(phrases.begin(), phrases.end(),
                           [this](const auto& phrase) { return Has(phrase); });
    }

private:
    // The number of tokens that make the phrase from here on, 0 if they do not. Its words may be
    // joined: "dal segno", "dalsegno".
    [[nodiscard]] std::size_t LengthAt(std::size_t from,
                                       std::initializer_list<std::string_view> phrase) const {
        std::size_t at = from;
        std::string_view rest;  // of the token that is being matched
        for (const std::string_view word : phrase) {
            if (rest.empty()) {
                if (at == mTokens.size()) return 0;
                rest = mTokens[at++];
            }
            if (rest.substr(0, word.size()) != word) return 0;
            rest.remove_prefix(word.size());
        }
        return rest.empty() ? at - from : 0;
    }

    std::vector<std::string> mTokens;
};

// "3x", "x3", "3 times" tell how often a passage is played, "3 repeats" how often it is played
// again.
std::int32_t RepeatTimesOf(const std::vector<std::string>& tokens) {
    const auto isTimes = [](const std::string& token) {
        constexpr std::array<std::string_view, 6> words = {"x",   "times", "fois",
                                                           "mal", "volte", "veces"};
        return std::find(words.begin(), words.end(), token) != words.end();
    };
    for (std::size_t i = 0; i < tokens.size(); ++i) {
        const std::int32_t number = ReadInteger(tokens[i]);
        if (number < 1 || !Ascii::IsDigit(tokens[i].front())) continue;
        const bool hasNext = i + 1 < tokens.size();
        if (hasNext && (tokens[i + 1] == "repeats" || tokens[i + 1] == "repeat")) {
            return std::min(number, std::numeric_limits<std::int32_t>::max() - 1) + 1;
        }
        const bool isTold = (hasNext && isTimes(tokens[i + 1])) || (i > 0 && tokens[i - 1] == "x");
        if (isTold && number >= 2) return number;
    }
    return 0;
}

}  // namespace

void ReadPlayWords(std::string_view words, bool hasCodaSign, CPlayMarks& marks) {
    const CPhrases phrases(words);
    const bool isDaCapo = phrases.HasAny({{"d", "c"}, {"da", "capo"}, {"dal", "capo"}});
    const bool isDalSegno = phrases.HasAny({{"d", "s"}, {"dal", "segno"}, {"del", "segno"}});
    if (isDaCapo || isDalSegno) {
        if (isDalSegno) marks.mDalSegno.Set();
        if (isDaCapo && !isDalSegno) marks.mDaCapo = true;
        marks.mAlFine |= phrases.HasAny({{"al", "fine"}, {"alla", "fine"}, {"a", "fine"}});
        marks.mAlCoda |= phrases.HasAny({{"coda"}, {"al", "coda"}, {"alla", "coda"}});
    } else if (phrases.HasAny({{"to", "coda"}, {"al", "coda"}, {"alla", "coda"}}) ||
               (hasCodaSign && phrases.HasAny({{"to"}, {"al"}}))) {
        marks.mToCoda.Set();
    } else if (phrases.Are({"coda"})) {
        marks.mCoda.Set();
    } else if (phrases.Are({"segno"})) {
        marks.mSegno.Set();
    } else if (phrases.Are({"fine"}) || phrases.Are({"il", "fine"})) {
        marks.mFine = true;
    }
    if (const std::int32_t times = RepeatTimesOf(phrases.Tokens()); times > 0) {
        marks.mRepeatTimes = times;
    }
}

std::vector<std::int32_t> ReadEndingNumbers(std::string_view text) {
    std::vector<std::int32_t> numbers;
    bool isRange = false;
    for (std::size_t i = 0; i < text.size() && numbers.size() < kMostEndingNumbers;) {
        if (!Ascii::IsDigit(text[i])) {
            isRange = isRange || (text[i] == '-' && !numbers.empty());
            if (text[i] == ',') isRange = false;
            ++i;
            continue;
        }
        const std::int32_t number = std::min(ReadInteger(text.substr(i)), kHighestEndingNumber);
        while (i < text.size() && Ascii::IsDigit(text[i])) ++i;
        if (number < 1) continue;
        std::int32_t from = isRange ? numbers.back() + 1 : number;
        while (from < number && numbers.size() < kMostEndingNumbers) numbers.push_back(from++);
        numbers.push_back(number);
        isRange = false;
    }
    return numbers;
}

}  // namespace brindle
