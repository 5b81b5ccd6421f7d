// SPDX-License-Identifier: MIT
#include "brindle/theory/TEnh.h"

#include <array>
#include <ostream>

namespace brindle {

namespace {

struct TWord {
    TEnh mEnh;
    std::string_view mWord;
};

constexpr auto kWords = std::to_array<TWord>({
    {TEnh_bbb, "triple flat"},
    {TEnh_bb, "double flat"},
    {TEnh_b, "flat"},
    {TEnh_n, "neutral"},
    {TEnh_s, "sharp"},
    {TEnh_ss, "double sharp"},
    {TEnh_sss, "triple sharp"},
    {TEnh_Undef, "undef"},
});

}  // namespace

TEnh EnhFromStdString(std::string_view word) {
    for (const TWord& row : kWords) {
        if (row.mWord == word) return row.mEnh;
    }
    return TEnh_Undef;
}

TEnh EnhFromString(const char* word) {
    return word == nullptr ? TEnh_Undef : EnhFromStdString(word);
}

std::ostream& operator<<(std::ostream& stream, TEnh enh) {
    for (const TWord& row : kWords) {
        if (row.mEnh == enh) return stream << row.mWord;
    }
    return stream << "unknown TEnh " << static_cast<int>(enh);
}

}  // namespace brindle
