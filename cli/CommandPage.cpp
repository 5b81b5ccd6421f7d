// SPDX-License-Identifier: MIT
#include "cli/CommandPage.h"

#include <algorithm>
#include <array>
#include <string_view>

namespace brindle::cli {

bool COptionPage::TakesFile() const {
    constexpr auto names =
        std::to_array<std::string_view>({"FILE", "FILES", "FOLDER", "MODEL", "PATH", "TEXT"});
    const std::string& name = mIsArgument ? mNames.front() : mValueName;
    return mChoices.empty() && std::find(names.begin(), names.end(), name) != names.end();
}

std::string CCommandPage::LastName() const {
    return mName.substr(mName.rfind(' ') + 1);
}

std::string CCommandPage::WordsBelow() const {
    const std::size_t blank = mName.find(' ');
    return blank == mName.npos ? "" : mName.substr(blank + 1);
}

std::vector<const CCommandPage*> AllPages(const CCommandPage& page) {
    std::vector<const CCommandPage*> pages{&page};
    for (const CCommandPage& command : page.mCommands) {
        const auto below = AllPages(command);
        pages.insert(pages.end(), below.begin(), below.end());
    }
    return pages;
}

}  // namespace brindle::cli
