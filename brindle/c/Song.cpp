// SPDX-License-Identifier: MIT
#include "brindle/c/internal/Border.h"
#include "brindle/c/internal/Handles.h"
#include "brindle/c/internal/Values.h"

#include "brindle/present/PrintableSong.h"
#include "brindle/present/internal/ReadingBars.h"
#include "brindle/song/ReadSong.h"
#include "brindle/song/SongBeats.h"

#include <memory>
#include <string>
#include <vector>

using namespace brindle::border;

namespace {

constexpr int kLastFormat = BRINDLE_FORMAT_ROMAN_TEXT;
static_assert(kLastFormat == brindle::TSongFormat_RomanText);

// What is wrong with options; null if nothing is.
const char* FaultOf(const brindle_song_options& options) {
    if (options.format < BRINDLE_FORMAT_AUTO || options.format > kLastFormat) {
        return "there is no such format";
    }
    const bool areBeats = brindle::AreSongBeats(options.beats_per_bar) &&
                          brindle::AreSongBeats(options.beats_per_chord);
    return areBeats ? nullptr : "beats are numbers of 1/1024 to 1024";
}

brindle::CSongOptions FromC(const brindle_song_options& options) {
    brindle::CSongOptions result;
    result.mFormat = static_cast<brindle::TSongFormat>(options.format);
    result.mBeatsPerBar = options.beats_per_bar;
    result.mBeatsPerChord = options.beats_per_chord;
    result.mEven = options.even != 0;
    result.mLenient = options.lenient != 0;
    result.mChordTextPrefs = ChordOptionsOf(options.chord_flags);
    return result;
}

// `read` gives the song for options.
template <class TRead>
brindle_status ReadWith(const brindle_song_options* options, brindle_song** song,
                        const TRead& read) {
    return Guarded([&] {
        const auto used = options != nullptr ? *options : brindle_song_options_default();
        if (const char* const fault = FaultOf(used)) return Fail(BRINDLE_ERROR_ARGUMENT, fault);
        auto result = std::make_unique<brindle_song>(brindle_song{read(FromC(used))});
        MakePrintable(result->mSong);
        *song = result.release();
        return BRINDLE_OK;
    });
}

// The element of a list of a song, or null with the fault told.
template <class TElement>
const TElement* ElementAt(const brindle_song* song, std::vector<TElement> brindle::CSong::*list,
                          size_t index) {
    ForgetFault();
    if (song == nullptr) {
        FailForNull("song");
        return nullptr;
    }
    const auto& elements = song->mSong.*list;
    if (index < elements.size()) return &elements[index];
    FailForIndex(index, elements.size());
    return nullptr;
}

}  // namespace

brindle_song_options brindle_song_options_default(void) {
    const brindle::CSongOptions usual;
    return {BRINDLE_FORMAT_AUTO, usual.mBeatsPerBar, usual.mBeatsPerChord, 0, 0, 0};
}

brindle_status brindle_song_read(const void* bytes, size_t size,
                                 const brindle_song_options* options, brindle_song** song) {
    if (song == nullptr) return FailForNull("song");
    *song = nullptr;
    if (bytes == nullptr && size > 0) return FailForNull("bytes");
    return ReadWith(options, song, [&](const brindle::CSongOptions& used) {
        return brindle::ReadSong(BytesOf(bytes, size), used);
    });
}

brindle_status brindle_song_read_file(const char* path, const brindle_song_options* options,
                                      brindle_song** song) {
    if (song == nullptr) return FailForNull("song");
    *song = nullptr;
    if (path == nullptr) return FailForNull("path");
    return ReadWith(options, song, [&](const brindle::CSongOptions& used) {
        return brindle::ReadSongFile(path, used);
    });
}

void brindle_song_free(brindle_song* song) {
    delete song;
}

int brindle_song_has_fault(const brindle_song* song) {
    return song != nullptr && song->mSong.HasFault() ? 1 : 0;
}

size_t brindle_song_fault_count(const brindle_song* song) {
    return song == nullptr ? 0 : song->mSong.mFaults.size();
}

