#include "tools/OptionTree.h"

#include <algorithm>
#include <sstream>

namespace {

constexpr std::size_t kLeftColumn = 26;

std::size_t ShownWidth(const std::string& text) {
    return static_cast<std::size_t>(
        std::ranges::count_if(text, [](char c) { return (static_cast<unsigned char>(c) & 0xC0U) != 0x80U; }));
}

/// A name, and behind it, or below a long one, what it is.
std::string Row(const std::string& left, const std::string& right, std::size_t width) {
    const std::string indent(kLeftColumn, ' ');
    std::string text = "  " + left;
    const std::size_t used = ShownWidth(text);
    text += used + 1 < kLeftColumn ? std::string(kLeftColumn - used, ' ') : "\n" + indent;
    return text + Wrapped(right, std::max<std::size_t>(width, kLeftColumn + 20), indent) + "\n";
}

std::string LeftOf(const OptionInfo& option) {
    if (option.names.empty()) return option.place + (option.many ? "..." : "");
    // Short names stand before long ones, in a column of their own.
    std::string text = option.names.front().size() > 2 ? "    " : "";
    const char* separator = "";
    for (const std::string& name : option.names) {
        text.append(separator).append(name);
        separator = ", ";
    }
    return option.IsFlag() ? text : text + " " + option.type;
}

std::string RowsOf(const std::vector<OptionInfo>& options, bool placed, std::size_t width) {
    std::string text;
    for (const OptionInfo& option : options) {
        if (option.names.empty() == placed) text += Row(LeftOf(option), option.about, width);
    }
    return text;
}

std::string ExitCodes(const std::vector<std::pair<int, std::string>>& codes, std::size_t width) {
    if (codes.empty()) return {};
    std::string text = "\nExit codes:\n";
    for (const auto& [code, meaning] : codes)
        text += "  " + std::to_string(code) + "  " + Wrapped(meaning, width, "     ") + "\n";
    return text;
}

std::string Paragraphs(const std::vector<std::string>& paragraphs, std::size_t width) {
    std::string text;
    for (const std::string& paragraph : paragraphs) text += "\n" + Wrapped(paragraph, width) + "\n";
    return text;
}

} // namespace

std::string Wrapped(const std::string& text, std::size_t width, const std::string& indent) {
    std::istringstream words(text);
    std::string lines;
    std::string word;
    std::size_t at = indent.size();
    while (words >> word) {
        const std::size_t length = ShownWidth(word);
        const bool isFirst = lines.empty();
        if (!isFirst && at + 1 + length > width) {
            lines += "\n" + indent;
            at = indent.size();
        } else if (!isFirst) {
            lines += ' ';
            ++at;
        }
        lines += word;
        at += length;
    }
    return lines;
}

std::string UsageOf(const ProgramInfo& program, const VerbInfo& verb) {
    std::string usage = program.name + " " + verb.name;
    const bool hasOptions =
        std::ranges::any_of(verb.options, [](const OptionInfo& option) { return !option.names.empty(); });
    if (hasOptions) usage += " [OPTIONS]";
    for (const OptionInfo& option : verb.options) {
        if (!option.names.empty()) continue;
        const std::string place = option.place + (option.many ? "..." : "");
        usage += option.required ? " " + place : " [" + place + "]";
    }
    return usage;
}

std::string ListOfVerbs(const ProgramInfo& program, std::size_t width) {
    std::string text = "Commands:\n";
    std::size_t longest = 0;
    for (const VerbInfo& verb : program.verbs) longest = std::max(longest, verb.name.size());
    const std::string indent(longest + 4, ' ');
    for (const VerbInfo& verb : program.verbs) {
        text += "  " + verb.name + std::string(longest + 2 - verb.name.size(), ' ') +
                Wrapped(verb.about, width, indent) + "\n";
    }
    return text + "\n\"" + program.name + " help COMMAND\" tells more of one.\n";
}

std::string HelpOf(const ProgramInfo& program, std::size_t width) {
    return Wrapped(program.about, width) + "\n\nUsage: " + program.name + " [OPTIONS] COMMAND ...\n\n" +
           ListOfVerbs(program, width) + "\nOptions, of every command too:\n" +
           RowsOf(program.options, false, width) + ExitCodes(program.exitCodes, width) +
           Paragraphs(program.more, width) + "\nExample:\n  " + program.verbs.front().examples.front().first +
           "\n";
}

std::string HelpOf(const ProgramInfo& program, const VerbInfo& verb, std::size_t width) {
    std::string text = Wrapped(verb.about, width) + "\n\nUsage: " + UsageOf(program, verb) + "\n";
    const std::string placed = RowsOf(verb.options, true, width);
    if (!placed.empty()) text += "\n" + placed;
    const std::string named = RowsOf(verb.options, false, width);
    if (!named.empty()) text += "\nOptions:\n" + named;
    text += Paragraphs(verb.more, width) + ExitCodes(verb.exitCodes, width);
    text += verb.examples.size() > 1 ? "\nExamples:\n" : "\nExample:\n";
    for (const auto& [command, effect] : verb.examples) {
        text += "  " + command + "\n";
        if (!effect.empty()) text += "      " + Wrapped(effect, width, "      ") + "\n";
    }
    return text;
}
