// SPDX-License-Identifier: MIT
#include "brindle/song/SongWishes.h"

#include "brindle/analysis/RomanNumeral.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/ReadKeyText.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <optional>

namespace brindle {
namespace {

constexpr std::size_t kMostSheetBars = 1024;
constexpr std::string_view kBlanks = " \t\r\n,;";

std::vector<std::string_view> PiecesOf(std::string_view text, std::string_view between) {
    std::vector<std::string_view> pieces;
    for (std::size_t at = text.find_first_not_of(between); at < text.size();) {
        const std::size_t end = std::min(text.find_first_of(between, at), text.size());
        pieces.push_back(text.substr(at, end - at));
        at = text.find_first_not_of(between, end);
    }
    return pieces;
}

/// The texts between bar lines, without an empty one before the first and behind the last.
std::vector<std::string_view> BarTexts(std::string_view text) {
    std::vector<std::string_view> bars;
    for (std::size_t at = 0; at <= text.size();) {
        const std::size_t end = std::min(text.find('|', at), text.size());
        bars.push_back(text.substr(at, end - at));
        at = end + 1;
    }
    const auto isBlank = [](std::string_view bar) { return PiecesOf(bar, kBlanks).empty(); };
    if (!bars.empty() && isBlank(bars.back())) bars.pop_back();
    if (!bars.empty() && isBlank(bars.front())) bars.erase(bars.begin());
    return bars;
}

std::optional<CChordLite> TypedChord(std::string_view text) {
    const CChordTextReading reading = ReadChordText(text);
    if (reading.mKind != TChordText_Chord || reading.mChord.IsUndef()) return std::nullopt;
    return reading.mChord;
}

/// Reads the words of the bars of a sheet into one wish for each chord.
class CSheetWishReader {
public:
    explicit CSheetWishReader(int beatsPerBar)
        : mBeatsPerBar(static_cast<std::size_t>(beatsPerBar)) {}

    void ReadBar(std::string_view text) {
        std::vector<std::string_view> words = PiecesOf(text, kBlanks);
        if (words.empty()) words = {"_"};
        if (mBeatsPerBar % words.size() != 0) {
            return Fail(fmt::format("bar {}: {} words do not share its {} beats evenly",
                                    mReading.mBars + 1, words.size(), mBeatsPerBar));
        }
        const std::size_t beats = mBeatsPerBar / words.size();
        for (const std::string_view word : words) {
            ReadWord(word);
            if (mIsHeld && !mReading.mWishes.empty()) {
                auto& wished = mReading.mWishes.back().mBeats;
                wished.insert(wished.end(), beats, 0);
            }
            mBeat += beats;
        }
        ++mReading.mBars;
    }
    [[nodiscard]] CSongWishReading Take() { return std::move(mReading); }

private:
    void ReadWord(std::string_view word) {
        if (word == "." || word == "%") return;
        mIsHeld = word != "_";
        if (!mIsHeld) return;
        const auto chord = TypedChord(word);
        if (!chord) {
            mIsHeld = false;
            return Fail(
                fmt::format("bar {}: {} is no chord; a gap is _", mReading.mBars + 1, word));
        }
        mReading.mWishes.push_back({TSongWish_Bars,
                                    fmt::format("{} in bar {}", word, mReading.mBars + 1),
                                    {{*chord, false}},
                                    {},
                                    mBeat});
    }
    void Fail(std::string fault) {
        if (mReading.mFault.empty()) mReading.mFault = std::move(fault);
    }

