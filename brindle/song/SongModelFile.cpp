// SPDX-License-Identifier: MIT
#include "brindle/song/SongModelFile.h"

#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/platform/JsonString.h"
#include "brindle/theory/ReadKeyText.h"

#include <fmt/format.h>
#include <nlohmann/json.hpp>

#include <cstdint>
#include <utility>

namespace brindle {
namespace {

using Json = nlohmann::json;

constexpr int kVersion = 1;
constexpr std::string_view kMark = "BrindleSongModel";
// A chord is its code, its length in ticks, and 1 if it ends a part.
constexpr std::size_t kNumbersPerChord = 3;
constexpr std::int32_t kMostTicks = 50'000'000;

/// A sum of FNV-1a over all that a file tells.
class CFileSum {
public:
    void Add(std::string_view text) {
        for (const char c : text) AddByte(static_cast<unsigned char>(c));
        AddByte(0);
    }
    void Add(std::uint32_t number) {
        for (int shift = 0; shift < 32; shift += 8) AddByte(number >> shift & 0xFFU);
    }
    [[nodiscard]] std::string Text() const { return fmt::format("{:016x}", mSum); }

private:
    void AddByte(std::uint32_t byte) { mSum = (mSum ^ byte) * 0x100000001B3U; }

    std::uint64_t mSum = 0xCBF29CE484222325U;
};

std::string KeyNameOf(const CSignKeyLite& key) {
    return WriteNoteName(key.mRootKeyEnh) +
           (key.mSignKeyType == TSignKeyType_Minor ? " minor" : " major");
}

std::string SumOf(const std::vector<CTaughtSong>& songs) {
    CFileSum sum;
    for (const CTaughtSong& song : songs) {
        sum.Add(song.mTitle);
        sum.Add(song.mStyle);
        sum.Add(KeyNameOf(song.mKey));
        sum.Add(fmt::format("{}", song.mBeatsPerBar));
        sum.Add(static_cast<std::uint32_t>(song.mChords.empty() ? 0 : song.mChords[0].mBegin));
        for (const CTaughtChord& chord : song.mChords) {
            sum.Add(chord.mChord.Code());
            sum.Add(static_cast<std::uint32_t>(chord.mLength));
            sum.Add(chord.mEndsSection ? 1U : 0U);
        }
    }
    return sum.Text();
}

void AppendSong(const CTaughtSong& song, std::string& text) {
    text += fmt::format(R"({{"Title":{},"Style":{},"Key":"{}","BeatsPerBar":{},"Begin":{},)",
                        JsonString(song.mTitle), JsonString(song.mStyle), KeyNameOf(song.mKey),
                        song.mBeatsPerBar, song.mChords.front().mBegin);
    text += "\"Chords\":[";
    for (std::size_t ix = 0; ix < song.mChords.size(); ++ix) {
        const CTaughtChord& chord = song.mChords[ix];
        text += fmt::format("{}{},{},{}", ix == 0 ? "" : ",", chord.mChord.Code(), chord.mLength,
                            chord.mEndsSection ? 1 : 0);
    }
    text += "]}";
}

/// Takes the values of a file apart; the first one that makes no sense is kept as the fault.
class CSongModelReader {
public:
    [[nodiscard]] std::string& Fault() { return mFault; }

    [[nodiscard]] CTaughtSong SongOf(const Json& json) {
        CTaughtSong song;
        song.mTitle = TextOf(json, "Title");
        song.mStyle = TextOf(json, "Style");
        song.mKey = ReadKeyText(TextOf(json, "Key")).mSignKey;
        if (song.mKey.IsUndef()) Fail("a key that is none");
        song.mBeatsPerBar = NumberOf(json, "BeatsPerBar", 1.0 / 64, 1024.0);
        const auto begin =
            static_cast<std::int32_t>(NumberOf(json, "Begin", -kMostTicks, kMostTicks));
        ReadChords(json, begin, song.mChords);
        return song;
    }

