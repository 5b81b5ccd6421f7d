// SPDX-License-Identifier: MIT
#include "brindle/c/internal/Border.h"
#include "brindle/c/internal/Handles.h"
#include "brindle/c/internal/Values.h"

#include "brindle/present/AnalysisJson.h"
#include "brindle/present/AnalysisSvg.h"
#include "brindle/present/CPaint.h"
#include "brindle/present/Explain.h"
#include "brindle/present/LeadSheetSvg.h"
#include "brindle/present/ReadingText.h"
#include "brindle/present/SheetJson.h"
#include "brindle/present/ShowSong.h"
#include "brindle/present/SongSymbols.h"
#include "brindle/present/internal/ReadingBars.h"
#include "brindle/song/AnalyseSong.h"
#include "brindle/song/ReadSongHarmony.h"

#include <memory>
#include <string>
#include <vector>

using namespace brindle::border;

struct brindle_analysis {
    brindle::CSong mSong;
    brindle::CSongAnalysis mFound;
    brindle::CSongReading mReading;
    /// A sentence for each chord, or empty.
    std::vector<std::string> mExplanations;
    std::vector<brindle_center> mCenters;
};

namespace {

static_assert(BRINDLE_FUNCTION_NONE == static_cast<int>(brindle::THarmFunction_None));
static_assert(BRINDLE_RELATION_LINE_CLICHE == static_cast<int>(brindle::TChordRelation_LineCliche));

std::vector<brindle_center> CentersOf(const brindle::CHarmonicAnalyse& analyse) {
    std::vector<brindle_center> centers;
    for (const auto& signKey : analyse.mSignKeys) {
        for (const auto& center : signKey.mHarmCenters) {
            if (center.IsUndef()) continue;
            centers.push_back(
                {ToC(center.mHarmCenter.ToScaleLite()), center.mPosition, center.mChords.size()});
        }
    }
    return centers;
}

void Analyse(brindle_analysis& analysis, const brindle_analysis_options& options) {
    const brindle::CSignKeyLite key = FromC(options.stated_key);
    StateKey(key, analysis.mSong);
    brindle::CAnalyseSongOptions asked;
    asked.mReadings = (options.flags & BRINDLE_ANALYSE_ALTERNATIVES) != 0;
    asked.mCopies = (options.flags & BRINDLE_ANALYSE_COPIES) != 0;
    analysis.mFound = AnalyseSong(analysis.mSong, asked);
    analysis.mReading = ReadSongHarmony(analysis.mSong, {.mStatedKey = key});
    if ((options.flags & BRINDLE_ANALYSE_EXPLAIN) != 0) {
        analysis.mExplanations = Explain(analysis.mSong, analysis.mReading);
    }
    analysis.mCenters = CentersOf(analysis.mFound.mAnalyse);
}

brindle_chord_reading ChordAt(const brindle_analysis& analysis, size_t index) {
    const brindle::CChordReading& reading = analysis.mReading.mChords[index];
    const brindle::CHarmAnlsChordWithPos& chord = analysis.mSong.mChords[index];
    const auto& explanations = analysis.mExplanations;
    return {chord.mPosition,
            LengthAt(analysis.mSong, index),
            SymbolAt(analysis.mSong, index),
            ToC(brindle::CChordLite(chord)),
            ToC(reading.mKey),
            reading.mNumeral.c_str(),
            reading.mFunction,
            reading.mRelation,
            reading.mResolvesTo,
            reading.mUnder,
            reading.mDeceptive ? 1 : 0,
            index < explanations.size() ? explanations[index].c_str() : ""};
}

// What is told of a chord that is not there.
brindle_chord_reading NoChordReading() {
    const brindle::CChordReading reading;
    return {0.0,
            0.0,
            "",
            ToC(brindle::CChordLite()),
            ToC(reading.mKey),
            "",
            reading.mFunction,
            reading.mRelation,
            reading.mResolvesTo,
            reading.mUnder,
            0,
            ""};
}

// The text that `make` gives for an analysis.
template <class TMake>
brindle_status GiveTextOf(const brindle_analysis* analysis, char** text, const TMake& make) {
    if (text == nullptr) return FailForNull("text");
    *text = nullptr;
    if (analysis == nullptr) return FailForNull("analysis");
    return Guarded([&] { return GiveText(make(*analysis), text); });
}

constexpr int kLastNaming = BRINDLE_CHORDS_ROMAN;

// What stands for the chords as a brindle_chord_naming tells, which is in its range.
std::vector<std::string> SymbolsOf(const brindle_analysis& analysis, int naming,
                                   const brindle_style* style) {
    if (naming == BRINDLE_CHORDS_AS_WRITTEN) return analysis.mSong.mSymbols;
    return SongSymbols(analysis.mSong, analysis.mReading,
                       static_cast<brindle::TSongNaming>(naming - BRINDLE_CHORDS_IN_STYLE),
                       FromC(style));
}

brindle::CLeadSheetOptions FromC(const brindle_sheet_options& options) {
    brindle::CLeadSheetOptions result;
    result.mBarsPerLine = options.bars_per_line;
    result.mWidth = options.width;
    if (options.theme == BRINDLE_THEME_LIGHT) result.mTheme = brindle::TSheetTheme_Light;
    if (options.theme == BRINDLE_THEME_DARK) result.mTheme = brindle::TSheetTheme_Dark;
    return result;
}

brindle::CSong NamedSong(const brindle_analysis& analysis, const brindle_sheet_options& options) {
    brindle::CSong song = analysis.mSong;
    song.mSymbols = SymbolsOf(analysis, options.naming, &options.style);
    return song;
}

bool IsNaming(int naming) {
    return naming >= BRINDLE_CHORDS_AS_WRITTEN && naming <= kLastNaming;
}

}  // namespace

