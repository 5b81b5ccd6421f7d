// SPDX-License-Identifier: MIT
#include "brindle/present/ImportMidi.h"

#include <algorithm>

namespace brindle {
namespace {

constexpr int kPercussionChannel = 9;
constexpr int kChannels = 16;

// Parts without a channel of their own share the channels that are not for percussion.
int ChannelOfPart(const CImportedPart& part, std::size_t index) {
    if (part.mChannel) return std::min(*part.mChannel, kChannels - 1);
    const int channel = static_cast<int>(index % (kChannels - 1));
    return channel < kPercussionChannel ? channel : channel + 1;
}

// Each instrument of a part may have a channel of its own; drums without one have that of drums.
int ChannelOfNote(const CImportedPart& part, const CPlayedNote& note, int channel) {
    if (note.mMidiChannel) return std::min(*note.mMidiChannel, kChannels - 1);
    return note.mIsUnpitched && !part.mChannel ? kPercussionChannel : channel;
}

// Negative for a note without a known pitch.
std::int64_t KeyOfNote(const CPlayedNote& note) {
    if (note.mMidiKey) return *note.mMidiKey;
    return note.mIsUnpitched && note.mNoteNr < 0 ? kUsualDrumKey : note.mNoteNr;
}

void AddPrograms(const CImportedPart& part, int channel, CMidiTrack& track) {
    if (part.mProgram) track.mPrograms.push_back({0, channel, *part.mProgram});
    for (const auto& [id, instrument] : part.mInstruments) {
        if (!instrument.mProgram || !instrument.mChannel || instrument.mChannel == part.mChannel) {
            continue;
        }
        track.mPrograms.push_back({0, *instrument.mChannel, *instrument.mProgram});
    }
}

CMidiTrack TrackOf(const CImportedPart& part, int channel) {
    CMidiTrack track;
    track.mName = part.mName;
    AddPrograms(part, channel, track);
    for (const CPlayedNote& note : part.mPlayedNotes) {
        const std::int64_t key = KeyOfNote(note);
        if (!note.mLength || key < 0) continue;
        track.mNotes.push_back({note.mPosition, *note.mLength, ChannelOfNote(part, note, channel),
                                static_cast<int>(key), note.mVelocity});
    }
    return track;
}

}  // namespace

CMidiPiece MidiPieceOf(const CImportedScore& score) {
    CMidiPiece piece;
    piece.mTicksPerQuarter = kImportTicksPerQuarter;
    piece.mTimeSignatures = score.mTimeSignatures;
    piece.mKeySignatures = score.mKeySignatures;
    // Many scores tell the tempo in each part.
    piece.mTempos = score.mTempos;
    const auto before = [](const CMidiTempo& a, const CMidiTempo& b) { return a.mTick < b.mTick; };
    const auto sameTick = [](const CMidiTempo& a, const CMidiTempo& b) {
        return a.mTick == b.mTick;
    };
    std::stable_sort(piece.mTempos.begin(), piece.mTempos.end(), before);
    piece.mTempos.erase(std::unique(piece.mTempos.begin(), piece.mTempos.end(), sameTick),
                        piece.mTempos.end());
    for (std::size_t n = 0; n < score.mParts.size(); ++n) {
        piece.mTracks.push_back(TrackOf(score.mParts[n], ChannelOfPart(score.mParts[n], n)));
    }
    return piece;
}

}  // namespace brindle
