// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"

#include "brindle/neural/ChordAnalysisNeuronalNet.h"
#include "brindle/present/NetText.h"

#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kNetHelp{
    "net",
    "Show the neural net that hears the roots of chords",
    "  brindle net trace\n"
    "  brindle net weights >net.txt\n"
    "  brindle net weights --json\n",
};

constexpr CCommandHelp kTraceHelp{
    "trace",
    "Its shape and the properties of its neurons",
    "  brindle net trace\n",
};

constexpr CCommandHelp kWeightsHelp{
    "weights",
    "A report: the patterns that it gets wrong, its weights, and a form that can be loaded",
    "  brindle net weights >net.txt\n",
};

TStatus PrintTrace(const CFormatOptions& format) {
    const NeuronalNet net(ChordAnalysisNeuronalNet);
    return Print(format.Format() == TFormat::Json ? NetJson(net) : NetText(net));
}

TStatus PrintWeights(const CFormatOptions& format) {
    const NeuronalNet net(ChordAnalysisNeuronalNet);
    return Print(format.Format() == TFormat::Json ? NetWeightsJson(net) : NetWeightsText(net));
}

using TPrinter = TStatus (*)(const CFormatOptions& format);

void AddPrinter(CCommand& net, const CCommandHelp& help, TPrinter print) {
    CCommand& command = net.AddCommand(help);
    const auto format = std::make_shared<CFormatOptions>();
    format->AddTo(command, {"text", "json"});
    command.OnCall([format, print] { return print(*format); });
}

}  // namespace

void AddNet(CCommand& program) {
    CCommand& command = program.AddCommand(kNetHelp);
    AddPrinter(command, kTraceHelp, PrintTrace);
    AddPrinter(command, kWeightsHelp, PrintWeights);
}

}  // namespace brindle::cli
