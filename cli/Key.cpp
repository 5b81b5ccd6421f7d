// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/KeyText.h"
#include "cli/LineByLine.h"

#include "brindle/present/ShownNames.h"
#include "brindle/theory/CSignKeyHeavy.h"
#include "brindle/theory/SignKeyCode.h"

#include <fmt/format.h>

#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kKeyHelp{
    "key",
    "Read a key: its signs, notes, relative key and one-byte code",
    "  brindle key \"F# minor\"\n"
    "  brindle key Bb --json\n"
    "  cat keys.txt | brindle key -\n",
};

// 15 stands for a key that has no code, G# major for instance.
bool HasCode(unsigned char code) {
    return code != kSignKeyCodeUndef;
}

std::vector<CKeyEnh> NotesOf(const CSignKeyLite& key) {
    return KeysOf(CScaleHeavy(key.mRootKeyEnh, key.Semitones()));
}

Json KeyToJson(const CSignKeyLite& key) {
    const CSignKeyLite relative = key.ParallelSignKey();
    const unsigned char code = ToSignKeyInEv(key.mRootKeyEnh, key.mSignKeyType);
    return {{"Name", key.NameLong(NamePrefs())},
            {"CKeyEnh", KeyEnhToJson(key.mRootKeyEnh)},
            {"Type", JSONWord(key.mSignKeyType)},
            {"SignsCount", key.SignsCount()},
            {"Notes", KeyEnhsToJson(NotesOf(key))},
            {"Relative",
             {{"Name", relative.NameLong(NamePrefs())},
              {"CKeyEnh", KeyEnhToJson(relative.mRootKeyEnh)},
              {"Type", JSONWord(relative.mSignKeyType)}}},
            {"Code", HasCode(code) ? Json(code) : Json(nullptr)}};
}

std::string KeyText(const CSignKeyLite& key, const CPaint& paint) {
    const unsigned char code = ToSignKeyInEv(key.mRootKeyEnh, key.mSignKeyType);
    return fmt::format(
        "{}\n"
        "  signs     {}\n"
        "  notes     {}\n"
        "  relative  {}\n"
        "  code      {}\n",
        paint.Strong(key.NameLong(NamePrefs())), SignsText(key.SignsCount()),
        NotesText(NotesOf(key)), key.ParallelSignKey().NameLong(NamePrefs()),
        HasCode(code) ? fmt::format("{}", code) : "none");
}

TStatus Key(const CLineOptions& options) {
    return PrintLineByLine(
        options, "Keys", ReadKeyText, [](const CKeyText& read) { return KeyToJson(read.mSignKey); },
        [](const CKeyText& read) { return KeyText(read.mSignKey, PaintOfOutput()); });
}

}  // namespace

void AddKey(CCommand& program) {
    CCommand& command = program.AddCommand(kKeyHelp);
    const auto options = std::make_shared<CLineOptions>();
    command.AddArgument("KEY", options->mWords, "A key, major or minor; - reads one a line")
        .Required();
    options->mFormat.AddTo(command, {"text", "json"});
    command.OnCall([options] { return Key(*options); });
}

}  // namespace brindle::cli