    void Fail(std::string_view what) {
        if (mFault.empty()) mFault = fmt::format("has {}", what);
    }

private:
    [[nodiscard]] std::string TextOf(const Json& json, const char* name) {
        const auto member = json.find(name);
        if (member == json.end() || !member->is_string()) {
            Fail(fmt::format("a song without {}", name));
            return {};
        }
        return member->get<std::string>();
    }
    [[nodiscard]] double NumberOf(const Json& json, const char* name, double least, double most) {
        const auto member = json.find(name);
        const double value =
            member != json.end() && member->is_number() ? member->get<double>() : least - 1;
        if (value >= least && value <= most) return value;
        Fail(fmt::format("a song without {}", name));
        return least;
    }
    void ReadChords(const Json& json, std::int32_t begin, std::vector<CTaughtChord>& chords) {
        const auto numbers = json.find("Chords");
        if (numbers == json.end() || !numbers->is_array() || numbers->empty() ||
            numbers->size() % kNumbersPerChord != 0) {
            return Fail("a song without Chords");
        }
        for (std::size_t ix = 0; ix < numbers->size(); ix += kNumbersPerChord) {
            const auto chord = CRelativeChord::FromCode(IntegerOf((*numbers)[ix]));
            const std::uint32_t length = IntegerOf((*numbers)[ix + 1]);
            const std::uint32_t isEnd = IntegerOf((*numbers)[ix + 2]);
            if (!chord || length == 0 || length > kMostTicks || isEnd > 1 || begin > kMostTicks) {
                return Fail("a chord that is none");
            }
            chords.push_back({*chord, begin, static_cast<std::int32_t>(length), isEnd == 1});
            begin += static_cast<std::int32_t>(length);
        }
    }
    /// A number that makes no sense is larger than all that do.
    [[nodiscard]] static std::uint32_t IntegerOf(const Json& json) {
        constexpr std::uint32_t none = 0xFFFFFFFFU;
        if (!json.is_number_unsigned()) return none;
        const auto value = json.get<std::uint64_t>();
        return value < none ? static_cast<std::uint32_t>(value) : none;
    }

    std::string mFault;
};

CSongModelReading RefusedModel(std::string fault) {
    return {CSongModel{}, std::move(fault)};
}

}  // namespace

std::string SongModelText(const CSongModel& model) {
    std::string text = fmt::format("{{\"{}\":{},\"Sum\":\"{}\",\"Songs\":[", kMark, kVersion,
                                   SumOf(model.Songs()));
    const char* between = "\n";
    for (const CTaughtSong& song : model.Songs()) {
        text += between;
        AppendSong(song, text);
        between = ",\n";
    }
    return text + "\n]}\n";
}

bool LooksLikeSongModel(std::string_view text) {
    return text.substr(0, 64).find(kMark) != std::string_view::npos;
}

CSongModelReading ReadSongModel(std::string_view text) {
    const Json json = ParseJson(text);
    if (!json.is_object() || !json.contains(kMark)) return RefusedModel("is no song model");
    const Json& version = json[std::string(kMark)];
    if (!version.is_number_unsigned()) return RefusedModel("is no song model");
    if (version != kVersion) {
        return RefusedModel(
            fmt::format("is a song model of version {}, and this program reads version {}",
                        version.get<std::uint64_t>(), kVersion));
    }
    const auto songs = json.find("Songs");
    const auto sum = json.find("Sum");
    if (songs == json.end() || !songs->is_array() || sum == json.end() || !sum->is_string()) {
        return RefusedModel("is damaged: it has no songs");
    }
    CSongModelReader reader;
    std::vector<CTaughtSong> taught;
    for (const Json& song : *songs) {
        if (!reader.Fault().empty()) break;
        if (!song.is_object()) reader.Fail("a song that is none");
        taught.push_back(reader.SongOf(song));
    }
    if (reader.Fault().empty() && SumOf(taught) != sum->get<std::string>()) {
        return RefusedModel("is damaged: its sum does not fit its songs");
    }
    if (!reader.Fault().empty()) return RefusedModel("is damaged: it " + reader.Fault());
    return {CSongModel(std::move(taught)), {}};
}

}  // namespace brindle
