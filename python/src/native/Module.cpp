// SPDX-License-Identifier: MIT
#include "Bind.h"
#include "Errors.h"

#include "brindle/Version.h"
#include "brindle/platform/Localization.h"
#include "brindle/platform/Resources.h"

#include <nanobind/nanobind.h>
#include <nanobind/stl/string.h>

using namespace brindle::python;

NB_MODULE(_native, module) {
    // An interpreter that ends with objects still in use is no fault of ours.
    nb::set_leak_warnings(false);
    BindErrors();
    module.attr("__version__") = brindle::BrindleVersionString;
    module.def(
        "_set_folders",
        [](const std::string& data, const std::string& translations) {
            brindle::SetResourceFolder(data);
            brindle::SetLocalizationFolder(translations);
        },
        nb::arg("data"), nb::arg("translations"),
        "Tells where the grids and the translations of this package lie.");
    BindNotes(module);
    BindKeysAndScales(module);
    BindChords(module);
    BindNames(module);
    BindSongs(module);
    BindAnalyses(module);
    BindFingerings(module);
    BindMarkov(module);
    BindSongModels(module);
    BindScores(module);
    BindBatch(module);
}
