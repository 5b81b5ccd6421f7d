// SPDX-License-Identifier: MIT
#include "brindle/song/internal/SongForm.h"

#include "brindle/platform/Ascii.h"

#include <algorithm>

namespace brindle {

std::size_t CFormPart::EndingBar() const {
    return mBars >= 8 ? mBars - 2 : mBars >= 2 ? mBars - 1 : 0;
}

std::vector<CFormPart> PartsOfForm(const std::string& form, std::size_t bars) {
    const std::string letters = form.empty() ? "A" : form;
    const bool areLetters = std::all_of(letters.begin(), letters.end(), Ascii::IsCapital);
    if (!areLetters || bars == 0 || bars % letters.size() != 0) return {};
    std::vector<CFormPart> parts;
    for (std::size_t ix = 0; ix < letters.size(); ++ix) {
        const bool isLast = ix + 1 == letters.size();
        const bool isSecond = ix > 0 && letters[ix] == letters[ix - 1];
        CFormPart part{letters[ix], 0, bars / letters.size(), false, false, -1, -1};
        part.mFirstBar = ix * part.mBars;
        part.mIsClosed = isLast || (isSecond && letters[ix] != letters[ix + 1]);
        for (std::size_t before = ix; before-- > 0;) {
            if (letters[before] != letters[ix]) continue;
            part.mBeginsLike = static_cast<std::ptrdiff_t>(before);
            if (parts[before].mIsClosed != part.mIsClosed) continue;
            part.mIsLike = static_cast<std::ptrdiff_t>(before);
        }
        parts.push_back(part);
    }
    for (CFormPart& part : parts) {
        const bool isDoubled = letters.find(std::string(2, part.mLetter)) != std::string::npos;
        part.mStaysOpen = isDoubled && !part.mIsClosed;
    }
    return parts;
}

}  // namespace brindle
