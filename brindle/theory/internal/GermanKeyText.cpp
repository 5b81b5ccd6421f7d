// SPDX-License-Identifier: MIT
#include "brindle/theory/internal/GermanKeyText.h"

#include "brindle/platform/Ascii.h"

namespace brindle {
namespace {

std::string LowerLetters(std::string_view text) {
    std::string lower(text);
    for (char& c : lower) c = Ascii::ToLower(c);
    return lower;
}

/// Whether a text ends in a word, which is then taken off with the blanks and hyphens before it.
bool TakeEnd(std::string& text, std::string_view word) {
    if (!text.ends_with(word)) return false;
    text.resize(text.size() - word.size());
    text.resize(text.find_last_not_of(" -") + 1);
    return true;
}

/// "f#" for "fis", "eb" for "es", "bb" for "b"; empty for what is no name of a key.
std::string EnglishRoot(std::string_view german) {
    if (german.empty() || german.front() < 'a' || german.front() > 'h') return {};
    const char letter = german.front();
    const std::string_view ending = german.substr(1);
    const std::string root(1, letter == 'h' ? 'b' : letter);
    if (ending.empty()) return letter == 'b' ? "bb" : root;
    if (ending == "is" || ending == "#") return letter == 'b' ? "" : root + '#';
    // As and Es have no "e" of their own before the "s".
    const bool isVowel = letter == 'a' || letter == 'e';
    const bool isFlat = ending == "b" || (isVowel ? ending == "s" : ending == "es");
    // B flat is B and not Hes; B with an ending would be flat twice.
    const bool isNamed = letter != 'h' && (letter != 'b' || ending == "b");
    return isFlat && isNamed ? root + 'b' : "";
}

/// "Fis", "Es": a name that only German has.
bool IsGermanRoot(std::string_view text) {
    return text.size() > 1 && Ascii::IsCapital(text.front()) && text.ends_with('s') &&
           !EnglishRoot(LowerLetters(text)).empty();
}

}  // namespace

std::optional<std::string> EnglishKeyText(std::string_view german) {
    const std::size_t first = german.find_first_not_of(' ');
    if (first == german.npos) return std::nullopt;
    german = german.substr(first, german.find_last_not_of(' ') + 1 - first);
    std::string root = LowerLetters(german);
    const bool isMinor = TakeEnd(root, "moll");
    // A small "fis" without a word is read as any small letter is.
    if (!isMinor && !TakeEnd(root, "dur") && !IsGermanRoot(german)) return std::nullopt;
    root = EnglishRoot(root);
    if (root.empty()) return std::nullopt;
    root.front() = Ascii::ToUpper(root.front());
    return root + (isMinor ? " minor" : " major");
}

}  // namespace brindle