const char* brindle_function_name(int function) {
    if (function < 0 || function > BRINDLE_FUNCTION_NONE) return "";
    return NameOf(static_cast<brindle::THarmFunction>(function)).data();
}

const char* brindle_relation_name(int relation) {
    if (relation < 0 || relation > BRINDLE_RELATION_LINE_CLICHE) return "";
    return NameOf(static_cast<brindle::TChordRelation>(relation)).data();
}

brindle_status brindle_analyse(const brindle_song* song, const brindle_analysis_options* options,
                               brindle_analysis** analysis) {
    if (analysis == nullptr) return FailForNull("analysis");
    *analysis = nullptr;
    if (song == nullptr) return FailForNull("song");
    return Guarded([&] {
        auto result = std::make_unique<brindle_analysis>();
        result->mSong = song->mSong;
        const brindle_analysis_options usual{ToC(brindle::CSignKeyLite()), 0};
        Analyse(*result, options != nullptr ? *options : usual);
        *analysis = result.release();
        return BRINDLE_OK;
    });
}

void brindle_analysis_free(brindle_analysis* analysis) {
    delete analysis;
}

brindle_status brindle_analysis_key(const brindle_analysis* analysis, brindle_key* key) {
    if (key == nullptr) return FailForNull("key");
    *key = ToC(brindle::CSignKeyLite());
    if (analysis == nullptr) return FailForNull("analysis");
    ForgetFault();
    *key = ToC(analysis->mReading.mKey);
    if (!analysis->mReading.mKey.IsUndef()) return BRINDLE_OK;
    return Fail(BRINDLE_ERROR_NOT_FOUND, "a song without chords has no key");
}

double brindle_analysis_confidence(const brindle_analysis* analysis) {
    if (analysis == nullptr || analysis->mReading.mKey.IsUndef()) return -1.0;
    return analysis->mReading.mConfidence;
}

size_t brindle_analysis_chord_count(const brindle_analysis* analysis) {
    return analysis == nullptr ? 0 : ChordCountOf(analysis->mSong);
}

brindle_status brindle_analysis_chord(const brindle_analysis* analysis, size_t index,
                                      brindle_chord_reading* chord) {
    if (chord == nullptr) return FailForNull("chord");
    *chord = NoChordReading();
    if (analysis == nullptr) return FailForNull("analysis");
    ForgetFault();
    const size_t count = ChordCountOf(analysis->mSong);
    if (index >= count) return FailForIndex(index, count);
    *chord = ChordAt(*analysis, index);
    return BRINDLE_OK;
}

size_t brindle_analysis_region_count(const brindle_analysis* analysis) {
    return analysis == nullptr ? 0 : analysis->mReading.mRegions.size();
}