    std::size_t mBeatsPerBar;
    std::size_t mBeat = 0;
    bool mIsHeld = false;
    CSongWishReading mReading;
};

/// "ii-V-I of F" without its key, which goes to `key`.
std::string_view WithoutKeyName(std::string_view text, CSignKeyLite& key) {
    for (const std::string_view word : {" of ", " in "}) {
        const std::size_t at = text.rfind(word);
        if (at == std::string_view::npos) continue;
        key = ReadKeyText(text.substr(at + word.size())).mSignKey;
        return text.substr(0, at);
    }
    return text;
}

/// Beside a perfect fifth b5 and #5 are tensions.
std::uint64_t ThirdAndFifth(std::uint64_t mask) {
    constexpr std::uint64_t kThirds = 0b11000;
    constexpr std::uint64_t kPerfectFifth = 1 << 7;
    constexpr std::uint64_t kAlteredFifths = 1 << 6 | 1 << 8;
    return mask & (kThirds | ((mask & kPerfectFifth) != 0 ? kPerfectFifth : kAlteredFifths));
}

/// The sevenths above a chord's root that its key has: V takes the minor one, I the major one.
std::uint64_t SeventhsIn(const CSignKeyLite& key, const CChordLite& chord) {
    constexpr std::uint64_t kMajor = 0b101010110101;
    constexpr std::uint64_t kMinorWithLeadingTone = 0b110110101101;
    const std::uint64_t scale =
        key.mSignKeyType == TSignKeyType_Minor ? kMinorWithLeadingTone : kMajor;
    const int degree = AbsKeyIntvlFromTo(key.mRootKeyEnh.mKeyNr, chord.mRootKeyEnh.mKeyNr);
    std::uint64_t sevenths = 0;
    for (const int seventh : {10, 11}) {
        if ((scale >> FoldIntoOctave(degree + seventh) & 1) != 0) sevenths |= 1ULL << seventh;
    }
    return sevenths;
}

/// A numeral without a figure stands for the chords of its kind that the key has.
std::optional<CWishedChord> WishedNumeral(std::string_view text, const CSignKeyLite& key) {
    const auto chord = ChordFromNumeral(text, key);
    if (!chord) return std::nullopt;
    const bool isPlain = text.find_first_not_of("ivIVb#") == std::string_view::npos;
    const bool isAltered = text.find_first_of("b#") != std::string_view::npos;
    return CWishedChord{*chord, isPlain,
                        isAltered ? CWishedChord::kBothSevenths : SeventhsIn(key, *chord)};
}

std::optional<CWishedChord> WishedChordOf(std::string_view text, const CSignKeyLite& key) {
    if (const auto chord = TypedChord(text)) return CWishedChord{*chord, false};
    return WishedNumeral(text, key);
}

bool AreAllChords(const std::vector<std::string_view>& words, const CSignKeyLite& key) {
    return std::all_of(words.begin(), words.end(),
                       [&](std::string_view word) { return WishedChordOf(word, key); });
}

}  // namespace

bool CWishedChord::Fits(int root, int bass, std::uint64_t mask) const {
    if (root != FoldIntoOctave(mChord.mRootKeyEnh.mKeyNr)) return false;
    if (mIsKind) {
        return ThirdAndFifth(mask) == ThirdAndFifth(mChord.mSemitones.Mask()) &&
               (mask & kBothSevenths & ~mSevenths) == 0;
    }
    const int wishedBass = mChord.HasBassNote() ? FoldIntoOctave(mChord.mBassKeyEnh.mKeyNr) : root;
    return (mAnyBass || bass == wishedBass) && mask == mChord.mSemitones.Mask();
}

CSongWishReading ReadSheetWishes(std::string_view text, int beatsPerBar) {
    const std::vector<std::string_view> bars = BarTexts(text);
    CSongWishReading empty;
    if (bars.empty()) empty.mFault = "there are no bars";
    if (bars.size() > kMostSheetBars) empty.mFault = "there are too many bars";
    if (!empty.mFault.empty()) return empty;
    CSheetWishReader reader(beatsPerBar);
    for (const std::string_view bar : bars) reader.ReadBar(bar);
    return reader.Take();
}

CSongWishReading ReadChordsWish(TSongWishKind kind, std::string_view text,
                                const CSignKeyLite& key) {
    CSongWishReading reading;
    CSignKeyLite ofKey = key;
    const std::string_view chords = WithoutKeyName(text, ofKey);
    if (ofKey.IsUndef()) {
        reading.mFault = fmt::format("{}: there is no such key", text);
        return reading;
    }
    // C-7 is a chord, and ii-V-I are three.
    std::vector<std::string_view> words = PiecesOf(chords, kBlanks);
    if (!AreAllChords(words, ofKey)) words = PiecesOf(chords, " \t\r\n,;-");
    CSongWish wish{kind, std::string(text), {}, {}, 0};
    for (const std::string_view word : words) {
        const auto chord = WishedChordOf(word, ofKey);
        if (!chord) {
            reading.mFault = fmt::format("{} is neither a chord nor a numeral", word);
            return reading;
        }
        wish.mChords.push_back(*chord);
        if (kind != TSongWish_Never) continue;
        wish.mChords.back().mSevenths = CWishedChord::kBothSevenths;
        wish.mChords.back().mAnyBass = !chord->mChord.HasBassNote();
    }
    if (words.empty()) {
        reading.mFault = "there are no chords";
    } else {
        reading.mWishes.push_back(std::move(wish));
    }
    return reading;
}

std::vector<CSongWish> BluesWishes(const CSignKeyLite& key, int beatsPerBar, std::size_t choruses) {
    struct CBluesBar {
        std::size_t mBar;
        const char* mMajor;
        const char* mMinor;
    };
    constexpr std::size_t chorus = 12;
    constexpr auto bars = std::to_array<CBluesBar>(
        {{0, "I", "i"}, {4, "IV", "iv"}, {6, "I", "i"}, {8, "V", "V"}, {10, "I", "i"}});
    const bool isMinor = key.mSignKeyType == TSignKeyType_Minor;
    std::vector<CSongWish> wishes;
    for (std::size_t ix = 0; ix < choruses * bars.size(); ++ix) {
        const CBluesBar& row = bars[ix % bars.size()];
        const char* const numeral = isMinor ? row.mMinor : row.mMajor;
        const std::size_t bar = ix / bars.size() * chorus + row.mBar;
        const auto chord = WishedNumeral(numeral, key);
        if (!chord) continue;
        wishes.push_back({TSongWish_Bars,
                          fmt::format("a blues has {} in bar {}", numeral, bar + 1),
                          {*chord},
                          {0},
                          bar * static_cast<std::size_t>(beatsPerBar)});
    }
    return wishes;
}

}  // namespace brindle
