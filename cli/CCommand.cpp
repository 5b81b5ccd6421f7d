// SPDX-License-Identifier: MIT
#include "cli/CCommand.h"

#include "cli/DidYouMean.h"
#include "cli/Message.h"

#include "brindle/chords/ReadChordText.h"
#include "brindle/platform/Ascii.h"
#include "brindle/platform/FileNames.h"
#include "brindle/present/ShownText.h"

#include <fmt/format.h>

#include <CLI/CLI.hpp>
#include <algorithm>
#include <cmath>
#include <filesystem>
#include <functional>
#include <optional>
#include <sstream>
#include <string_view>
#include <system_error>
#include <utility>

namespace brindle::cli {
namespace {

class CExamplesFirst : public CLI::Formatter {
public:
    explicit CExamplesFirst(std::string examples) : mExamples(std::move(examples)) {
        column_width(34);
    }

    std::string make_help(const CLI::App* app, std::string name,
                          CLI::AppFormatMode mode) const override {
        std::string help = CLI::Formatter::make_help(app, std::move(name), mode);
        if (mode == CLI::AppFormatMode::Sub) return help;
        return "Examples:\n" + mExamples + "\n" + help;
    }

private:
    std::string mExamples;
};

void ShowExamplesFirst(CLI::App& app, const char* examples) {
    if (examples != nullptr) app.formatter(std::make_shared<CExamplesFirst>(examples));
}

std::vector<std::string> CommandNames(const CLI::App& app) {
    std::vector<std::string> names;
    for (const CLI::App* const command : app.get_subcommands({})) {
        names.push_back(command->get_name());
    }
    return names;
}

const CLI::App* CommandOf(const CLI::App& app, const std::string& name) {
    for (const CLI::App* const command : app.get_subcommands({})) {
        if (command->check_name(name)) return command;
    }
    return nullptr;
}

std::vector<std::string> OptionNames(const CLI::App& app) {
    std::vector<std::string> names;
    for (const CLI::Option* const option : app.get_options()) {
        for (const std::string& name : option->get_lnames()) names.push_back("--" + name);
    }
    return names;
}

// The command that the words of the command line lead to, the last of those in one another.
const CLI::App& AskedFor(const CLI::App& program) {
    const CLI::App* app = &program;
    while (!app->get_subcommands().empty()) app = app->get_subcommands().front();
    return *app;
}

std::string CallOf(const CLI::App& app) {
    const CLI::App* const above = app.get_parent();
    return above == nullptr ? app.get_name() : CallOf(*above) + ' ' + app.get_name();
}

TStatus FailWithHelp(const CLI::App& app, std::string_view message) {
    const std::string problem = Printable(message);
    const std::string call = CallOf(app) + " --help";
    return Fail(TStatus::BadUsage,
                message.ends_with('?')
                    ? Message("{problem} See {call}", {{"problem", problem}, {"call", call}})
                    : Message("{problem}; see {call}", {{"problem", problem}, {"call", call}}));
}

/// The words of the command line behind the program's name.
using TTypedWords = std::vector<std::string>;

// The first option that the command does not have. What stands behind "=" is its value, and behind
// the letter of a short one.
std::string UnknownOption(const CLI::App& app, const TTypedWords& words) {
    for (const std::string& word : words) {
        const bool isLong = word.starts_with("--");
        const bool isShort = word.size() > 1 && word[0] == '-' && Ascii::IsLetter(word[1]);
        if (!(isLong ? word != "--" : isShort)) continue;
        const std::string name = word.substr(0, isLong ? word.find('=') : 2);
        if (app.get_option_no_throw(name) == nullptr) return name;
    }
    return {};
}

// A letter is short for the only option that begins with it.
std::string MeantOption(const CLI::App& app, const std::string& name) {
    std::vector<std::string> names = OptionNames(app);
    if (name.starts_with("--")) return NearestWord(name, names);
    std::erase_if(names, [&](const std::string& n) { return n[2] != Ascii::ToLower(name[1]); });
    return names.size() == 1 ? names.front() : std::string();
}

TStatus FailForUnknown(const CLI::App& app, const TTypedWords& words, const std::string& message) {
    const std::string name = UnknownOption(app, words);
    if (name.empty()) return FailWithHelp(app, message);
    const std::string problem =
        Message("{option} is no option of {command}", {{"option", name}, {"command", CallOf(app)}});
    return FailWithHelp(app, WithMeant(problem, MeantOption(app, name)));
}

// How a song in the place of a command is read, which is what somebody types who has not read the
// help; nothing for what is no song.
std::string HowToRead(const std::string& typed) {
    std::error_code error;
    const std::string shown = Printable(typed);
    if (std::filesystem::is_regular_file(typed, error)) {
        return Message("{file} is a file and no subcommand; {call} reads it as a song",
                       {{"file", shown}, {"call", "brindle analyse " + shown}});
    }
    if (LooksLikeFileName(typed)) {
        return Message("{word} is no subcommand, and there is no such file", {{"word", shown}});
    }
    const std::string first = typed.substr(0, typed.find_first_of(Ascii::kWhiteSpace));
    if (ReadChordText(first).mKind != TChordText_Chord) return {};
    return Message("{chords} is no subcommand; {call} reads it as a song",
                   {{"chords", shown}, {"call", "brindle analyse \"" + shown + '"'}});
}

TStatus FailForCommand(const CLI::App& app, const std::string& typed) {
    const auto names = CommandNames(app);
    const std::string how = app.get_parent() == nullptr ? HowToRead(typed) : std::string();
    if (!how.empty()) return Fail(TStatus::BadUsage, how);
    const std::string shown = Printable(typed);
    const std::string nearest = NearestWord(typed, names);
    if (!nearest.empty()) {
        const std::string problem = Message("{word} is no subcommand", {{"word", shown}});
        return FailWithHelp(app, WithMeant(problem, nearest));
    }
    const std::string all = fmt::format("{}", fmt::join(names, ", "));
    return Fail(TStatus::BadUsage, Message("{word} is no subcommand, there are: {commands}",
                                           {{"word", shown}, {"commands", all}}));
}

// The words of a command line, with those of `help COMMAND` in the order of `COMMAND --help`, which
// other programs have taught people.
struct CHelpWords {
    TTypedWords mWords;
    const CLI::App* mApp;   // the command that they lead to
    std::string mNextWord;  // which is none of its commands
    bool mIsHelp = false;
};

CHelpWords WithHelpBehind(const CLI::App& program, TTypedWords words) {
    CHelpWords help{std::move(words), &program, {}};
    for (std::size_t i = 0; i < help.mWords.size() && !CommandNames(*help.mApp).empty();) {
        const std::string word = help.mWords[i];
        if (word == "help" && !help.mIsHelp) {
            help.mIsHelp = true;
            help.mWords.erase(help.mWords.begin() + static_cast<std::ptrdiff_t>(i));
            continue;
        }
        const CLI::App* const command = CommandOf(*help.mApp, word);
        if (command == nullptr) {
            help.mNextWord = word;
            break;
        }
        help.mApp = command;
        ++i;
    }
    if (help.mIsHelp) help.mWords.emplace_back("--help");
    return help;
}

// The first word behind those that lead to the command, if it is none of its options.
std::string WordBehind(const CLI::App& app, const TTypedWords& words) {
    std::size_t depth = 0;
    for (const CLI::App* above = app.get_parent(); above != nullptr; above = above->get_parent()) {
        ++depth;
    }
    return depth < words.size() && !words[depth].starts_with("-") ? words[depth] : std::string();
}

std::string ValueNameOf(const CLI::Option& option) {
    if (option.get_items_expected_max() == 0) return {};
    const std::string& text = option.get_option_text();
    return text.find_first_not_of(' ') == text.npos ? "VALUE" : text;
}

// What is missing behind an option, or the message of CLI11 for what else is wrong with their
// count.
std::string MissingValue(const CLI::App& app, const std::string& message) {
    const std::string name = message.substr(0, message.find(": "));
    if (!message.ends_with(" missing") || message.find(" required ") == message.npos) {
        return message;
    }
    const CLI::Option* const option = app.get_option_no_throw(name);
    if (option == nullptr) return message;
    return Message("{option} needs a value behind it: {call}",
                   {{"option", name}, {"call", name + ' ' + ValueNameOf(*option)}});
}

// The message of CLI11 for an argument or an option that was not told.
std::string MissingWord(const std::string& message) {
    constexpr std::string_view end = " is required";
    if (!message.ends_with(end)) return message;
    const std::string option = message.substr(0, message.size() - end.size());
    return Message("{option} is required", {{"option", option}});
}

// The message of CLI11 for a value that it cannot read, which is always a number.
std::string NoNumber(const std::string& message) {
    constexpr std::string_view head = "Could not convert: ";
    const std::size_t equals = message.find(" = ");
    if (!message.starts_with(head) || equals == message.npos) return message;
    return Message("{option}: {word} is no number",
                   {{"option", message.substr(head.size(), equals - head.size())},
                    {"word", message.substr(equals + 3)}});
}

// The message of CLI11 for words that nothing takes.
std::string UnexpectedWords(const std::string& message) {
    const std::size_t colon = message.find(": ");
    if (colon == message.npos) return message;
    return Message("{words} is not expected here", {{"words", message.substr(colon + 2)}});
}

// The message of CLI11 for options that exclude each other.
std::string ExcludedOption(const std::string& message) {
    constexpr std::string_view verb = " excludes ";
    const std::size_t place = message.find(verb);
    if (place == message.npos) return message;
    return Message(
        "{option} and {other} exclude each other",
        {{"option", message.substr(0, place)}, {"other", message.substr(place + verb.size())}});
}

// CLI11 asks for help and version by exceptions, too; these end well.
TStatus Report(const CLI::App& program, const CLI::ParseError& error, const TTypedWords& words) {
    if (error.get_exit_code() == static_cast<int>(CLI::ExitCodes::Success)) {
        std::ostringstream shown;
        program.exit(error, shown, shown);
        return Print(shown.str());
    }
    const CLI::App& app = AskedFor(program);
    if (!CommandNames(app).empty()) {
        const std::string typed = WordBehind(app, words);
        if (!typed.empty()) return FailForCommand(app, typed);
        return FailForUnknown(app, words, Message("A subcommand is required"));
    }
    const std::string what = error.what();
    switch (static_cast<CLI::ExitCodes>(error.get_exit_code())) {
        case CLI::ExitCodes::ExtrasError:
            return FailForUnknown(app, words, UnexpectedWords(what));
        case CLI::ExitCodes::ConversionError:
            return FailWithHelp(app, NoNumber(what));
        case CLI::ExitCodes::RequiredError:
            return FailWithHelp(app, MissingWord(what));
        case CLI::ExitCodes::ExcludesError:
            return FailWithHelp(app, ExcludedOption(what));
        case CLI::ExitCodes::ArgumentMismatch:
            return FailWithHelp(app, MissingValue(app, what));
        default:
            return FailWithHelp(app, what);
    }
}

// One of some words, or the nearest of them in the message.
CLI::Validator OneOf(const std::vector<std::string>& choices) {
    CLI::Validator validator;
    return validator.operation([choices](const std::string& typed) {
        if (std::find(choices.begin(), choices.end(), typed) != choices.end()) {
            return std::string();
        }
        const std::string all = fmt::format("{}", fmt::join(choices, ", "));
        return WithMeant(
            Message("{word} is none of {choices}", {{"word", typed}, {"choices", all}}),
            NearestWord(typed, choices));
    });
}

// A number in a range; what is wrong with it otherwise.
std::function<std::string(const std::string&)> Within(double least, double most, bool isWhole) {
    return [least, most, isWhole](const std::string& typed) {
        double value = 0.0;
        if (!CLI::detail::lexical_cast(typed, value) || std::isnan(value)) {
            return Message("{word} is no number", {{"word", typed}});
        }
        if (value < least || value > most) {
            return Message(
                "{word} is not from {least} to {most}",
                {{"word", typed}, {"least", ShortNumber(least)}, {"most", ShortNumber(most)}});
        }
        if (isWhole && value != std::floor(value)) {
            return Message("{word} is no whole number", {{"word", typed}});
        }
        return std::string();
    };
}

std::vector<std::string> NamesOf(const CLI::Option& option) {
    if (!option.nonpositional()) return {option.get_name(true)};
    std::vector<std::string> names;
    for (const std::string& name : option.get_snames()) names.push_back('-' + name);
    for (const std::string& name : option.get_lnames()) names.push_back("--" + name);
    return names;
}

COptionPage PageOf(const CLI::Option& option) {
    COptionPage page;
    page.mNames = NamesOf(option);
    page.mIsArgument = !option.nonpositional();
    if (!page.mIsArgument) page.mValueName = ValueNameOf(option);
    page.mPurpose = option.get_description();
    page.mGroup = option.get_group() == "Options" ? "" : option.get_group();
    page.mIsRequired = option.get_required();
    page.mIsMany = option.get_expected_max() > 1;
    return page;
}

}  // namespace

COption& COption::Required() {
    mOption->required();
    return *this;
}

COption& COption::InRange(int least, int most) {
    mOption->check(Within(least, most, true));
    return *this;
}

COption& COption::InRange(std::uint64_t least, std::uint64_t most) {
    mOption->check(Within(static_cast<double>(least), static_cast<double>(most), true));
    return *this;
}

COption& COption::InRange(double least, double most) {
    mOption->check(Within(least, most, false));
    return *this;
}

COption& COption::Excludes(const std::string& name) {
    // The text keeps the help from listing what is excluded.
    mOption->excludes(name)->option_text(" ");
    return *this;
}

COption& COption::InGroup(const std::string& heading) {
    mOption->group(heading);
    return *this;
}

CCommand::CCommand(const CCommandHelp& help, const std::string& version)
    : mApp(std::make_shared<CLI::App>(help.mPurpose, help.mName)),
      mName(help.mName),
      mExamples(help.mExamples == nullptr ? "" : help.mExamples),
      mStatus(std::make_shared<TStatus>(TStatus::Success)) {
    mApp->set_version_flag("--version", version);
    ShowExamplesFirst(*mApp, help.mExamples);
}

CCommand::CCommand(CCommand& above, const CCommandHelp& help)
    : mApp(above.mApp->get_subcommand_ptr(above.mApp->add_subcommand(help.mName, help.mPurpose))),
      mName(above.mName + ' ' + help.mName),
      mExamples(help.mExamples == nullptr ? "" : help.mExamples),
      mStatus(above.mStatus) {
    ShowExamplesFirst(*mApp, help.mExamples);
}

CCommand& CCommand::AddCommand(const CCommandHelp& help) {
    mApp->require_subcommand(1);
    mCommands.push_back(CCommand(*this, help));
    return mCommands.back();
}

void CCommand::AlsoCalled(const std::string& name) {
    mApp->alias(name);
    mOtherName = mName.substr(0, mName.rfind(' ') + 1) + name;
}

COption CCommand::AddArgument(const std::string& name, std::string& word,
                              const std::string& purpose) {
    return AddOption(name, " ", word, purpose);
}

COption CCommand::AddArgument(const std::string& name, std::vector<std::string>& words,
                              const std::string& purpose) {
    return COption(*mApp->add_option(name, words, purpose)->option_text("..."));
}

COption CCommand::AddListOption(const std::string& names, const std::string& valueName,
                                std::vector<std::string>& values, const std::string& purpose) {
    CLI::Option* const option = mApp->add_option(names, values, purpose);
    return COption(*option->allow_extra_args(false)->option_text(valueName));
}

template <typename TValue>
COption CCommand::AddOption(const std::string& names, const std::string& valueName, TValue& value,
                            const std::string& purpose) {
    return COption(*mApp->add_option(names, value, purpose)->option_text(valueName));
}

template COption CCommand::AddOption(const std::string&, const std::string&, std::string&,
                                     const std::string&);
template COption CCommand::AddOption(const std::string&, const std::string&, int&,
                                     const std::string&);
template COption CCommand::AddOption(const std::string&, const std::string&, std::uint64_t&,
                                     const std::string&);
template COption CCommand::AddOption(const std::string&, const std::string&, double&,
                                     const std::string&);
template COption CCommand::AddOption(const std::string&, const std::string&,
                                     std::optional<std::uint64_t>&, const std::string&);
template COption CCommand::AddOption(const std::string&, const std::string&,
                                     std::optional<std::string>&, const std::string&);

COption CCommand::AddChoice(const std::string& name, std::string& value,
                            const std::vector<std::string>& choices, const std::string& purpose) {
    const std::string defaultValue = " (default: " + value + ")";
    const COption option =
        AddOption(name, fmt::format("{}", fmt::join(choices, "|")), value, purpose + defaultValue);
    option.mOption->check(OneOf(choices));
    mChoices[option.mOption] = choices;
    return option;
}

COption CCommand::AddChoiceArgument(const std::string& name, std::string& word,
                                    const std::vector<std::string>& choices,
                                    const std::string& purpose) {
    const COption argument =
        AddOption(name, fmt::format("{}", fmt::join(choices, "|")), word, purpose);
    argument.mOption->check(OneOf(choices))->required();
    mChoices[argument.mOption] = choices;
    return argument;
}

COption CCommand::AddFlag(const std::string& name, bool& value, const std::string& purpose) {
    return COption(*mApp->add_flag(name, value, purpose));
}

COption CCommand::Option(const std::string& name) const {
    return COption(*mApp->get_option(name));
}

void CCommand::OnCall(std::function<TStatus()> call) {
    mApp->callback([call = std::move(call), status = mStatus] { *status = call(); });
}

CCommandPage CCommand::Page() const {
    CCommandPage page{mName, mOtherName, mApp->get_description(), mExamples, {}, {}};
    for (const CLI::Option* const option : mApp->get_options()) {
        page.mOptions.push_back(PageOf(*option));
        const auto choices = mChoices.find(option);
        if (choices != mChoices.end()) page.mOptions.back().mChoices = choices->second;
    }
    for (const CCommand& command : mCommands) page.mCommands.push_back(command.Page());
    return page;
}

TStatus CCommand::Run(int argc, const char* const* argv) {
    const auto help = WithHelpBehind(*mApp, TTypedWords(argv + std::min(argc, 1), argv + argc));
    const bool isOption = help.mNextWord.starts_with("-");
    if (help.mIsHelp && !help.mNextWord.empty() && !isOption) {
        return FailForCommand(*help.mApp, help.mNextWord);
    }
    try {
        mApp->parse(TTypedWords(help.mWords.rbegin(), help.mWords.rend()));
    } catch (const CLI::ParseError& error) {
        return Report(*mApp, error, help.mWords);
    }
    return *mStatus;
}

}  // namespace brindle::cli
