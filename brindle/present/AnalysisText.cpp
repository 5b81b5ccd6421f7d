// SPDX-License-Identifier: MIT
#include "brindle/present/AnalysisText.h"

#include "brindle/present/CBars.h"
#include "brindle/present/CTable.h"
#include "brindle/present/KeysText.h"
#include "brindle/present/ShownNames.h"
#include "brindle/present/ShownText.h"

#include <fmt/format.h>

#include <algorithm>
#include <utility>

namespace brindle {
namespace {

std::string DistanceText(int distance) {
    return distance < 0 ? " -" : fmt::format("{:2} {}", distance, DegreeName(distance));
}

class CTextWriter {
public:
    CTextWriter(const CShownSong& song, const CPaint& paint)
        : mPaint(paint), mBars(song.mBeatsPerBar, song.mBarStarts) {}

    void WriteScore(const CShownSong& song) {
        const CShownScore& score = song.mScore;
        if (!score.mTitle.empty()) mText += mPaint.Strong(score.mTitle) + '\n';
        if (song.mBarStarts.empty()) return;
        if (!mText.empty()) mText += '\n';
        std::string times;
        for (const CShownScore::CTime& time : score.mTimes) {
            Append(times, time.mName);
            if (score.mTimes.size() > 1)
                times += fmt::format(" from bar {}", mBars.BarOf(time.mPosition));
        }
        std::string sections;
        for (const double section : score.mSections) {
            Append(sections, fmt::format("{}", mBars.BarOf(section)));
        }
        WriteFact("bars", fmt::format("{}", song.mBarStarts.size()));
        if (!times.empty()) WriteFact("time", times);
        if (!sections.empty()) WriteFact("sections", "from bars " + sections);
        for (const CShownScore::CCopy& copy : score.mCopies) {
            WriteFact("copy", CopyText(copy));
        }
    }

    void Write(const CShownSignKey& signKey) {
        StartParagraph();
        mText += mPaint.Strong("Sign key " + signKey.mName);
        mText += mPaint.Faint(fmt::format(", from bar {}\n", mBars.BarOf(signKey.mBegin)));
        bool isAfterChords = true;
        for (const CShownCenter& center : signKey.mCenters) {
            const bool hasChords = !center.mChords.empty();
            if (isAfterChords || hasChords) StartParagraph();
            WriteHead(center);
            if (hasChords) WriteChords(center.mChords);
            isAfterChords = hasChords;
        }
    }

    void WriteLooseChords(const std::vector<CShownChord>& chords) {
        if (chords.empty()) return;
        StartParagraph();
        mText += mPaint.Strong("Chords outside of every center") + "\n\n";
        WriteChords(chords);
    }

    void WriteKeys(const CShownKeys& keys) {
        const std::string summary = KeysSummary(keys, mBars, mPaint);
        if (summary.empty()) return;
        StartParagraph();
        mText += summary;
    }

    void WriteReadings(const std::vector<CShownCenter>& readings) {
        StartParagraph();
        mText += mPaint.Strong("Readings") + "\n\n";
        if (readings.empty()) {
            mText += "    none found\n";
            return;
        }
        CTable table({"center", "where", "probability", "chords"});
        for (const CShownCenter& reading : readings) {
            table.AddRow({reading.mName, BarsOf(reading.mRange, mBars),
                          fmt::format("{:.2f}", reading.mProbability), SymbolsOf(reading)});
        }
        Write(table);
    }

    [[nodiscard]] std::string Text() && { return std::move(mText); }

private:
    static void Append(std::string& list, const std::string& element) {
        if (!list.empty()) list += ", ";
        list += element;
    }

    void WriteFact(std::string_view name, const std::string& fact) {
        mText += mPaint.Faint(fmt::format("  {:<8}  ", name)) + fact + '\n';
    }

    // "bars 17 to 32 as bars 1 to 16"
    [[nodiscard]] std::string CopyText(const CShownScore::CCopy& copy) const {
        const auto bars = [&](double position) {
            const long first = mBars.BarOf(position);
            const long last = first + static_cast<long>(copy.mBarCount) - 1;
            return last <= first ? fmt::format("bar {}", first)
                                 : fmt::format("bars {} to {}", first, last);
        };
        return bars(copy.mBegin) + " as " + bars(copy.mSource);
    }

    void StartParagraph() {
        if (!mText.empty()) mText += '\n';
    }

    void WriteHead(const CShownCenter& center) {
        const bool hasChords = !center.mChords.empty();
        std::string details = hasChords ? ", " + BarsOf(center.mRange, mBars)
                                        : fmt::format(", from bar {}, without chords of its own",
                                                      mBars.BarOf(center.mRange.mBegin));
        if (center.mProbability != kPosUndef) {
            details += fmt::format(", probability {:.2f}", center.mProbability);
        }
        mText += "  " + mPaint.Accent("Center " + center.mName) + mPaint.Faint(details) + '\n';
        if (hasChords) mText += '\n';
    }

    [[nodiscard]] static std::string SymbolsOf(const CShownCenter& center) {
        std::vector<std::string> symbols;
        for (const CShownChord& chord : center.mChords) symbols.push_back(chord.mSymbol);
        return FirstAndLast(symbols);
    }

    void WriteChords(const std::vector<CShownChord>& chords) {
        CTable table({" bar", " beat", "chord", "function", "root", "bass"});
        long barBefore = 0;
        for (const CShownChord& chord : chords) {
            const long bar = mBars.BarOf(chord.mRange.mBegin);
            table.AddRow({bar == barBefore ? "" : fmt::format("{}", bar),
                          ShortNumber(mBars.BeatOf(chord.mRange.mBegin)), chord.mSymbol,
                          chord.mNumeral.empty() ? "-" : chord.mNumeral,
                          DistanceText(chord.mRootDist),
                          chord.mBassDist < 0 ? "" : DistanceText(chord.mBassDist)});
            barBefore = bar;
        }
        Write(table);
    }

    void Write(const CTable& table) { mText += table.Text(mPaint, "    "); }

    const CPaint& mPaint;
    CBars mBars;
    std::string mText;
};

}  // namespace

std::string AnalysisText(const CShownSong& song, const CPaint& paint) {
    CTextWriter writer(song, paint);
    writer.WriteScore(song);
    for (const CShownSignKey& signKey : song.mSignKeys) writer.Write(signKey);
    writer.WriteLooseChords(song.mLooseChords);
    writer.WriteKeys(song.mKeys);
    if (song.mHasReadings) writer.WriteReadings(song.mReadings);
    return std::move(writer).Text();
}

}  // namespace brindle
