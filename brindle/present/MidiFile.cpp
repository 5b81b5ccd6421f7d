// SPDX-License-Identifier: MIT
#include "brindle/present/MidiFile.h"

#include <algorithm>
#include <bit>
#include <cmath>
#include <string_view>

namespace brindle {
namespace {

// The farthest tick that the distance between two events can reach.
constexpr std::int64_t kLastTick = 0x0FFFFFFF;
constexpr std::size_t kMostTracks = 0xFFFE;

// What comes first among events of one tick: a note that is struck again must have ended before,
// and an instrument must be there before its notes.
enum class TRank : std::uint8_t { NoteOff, Setting, NoteOn };

struct CEvent {
    std::int64_t mTick;
    TRank mRank;
    std::string mBytes;

    friend bool operator<(const CEvent& a, const CEvent& b) {
        return a.mTick != b.mTick ? a.mTick < b.mTick : a.mRank < b.mRank;
    }
};

std::int64_t Tick(std::int64_t tick) {
    return std::clamp<std::int64_t>(tick, 0, kLastTick);
}

char Byte(int value) {
    return static_cast<char>(static_cast<unsigned char>(value));
}

// 0 to 127.
char DataByte(int value) {
    return Byte(std::clamp(value, 0, 127));
}

char ChannelByte(int kind, int channel) {
    return Byte(kind | std::clamp(channel, 0, 15));
}

std::string BigEndian(std::uint32_t value, int bytes) {
    std::string text;
    for (int shift = 8 * (bytes - 1); shift >= 0; shift -= 8) {
        text += Byte(static_cast<int>(value >> shift & 0xFFU));
    }
    return text;
}

// Seven bits a byte, the highest first; all bytes but the last have their top bit set.
std::string VariableLength(std::uint32_t value) {
    std::string text(1, Byte(static_cast<int>(value & 0x7FU)));
    for (value >>= 7U; value != 0; value >>= 7U) {
        text.insert(text.begin(), Byte(static_cast<int>(value & 0x7FU) | 0x80));
    }
    return text;
}

std::string Meta(int kind, std::string_view content) {
    return std::string{Byte(0xFF), Byte(kind)} +
           VariableLength(static_cast<std::uint32_t>(content.size())) + std::string(content);
}

std::string Chunk(std::string_view kind, std::string_view content) {
    return std::string(kind) + BigEndian(static_cast<std::uint32_t>(content.size()), 4) +
           std::string(content);
}

CEvent Setting(std::int64_t tick, std::string bytes) {
    return {Tick(tick), TRank::Setting, std::move(bytes)};
}

CEvent TempoEvent(const CMidiTempo& tempo) {
    const double microseconds = 60e6 / tempo.mQuartersPerMinute;
    const bool isReal = microseconds >= 1.0;
    const double limited = isReal ? std::min(std::round(microseconds), 16777215.0) : 500000.0;
    return Setting(tempo.mTick, Meta(0x51, BigEndian(static_cast<std::uint32_t>(limited), 3)));
}

CEvent TimeSignatureEvent(const CMidiTimeSignature& signature) {
    const auto denominator = static_cast<unsigned>(std::clamp(signature.mDenominator, 1, 128));
    // A click for each quarter note, and eight 32nd notes to a quarter.
    const std::string content{Byte(std::clamp(signature.mNumerator, 1, 255)),
                              Byte(static_cast<int>(std::bit_width(denominator)) - 1), Byte(24),
                              Byte(8)};
    return Setting(signature.mTick, Meta(0x58, content));
}

CEvent KeySignatureEvent(const CMidiKeySignature& signature) {
    const std::string content{Byte(std::clamp(signature.mSharps, -7, 7)),
                              Byte(signature.mIsMinor ? 1 : 0)};
    return Setting(signature.mTick, Meta(0x59, content));
}

void AppendNote(const CMidiNote& note, std::vector<CEvent>& events) {
    if (note.mNoteNr < 0 || note.mNoteNr > 127) return;
    const std::int64_t begin = std::min(Tick(note.mTick), kLastTick - 1);
    const std::int64_t length = std::clamp<std::int64_t>(note.mDuration, 1, kLastTick - begin);
    const char key = Byte(note.mNoteNr);
    // A velocity of 0 would end the note.
    const char velocity = Byte(std::clamp(note.mVelocity, 1, 127));
    events.push_back({begin, TRank::NoteOn, {ChannelByte(0x90, note.mChannel), key, velocity}});
    events.push_back(
        {begin + length, TRank::NoteOff, {ChannelByte(0x80, note.mChannel), key, Byte(64)}});
}

std::string TrackChunk(std::vector<CEvent> events) {
    std::stable_sort(events.begin(), events.end());
    std::string content;
    std::int64_t now = 0;
    for (const CEvent& event : events) {
        content += VariableLength(static_cast<std::uint32_t>(event.mTick - now)) + event.mBytes;
        now = event.mTick;
    }
    content += VariableLength(0) + Meta(0x2F, "");
    return Chunk("MTrk", content);
}

std::string ConductorChunk(const CMidiPiece& piece) {
    std::vector<CEvent> events;
    for (const auto& signature : piece.mTimeSignatures) {
        events.push_back(TimeSignatureEvent(signature));
    }
    for (const auto& signature : piece.mKeySignatures) {
        events.push_back(KeySignatureEvent(signature));
    }
    for (const auto& tempo : piece.mTempos) events.push_back(TempoEvent(tempo));
    return TrackChunk(std::move(events));
}

std::string NotesChunk(const CMidiTrack& track) {
    std::vector<CEvent> events;
    if (!track.mName.empty()) events.push_back(Setting(0, Meta(0x03, track.mName)));
    for (const auto& program : track.mPrograms) {
        events.push_back(Setting(
            program.mTick, {ChannelByte(0xC0, program.mChannel), DataByte(program.mProgram)}));
    }
    for (const auto& note : track.mNotes) AppendNote(note, events);
    return TrackChunk(std::move(events));
}

}  // namespace

std::string MidiFileBytes(const CMidiPiece& piece) {
    const std::size_t tracks = std::min(piece.mTracks.size(), kMostTracks);
    const int ticks = std::clamp(piece.mTicksPerQuarter, 1, 32767);
    std::string bytes =
        Chunk("MThd", BigEndian(1, 2) + BigEndian(static_cast<std::uint32_t>(tracks + 1), 2) +
                          BigEndian(static_cast<std::uint32_t>(ticks), 2));
    bytes += ConductorChunk(piece);
    for (std::size_t track = 0; track < tracks; ++track) bytes += NotesChunk(piece.mTracks[track]);
    return bytes;
}

}  // namespace brindle
