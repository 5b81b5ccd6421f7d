// SPDX-License-Identifier: MIT
#include "cli/CommandPage.h"

#include <algorithm>
#include <array>
#include <string_view>

namespace brindle::cli {
namespace {

std::string BehindBlank(const std::string& name) {
    const std::size_t blank = name.find(' ');
    return blank == name.npos ? "" : name.substr(blank + 1);
}

}  // namespace

bool COptionPage::TakesFile() const {
    // What a command reads may stand in a file, whatever it is.
    if (mIsArgument) return mChoices.empty() && !TakesCommand();
    constexpr auto names = std::to_array<std::string_view>({"FILE", "FOLDER", "MODEL", "PATH"});
    return std::find(names.begin(), names.end(), mValueName) != names.end();
}

bool COptionPage::TakesCommand() const {
    return mIsArgument && mNames.front() == "COMMAND";
}

std::string CCommandPage::LastName() const {
    return mName.substr(mName.rfind(' ') + 1);
}

std::string CCommandPage::WordsBelow() const {
    return BehindBlank(mName);
}

std::string CCommandPage::OtherWordsBelow() const {
    return BehindBlank(mOtherName);
}

bool CCommandPage::TakesCommand() const {
    return std::any_of(mOptions.begin(), mOptions.end(),
                       [](const COptionPage& option) { return option.TakesCommand(); });
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