brindle_status brindle_song_fault(const brindle_song* song, size_t index, brindle_fault* fault) {
    if (fault == nullptr) return FailForNull("fault");
    *fault = {0, 0, 0, ""};
    const auto* const found = ElementAt(song, &brindle::CSong::mFaults, index);
    if (found == nullptr) return BRINDLE_ERROR_ARGUMENT;
    *fault = {found->mLine, found->mColumn, found->mIsNote ? 1 : 0, found->mText.c_str()};
    return BRINDLE_OK;
}

brindle_format brindle_song_format(const brindle_song* song) {
    return song == nullptr ? BRINDLE_FORMAT_AUTO : static_cast<brindle_format>(song->mSong.mFormat);
}

const char* brindle_song_title(const brindle_song* song) {
    return song == nullptr ? "" : song->mSong.mTitle.c_str();
}

const char* brindle_song_makers(const brindle_song* song) {
    return song == nullptr ? "" : song->mSong.mMakers.c_str();
}

const char* brindle_song_style(const brindle_song* song) {
    return song == nullptr ? "" : song->mSong.mStyle.c_str();
}

brindle_status brindle_song_stated_key(const brindle_song* song, brindle_key* key) {
    if (key == nullptr) return FailForNull("key");
    *key = ToC(brindle::CSignKeyLite());
    if (song == nullptr) return FailForNull("song");
    ForgetFault();
    const auto& stated = song->mSong.mStatedKey;
    if (!stated) return Fail(BRINDLE_ERROR_NOT_FOUND, "the song states no key");
    *key = ToC(*stated);
    return BRINDLE_OK;
}

double brindle_song_tempo(const brindle_song* song) {
    return song == nullptr ? 0.0 : song->mSong.mTempo.value_or(0.0);
}

double brindle_song_beats_per_bar(const brindle_song* song) {
    return song == nullptr ? 0.0 : song->mSong.mBeatsPerBar;
}

size_t brindle_song_chord_count(const brindle_song* song) {
    return song == nullptr ? 0 : ChordCountOf(song->mSong);
}

brindle_status brindle_song_chord_at(const brindle_song* song, size_t index,
                                     brindle_song_chord* chord) {
    if (chord == nullptr) return FailForNull("chord");
    *chord = {0.0, 0.0, "", ToC(brindle::CChordLite())};
    if (song == nullptr) return FailForNull("song");
    ForgetFault();
    const size_t count = ChordCountOf(song->mSong);
    if (index >= count) return FailForIndex(index, count);
    const brindle::CHarmAnlsChordWithPos& found = song->mSong.mChords[index];
    *chord = {found.mPosition, LengthAt(song->mSong, index), SymbolAt(song->mSong, index),
              ToC(brindle::CChordLite(found))};
    return BRINDLE_OK;
}

size_t brindle_song_bar_count(const brindle_song* song) {
    return song == nullptr ? 0 : song->mSong.mBars.size();
}

brindle_status brindle_song_bar(const brindle_song* song, size_t index, brindle_bar* bar) {
    if (bar == nullptr) return FailForNull("bar");
    *bar = {"", 0.0, 0.0, 0, 0};
    const auto* const found = ElementAt(song, &brindle::CSong::mBars, index);
    if (found == nullptr) return BRINDLE_ERROR_ARGUMENT;
    *bar = {found->mNumber.c_str(), found->mPosition, found->mLength, found->mTime.mNumerator,
            found->mTime.mDenominator};
    return BRINDLE_OK;
}

size_t brindle_song_section_count(const brindle_song* song) {
    return song == nullptr ? 0 : song->mSong.mSections.size();
}

brindle_status brindle_song_section(const brindle_song* song, size_t index,
                                    brindle_section* section) {
    if (section == nullptr) return FailForNull("section");
    *section = {"", 0.0};
    const auto* const found = ElementAt(song, &brindle::CSong::mSections, index);
    if (found == nullptr) return BRINDLE_ERROR_ARGUMENT;
    *section = {found->mName.c_str(), found->mPosition};
    return BRINDLE_OK;
}
