// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/LeadSheetSvg.h"

#include <optional>
#include <string>

namespace brindle {
struct CSong;
struct CSongReading;
}  // namespace brindle

namespace brindle::cli {

class CCommand;

/// The options --picture, --bars-per-line, --width, --page and --theme, and the lead sheet that
/// they ask for.
class CSheetPicture {
public:
    void AddTo(CCommand& command);

    /// What is wrong with the options; `isAxis` where the time axis is drawn for whatever reason.
    /// Without a picture they are wrong when they are told.
    [[nodiscard]] std::optional<std::string> Contradiction(bool isPicture, bool isAxis) const;

    /// Whether the time axis with the centers is wanted instead.
    [[nodiscard]] bool IsAxis() const { return mPicture == "axis"; }

    /// Whether nothing but the lead sheet will do.
    [[nodiscard]] bool IsSheetTold() const { return mPicture == "sheet"; }

    /// The picture of a song.
    [[nodiscard]] std::string Draw(const CSong& song, const CSongReading& reading) const;

private:
    [[nodiscard]] bool HasPaper() const { return mPage == "a4"; }
    [[nodiscard]] bool HasWidth() const;
    /// Whether anything differs from the usual lead sheet.
    [[nodiscard]] bool HasLayout() const;

    std::string mPicture = "sheet";
    std::string mPage = "endless";
    std::string mTheme = "auto";
    CLeadSheetOptions mOptions;
};

}  // namespace brindle::cli
