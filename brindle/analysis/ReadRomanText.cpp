// SPDX-License-Identifier: MIT
#include "brindle/analysis/ReadRomanText.h"

#include "brindle/analysis/RomanNumeral.h"
#include "brindle/analysis/internal/RomanTextWords.h"
#include "brindle/platform/Ascii.h"
#include "brindle/platform/Utf8.h"

#include <algorithm>
#include <array>
#include <optional>
#include <unordered_map>

namespace brindle {
namespace {

constexpr std::size_t kMostBars = 100'000;
constexpr std::size_t kMostCopiedWords = 100'000;
constexpr std::size_t kMostFaults = 1'000;

constexpr std::string_view kTooManyMeasures = "there are too many measures";
constexpr std::string_view kNotHigher =
    "the number of the measure is not higher than the one before";

/// What stands behind the number of a measure.
struct CMeasureText {
    std::string_view mText;
    std::string_view mLine;
    std::size_t mLineNumber = 0;
};

std::size_t CharactersBefore(std::string_view line, const char* end) {
    return CountUtf8Characters(line.substr(0, static_cast<std::size_t>(end - line.data())));
}

bool IsDoubleBar(std::string_view word) {
    return word.find_first_not_of("|:") == word.npos && word.find('|') != word.npos;
}

bool HasBeats(std::string_view line) {
    for (std::string_view word = TakeWord(line); !word.empty(); word = TakeWord(line)) {
        if (BeatOf(word)) return true;
    }
    return false;
}

constexpr CNumeralOptions kNumeralsOfRomanText{.mFigures = true, .mByKey = true};

// Headers have a colon, too, "Form: binary". Those that name a key are the key.
bool BeginsWithNumeral(std::string_view line) {
    const std::string_view word = TakeWord(line);
    if (BeatOf(word) || KeyOf(word)) return true;
    const CSignKeyLite anyKey({0, TEnh_n}, TSignKeyType_Major);
    return word.find(':') == word.npos &&
           !ReadNumeral(word, anyKey, kNumeralsOfRomanText).mChord.IsUndef();
}

bool IsWordForNoChord(std::string_view word) {
    return word == "NC" || word == "N.C." || word == "NC.";
}

class CRomanTextReader {
public:
    explicit CRomanTextReader(const CSignKeyLite& key) {
        if (!key.IsUndef()) mKey = key;
    }

    CRomanTextReading Read(std::string_view text);

private:
    CRomanTextReading mReading;
    std::unordered_map<int, CMeasureText> mMeasures;
    CTimeSignature mTime;
    std::optional<CSignKeyLite> mKey;
    double mEnd = 0.0;
    int mLastNumber = -1;
    std::size_t mCopiedWords = 0;
    /// Of a copy the faults are told already.
    bool mIsCopy = false;
    std::string_view mLine;
    std::size_t mLineNumber = 0;

    /// Where the next numeral of a measure stands.
    struct CPlaceInText {
        double mBarPosition = 0.0;
        double mBarLength = 0.0;
        double mPosition = 0.0;
        double mPickup = 0.0;  ///< how much of the bar is not there, at its beginning
        bool mHasBeat = false;
        bool mHasKey = false;
    };

    void ReadLine();
    void ReadMeasureLine(std::string_view rest, const CMeasureRange& range);
    void ReadHeader(std::size_t colon);
    void ReadTime(std::string_view value);
    void CopyMeasures(const CMeasureRange& range, std::string_view source);
    void FillTo(int number);
    void AddMeasure(int number, const CMeasureText& measure, bool hasLetter);
    void ReadTypedLine(std::string_view line);
    void ReadTypedWord(std::string_view word, CPlaceInText& place);
    [[nodiscard]] CPlaceInText PlaceOfNextBar() const;
    void CloseBar(int number, const CPlaceInText& place);
    void ReadWord(std::string_view word, CPlaceInText& place);
    void ReadBeat(double beat, std::string_view word, CPlaceInText& place);
    void ReadNumeralAt(std::string_view word, CPlaceInText& place);
    void AddChord(CRomanTextChord chord, std::string_view word, CPlaceInText& place);
    void SetLengths();

