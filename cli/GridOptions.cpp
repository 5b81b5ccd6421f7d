// SPDX-License-Identifier: MIT
#include "cli/GridOptions.h"

#include "cli/CommandLine.h"
#include "cli/DidYouMean.h"
#include "cli/Input.h"
#include "cli/Message.h"

#include "brindle/guitarchords/Tunings.h"
#include "brindle/present/ChordGrid.h"

#include <fmt/format.h>

#include <string>
#include <vector>

namespace brindle::cli {

void CFingeringOptionsOfUser::AddTo(CCommand& command) {
    const auto inSearch = [](COption option) { option.InGroup("What a hand can hold"); };
    inSearch(command.AddOption("--most", "N", mMost, "Most fingerings of a chord (default: 6)")
                 .InRange(1, 1000));
    inSearch(command.AddOption("--highest-fret", "N", mHighestFret, "Last fret (default: 15)")
                 .InRange(1, kFingeringMostFrets));
    inSearch(command
                 .AddOption("--span", "N", mSpan,
                            "Frets under the hand, one more up the neck (default: 4)")
                 .InRange(2, 6));
    inSearch(command.AddChoice("--bass", mBass, {"usual", "required", "free"},
                               "Whether the bass of the chord has to be the lowest note"));
    inSearch(command.AddFlag("--whole", mIsWhole, "Leave nothing out"));
    inSearch(command.AddFlag("--rootless", mIsRootless, "Leave the root to a bass player"));
    command.AddChoice("--dots", mDots, {"fingers", "notes", "intervals"},
                      "What stands on the dots");
    command.AddFlag("--left", mIsLeft, "Draw for the left hand");
}

CFingeringOptions CFingeringOptionsOfUser::Options() const {
    CFingeringOptions options;
    options.mLimit = static_cast<std::size_t>(mMost);
    options.mHighestFret = mHighestFret;
    options.mSpan = mSpan;
    options.mSpanUpTheNeck = mSpan + 1;
    options.mMayOmitTones = !mIsWhole;
    options.mMayOmitRoot = mIsRootless;
    if (mBass == "required") options.mBass = TFingeringBass::Required;
    if (mBass == "free") options.mBass = TFingeringBass::Free;
    return options;
}

CGridStyle CFingeringOptionsOfUser::Style() const {
    CGridStyle style;
    style.mLeftHanded = mIsLeft;
    if (mDots == "notes") style.mDots = TGridDots::Notes;
    if (mDots == "intervals") style.mDots = TGridDots::Intervals;
    return style;
}

std::optional<GChShortTuning> ReadTuningOption(const std::string& text) {
    const auto tuning = ReadTuning(text);
    if (tuning) return tuning;
    std::vector<std::string> names;
    for (const CNamedTuning& named : NamedTunings()) names.emplace_back(named.mName);
    const std::string meant = NearestWord(text, names);
    const std::string typed = Printable(text);
    Fail(TStatus::BadUsage,
         meant.empty()
             ? Message("{word} is no tuning: a name, as drop-d or ukulele, letters from the lowest "
                       "string, as in DADGAD, or pitches, as in E2A2D3G3B3E4",
                       {{"word", typed}})
             : WithMeant(Message("{word} is no tuning", {{"word", typed}}), meant));
    return std::nullopt;
}

TStatus FailWithoutFingering(const std::string& symbol, const GChShortTuning& tuning) {
    const int strings = GChNumberOfStringsInShortTuning(tuning);
    if (strings <= kFingeringMostStrings) {
        return Fail(TStatus::BadInput,
                    fmt::format("no fingering of {} for {}", symbol, TuningText(tuning)));
    }
    return Fail(
        TStatus::BadInput,
        fmt::format("no fingering of {}: they are searched on at most {} strings, not on {}",
                    symbol, kFingeringMostStrings, strings));
}

}  // namespace brindle::cli
