// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/ScoreReader.h"

#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/musicxml/internal/MeasureReader.h"
#include "brindle/musicxml/internal/ScoreElements.h"
#include "brindle/platform/Ascii.h"
#include "brindle/platform/ReadNumber.h"
#include "brindle/platform/XmlStreamParser.h"

#include <cmath>
#include <deque>
#include <map>
#include <set>
#include <string>
#include <utility>

namespace brindle {

namespace {

using enum TScoreElement;

/// Finds its way through the parts and measures of a score and hands each measure to the reader of
/// measures. A score lists the measures of each part, or the parts of each measure.
class CScoreReader : public XmlStreamDelegate {
public:
    void didStartElement(XmlStreamParser& parser, std::string_view name,
                         const XmlAttributes& attributes) override {
        const TScoreElement element = ScoreElementOf(name);
        const TScoreElement parent = Parent();
        parser.setTextWanted(IsTextRead(element));
        mOpen.push_back(element);
        mText.clear();
        if (mOpen.size() == 1) {
            mIsScore = element == ScorePartwise || element == ScoreTimewise;
        } else if (!mIsScore) {
            return;
        } else if (element == Part && parent != Measure) {
            OpenPart(attributes.Value("id"));
        } else if (element == Measure && parent != Part) {
            ++mMeasureCount;
            mNumber = attributes.Value("number");
        } else if (element == Measure || element == Part) {
            if (element == Part) {
                OpenPart(attributes.Value("id"));
                AppendMissedMeasures();
            }
            OpenMeasure();
            TakeNumber(element == Measure ? attributes.Value("number") : mNumber);
        } else if (element == Sound) {
            TakeTempo(attributes.Value("tempo"));
            if (mReader) mReader->Started(element, parent, attributes);
        } else if (mReader) {
            mReader->Started(element, parent, attributes);
        }
    }

    void didEndElement(XmlStreamParser& parser, std::string_view) override {
        const TScoreElement element = mOpen.back();
        mOpen.pop_back();
        const TScoreElement parent = Parent();
        parser.setTextWanted(IsTextRead(parent));
        const std::string_view text = Ascii::Trimmed(mText);
        if (element == MovementTitle) {
            mMovementTitle = text;
        } else if (element == WorkTitle) {
            mWorkTitle = text;
        } else if (element == Creator) {
            AddMaker(text);
        } else if ((element == Measure && parent == Part) ||
                   (element == Part && parent == Measure)) {
            CloseMeasure();
        } else if (mReader) {
            mReader->Ended(element, parent, text);
        }
        mText.clear();
    }

    void foundCharacters(XmlStreamParser&, std::string_view text) override {
        if (mText.size() + text.size() <= kXmlMaxTextLength) mText += text;
    }

    [[nodiscard]] bool IsScore() const { return mIsScore; }
    [[nodiscard]] bool WasCut() const { return mAllMeasures > kMaxWrittenMeasures; }

    [[nodiscard]] CWrittenScore Take() {
        CWrittenScore score;
        score.mTitle = mMovementTitle.empty() ? mWorkTitle : mMovementTitle;
        score.mMakers = std::move(mMakers);
        score.mTempo = mTempo;
        JoinParts(score);
        return score;
    }

private:
    [[nodiscard]] TScoreElement Parent() const { return mOpen.empty() ? Other : mOpen.back(); }

    void OpenPart(std::string_view id) {
        const auto [it, isNew] = mPartOfId.try_emplace(std::string(id), mParts.size());
        if (isNew) mParts.emplace_back();
        mPart = &mParts[it->second];
    }

    void TakeNumber(std::string_view number) {
        if (!WasCut()) mPart->mMeasures.back().mNumber = number;
    }

    // The first one; marks of the metronome are given as sounds, too.
    void TakeTempo(std::string_view text) {
        const double tempo = text.empty() ? 0.0 : ReadDecimal(text);
        if (!mTempo && tempo > 0.0 && std::isfinite(tempo)) mTempo = tempo;
    }

    void AddMaker(std::string_view maker) {
        if (maker.empty() || mMakers.size() > kXmlMaxTextLength) return;
        // Who wrote the music and the words is written twice.
        if (!mMakerNames.emplace(maker).second) return;
        if (!mMakers.empty()) mMakers += ", ";
        mMakers += maker;
    }

