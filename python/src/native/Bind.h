// SPDX-License-Identifier: MIT
#pragma once

#include <nanobind/nanobind.h>

namespace brindle::python {

// Each adds the classes and functions of one subject to the module.

void BindNotes(nanobind::module_& module);
void BindKeysAndScales(nanobind::module_& module);
void BindChords(nanobind::module_& module);
void BindNames(nanobind::module_& module);
void BindSongs(nanobind::module_& module);
void BindAnalyses(nanobind::module_& module);
void BindFingerings(nanobind::module_& module);
void BindMarkov(nanobind::module_& module);
void BindSongModels(nanobind::module_& module);
void BindScores(nanobind::module_& module);
void BindBatch(nanobind::module_& module);

}  // namespace brindle::python
