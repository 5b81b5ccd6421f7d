// SPDX-License-Identifier: MIT
#pragma once

#include <boost/container/small_vector.hpp>
#include <cstddef>
#include <string_view>

namespace brindle::ChordText {

/// A chord text in plain ASCII, as far as it can be: ♯ is "#", Δ is "^", superscript digits are
/// digits. It is trimmed, and brackets around the whole are gone. Each character knows where it
/// comes from.
class CUnifiedText {
public:
    explicit CUnifiedText(std::string_view input);

    [[nodiscard]] bool IsEmpty() const { return mBegin == mEnd; }
    [[nodiscard]] std::string_view Text() const {
        return std::string_view(mText.data(), mEnd).substr(mBegin);
    }
    /// The same in lower case.
    [[nodiscard]] std::string_view Lower() const {
        return std::string_view(mLower.data(), mEnd).substr(mBegin);
    }
    [[nodiscard]] std::string_view Input() const { return mInput; }
    /// The byte of the input that character `pos` of Text comes from; `pos` may be its size.
    [[nodiscard]] std::size_t InputOffset(std::size_t pos) const { return mOffsets[mBegin + pos]; }

private:
    void Append(char folded, std::size_t offset);
    void AppendNonAscii(std::size_t& offset);
    void Trim();
    void TakeInsideOfBrackets();

    // Usual symbols are folded on the stack.
    static constexpr std::size_t kUsualLength = 48;

    std::string_view mInput;
    boost::container::small_vector<char, kUsualLength> mText;
    boost::container::small_vector<char, kUsualLength> mLower;
    // One more than characters: the end of the input.
    boost::container::small_vector<std::size_t, kUsualLength + 1> mOffsets;
    std::size_t mBegin = 0;
    std::size_t mEnd = 0;
};

}  // namespace brindle::ChordText