    void Append(std::size_t count) {
        mAllMeasures += count;
        if (WasCut()) return;
        mPart->mMeasures.resize(mPart->mMeasures.size() + count);
        mPart->mMarks.resize(mPart->mMeasures.size());
    }

    // Measures in which a score that lists the parts of each measure did not name this part.
    void AppendMissedMeasures() {
        const std::size_t count = mPart->mMeasures.size() + 1;
        if (count < mMeasureCount) Append(mMeasureCount - count);
    }

    void OpenMeasure() {
        Append(1);
        if (WasCut()) return;
        mPart->mMarks.back().mRepeatForward = mPart->mRepeatBeginsNext;
        mPart->mRepeatBeginsNext = false;
        mReader.emplace(*mPart);
    }

    void CloseMeasure() {
        if (mReader) mReader->Finish();
        mReader.reset();
    }

    // The harmonies, keys and times are those of one part, the marks those of all.
    void JoinParts(CWrittenScore& score) {
        if (mParts.empty()) return;
        std::size_t chosen = 0;
        while (chosen < mParts.size() && !mParts[chosen].mHasHarmonies) ++chosen;
        if (chosen == mParts.size()) chosen = 0;
        score.mMeasures = std::move(mParts[chosen].mMeasures);
        score.mMarks = std::move(mParts[chosen].mMarks);
        for (std::size_t i = 0; i < mParts.size(); ++i) {
            if (i != chosen) Join(mParts[i], score);
        }
    }

    static void Join(const CScorePart& part, CWrittenScore& score) {
        TScoreMeasures& measures = score.mMeasures;
        if (measures.size() < part.mMeasures.size()) measures.resize(part.mMeasures.size());
        score.mMarks.resize(measures.size());
        for (std::size_t i = 0; i < part.mMeasures.size(); ++i) {
            const CScoreMeasure& other = part.mMeasures[i];
            CScoreMeasure& measure = measures[i];
            score.mMarks[i].Add(part.mMarks[i]);
            if (measure.mNumber.empty()) measure.mNumber = other.mNumber;
            if (measure.mRehearsal.empty()) measure.mRehearsal = other.mRehearsal;
            measure.mHasRehearsal |= other.mHasRehearsal;
            measure.mHasSlash |= other.mHasSlash;
            if (!measure.mTime) measure.mTime = other.mTime;
            if (!measure.mKey) measure.mKey = other.mKey;
            measure.mOtherLength = std::max(measure.mOtherLength, other.mLength);
        }
    }

    std::vector<TScoreElement> mOpen;
    std::string mText;  // of the innermost element, up to here
    bool mIsScore = false;
    std::string mMovementTitle;
    std::string mWorkTitle;
    std::string mMakers;
    std::set<std::string> mMakerNames;
    std::optional<double> mTempo;
    std::string mNumber;            // of the measure, where a score lists its parts
    std::deque<CScorePart> mParts;  // a deque, since readers of measures point into it
    std::map<std::string, std::size_t, std::less<>> mPartOfId;
    CScorePart* mPart = nullptr;
    std::size_t mMeasureCount = 0;  // begun in a score that lists the parts of each measure
    std::size_t mAllMeasures = 0;   // of all parts
    std::optional<CMeasureReader> mReader;
};

// The length of a bar that no part fills is that of its time.
void FillLengths(TScoreMeasures& measures) {
    std::optional<CScoreTime> time;
    for (CScoreMeasure& measure : measures) {
        if (measure.mTime) time = measure.mTime;
        if (measure.mLength <= 0) measure.mLength = measure.mOtherLength;
        if (measure.mLength <= 0 && time) measure.mLength = time->BarLength();
    }
}

}  // namespace

CScoreReading ReadScore(std::string_view bytes) {
    XmlStreamParser parser;
    CScoreReader reader;
    parser.setDelegate(&reader);
    CScoreReading reading;
    if (!parser.parse(bytes)) {
        reading.mError = parser.parserError();
    } else if (!reader.IsScore()) {
        reading.mError = XmlError{0, "no MusicXML score", 1, 1};
    } else {
        reading.mWasCut = reader.WasCut();
        reading.mScore = reader.Take();
        FillLengths(reading.mScore.mMeasures);
    }
    return reading;
}

}  // namespace brindle
