#include "tools/OptionTree.h"

#include <algorithm>

namespace {

std::string InRoff(const std::string& text) {
    std::string roff;
    for (const char c : text) {
        if (c == '\\') {
            roff += "\\e";
        } else if (c == '-') {
            roff += "\\-";
        } else if (c == '\n') {
            roff += ' ';
        } else {
            roff += c;
        }
    }
    // A line that began with one of these would be a request.
    if (!roff.empty() && (roff.front() == '.' || roff.front() == '\'')) roff.insert(0, "\\&");
    return roff;
}

std::string Bold(const std::string& text) {
    return "\\fB" + InRoff(text) + "\\fR";
}

std::string Italic(const std::string& text) {
    return "\\fI" + InRoff(text) + "\\fR";
}

std::string InCapitals(std::string text) {
    for (char& c : text) c = c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c;
    return text;
}

/// No date, so that the same sources give the same page.
std::string Title(const ProgramInfo& program, const std::string& page) {
    return ".TH \"" + InRoff(InCapitals(page)) + "\" 1 \"\" \"" +
           InRoff(program.name + " " + program.version) + "\" \"User Commands\"\n.SH NAME\n";
}

std::string InRoff(const OptionInfo& option) {
    std::string name;
    if (option.names.empty()) {
        name = Italic(option.place) + (option.many ? "..." : "");
    } else {
        for (const std::string& each : option.names) name += (name.empty() ? "" : ", ") + Bold(each);
        if (!option.IsFlag()) name += " " + Italic(option.type);
    }
    std::string text = ".TP\n" + name + "\n" + InRoff(option.about) + "\n";
    if (option.values.kind == OptionValues::KindEnm::WORDS && !option.values.words.empty() &&
        option.values.words.size() <= 12) {
        std::string words;
        for (const std::string& word : option.values.words) words += (words.empty() ? "" : ", ") + word;
        text += "(" + InRoff(words) + ")\n";
    }
    return text;
}

std::string Options(const std::vector<OptionInfo>& options, bool placed) {
    std::string text;
    for (const OptionInfo& option : options) {
        if (option.names.empty() == placed) text += InRoff(option);
    }
    return text;
}

std::string Section(const char* title, const std::string& text) {
    return text.empty() ? text : ".SH " + std::string(title) + "\n" + text;
}

std::string ExitStatus(const std::vector<std::pair<int, std::string>>& codes) {
    std::string text;
    for (const auto& [code, meaning] : codes)
        text += ".TP\n" + Bold(std::to_string(code)) + "\n" + InRoff(meaning) + "\n";
    return text;
}

std::string InParagraphs(const std::vector<std::string>& paragraphs) {
    std::string text;
    for (const std::string& paragraph : paragraphs) text += ".PP\n" + InRoff(paragraph) + "\n";
    return text;
}

std::string Examples(const VerbInfo& verb) {
    std::string text;
    for (const auto& [command, effect] : verb.examples) {
        if (!effect.empty()) text += ".PP\n" + InRoff(effect) + ":\n";
        text += ".PP\n.EX\n    " + InRoff(command) + "\n.EE\n";
    }
    return text;
}

std::string Reference(const std::string& page, const char* behind) {
    return ".BR " + InRoff(page) + " (1)" + behind + "\n";
}

} // namespace

std::string ManualOf(const ProgramInfo& program) {
    std::string commands;
    std::string pages;
    for (const VerbInfo& verb : program.verbs) {
        const std::string page = program.name + "-" + verb.name;
        commands += ".TP\n" + Bold(verb.name) + "\n" + InRoff(verb.about) + " (see\n" + Reference(page, ").");
        pages += Reference(page, &verb == &program.verbs.back() ? "" : ",");
    }
    return Title(program, program.name) + InRoff(program.name) + " \\- " +
           InRoff("write and check finite-element models and keyword decks") + "\n.SH SYNOPSIS\n" +
           Bold(program.name) + " [" + Italic("OPTIONS") + "] " + Italic("COMMAND") + " ...\n" +
           Section("DESCRIPTION", InRoff(program.about) + "\n" + InParagraphs(program.more)) +
           Section("COMMANDS", commands) + Section("OPTIONS", Options(program.options, false)) +
           Section("EXIT STATUS", ExitStatus(program.exitCodes)) +
           Section("EXAMPLES", Examples(program.verbs.front())) + Section("SEE ALSO", pages);
}

std::string ManualOf(const ProgramInfo& program, const VerbInfo& verb) {
    const std::string page = program.name + "-" + verb.name;
    std::string about = verb.about;
    about.front() = static_cast<char>(about.front() >= 'A' && about.front() <= 'Z' ? about.front() - 'A' + 'a'
                                                                                   : about.front());
    return Title(program, page) + InRoff(page) + " \\- " + InRoff(about) + "\n" +
           Section("SYNOPSIS", Bold(program.name + " " + verb.name) +
                                   InRoff(UsageOf(program, verb).substr(page.size())) + "\n") +
           Section("DESCRIPTION",
                   InRoff(verb.about) + ".\n" + InParagraphs(verb.more) + Options(verb.options, true)) +
           Section("OPTIONS", Options(verb.options, false) + Options(program.options, false)) +
           Section("EXIT STATUS", ExitStatus(verb.exitCodes.empty() ? program.exitCodes : verb.exitCodes)) +
           Section("EXAMPLES", Examples(verb)) + Section("SEE ALSO", Reference(program.name, ""));
}
