// SPDX-License-Identifier: MIT
#include "brindle/present/SheetJson.h"

#include "brindle/present/CJsonWriter.h"
#include "brindle/present/KeyColor.h"
#include "brindle/present/internal/ReadingNotes.h"
#include "brindle/present/internal/SheetLines.h"
#include "brindle/present/internal/SheetLinks.h"
#include "brindle/present/internal/SheetStyle.h"

#include <fmt/format.h>

#include <algorithm>
#include <cstdint>
#include <iterator>
#include <map>
#include <string_view>
#include <utility>
#include <vector>

namespace brindle {
namespace {

using namespace LeadSheet;

void WriteSheetIndex(CJsonWriter& json, std::string_view name, std::size_t index) {
    json.Key(name);
    index == kNone ? json.Null() : json.Integer(static_cast<std::int64_t>(index));
}

/// The keys of a reading, each once, and which of them each chord is in.
class CSheetKeys {
public:
    explicit CSheetKeys(const CSongReading& reading) {
        for (const CChordReading& chord : reading.mChords) mKeyOfChord.push_back(IndexOf(chord));
    }

    [[nodiscard]] std::size_t KeyOf(std::size_t chord) const {
        return chord < mKeyOfChord.size() ? mKeyOfChord[chord] : kNone;
    }

    void Write(CJsonWriter& json) const {
        json.Key("Keys").BeginArray();
        for (const CSignKeyLite& key : mKeys) {
            json.BeginObject().Key("Name").String(NameOfKey(key));
            json.Key("Paper").String(ColorOf(key, Shade_Sheet));
            json.Key("Ink").String(ColorOf(key, Shade_SheetName));
            json.Key("NightPaper").String(ColorOf(key, Shade_NightSheet));
            json.Key("NightInk").String(ColorOf(key, Shade_NightSheetName)).EndObject();
        }
        json.EndArray();
    }

private:
    std::size_t IndexOf(const CChordReading& chord) {
        if (chord.mKey.mRootKeyEnh.IsUndef()) return kNone;
        const auto [known, isNew] = mIndices.emplace(BandStyle(chord.mKey), mKeys.size());
        if (isNew) mKeys.push_back(chord.mKey);
        return known->second;
    }

    std::vector<CSignKeyLite> mKeys;
    std::vector<std::size_t> mKeyOfChord;
    std::map<std::string, std::size_t> mIndices;
};

void WriteHead(CJsonWriter& json, const CSong& song, const CSongReading& reading) {
    json.Key("Title").String(song.mTitle).Key("Makers").String(song.mMakers);
    json.Key("Style").String(song.mStyle).Key("Tempo");
    song.mTempo ? json.Number(*song.mTempo) : json.Null();
    json.Key("Key").StringOrNull(NameOfKey(reading.mKey));
    json.Key("Confidence").Number(reading.mConfidence);
    json.Key("BeatsPerBar").Number(song.mBeatsPerBar);
    json.Key("Notes").BeginArray();
    for (const std::string& note : KeyContradictions(song, reading)) json.String(note);
    json.EndArray();
}

void WriteTime(CJsonWriter& json, const CSongTime& time) {
    json.Key("Time");
    if (time.IsUndef()) {
        json.Null();
        return;
    }
    json.String(fmt::format("{}/{}", time.mNumerator, time.mDenominator));
}

std::string_view SignName(TSongSign sign) {
    switch (sign) {
        case TSongSign_None:
            return "";
        case TSongSign_Segno:
            return "segno";
        case TSongSign_Coda:
            return "coda";
    }
    return "";
}

void WriteSheetBar(CJsonWriter& json, const CSheetBar& bar) {
    json.BeginObject().Key("Number").String(bar.mNumber);
    json.Key("Position").Number(bar.mPosition).Key("Length").Number(bar.mLength);
    json.Key("BarCount").Integer(static_cast<std::int64_t>(bar.mBarCount));
    json.Key("Begin").Integer(static_cast<std::int64_t>(bar.mBegin));
    json.Key("End").Integer(static_cast<std::int64_t>(bar.mEnd));
    WriteSheetIndex(json, "Held", bar.mHeld);
    json.Key("IsUpbeat").Bool(bar.mIsUpbeat);
    WriteTime(json, bar.mTime);
    json.Key("BeginsSection").Bool(bar.mBeginsSection).Key("Section").String(bar.mSection);
    json.Key("BeginsRepeat").Bool(bar.mBeginsRepeat).Key("EndsRepeat").Bool(bar.mEndsRepeat);
    json.Key("Times").Integer(static_cast<std::int64_t>(bar.mTimes));
    json.Key("Ending").String(bar.mEnding).Key("IsInEnding").Bool(bar.mIsInEnding);
    json.Key("ClosesEnding").Bool(bar.mClosesEnding).Key("Remark").String(bar.mRemark);
    json.Key("Sign").StringOrNull(SignName(bar.mSign)).Key("Words").String(bar.mWords);
    json.EndObject();
}

/// Which drawn bar each chord that is drawn stands in.
std::vector<std::size_t> BarsOfChords(const CSheet& sheet) {
    std::vector<std::size_t> bars(sheet.mDrawnAs.size(), kNone);
    for (std::size_t i = 0; i < sheet.mBars.size(); ++i) {
        for (std::size_t chord = sheet.mBars[i].mBegin; chord < sheet.mBars[i].mEnd; ++chord) {
            bars[chord] = i;
        }
    }
    return bars;
}

/// Finds the drawn bar of each played one, which come in their order.
class CDrawnBars {
public:
    explicit CDrawnBars(const CSheet& sheet) : mSheet(sheet), mBarsOfChords(BarsOfChords(sheet)) {}

