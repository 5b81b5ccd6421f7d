// SPDX-License-Identifier: MIT
// Trains the net that hears the root of a chord, from nothing, and tells how well it does.

#include "tools/train_root_net/RootNetFigures.h"
#include "tools/train_root_net/RootNetTrainer.h"
#include "tools/train_root_net/WeightTable.h"

#include <fmt/format.h>
#include <unistd.h>
#include <CLI/CLI.hpp>

#include <fstream>
#include <iostream>
#include <iterator>
#include <string>

using namespace brindle;
using namespace brindle::tools;

namespace {

constexpr const char* kTablePath = BRINDLE_SOURCE_DIR "/brindle/neural/weight_definitions.cpp";
constexpr const char* kDocumentPath = BRINDLE_SOURCE_DIR "/docs/root-net.md";
constexpr std::string_view kFiguresMark = "<!-- From here on made by tools/train_root_net. -->\n";

constexpr double kFirstStepSize = 0.02;
constexpr double kLastStepSize = 0.0001;

/// A bar on a terminal's standard error, nothing elsewhere.
class ProgressBar {
public:
    explicit ProgressBar(int count) : mCount(count) {}
    ~ProgressBar() {
        if (mIsTerminal) std::cerr << '\n';
    }
    void Show(int done, std::size_t wrongCount) const {
        if (!mIsTerminal) return;
        constexpr int kWidth = 40;
        const int filled = kWidth * done / mCount;
        std::cerr << fmt::format("\r[{:#<{}}{:.<{}}] cycle {}, {} wrong    ", "", filled, "",
                                 kWidth - filled, done, wrongCount);
    }

private:
    int mCount;
    bool mIsTerminal = isatty(STDERR_FILENO) != 0;
};

std::vector<double> TrainedWeights(const std::vector<CChordRootPattern>& patterns,
                                   std::uint64_t seed, int cycles) {
    RootNetTrainer trainer(patterns, seed);
    const ProgressBar bar(cycles);
    for (int cycle = 0; cycle < cycles; ++cycle) {
        const double left = 1.0 - static_cast<double>(cycle) / cycles;
        const std::size_t wrongCount =
            trainer.TrainCycle(kFirstStepSize * left * left + kLastStepSize);
        bar.Show(cycle + 1, wrongCount);
    }
    return RoundedToSixDigits(trainer.Weights());
}

std::string FileText(const char* path) {
    std::ifstream file(path);
    return {std::istreambuf_iterator<char>(file), {}};
}

/// The document up to the mark, then the figures.
std::string DocumentWith(const std::string& figures) {
    const std::string document = FileText(kDocumentPath);
    const std::size_t mark = document.find(kFiguresMark);
    return document.substr(0, mark) + std::string(kFiguresMark) + "\n" + figures;
}

bool Write(const char* path, const std::string& text) {
    std::ofstream file(path);
    file << text;
    file.close();
    if (!file) std::cerr << "train_root_net: cannot write " << path << '\n';
    return file.good();
}

bool IsAsMade(const char* path, const std::string& text) {
    const bool isEqual = FileText(path) == text;
    if (!isEqual) std::cerr << "train_root_net: " << path << " is not what training makes\n";
    return isEqual;
}

}  // namespace

int main(int argc, char** argv) {
    std::uint64_t seed = 1;
    int cycles = 100;
    bool write = false;
    bool check = false;
    CLI::App app{"Trains the net that hears roots and prints how well it does"};
    app.add_option("--seed", seed, "Seed of all random numbers")->capture_default_str();
    app.add_option("--cycles", cycles, "Times that all patterns are learned")
        ->capture_default_str()
        ->check(CLI::Range(1, 100000));
    app.add_flag("--write", write, "Write the weights and the figures into the source tree");
    app.add_flag("--check", check, "Compare both with those in the source tree");
    CLI11_PARSE(app, argc, argv);

    const std::vector<CChordRootPattern> patterns = ChordRootPatterns();
    const std::vector<double> weights = TrainedWeights(patterns, seed, cycles);
    const CHeardRoots heard[] = {HeardByNet(patterns, weights), FoundByScore(patterns)};
    const std::string table = WeightTableText(weights);
    const std::string figures = fmt::format(
        "Trained with seed {}, {} cycles. The output of the right root stands at least {:.3f} "
        "above "
        "all others.\n\n{}",
        seed, cycles, LeastMargin(patterns, weights), FiguresText(patterns, heard));
    std::cout << figures;

    bool isGood = true;
    if (write) isGood = Write(kTablePath, table) && Write(kDocumentPath, DocumentWith(figures));
    if (check)
        isGood = IsAsMade(kTablePath, table) && IsAsMade(kDocumentPath, DocumentWith(figures));
    return isGood ? 0 : 1;
}
