// SPDX-License-Identifier: MIT
#include "MarkovForms.h"

#include "tests/support/Expected.h"

#include "brindle/platform/AtomicFile.h"

#include <doctest/doctest.h>

#include <filesystem>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

using Helper = VariableLengthMarkovModel::JSONDeserialization_Helper;

/// A file that is gone at the end of the test.
class CScratchFile {
public:
    CScratchFile()
        : mPath((std::filesystem::temp_directory_path() / "brindle_markov_test.json").string()) {}
    CScratchFile(const CScratchFile&) = delete;
    CScratchFile& operator=(const CScratchFile&) = delete;
    ~CScratchFile() { std::filesystem::remove(mPath); }

    [[nodiscard]] const std::string& Path() const { return mPath; }
    [[nodiscard]] std::string Content() const { return ReadWholeFile(mPath).value_or("no file"); }

private:
    std::string mPath;
};

json Saved(const json& in) {
    const CScratchFile file;
    ModelOf(in).SaveToFile(file.Path());
    return file.Content();
}

json LoadedAndSaved(const json& in) {
    const CScratchFile file;
    const auto saved = ModelOf(in);
    saved.SaveToFile(file.Path());
    VariableLengthMarkovModel loaded;
    Helper::VariableLengthMarkovModelFromJSONFile(file.Path(), loaded);
    loaded.SaveToFile(file.Path());
    return {{"text", file.Content()}, {"equal", loaded == saved}};
}

}  // namespace

TEST_CASE("Models are saved and read as expected") {
    CheckExpected("markov_files", {
                                      {"VariableLengthMarkovModel::SaveToFile", Saved},
                                      {"LoadAndSave", LoadedAndSaved},
                                  });
}