    /// The bar that is drawn at its own place, or the one whose chords are drawn for its chords. A
    /// bar without chords follows the one before, and stays where many are drawn as one rest.
    std::size_t Next(const CSongBar& played) {
        const std::size_t own = BarAt(played.mPosition);
        const std::size_t ofChord = own == kNone ? BarOfFirstChord(played) : own;
        if (ofChord != kNone) return mBefore = ofChord;
        const bool isRest = mSheet.mBars[mBefore].mBarCount > 1;
        if (!isRest && mBefore + 1 < mSheet.mBars.size()) ++mBefore;
        return mBefore;
    }

private:
    [[nodiscard]] std::size_t BarAt(double position) const {
        const auto bar = std::lower_bound(
            mSheet.mBars.begin(), mSheet.mBars.end(), position - kTolerance,
            [](const CSheetBar& drawn, double from) { return drawn.mPosition < from; });
        const bool isThere = bar != mSheet.mBars.end() && bar->mPosition <= position + kTolerance;
        return isThere ? static_cast<std::size_t>(bar - mSheet.mBars.begin()) : kNone;
    }

    [[nodiscard]] std::size_t BarOfFirstChord(const CSongBar& played) const {
        const auto& positions = mSheet.mPositions;
        const auto first =
            std::lower_bound(positions.begin(), positions.end(), played.mPosition - kTolerance);
        const bool isInside =
            first != positions.end() && *first < played.mPosition + played.mLength - kTolerance;
        if (!isInside) return kNone;
        const auto chord = static_cast<std::size_t>(first - positions.begin());
        return mBarsOfChords[mSheet.mDrawnAs[chord]];
    }

    const CSheet& mSheet;
    std::vector<std::size_t> mBarsOfChords;
    std::size_t mBefore = 0;
};

void WritePlayedBar(CJsonWriter& json, double position, double length, std::size_t bar) {
    json.BeginObject().Key("Position").Number(position).Key("Length").Number(length);
    json.Key("Bar").Integer(static_cast<std::int64_t>(bar)).EndObject();
}

void WritePlayedBars(CJsonWriter& json, const CSong& song, const CSheet& sheet) {
    json.Key("PlayedBars").BeginArray();
    if (song.mBars.empty()) {
        for (std::size_t i = 0; i < sheet.mBars.size(); ++i) {
            WritePlayedBar(json, sheet.mBars[i].mPosition, sheet.mBars[i].mLength, i);
        }
    } else if (!sheet.mBars.empty()) {
        CDrawnBars drawn(sheet);
        for (const CSongBar& bar : song.mBars) {
            WritePlayedBar(json, bar.mPosition, bar.mLength, drawn.Next(bar));
        }
    }
    json.EndArray();
}

void WriteRuns(CJsonWriter& json, const CTextRuns& runs) {
    json.BeginArray();
    for (const CTextRun& run : runs) {
        json.BeginArray().String(run.mText).Number(run.mSize).Number(run.mRaise).EndArray();
    }
    json.EndArray();
}

void WriteSheetChords(CJsonWriter& json, const CSong& song, const CSongReading& reading,
                      const CSheet& sheet, const CSheetKeys& keys) {
    const std::vector<CChordTexts> texts = MakeChordTexts(song, reading);
    json.Key("Chords").BeginArray();
    for (std::size_t i = 0; i < sheet.mPositions.size(); ++i) {
        json.BeginObject().Key("Position").Number(sheet.mPositions[i]);
        json.Key("Symbol").String(JoinRuns(texts[i].mSymbol));
        WriteRuns(json.Key("Runs"), texts[i].mSymbol);
        json.Key("Numeral").String(JoinRuns(texts[i].mNumeral));
        WriteRuns(json.Key("NumeralRuns"), texts[i].mNumeral);
        WriteSheetIndex(json, "Key", keys.KeyOf(i));
        json.EndObject();
    }
    json.EndArray();
}

void WriteLinks(CJsonWriter& json, std::string_view name, const std::vector<CSheetLink>& links) {
    json.Key(name).BeginArray();
    for (const CSheetLink& link : links) {
        json.BeginObject().Key("From").Integer(static_cast<std::int64_t>(link.mFrom));
        WriteSheetIndex(json, "To", link.mTo);
        json.Key("IsDotted").Bool(link.mIsDotted).EndObject();
    }
    json.EndArray();
}

}  // namespace

std::string SheetJson(const CSong& song, const CSongReading& reading) {
    const CSheet sheet = MakeSheet(song);
    const CSheetLinks links = MakeLinks(song, reading, sheet);
    const CSheetKeys keys(reading);
    CJsonWriter json;
    json.BeginObject();
    WriteHead(json, song, reading);
    json.Key("Bars").BeginArray();
    for (const CSheetBar& bar : sheet.mBars) WriteSheetBar(json, bar);
    json.EndArray();
    WritePlayedBars(json, song, sheet);
    json.Key("DrawnAs").BeginArray();
    for (const std::size_t drawn : sheet.mDrawnAs) json.Integer(static_cast<std::int64_t>(drawn));
    json.EndArray();
    WriteSheetChords(json, song, reading, sheet, keys);
    keys.Write(json);
    WriteLinks(json, "Arrows", links.mArrows);
    WriteLinks(json, "Brackets", links.mBrackets);
    json.EndObject();
    return std::move(json).Text();
}

std::string TextRunsJson(std::string_view text, bool isNumeral) {
    CJsonWriter json;
    WriteRuns(json, isNumeral ? SetNumeral(text) : SetSymbol(text));
    return std::move(json).Text();
}

}  // namespace brindle
