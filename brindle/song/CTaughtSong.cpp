// SPDX-License-Identifier: MIT
#include "brindle/song/CTaughtSong.h"

#include "brindle/song/ReadSongHarmony.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <cmath>

namespace brindle {
namespace {

constexpr std::int32_t kUsualPart = 8 * kTicksPerBar;
// Beyond it a position is none.
constexpr double kLastBar = 1e6;

/// Tells the tick of a position; asked in the order of time.
class CTickClock {
public:
    explicit CTickClock(const CSong& song) : mSong(song) {
        if (!song.mBars.empty() && song.mBars.front().mLength < Nominal(song.mBars.front())) {
            mUpbeat = 1;
        }
    }

    [[nodiscard]] std::int32_t At(double position) {
        const auto& bars = mSong.mBars;
        if (bars.empty()) return Ticks(position / mSong.mBeatsPerBar);
        while (mBar + 1 < bars.size() && bars[mBar + 1].mPosition <= position) ++mBar;
        const CSongBar& bar = bars[mBar];
        double within = (position - bar.mPosition) / Nominal(bar);
        // An upbeat ends at the bar line.
        if (mBar == 0 && mUpbeat == 1) within += 1.0 - bar.mLength / Nominal(bar);
        return Ticks(static_cast<double>(mBar) - mUpbeat + within);
    }

private:
    [[nodiscard]] double Nominal(const CSongBar& bar) const {
        if (bar.mTime.IsUndef()) return mSong.mBeatsPerBar;
        // Beats of a score are quarter notes; a text counts its own.
        return mSong.mFormat == TSongFormat_MusicXml ||
                       mSong.mFormat == TSongFormat_CompressedMusicXml
                   ? bar.mTime.mNumerator * 4.0 / bar.mTime.mDenominator
                   : mSong.mBeatsPerBar;
    }
    [[nodiscard]] static std::int32_t Ticks(double bars) {
        if (!(std::abs(bars) < kLastBar)) return 0;
        return static_cast<std::int32_t>(std::lround(bars * kTicksPerBar));
    }

    const CSong& mSong;
    std::size_t mBar = 0;
    int mUpbeat = 0;
};

std::vector<std::int32_t> SectionTicks(const CSong& song) {
    std::vector<double> positions;
    for (const CSongSection& section : song.mSections) positions.push_back(section.mPosition);
    for (const CSongRepeat& repeat : song.mRepeats) positions.push_back(repeat.mPosition);
    std::sort(positions.begin(), positions.end());
    CTickClock clock(song);
    std::vector<std::int32_t> ticks;
    for (const double position : positions) ticks.push_back(clock.At(position));
    return ticks;
}

void MarkEnds(const CSong& song, std::vector<CTaughtChord>& chords) {
    std::vector<std::int32_t> begins = SectionTicks(song);
    const std::int32_t end = chords.back().mBegin + chords.back().mLength;
    if (begins.empty()) {
        for (std::int32_t tick = kUsualPart; tick < end; tick += kUsualPart) begins.push_back(tick);
    }
    std::size_t next = 0;
    for (std::size_t ix = 0; ix + 1 < chords.size(); ++ix) {
        const std::int32_t behind = chords[ix + 1].mBegin;
        while (next < begins.size() && begins[next] <= chords[ix].mBegin) ++next;
        chords[ix].mEndsSection = next < begins.size() && begins[next] <= behind;
    }
    chords.back().mEndsSection = true;
}

/// Those that are of no length are played by nobody.
void SetLengths(std::int32_t end, std::vector<CTaughtChord>& chords) {
    for (std::size_t ix = 0; ix < chords.size(); ++ix) {
        const std::int32_t behind = ix + 1 < chords.size() ? chords[ix + 1].mBegin : end;
        chords[ix].mLength = std::max(1, behind - chords[ix].mBegin);
    }
}

}  // namespace

CTaughtSong TeachSong(const CSong& song) {
    CTaughtSong taught{song.mTitle, song.mStyle, {}, song.mBeatsPerBar, {}};
    if (song.mChords.empty() || !(song.mBeatsPerBar > 0.0)) return taught;
    const CSongReading reading = ReadSongHarmony(song);
    taught.mKey = reading.mKey;
    if (taught.mKey.IsUndef()) return taught;
    int tonic = taught.mKey.mRootKeyEnh.mKeyNr;
    CTickClock clock(song);
    const CChordLite* before = nullptr;
    for (std::size_t ix = 0; ix < song.mChords.size(); ++ix) {
        const CHarmAnlsChordWithPos& chord = song.mChords[ix];
        const CSignKeyLite& key = reading.mChords[ix].mKey;
        if (chord.IsUndef() || key.IsUndef() || chord.mSemitones.IsEmpty()) continue;
        if (before != nullptr && before->EqualWithoutEnh(chord)) continue;
        taught.mChords.push_back(
            {RelativeChordOf(chord, key, tonic), clock.At(chord.mPosition), 0, false});
        tonic = key.mRootKeyEnh.mKeyNr;
        before = &chord;
    }
    if (taught.mChords.empty()) return taught;
    SetLengths(clock.At(song.mChords.back().mPosition), taught.mChords);
    MarkEnds(song, taught.mChords);
    return taught;
}

std::vector<CChordLite> WrittenChordsOf(const CTaughtSong& song) {
    std::vector<CChordLite> chords;
    int above = 0;
    for (const CTaughtChord& taught : song.mChords) {
        above = FoldIntoOctave(above + taught.mChord.mShift);
        chords.push_back(
            ChordInKey(taught.mChord, KeyAbove(song.mKey, above, taught.mChord.mIsMinorKey)));
    }
    return chords;
}

CTaughtSong WithoutKeys(const CTaughtSong& song) {
    const CSignKeyLite cMajor({0, TEnh_n}, TSignKeyType_Major);
    CTaughtSong absolute = song;
    absolute.mKey = cMajor;
    const std::vector<CChordLite> chords = WrittenChordsOf(song);
    for (std::size_t ix = 0; ix < chords.size(); ++ix) {
        absolute.mChords[ix].mChord = RelativeChordOf(chords[ix], cMajor, 0);
    }
    return absolute;
}

}  // namespace brindle
