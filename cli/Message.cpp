// SPDX-License-Identifier: MIT
#include "cli/Message.h"

#include "brindle/platform/Localization.h"

#include <algorithm>

namespace brindle::cli {

std::string Message(const char* english, std::initializer_list<CFilledPlace> places) {
    return Message(english, std::span(places.begin(), places.size()));
}

std::string Message(const char* english, std::span<const CFilledPlace> places) {
    const std::string pattern = LocalizedString(english);
    std::string_view rest = pattern;
    std::string text;
    while (true) {
        const std::size_t open = rest.find('{');
        const std::size_t close = rest.find('}', open);
        if (close == rest.npos) return text.append(rest);
        const std::string_view name = rest.substr(open + 1, close - open - 1);
        const auto place =
            std::find_if(places.begin(), places.end(),
                         [&](const CFilledPlace& candidate) { return candidate.mName == name; });
        text += rest.substr(0, open);
        if (place != places.end()) text += place->mText;
        rest.remove_prefix(close + 1);
    }
}

}  // namespace brindle::cli
