// SPDX-License-Identifier: MIT
#include "brindle/present/internal/SheetStyle.h"

#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/present/KeyColor.h"

#include <fmt/format.h>

namespace brindle::LeadSheet {
namespace {

constexpr std::string_view kFonts =
    ".sym,.sec{font-family:Helvetica,Arial,'Liberation Sans',sans-serif;font-weight:bold}\n"
    ".num,.ttl,.ita{font-family:'Times New Roman',Times,'Liberation Serif',serif}\n"
    ".ttl{font-weight:bold}\n"
    ".ita{font-style:italic}\n"
    ".bar,.thick,.arc,.dot,.thin{fill:none}\n"
    ".bar{stroke-width:1.1}\n"
    ".thick{stroke-width:3.4}\n"
    ".arc,.dot{stroke-width:1.2}\n"
    ".dot{stroke-dasharray:2.2 2.4}\n"
    ".thin{stroke-width:.9}\n";

struct CColors {
    std::string_view mPaper;
    std::string_view mInk;
    std::string_view mQuiet;
    std::string_view mArc;
    TShade mBand;
    TShade mName;
};

constexpr CColors kDay{"#ffffff", "#161616", "#6a6a6a", "#3d4a5c", Shade_Sheet, Shade_SheetName};
constexpr CColors kNight{"#17181a", "#f0f0ee",        "#a0a0a0",
                         "#a9b8cc", Shade_NightSheet, Shade_NightSheetName};

bool IsMinor(const CSignKeyLite& key) {
    return key.mSignKeyType == TSignKeyType_Minor;
}

std::string Rules(const std::vector<CSignKeyLite>& keys, const CColors& colors) {
    std::string rules = fmt::format(
        ".paper{{fill:{0}}}\n.ink{{fill:{1}}}\n.quiet{{fill:{2}}}\n"
        ".bar,.thick{{stroke:{1}}}\n.thin{{stroke:{2}}}\n"
        ".arc,.dot{{stroke:{3}}}\n.head{{fill:{3}}}\n",
        colors.mPaper, colors.mInk, colors.mQuiet, colors.mArc);
    for (const CSignKeyLite& key : keys) {
        rules +=
            fmt::format(".{}{{fill:{}}}\n.{}{{fill:{}}}\n", BandStyle(key),
                        ColorOf(key, colors.mBand), NameStyle(key), ColorOf(key, colors.mName));
    }
    return rules;
}

std::string StyleOf(std::string_view prefix, const CSignKeyLite& key) {
    return fmt::format("{}{}{}", prefix, key.mRootKeyEnh.mKeyNr, IsMinor(key) ? "m" : "");
}

}  // namespace

std::string BandStyle(const CSignKeyLite& key) {
    return StyleOf("k", key);
}

std::string NameStyle(const CSignKeyLite& key) {
    return StyleOf("n", key);
}

std::string NameOfKey(const CSignKeyLite& key) {
    const std::string root = WriteNoteName(key.mRootKeyEnh, {.mUnicodeSigns = true});
    return root.empty() ? root : root + (IsMinor(key) ? " minor" : " major");
}

std::string StyleElement(const std::vector<CSignKeyLite>& keys, TSheetTheme theme) {
    std::string style = "<style>\n" + std::string(kFonts);
    style += Rules(keys, theme == TSheetTheme_Dark ? kNight : kDay);
    if (theme == TSheetTheme_Auto) {
        style += "@media (prefers-color-scheme:dark){\n" + Rules(keys, kNight) + "}\n";
    }
    return style + "</style>\n";
}

}  // namespace brindle::LeadSheet