    void Fail(std::string_view what, std::string_view where, bool isNote = false);
};

void CRomanTextReader::Fail(std::string_view what, std::string_view where, bool isNote) {
    auto& list = isNote ? mReading.mNotes : mReading.mFaults;
    if (mIsCopy || list.size() >= kMostFaults) return;
    // What is expected and not there has its place at the end of the line.
    const char* const place = where.empty() ? mLine.data() + mLine.size() : where.data();
    list.push_back({mLineNumber, CharactersBefore(mLine, place) + 1, std::string(what)});
}

CRomanTextReading CRomanTextReader::Read(std::string_view text) {
    constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";
    if (text.starts_with(byteOrderMark)) text.remove_prefix(byteOrderMark.size());
    while (!text.empty()) {
        mLine = text.substr(0, text.find('\n'));
        text.remove_prefix(std::min(mLine.size() + 1, text.size()));
        ++mLineNumber;
        ReadLine();
    }
    SetLengths();
    return std::move(mReading);
}

void CRomanTextReader::ReadLine() {
    std::string_view line = Ascii::Trimmed(mLine);
    if (line.empty()) return;
    if (const auto range = TakeMeasures(line)) return ReadMeasureLine(line, *range);
    if (LooksLikeMeasure(line)) return Fail("a measure is written m1, m1a or m1-4", line);
    if (BeginsWithNumeral(line)) return ReadTypedLine(line);
    const std::size_t colon = mLine.find(':');
    if (colon != mLine.npos) return ReadHeader(colon);
    Fail("this is neither a measure nor a header", line);
}

void CRomanTextReader::ReadHeader(std::size_t colon) {
    const std::string_view name = Ascii::Trimmed(mLine.substr(0, colon));
    const std::string_view value = Ascii::Trimmed(mLine.substr(colon + 1));
    const auto set = [&](std::string& field) {
        if (field.empty()) field = value;
    };
    if (name == "Title" || name == "Piece") return set(mReading.mTitle);
    if (name == "Movement") return set(mReading.mMovement);
    if (name == "Composer") return set(mReading.mComposer);
    if (name == "Analyst") return set(mReading.mAnalyst);
    if (name == "Time Signature" || name == "Time signature") return ReadTime(value);
    if (name == "Pedal") return Fail("pedals are left out", name, true);
    // Another header says nothing of the music.
}

void CRomanTextReader::ReadTime(std::string_view value) {
    const auto time = TimeSignatureOf(value);
    if (!time) return Fail("this is no time signature", value);
    mTime = *time;
    if (!mReading.mTimes.empty() && mReading.mTimes.back().mPosition == mEnd) {
        mReading.mTimes.pop_back();
    }
    mReading.mTimes.push_back({time->mBeats, time->mBeatValue, mEnd});
}

void CRomanTextReader::ReadMeasureLine(std::string_view rest, const CMeasureRange& range) {
    rest = Ascii::Trimmed(rest);
    if (range.mIsVariant) return Fail("another reading of the measure is left out", mLine, true);
    if (rest.starts_with('=')) return CopyMeasures(range, Ascii::Trimmed(rest.substr(1)));
    if (range.mLast != range.mFirst) return Fail("more than one measure is a copy, with =", mLine);
    if (rest.starts_with(':')) rest.remove_prefix(1);
    const CMeasureText measure{rest, mLine, mLineNumber};
    if (!range.mHasLetter) mMeasures.insert_or_assign(range.mFirst, measure);
    AddMeasure(range.mFirst, measure, range.mHasLetter);
}

void CRomanTextReader::CopyMeasures(const CMeasureRange& range, std::string_view source) {
    const std::string_view typed = source;
    const auto from = TakeMeasures(source);
    if (!from || !Ascii::Trimmed(source).empty())
        return Fail("measures are expected behind =", typed);
    const int count = from->mLast - from->mFirst + 1;
    if (range.mLast - range.mFirst + 1 != count) {
        return Fail("the copy is not as long as what is copied", typed);
    }
    if (range.mFirst <= mLastNumber) Fail(kNotHigher, mLine);
    for (int i = 0; i < count; ++i) {
        const auto measure = mMeasures.find(from->mFirst + i);
        if (measure == mMeasures.end()) return Fail("a measure that is copied is not there", typed);
        const CMeasureText text = measure->second;
        mCopiedWords += text.mText.size() / 2 + 1;
        if (mCopiedWords > kMostCopiedWords) return Fail("too much is copied", typed);
        mMeasures.insert_or_assign(range.mFirst + i, text);
        mIsCopy = true;
        AddMeasure(range.mFirst + i, text, false);
        mIsCopy = false;
    }
}

// Measures that are not written go on with the chord before them.
void CRomanTextReader::FillTo(int number) {
    const double length = mTime.BarLength();
    while (mLastNumber >= 0 && mLastNumber + 1 < number && mReading.mBars.size() < kMostBars) {
        mReading.mBars.push_back({++mLastNumber, mEnd, length});
        mEnd += length;
    }
}

void CRomanTextReader::AddMeasure(int number, const CMeasureText& measure, bool hasLetter) {
    if (number < mLastNumber || (number == mLastNumber && !hasLetter)) {
        Fail(kNotHigher, mLine);
    }
    FillTo(number);
    if (mReading.mBars.size() >= kMostBars) return Fail(kTooManyMeasures, mLine);
    mLastNumber = number;
    CPlaceInText place = PlaceOfNextBar();
    std::string_view rest = measure.mText;
    bool isRead = false;
    bool isBehindBarLine = false;
    for (std::string_view word = TakeWord(rest); !word.empty(); word = TakeWord(rest)) {
        if (word == "|") {
            isBehindBarLine = isRead;
            continue;
        }
        if (isBehindBarLine) {
            if (mReading.mBars.size() + 1 >= kMostBars) return Fail(kTooManyMeasures, word);
            CloseBar(mLastNumber++, place);
            place = PlaceOfNextBar();
            isBehindBarLine = false;
        }
        ReadWord(word, place);
        isRead = true;
    }
    CloseBar(mLastNumber, place);
}

CRomanTextReader::CPlaceInText CRomanTextReader::PlaceOfNextBar() const {
    return {mEnd, mTime.BarLength(), mEnd};
}

void CRomanTextReader::CloseBar(int number, const CPlaceInText& place) {
    const double length = place.mBarLength - place.mPickup;
    mReading.mBars.push_back({number, place.mBarPosition, length});
    mEnd = place.mBarPosition + length;
}

void CRomanTextReader::ReadTypedLine(std::string_view line) {
    mLastNumber = std::max(mLastNumber, 0);
    if (HasBeats(line)) return AddMeasure(mLastNumber + 1, {line, mLine, mLineNumber}, false);
    CPlaceInText place = PlaceOfNextBar();
    for (std::string_view word = TakeWord(line); !word.empty(); word = TakeWord(line)) {
        if (mReading.mBars.size() >= kMostBars) return Fail(kTooManyMeasures, word);
        ReadTypedWord(word, place);
    }
    if (place.mPosition > place.mBarPosition) CloseBar(++mLastNumber, place);
}

void CRomanTextReader::ReadTypedWord(std::string_view word, CPlaceInText& place) {
    if (KeyOf(word)) return ReadWord(word, place);
    const bool isBarLine = IsDoubleBar(word);
    const bool isFull = place.mPosition >= place.mBarPosition + place.mBarLength;
    if (isFull || (isBarLine && place.mPosition > place.mBarPosition)) {
        CloseBar(++mLastNumber, place);
        place = PlaceOfNextBar();
    }
    if (isBarLine) {
        if (word != "|") mReading.mDoubleBars.push_back(place.mPosition);
        return;
    }
    if (word != ".") ReadNumeralAt(word, place);
    place.mPosition += mTime.BeatLength();
}

void CRomanTextReader::ReadWord(std::string_view word, CPlaceInText& place) {
    if (const auto beat = BeatOf(word)) return ReadBeat(*beat, word, place);
    if (const auto key = KeyOf(word)) {
        mKey = *key;
        place.mHasKey = true;
        return;
    }
    if (IsDoubleBar(word)) {
        mReading.mDoubleBars.push_back(place.mPosition);
        return;
    }
    ReadNumeralAt(word, place);
}

void CRomanTextReader::ReadBeat(double beat, std::string_view word, CPlaceInText& place) {
    const double into = (beat - 1.0) * mTime.BeatLength();
    const bool isPickup = mLastNumber == 0 && !place.mHasBeat && place.mPickup == 0.0;
    if (into >= place.mBarLength) return Fail("the bar has no such beat", word);
    if (isPickup) place.mPickup = into;
    const double position = place.mBarPosition + into - place.mPickup;
    if (position < place.mPosition) return Fail("the beat is before the one that was told", word);
    place.mPosition = position;
    place.mHasBeat = true;
}

void CRomanTextReader::ReadNumeralAt(std::string_view word, CPlaceInText& place) {
    CRomanTextChord chord;
    chord.mNumeral = word;
    chord.mPosition = place.mPosition;
    chord.mChord = CChordLite_NoChordYield;
    if (mKey) chord.mKey = *mKey;
    if (!IsWordForNoChord(word)) {
        if (!mKey) return Fail("a numeral needs a key before it, as in C: I", word);
        const CNumeralReading reading = ReadNumeral(word, *mKey, kNumeralsOfRomanText);
        if (reading.mChord.IsUndef()) {
            Fail(reading.mFault, word.substr(std::min(reading.mFaultOffset, word.size())));
        } else {
            chord.mChord = reading.mChord;
        }
    }
    AddChord(std::move(chord), word, place);
}

void CRomanTextReader::AddChord(CRomanTextChord chord, std::string_view word, CPlaceInText& place) {
    const bool isNewKey = mReading.mKeys.empty() || mReading.mKeys.back().mKey != chord.mKey;
    if (isNewKey && !chord.mKey.IsUndef()) {
        mReading.mKeys.push_back({chord.mKey, chord.mPosition});
    }
    const bool hasOther =
        !mReading.mChords.empty() && mReading.mChords.back().mPosition == chord.mPosition;
    if (!hasOther) {
        mReading.mChords.push_back(std::move(chord));
    } else if (place.mHasKey) {
        // One chord in two keys: where the old key ends and the new one begins.
        CRomanTextChord& pivot = mReading.mChords.back();
        chord.mKeyBefore = pivot.mKey;
        chord.mNumeralBefore = std::move(pivot.mNumeral);
        pivot = std::move(chord);
    } else {
        Fail("there is a chord on this beat already", word);
    }
    place.mHasKey = false;
}

void CRomanTextReader::SetLengths() {
    double end = mEnd;
    for (auto chord = mReading.mChords.rbegin(); chord != mReading.mChords.rend(); ++chord) {
        chord->mLength = end - chord->mPosition;
        end = chord->mPosition;
    }
    if (mReading.mTimes.empty() && !mReading.mBars.empty()) mReading.mTimes.push_back({4, 4, 0.0});
}

}  // namespace

CRomanTextReading ReadRomanText(std::string_view text, const CSignKeyLite& key) {
    return CRomanTextReader(key).Read(text);
}

}  // namespace brindle
