// SPDX-License-Identifier: MIT
#include "brindle/theory/SetFromStringHelper.h"

#include <algorithm>

namespace brindle {

namespace SetFromStringHelper {

namespace {

std::size_t LengthWithoutBlanks(std::string_view text) {
    return text.size() - static_cast<std::size_t>(std::count(text.begin(), text.end(), ' '));
}

}  // namespace

std::string ToLowercase(std::string_view text) {
    std::string lowered(text.size(), '\0');
    std::transform(text.begin(), text.end(), lowered.begin(), ToLower);
    return lowered;
}

void SkipLeadingBlanks(std::string_view text, int& pos) {
    const std::string_view remainder = RemainderFrom(text, pos);
    const std::size_t blanks = std::min(remainder.find_first_not_of(' '), remainder.size());
    pos += static_cast<int>(blanks);
}

bool _RemainingLengthWithoutSpacesDiffers(std::string_view keyword, std::string_view text,
                                          int pos) {
    return pos < 0 || LengthWithoutBlanks(keyword) != LengthWithoutBlanks(RemainderFrom(text, pos));
}

}  // namespace SetFromStringHelper

bool CKeywordsAndName::MatchesKeywords(SetFromStringHelper::TSpaces spaces,
                                       std::string_view text) const {
    return SetFromStringHelper::CompareStrs(spaces, mKeywords, text);
}

CKeywordsAndNames::const_iterator CKeywordsAndNames::FindFirstMatching(
    SetFromStringHelper::TSpaces spaces, std::string_view text) const {
    return std::find_if(begin(), end(), [&](const CKeywordsAndName& record) {
        return record.MatchesKeywords(spaces, text);
    });
}

CKeywordsAndNames::iterator CKeywordsAndNames::FindFirstMatching(
    SetFromStringHelper::TSpaces spaces, std::string_view text) {
    const auto found = std::as_const(*this).FindFirstMatching(spaces, text);
    return begin() + (found - cbegin());
}

CKeywordsAndNames::const_iterator CKeywordsAndNames::FindWholeRemainderAndAdvance(
    std::string_view text, int& pos) const {
    const std::string lowered = SetFromStringHelper::ToLowercase(text);
    SetFromStringHelper::SkipLeadingBlanks(lowered, pos);
    return std::find_if(begin(), end(), [&](const CKeywordsAndName& record) {
        return SetFromStringHelper::CompareLowercaseStrsAndOnMatchAdvanceStringPos(
            SetFromStringHelper::TSpaces_WholeRemainder, record.mKeywords, lowered, pos);
    });
}

}  // namespace brindle
