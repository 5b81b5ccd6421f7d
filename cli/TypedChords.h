// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/ReadSong.h"

#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace brindle::cli {

class CCommand;
struct CTypedSong;

/// Prints faults with their lines and carets under the places, a score of them at most. `name` is
/// that of the file, empty for what was typed.
void PrintFaults(std::string_view text, std::span<const CTextFault> faults, bool areWarnings,
                 std::string_view name = {});

/// How chords and songs that people type are read, with the options for it: --symbols and
/// --lenient, and for songs --from, --even, --beats-per-bar and --beats-per-chord. Every subcommand
/// that takes chords reads them here.
class CTypedChords {
public:
    void AddTo(CCommand& command);
    void AddTo(CCommand& command, const std::string& fromPurpose);
    /// Adds --beats-per-bar and --beats-per-chord.
    void AddBeatsTo(CCommand& command);

    /// What is wrong with the values of these two.
    [[nodiscard]] std::optional<std::string> BeatsContradiction() const;
    [[nodiscard]] double BeatsPerBar() const { return mBeatsPerBar; }
    void UseBeatsPerBar(double beats) { mBeatsPerBar = beats; }
    /// As --symbols native: by the parser that hosts use, which has no faults.
    void UseNative() { mReader = "native"; }
    /// B is B flat, as in German, even where no H tells it.
    void UseBAsBFlat() { mIsBBFlat = true; }
    /// Of numerals up to the first key of their own.
    void UseKey(const CSignKeyLite& key) { mKey = key; }
    [[nodiscard]] bool IsLenient() const { return mIsLenient; }

    /// The chords of typed symbols, one for each; any H among them makes them all German. Nothing
    /// when one is not understood; then the error has been printed.
    [[nodiscard]] std::optional<std::vector<CChordLite>> ReadSymbols(
        const std::vector<std::string>& symbols) const;
    [[nodiscard]] std::optional<CChordLite> ReadSymbol(const std::string& symbol) const;

    /// The song of a source of any form, a score or a text, with its faults left to the caller.
    [[nodiscard]] CSong ReadSource(std::string_view bytes) const;
    /// The same with the faults printed: as warnings with --lenient, else as an error, and then
    /// there is no song.
    [[nodiscard]] std::optional<CSong> ReadSongOrFail(const CTypedSong& typed) const;

private:
    [[nodiscard]] bool IsNative() const { return mReader == "native"; }
    [[nodiscard]] CSong ReadNative(std::string_view text) const;
    [[nodiscard]] std::optional<CSong> ReadText(const CTypedSong& typed) const;
    [[nodiscard]] bool TakeReading(const std::string& symbol, const CChordTextReading& reading,
                                   std::vector<CChordLite>& chords) const;

    std::string mReader = "all";
    std::string mForm = "auto";
    bool mIsLenient = false;
    bool mIsEven = false;
    bool mIsBBFlat = false;
    double mBeatsPerBar = 4.0;
    double mBeatsPerChord = 1.0;
    CSignKeyLite mKey;
};

}  // namespace brindle::cli
