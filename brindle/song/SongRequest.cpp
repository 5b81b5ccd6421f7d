// SPDX-License-Identifier: MIT
#include "brindle/song/SongRequest.h"

#include "brindle/platform/Ascii.h"
#include "brindle/song/SongStyles.h"

#include <fmt/format.h>

#include <algorithm>
#include <string_view>

namespace brindle {
namespace {

constexpr std::size_t kUsualBars = 32;
constexpr std::size_t kBluesBars = 12;
constexpr const char* kBlues = "blues";

/// Without white space and in small letters.
std::string PlainForm(std::string_view text) {
    std::string plain;
    for (const char c : text) {
        if (!Ascii::IsWhiteSpace(c)) plain += Ascii::ToLower(c);
    }
    return plain;
}

/// Small letters up to e are those of parts; beyond, they are words: "verse".
std::string LettersOf(const std::string& text) {
    std::string letters;
    for (const char c : text) {
        if (Ascii::IsWhiteSpace(c)) continue;
        letters += c >= 'a' && c <= 'e' ? Ascii::ToUpper(c) : c;
    }
    return letters;
}

class CRequestReader {
public:
    explicit CRequestReader(const CSongRequest& request)
        : mRequest(request), mIsBlues(PlainForm(request.mForm) == kBlues) {}

    [[nodiscard]] CSongRequestReading Read() {
        mReading.mOptions.mKey = mRequest.mKey;
        mReading.mOptions.mBeatsPerBar = mRequest.mBeatsPerBar;
        // Wishes are counted in beats and bars; WriteSong tells that these are none.
        if (!AreWritable()) {
            if (mRequest.mBars > 0) mReading.mOptions.mBars = mRequest.mBars;
            return mReading;
        }
        CSongWishReading sheet;
        if (!mRequest.mSheet.empty()) {
            sheet = ReadSheetWishes(mRequest.mSheet, mRequest.mBeatsPerBar);
        }
        ReadForm(sheet.mBars);
        if (sheet.mBars > mReading.mOptions.mBars && sheet.mFault.empty()) {
            sheet.mFault = fmt::format("{} bars are more than the {} of the song", sheet.mBars,
                                       mReading.mOptions.mBars);
        }
        Take("sheet", std::move(sheet));
        TakeChord("begins", TSongWish_Begin, mRequest.mBegins);
        TakeChord("ends", TSongWish_End, mRequest.mEnds);
        TakeRows();
        TakeChords("never", TSongWish_Never, mRequest.mNever);
        return std::move(mReading);
    }

private:
    [[nodiscard]] bool AreWritable() const {
        return mRequest.mBeatsPerBar >= 1 && mRequest.mBeatsPerBar <= kMostWrittenBeatsPerBar &&
               mRequest.mBars <= kMostWrittenBars;
    }
    void ReadForm(std::size_t sheetBars) {
        std::size_t& bars = mReading.mOptions.mBars;
        bars = mRequest.mBars;
        if (mIsBlues) return ReadBlues(bars);
        mReading.mOptions.mForm = LettersOf(mRequest.mForm);
        const bool isFree = mReading.mOptions.mForm.empty();
        if (bars == 0) bars = sheetBars > 0 && isFree ? sheetBars : kUsualBars;
        if (isFree && mRequest.mSheet.empty() && bars == kUsualBars) {
            mReading.mOptions.mForm = "AABA";
        }
    }
    void ReadBlues(std::size_t& bars) {
        if (bars == 0) bars = kBluesBars;
        mReading.mStyle = kBlues;
        if (bars % kBluesBars != 0) return Fail("form", "a blues has 12 bars, or 24, 36 and so on");
        CSongWishReading blues;
        blues.mWishes = BluesWishes(mRequest.mKey, mRequest.mBeatsPerBar, bars / kBluesBars);
        Take("form blues:", std::move(blues));
    }
    void TakeRows() {
        const std::string_view text = mRequest.mContains;
        for (std::size_t at = 0; at < text.size();) {
            const std::size_t end = std::min(text.find(';', at), text.size());
            TakeChords("contains", TSongWish_Contains, text.substr(at, end - at));
            at = end + 1;
        }
    }
    void TakeChord(const char* name, TSongWishKind kind, std::string_view text) {
        const std::size_t before = mReading.mOptions.mWishes.size();
        TakeChords(name, kind, text);
        const auto& wishes = mReading.mOptions.mWishes;
        if (wishes.size() > before && wishes.back().mChords.size() > 1) {
            Fail(name, "one chord is wanted here; a sheet takes several");
        }
    }
    void TakeChords(const char* name, TSongWishKind kind, std::string_view text) {
        if (!text.empty()) Take(name, ReadChordsWish(kind, text, mRequest.mKey));
    }
    void Take(const char* name, CSongWishReading reading) {
        if (!reading.mFault.empty()) return Fail(name, reading.mFault);
        for (CSongWish& wish : reading.mWishes) {
            wish.mText = fmt::format("{} {}", name, wish.mText);
            mReading.mOptions.mWishes.push_back(std::move(wish));
        }
    }
    void Fail(const char* name, const std::string& fault) {
        if (mReading.mFault.empty()) mReading.mFault = fmt::format("{}: {}", name, fault);
    }

    const CSongRequest& mRequest;
    bool mIsBlues;
    CSongRequestReading mReading;
};

}  // namespace

CSongRequestReading ReadSongRequest(const CSongRequest& request) {
    return CRequestReader(request).Read();
}

CWrittenSong WriteRequestedSong(const CSongModel& model, const CSongRequestReading& request) {
    if (!request.mFault.empty()) {
        CWrittenSong refused;
        refused.mFault = request.mFault;
        return refused;
    }
    if (request.mStyle.empty()) return WriteSong(model, request.mOptions);
    const auto ofStyle = ModelOfStyle(model, request.mStyle);
    return WriteSong(ofStyle ? *ofStyle : model, request.mOptions);
}

}  // namespace brindle
