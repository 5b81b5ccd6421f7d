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

CMidiTrack TrackOf(const CImportedPart& part, int channel) {
    CMidiTrack track;
    track.mName = part.mName;
    if (part.mProgram) track.mPrograms.push_back({0, channel, *part.mProgram});
    for (const CImportedEvent& event : part.mEvents) {
        if (!event.mIsNote || !event.mLength || event.mNoteNr < 0) continue;
        track.mNotes.push_back({event.mPosition, *event.mLength, channel,
                                static_cast<int>(event.mNoteNr), event.mVelocity});
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