brindle_status brindle_analysis_region(const brindle_analysis* analysis, size_t index,
                                       brindle_region* region) {
    if (region == nullptr) return FailForNull("region");
    *region = {ToC(brindle::CSignKeyLite()), 0.0, 0.0, 0, 0};
    if (analysis == nullptr) return FailForNull("analysis");
    ForgetFault();
    const auto& regions = analysis->mReading.mRegions;
    if (index >= regions.size()) return FailForIndex(index, regions.size());
    const brindle::CKeyRegion& found = regions[index];
    *region = {ToC(found.mKey), found.mPosition, found.mEndPosition, found.mBegin,
               found.mEnd - found.mBegin};
    return BRINDLE_OK;
}

size_t brindle_analysis_center_count(const brindle_analysis* analysis) {
    return analysis == nullptr ? 0 : analysis->mCenters.size();
}

brindle_status brindle_analysis_center(const brindle_analysis* analysis, size_t index,
                                       brindle_center* center) {
    if (center == nullptr) return FailForNull("center");
    *center = {ToC(brindle::CScaleLite()), 0.0, 0};
    if (analysis == nullptr) return FailForNull("analysis");
    ForgetFault();
    const auto& centers = analysis->mCenters;
    if (index >= centers.size()) return FailForIndex(index, centers.size());
    *center = centers[index];
    return BRINDLE_OK;
}

brindle_status brindle_analysis_json(const brindle_analysis* analysis, char** text) {
    return GiveTextOf(analysis, text, [](const brindle_analysis& from) {
        return AnalysisJson(from.mSong, from.mFound, from.mReading, from.mExplanations);
    });
}

brindle_status brindle_analysis_text(const brindle_analysis* analysis, char** text) {
    return GiveTextOf(analysis, text, [](const brindle_analysis& from) {
        return ReadingText(from.mSong, from.mReading, {}, brindle::CPaint(false));
    });
}

brindle_status brindle_analysis_svg(const brindle_analysis* analysis, int picture, char** text) {
    return GiveTextOf(analysis, text, [picture](const brindle_analysis& from) {
        return picture == BRINDLE_PICTURE_TIME_AXIS ? AnalysisSvg(ShowSong(from.mSong, from.mFound))
                                                    : LeadSheetSvg(from.mSong, from.mReading);
    });
}

brindle_sheet_options brindle_sheet_options_default(void) {
    const brindle::CLeadSheetOptions usual;
    return {BRINDLE_CHORDS_AS_WRITTEN,
            {BRINDLE_NAMING_LETTERS, 0},
            usual.mBarsPerLine,
            BRINDLE_THEME_AUTO,
            usual.mWidth};
}

brindle_status brindle_analysis_sheet(const brindle_analysis* analysis,
                                      const brindle_sheet_options* options, char** text) {
    const auto used = options != nullptr ? *options : brindle_sheet_options_default();
    if (text != nullptr) *text = nullptr;
    if (!IsNaming(used.naming)) return Fail(BRINDLE_ERROR_ARGUMENT, "there is no such naming");
    return GiveTextOf(analysis, text, [&](const brindle_analysis& from) {
        return LeadSheetSvg(NamedSong(from, used), from.mReading, FromC(used));
    });
}

brindle_status brindle_analysis_sheet_json(const brindle_analysis* analysis,
                                           const brindle_sheet_options* options, char** text) {
    const auto used = options != nullptr ? *options : brindle_sheet_options_default();
    if (text != nullptr) *text = nullptr;
    if (!IsNaming(used.naming)) return Fail(BRINDLE_ERROR_ARGUMENT, "there is no such naming");
    return GiveTextOf(analysis, text, [&](const brindle_analysis& from) {
        return SheetJson(NamedSong(from, used), from.mReading);
    });
}

brindle_status brindle_text_runs_json(const char* symbol, int is_numeral, char** text) {
    if (text == nullptr) return FailForNull("text");
    *text = nullptr;
    if (symbol == nullptr) return FailForNull("symbol");
    return Guarded([&] { return GiveText(brindle::TextRunsJson(symbol, is_numeral != 0), text); });
}

brindle_status brindle_analysis_symbols(const brindle_analysis* analysis, int naming,
                                        const brindle_style* style, char** lines) {
    if (lines != nullptr) *lines = nullptr;
    if (!IsNaming(naming)) return Fail(BRINDLE_ERROR_ARGUMENT, "there is no such naming");
    return GiveTextOf(analysis, lines, [&](const brindle_analysis& from) {
        auto symbols = SymbolsOf(from, naming, style);
        symbols.resize(ChordCountOf(from.mSong));
        std::string text;
        for (const std::string& symbol : symbols) text += symbol + '\n';
        return text;
    });
}
