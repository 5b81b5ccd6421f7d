// SPDX-License-Identifier: MIT
#include "cli/SheetPicture.h"

#include "cli/CCommand.h"

namespace brindle::cli {

void CSheetPicture::AddTo(CCommand& command) {
    command.AddChoice("--picture", mPicture, {"sheet", "axis"},
                      "Draw a lead sheet, or a time axis with the centers");
    // Empty until it is told.
    mPicture.clear();
    command.AddOption("--bars-per-line", "N", mOptions.mBarsPerLine,
                      "Bars on a line of the lead sheet (default: 4)");
    command.AddOption("--width", "PIXELS", mOptions.mWidth,
                      "Width of an endless lead sheet (default: 800)");
    command.AddChoice("--page", mPage, {"endless", "a4"}, "Paper of the lead sheet");
    command.AddChoice("--theme", mTheme, {"auto", "light", "dark"},
                      "Colors of the lead sheet; auto are those that the viewer prefers");
}

std::optional<std::string> CSheetPicture::Contradiction(bool isPicture, bool isAxis) const {
    if (mOptions.mBarsPerLine < 1 || mOptions.mBarsPerLine > 16) {
        return "--bars-per-line takes 1 to 16 bars";
    }
    if (!(mOptions.mWidth >= 200.0 && mOptions.mWidth <= 4000.0)) {
        return "--width takes 200 to 4000 pixels";
    }
    if (!isPicture && (HasLayout() || !mPicture.empty())) {
        return "--picture, --bars-per-line, --width, --page and --theme are for pictures, "
               "--format svg";
    }
    if (isAxis && HasLayout()) {
        return "--bars-per-line, --width, --page and --theme are for the lead sheet, not for the "
               "time axis";
    }
    if (HasPaper() && HasWidth()) return "--page a4 is as wide as its paper; leave --width out";
    return std::nullopt;
}

bool CSheetPicture::HasWidth() const {
    return mOptions.mWidth != CLeadSheetOptions().mWidth;
}

bool CSheetPicture::HasLayout() const {
    return HasPaper() || HasWidth() || mTheme != "auto" ||
           mOptions.mBarsPerLine != CLeadSheetOptions().mBarsPerLine;
}

std::string CSheetPicture::Draw(const CSong& song, const CSongReading& reading) const {
    CLeadSheetOptions options = mOptions;
    options.mPage = HasPaper() ? TSheetPage_A4 : TSheetPage_Endless;
    if (mTheme != "auto") options.mTheme = mTheme == "dark" ? TSheetTheme_Dark : TSheetTheme_Light;
    return LeadSheetSvg(song, reading, options);
}

}  // namespace brindle::cli
