// SPDX-License-Identifier: MIT
#include "brindle/theory/TEnh.h"

#include <array>
#include <ostream>

namespace brindle {

namespace {

struct CEnhWord {
    TEnh mEnh;
    std::string_view mWord;
    std::string_view mEnumerator;
};

// clang-format off
constexpr auto kEnhWords = std::to_array<CEnhWord>({
    {TEnh_bbb,   "triple flat",  "TEnh_bbb"},
    {TEnh_bb,    "double flat",  "TEnh_bb"},
    {TEnh_b,     "flat",         "TEnh_b"},
    {TEnh_n,     "neutral",      "TEnh_n"},
    {TEnh_s,     "sharp",        "TEnh_s"},
    {TEnh_ss,    "double sharp", "TEnh_ss"},
    {TEnh_sss,   "triple sharp", "TEnh_sss"},
    {TEnh_Undef, "undef",        "TEnh_Undef"},
});
// clang-format on

}  // namespace

TEnh EnhFromStdString(std::string_view word) {
    for (const CEnhWord& row : kEnhWords) {
        if (row.mWord == word) return row.mEnh;
    }
    return TEnh_Undef;
}

TEnh EnhFromString(const char* word) {
    return word == nullptr ? TEnh_Undef : EnhFromStdString(word);
}

std::string StringForInitializerList(TEnh enh) {
    for (const CEnhWord& row : kEnhWords) {
        if (row.mEnh == enh) return std::string(row.mEnumerator);
    }
    return "TEnh(" + std::to_string(static_cast<int>(enh)) + ")";
}

std::ostream& operator<<(std::ostream& stream, TEnh enh) {
    for (const CEnhWord& row : kEnhWords) {
        if (row.mEnh == enh) return stream << row.mWord;
    }
    return stream << "unknown TEnh " + std::to_string(static_cast<int>(enh));
}

}  // namespace brindle
