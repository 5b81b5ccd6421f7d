// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/CFoldedNumeral.h"

#include <algorithm>

namespace brindle {
namespace {

struct CReplacement {
    std::string_view mWritten;
    std::string_view mRead;
};

// What people write for the signs of the tables; longer before shorter.
constexpr auto kOtherSigns = std::to_array<CReplacement>({
    {"maj", "^"},
    {"Maj", "^"},
    {"MAJ", "^"},
    {"dim", "o"},
    {"aug", "+"},
    {"min", "m"},
    {"omit", "no"},
    {"M", "^"},
    {"%", "h"},
    {"\xE2\x99\xAF", "#"},  // a sharp
    {"\xE2\x99\xAD", "b"},  // a flat
    {"\xC3\xB8", "h"},      // ø
    {"\xC3\x98", "h"},      // Ø
    {"\xE2\x88\x85", "h"},  // the empty set
    {"\xC2\xB0", "o"},      // °
    {"\xC2\xBA", "o"},      // º
    {"\xE2\x96\xB3", "^"},  // a white triangle
    {"\xCE\x94", "^"},      // a Delta
    {"\xE2\x88\x86", "^"},  // an increment
    {"\xE2\x80\x93", "-"},  // a dash
    {"\xE2\x88\x92", "-"},  // a minus
    {"\xC2\xB9", "1"},
    {"\xC2\xB2", "2"},
    {"\xC2\xB3", "3"},
    {"\xE2\x81\xB4", "4"},
    {"\xE2\x81\xB5", "5"},
    {"\xE2\x81\xB6", "6"},
    {"\xE2\x81\xB7", "7"},
    {"\xE2\x81\xB8", "8"},
    {"\xE2\x81\xB9", "9"},
    {"\xE2\x82\x82", "2"},
    {"\xE2\x82\x83", "3"},
    {"\xE2\x82\x84", "4"},
    {"\xE2\x82\x85", "5"},
    {"\xE2\x82\x86", "6"},
    {"\xE2\x82\x87", "7"},
    {"\xE2\x85\xA0", "I"},
    {"\xE2\x85\xA1", "II"},
    {"\xE2\x85\xA2", "III"},
    {"\xE2\x85\xA3", "IV"},
    {"\xE2\x85\xA4", "V"},
    {"\xE2\x85\xA5", "VI"},
    {"\xE2\x85\xA6", "VII"},
    {"\xE2\x85\xB0", "i"},
    {"\xE2\x85\xB1", "ii"},
    {"\xE2\x85\xB2", "iii"},
    {"\xE2\x85\xB3", "iv"},
    {"\xE2\x85\xB4", "v"},
    {"\xE2\x85\xB5", "vi"},
    {"\xE2\x85\xB6", "vii"},
});

// Digits and most letters stand for themselves.
constexpr bool CanBeginSign(char c) {
    return static_cast<unsigned char>(c) >= 0x80 || c == 'm' || c == 'M' || c == 'd' || c == 'a' ||
           c == 'o' || c == '%';
}

const CReplacement* SignAt(std::string_view text) {
    if (!CanBeginSign(text.front())) return nullptr;
    const auto sign = std::find_if(kOtherSigns.begin(), kOtherSigns.end(), [&](const auto& row) {
        return row.mWritten.front() == text.front() && text.starts_with(row.mWritten);
    });
    return sign == kOtherSigns.end() ? nullptr : &*sign;
}

}  // namespace

CFoldedNumeral::CFoldedNumeral(std::string_view typed) {
    Fold(typed);
    CutGroups();
}

// Never longer than what was typed: no sign is read as more bytes than it is written with.
void CFoldedNumeral::Fold(std::string_view typed) {
    std::size_t at = 0;
    while (at < typed.size() && mFoldedSize < kLongest) {
        const CReplacement* sign = SignAt(typed.substr(at));
        const std::string_view read = sign != nullptr ? sign->mRead : typed.substr(at, 1);
        for (const char c : read) {
            mChars[mFoldedSize] = c;
            mOffsets[mFoldedSize++] = static_cast<std::uint8_t>(at);
        }
        at += sign != nullptr ? sign->mWritten.size() : 1;
    }
    mOffsets[mFoldedSize] = static_cast<std::uint8_t>(typed.size());
    mSize = mFoldedSize;
}

void CFoldedNumeral::CutGroups() {
    const auto begin = mChars.begin();
    while (true) {
        const auto end = begin + static_cast<std::ptrdiff_t>(mSize);
        const auto open = std::find(begin, end, '[');
        if (open == end) break;
        const auto close = std::find(open, end, ']');
        mIsWhole = close != end && mGroupCount < kMostGroups;
        if (!mIsWhole) {
            mWrongBracket = mOffsets[static_cast<std::size_t>(open - begin)];
            return;
        }
        // The group goes behind all that is left, so that the groups before it move to the left.
        const auto length = static_cast<std::size_t>(close + 1 - open);
        const auto whole = static_cast<std::ptrdiff_t>(mFoldedSize);
        const auto from = open - begin;
        std::rotate(open, close + 1, begin + whole);
        std::rotate(mOffsets.begin() + from, mOffsets.begin() + from + (close + 1 - open),
                    mOffsets.begin() + whole);
        mSize -= length;
        for (std::size_t i = 0; i < mGroupCount; ++i) {
            mGroups[i].mBegin -= length;
            mGroups[i].mEnd -= length;
        }
        mGroups[mGroupCount++] = {mFoldedSize - length + 1, mFoldedSize - 1};
    }
    const std::size_t alone = Text().find(']');
    mIsWhole = alone == std::string_view::npos;
    if (!mIsWhole) mWrongBracket = mOffsets[alone];
}

std::string_view CFoldedNumeral::Group(std::size_t ix) const {
    return {mChars.data() + mGroups[ix].mBegin, mGroups[ix].mEnd - mGroups[ix].mBegin};
}

std::size_t CFoldedNumeral::OffsetOf(std::string_view piece) const {
    const auto at = static_cast<std::size_t>(piece.data() - mChars.data());
    // The end of the numeral is the end of what was typed, wherever the groups stood.
    return at == mSize ? mOffsets[mFoldedSize] : mOffsets[at];
}

}  // namespace brindle
