// SPDX-License-Identifier: MIT
#include "cli/Markov.h"

#include "cli/Input.h"
#include "cli/MarkovSongs.h"

#include "brindle/markov/ReadMarkovSequence.h"
#include "brindle/platform/SeededRandom.h"
#include "brindle/song/SongModelFile.h"

#include <fmt/format.h>

#include <utility>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kMarkovHelp{
    "markov",
    "Learn songs and write new ones in their manner",
    "  brindle markov generate --form AABA --key \"Eb major\"\n"
    "  brindle markov learn -o model.json songs/\n"
    "  brindle markov generate model.json --sheet \"C | _ | _ | G7 | C\"\n"
    "  brindle markov next \"Dm7 G7\"\n"
    "  brindle markov score model.json more-songs/\n"
    "  brindle markov learn --plain --order 3 -o plain.json songs/\n"
    "  brindle markov fill plain.json \"(4,C);(4,U);(4,G7);(4,C)\"\n",
};

}  // namespace

std::optional<VariableLengthMarkovModel> ReadModel(const std::string& path) {
    using Helper = VariableLengthMarkovModel::JSONDeserialization_Helper;
    const auto text = ReadInput(path);
    if (!text) return std::nullopt;
    const auto fail = [&](std::string_view what) {
        Fail(TStatus::BadInput, fmt::format("{} {}", InputName(path), what));
        return std::nullopt;
    };
    if (LooksLikeSongModel(*text)) {
        return fail("is a model of songs and no plain one; brindle markov learn --plain makes one");
    }
    VariableLengthMarkovModel model;
    Helper::VariableLengthMarkovModelFromJSONString(*text, model);
    if (model.mMaxHistoryLength == 0) {
        return fail("is no model file; brindle markov learn makes one");
    }
    if (model.mMaxHistoryLength > kLongestOrder) return fail("has histories that are too long");
    if (model.mTransitionMap.empty()) return fail("is a model that has learned nothing");
    if (!model.mTransitionMap.HasUsualCounts()) {
        return fail("is a damaged model: a symbol follows 1 to 2147483647 times");
    }
    return model;
}

void SetSeed(VariableLengthMarkovModel& model, const std::optional<std::uint64_t>& seed) {
    if (!seed) return;
    model.SetRandomSource([random = SeededRandom(*seed)]() mutable { return random.Next(); });
}

std::optional<std::vector<CMarkovObject>> ReadSymbols(const std::string& option,
                                                      const std::string& text) {
    CMarkovSequenceText read = ReadMarkovSequence(text);
    if (read.mError.empty()) return std::move(read.mSymbols);
    Fail(TStatus::BadUsage, fmt::format("{}: {}", option, read.mError));
    return std::nullopt;
}

void AddMarkov(CCommand& program) {
    CCommand& markov = program.AddCommand(kMarkovHelp);
    AddMarkovLearn(markov);
    AddMarkovGenerate(markov);
    AddMarkovFill(markov);
    AddMarkovShow(markov);
    AddMarkovNext(markov);
    AddMarkovScore(markov);
    AddMarkovListSongs(markov);
}

}  // namespace brindle::cli
