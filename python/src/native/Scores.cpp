// SPDX-License-Identifier: MIT
#include "Bind.h"
#include "Errors.h"

#include <nanobind/stl/string.h>

namespace brindle::python {
namespace {

constexpr const char* kKind = "ScoreError";

nb::str JsonLinesOf(const nb::bytes& score) {
    char* lines = nullptr;
    {
        const nb::gil_scoped_release released;
        Check(brindle_score_json_lines(score.c_str(), score.size(), &lines), kKind);
    }
    return nb::str(CText(lines).get());
}

nb::bytes MidiOf(const nb::bytes& score) {
    char* midi = nullptr;
    std::size_t size = 0;
    {
        const nb::gil_scoped_release released;
        Check(brindle_score_midi(score.c_str(), score.size(), &midi, &size), kKind);
    }
    const CText owned(midi);
    return nb::bytes(owned.get(), size);
}

}  // namespace

void BindScores(nb::module_& module) {
    module.def("_score_json_lines", JsonLinesOf, nb::arg("score"),
               "The notes of a score, a JSON object a line.");
    module.def("_score_midi", MidiOf, nb::arg("score"), "The notes of a score as a MIDI file.");
}

}  // namespace brindle::python
