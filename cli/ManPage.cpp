// SPDX-License-Identifier: MIT
#include "cli/ManPage.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle::cli {
namespace {

/// A text that the formatter shows as it is. Typed signs are shown as they are typed, not as their
/// printed relatives, so that examples can be copied.
std::string Plain(std::string_view text) {
    std::string plain;
    bool isLineStart = true;
    for (const char c : text) {
        if (isLineStart && (c == '.' || c == '\'')) plain += "\\&";
        isLineStart = c == '\n';
        switch (c) {
            case '\\':
                plain += "\\e";
                break;
            case '-':
                plain += "\\-";
                break;
            case '\'':
                plain += "\\(aq";
                break;
            case '^':
                plain += "\\(ha";
                break;
            case '~':
                plain += "\\(ti";
                break;
            case '`':
                plain += "\\(ga";
                break;
            default:
                plain += c;
        }
    }
    return plain;
}

std::string PageName(const CCommandPage& page) {
    std::string name = page.mName;
    std::replace(name.begin(), name.end(), ' ', '-');
    return name;
}

std::string Synopsis(const CCommandPage& page) {
    std::string line = "\\fB" + Plain(page.mName) + "\\fR [\\fIOPTION\\fR...]";
    for (const COptionPage& option : page.mOptions) {
        if (!option.mIsArgument) continue;
        const std::string name =
            "\\fI" + Plain(option.mNames.front()) + "\\fR" + (option.mIsMany ? "..." : "");
        line += option.mIsRequired ? ' ' + name : " [" + name + ']';
    }
    if (!page.mCommands.empty()) line += " \\fICOMMAND\\fR ...";
    return line + '\n';
}

/// The heading of a paragraph with its text indented.
std::string Paragraph(const std::string& head, std::string_view text) {
    return ".TP\n" + head + '\n' + Plain(text) + '\n';
}

std::string OptionText(const COptionPage& option) {
    const char font = option.mIsArgument ? 'I' : 'B';
    std::string head;
    for (const std::string& name : option.mNames) {
        head += fmt::format("{}\\f{}{}\\fR", head.empty() ? "" : ", ", font, Plain(name));
    }
    const std::string value =
        option.mIsArgument ? fmt::format("{}", fmt::join(option.mChoices, "|")) : option.mValueName;
    if (!value.empty()) head += " \\fI" + Plain(value) + "\\fR";
    return Paragraph(head, option.mPurpose);
}

std::string Options(const CCommandPage& page) {
    std::vector<std::string> groups;
    for (const COptionPage& option : page.mOptions) {
        if (std::find(groups.begin(), groups.end(), option.mGroup) == groups.end()) {
            groups.push_back(option.mGroup);
        }
    }
    std::string text = ".SH OPTIONS\n";
    for (const std::string& group : groups) {
        if (!group.empty()) text += ".SS " + Plain(group) + '\n';
        for (const COptionPage& option : page.mOptions) {
            if (option.mGroup == group) text += OptionText(option);
        }
    }
    return text;
}

std::string Commands(const CCommandPage& page) {
    if (page.mCommands.empty()) return {};
    std::string text = ".SH COMMANDS\n";
    for (const CCommandPage& command : page.mCommands) {
        text += Paragraph("\\fB" + Plain(PageName(command)) + "\\fR(1)", command.mPurpose);
    }
    return text;
}

/// The examples, and behind a blank line what there is to know.
std::string ExamplesAndNotes(const std::string& examples) {
    if (examples.empty()) return {};
    const std::size_t end = std::min(examples.find("\n\n"), examples.size());
    std::string text = ".SH EXAMPLES\n.nf\n" + Plain(examples.substr(0, end));
    text += text.back() == '\n' ? ".fi\n" : "\n.fi\n";
    const std::size_t notes = examples.find_first_not_of('\n', end);
    if (notes != examples.npos) text += ".SH NOTES\n" + Plain(examples.substr(notes));
    return text;
}

}  // namespace

std::string ManPageFile(const CCommandPage& page) {
    return PageName(page) + ".1";
}

std::string ManPage(const CCommandPage& page, const CCommandPage& program,
                    std::string_view version) {
    std::string text = fmt::format(".TH {} 1 \"\" \"brindle {}\" \"User Commands\"\n",
                                   Plain(PageName(page)), Plain(version));
    text += fmt::format(".SH NAME\n{} \\- {}\n", Plain(PageName(page)), Plain(page.mPurpose));
    text += ".SH SYNOPSIS\n" + Synopsis(page) + Commands(page) + Options(page) +
            ExamplesAndNotes(page.mExamples);
    text +=
        ".SH EXIT STATUS\n0 if all went well, 1 for input that cannot be read, 2 for wrong use.\n";
    if (&page == &program) return text;
    return text + ".SH SEE ALSO\n.BR " + PageName(program) + " (1)\n";
}

}  // namespace brindle::cli
