#include "tools/OptionTree.h"

#include <algorithm>

namespace {

using KindEnm = OptionValues::KindEnm;

std::string WithBlanks(const std::vector<std::string>& words) {
    std::string text;
    for (const std::string& word : words) text += (text.empty() ? "" : " ") + word;
    return text;
}

/// In single quotes for a shell.
std::string ForShell(const std::string& text) {
    std::string quoted = "'";
    for (const char c : text) quoted += c == '\'' ? std::string("'\\''") : std::string(1, c);
    return quoted + "'";
}

std::string Replaced(std::string text, const std::string& what, const std::string& by) {
    for (std::size_t at = text.find(what); at != std::string::npos; at = text.find(what, at + by.size()))
        text.replace(at, what.size(), by);
    return text;
}

/// What is given by its place, taken together.
std::vector<const OptionInfo*> PlacedOf(const VerbInfo& verb) {
    std::vector<const OptionInfo*> placed;
    for (const OptionInfo& option : verb.options) {
        if (option.names.empty()) placed.push_back(&option);
    }
    return placed;
}

std::vector<const OptionInfo*> NamedOf(const ProgramInfo& program, const VerbInfo& verb) {
    std::vector<const OptionInfo*> named;
    for (const auto* options : {&verb.options, &program.options}) {
        for (const OptionInfo& option : *options) {
            const bool isThere = std::ranges::any_of(
                named, [&option](const OptionInfo* other) { return other->names == option.names; });
            const bool isOfProgram = option.names == std::vector<std::string>{"--version"};
            if (!option.names.empty() && !isThere && !isOfProgram) named.push_back(&option);
        }
    }
    return named;
}

// bash

std::string BashValues(const OptionValues& values) {
    switch (values.kind) {
    case KindEnm::FILES:
        return values.words.empty() ? "_qrxdeck_files" : "_qrxdeck_files " + WithBlanks(values.words);
    case KindEnm::FOLDERS: return "_qrxdeck_folders";
    case KindEnm::WORDS: return "_qrxdeck_words " + ForShell(WithBlanks(values.words));
    default: return ":";
    }
}

constexpr char kBashHead[] = R"(# Completion of qrxdeck for bash; made by "qrxdeck completion bash".

_qrxdeck_words() {
    local word
    while IFS= read -r word; do COMPREPLY+=("$word"); done < <(compgen -W "$1" -- "$cur")
}

_qrxdeck_folders() {
    local folder
    compopt -o filenames 2>/dev/null
    while IFS= read -r folder; do COMPREPLY+=("$folder"); done < <(compgen -d -- "$cur")
}

# Files with one of the extensions, or all where none is given, and folders.
_qrxdeck_files() {
    local file extension
    compopt -o filenames 2>/dev/null
    while IFS= read -r file; do
        if [[ -d $file || $# -eq 0 ]]; then COMPREPLY+=("$file"); continue; fi
        for extension; do [[ $file == *."$extension" ]] && COMPREPLY+=("$file"); done
    done < <(compgen -f -- "$cur")
}

_qrxdeck() {
    local cur=${COMP_WORDS[COMP_CWORD]} prev=${COMP_WORDS[COMP_CWORD-1]} verb= i
    # "--option=value" comes as three words.
    if [[ $cur == "=" ]]; then
        cur=
    elif [[ $prev == "=" ]]; then
        prev=${COMP_WORDS[COMP_CWORD-2]}
    fi
    COMPREPLY=()
    for ((i = 1; i < COMP_CWORD; ++i)); do
        case ${COMP_WORDS[i]} in
)";

std::string BashVerb(const ProgramInfo& program, const VerbInfo& verb) {
    std::string text = "        " + verb.name + ")\n            case $prev in\n";
    std::vector<std::string> names;
    for (const OptionInfo* option : NamedOf(program, verb)) {
        std::string pattern;
        for (const std::string& name : option->names) {
            names.push_back(name);
            pattern += (pattern.empty() ? "" : "|") + name;
        }
        if (!option->IsFlag())
            text += "                " + pattern + ") " + BashValues(option->values) + "; return ;;\n";
    }
    text += "            esac\n            if [[ $cur == -* ]]; then\n                _qrxdeck_words " +
            ForShell(WithBlanks(names)) + "\n            else\n";
    const std::vector<const OptionInfo*> placed = PlacedOf(verb);
    for (const OptionInfo* option : placed) text += "                " + BashValues(option->values) + "\n";
    if (placed.empty()) text += "                :\n";
    return text + "            fi ;;\n";
}

std::string ForBash(const ProgramInfo& program) {
    std::string text = kBashHead;
    std::vector<std::string> names;
    std::string verbs;
    for (const OptionInfo& option : program.options) {
        for (const std::string& name : option.names) names.push_back(name);
        if (option.IsFlag()) continue;
        for (const std::string& name : option.names) {
            text += "            " + name + ") [[ ${COMP_WORDS[i+1]} == = ]] && ((++i)); ((++i)) ;;\n";
        }
    }
    text += "            -*) ;;\n            *) verb=${COMP_WORDS[i]}; break ;;\n        esac\n    done\n"
            "    case $verb in\n        '')\n            case $prev in\n";
    for (const OptionInfo& option : program.options) {
        if (option.IsFlag()) continue;
        for (const std::string& name : option.names)
            text += "                " + name + ") " + BashValues(option.values) + "; return ;;\n";
    }
    for (const VerbInfo& verb : program.verbs) verbs += (verbs.empty() ? "" : " ") + verb.name;
    text += "            esac\n            if [[ $cur == -* ]]; then _qrxdeck_words " +
            ForShell(WithBlanks(names)) + "; else _qrxdeck_words " + ForShell(verbs) + "; fi ;;\n";
    for (const VerbInfo& verb : program.verbs) text += BashVerb(program, verb);
    return text + "    esac\n}\n\ncomplete -F _qrxdeck qrxdeck\n";
}

// zsh

std::string ZshAbout(const std::string& text) {
    std::string escaped;
    for (const char c : text) {
        if (std::string_view("[]:\\").find(c) != std::string_view::npos) escaped += '\\';
        escaped += c;
    }
    return escaped;
}

std::string ZshValues(const OptionInfo& option) {
    const std::string message = option.names.empty() ? option.place : option.type;
    switch (option.values.kind) {
    case KindEnm::FILES: {
        if (option.values.words.empty()) return message + ":_files";
        std::string extensions;
        for (const std::string& word : option.values.words)
            extensions += (extensions.empty() ? "" : "|") + word;
        return message + ":_files -g \"*.(" + extensions + ")(-.)\"";
    }
    case KindEnm::FOLDERS: return message + ":_files -/";
    case KindEnm::WORDS: return message + ":(" + WithBlanks(option.values.words) + ")";
    default: return message + ": ";
    }
}

std::string ZshOption(const OptionInfo& option) {
    const std::string about = "[" + ZshAbout(option.about) + "]";
    const std::string values = option.IsFlag() ? "" : ":" + ZshValues(option);
    const std::string excluded = option.many ? "*" : "(" + WithBlanks(option.names) + ")";
    std::string text;
    for (const std::string& name : option.names) {
        // A long option takes its value behind "=" too, a short one at once.
        const std::string sign = option.IsFlag() ? "" : name.size() > 2 ? "=" : "+";
        text += " \\\n            " + ForShell(excluded + name + sign + about + values);
    }
    return text;
}

std::string ForZsh(const ProgramInfo& program) {
    std::string text =
        "#compdef qrxdeck\n# Completion of qrxdeck for zsh; made by \"qrxdeck completion zsh\".\n\n"
        "_qrxdeck() {\n    local curcontext=\"$curcontext\" state line\n"
        "    local -A opt_args\n    _arguments -C";
    for (const OptionInfo& option : program.options) text += ZshOption(option);
    text += " \\\n            '1: :->verb' '*:: :->rest' && return\n    case $state in\n    verb)\n"
            "        local -a verbs=(\n";
    for (const VerbInfo& verb : program.verbs)
        text += "            " + ForShell(verb.name + ":" + Replaced(verb.about, ":", "\\:")) + "\n";
    text +=
        "        )\n        _describe -t commands command verbs ;;\n    rest)\n        case $words[1] in\n";
    for (const VerbInfo& verb : program.verbs) {
        text += "        " + verb.name + ")\n            _arguments";
        for (const OptionInfo* option : NamedOf(program, verb)) text += ZshOption(*option);
        int place = 0;
        for (const OptionInfo* option : PlacedOf(verb)) {
            const std::string where = option->many ? "*" : std::to_string(++place);
            text += " \\\n            " + ForShell(where + ":" + ZshValues(*option));
        }
        text += " ;;\n";
    }
    return text +
           "        esac ;;\n    esac\n}\n\n"
           "if [[ $funcstack[1] == _qrxdeck ]]; then _qrxdeck \"$@\"; else compdef _qrxdeck qrxdeck; fi\n";
}

// fish

std::string ForFishQuoted(const std::string& text) {
    return "'" + Replaced(Replaced(text, "\\", "\\\\"), "'", "\\'") + "'";
}

std::string FishValues(const OptionValues& values) {
    switch (values.kind) {
    case KindEnm::FILES:
        return values.words.empty() ? " -F" : " -a '(__qrxdeck_files " + WithBlanks(values.words) + ")'";
    case KindEnm::FOLDERS: return " -a '(__fish_complete_directories)'";
    case KindEnm::WORDS: return " -a " + ForFishQuoted(WithBlanks(values.words));
    default: return "";
    }
}

constexpr char kFishHead[] = R"(# Completion of qrxdeck for fish; made by "qrxdeck completion fish".

# Files with one of the extensions, and folders.
function __qrxdeck_files
    set -l token (string replace -r '^~/' "$HOME/" -- (commandline -ct | string unescape))
    for file in $token*
        if test -d "$file"
            echo "$file/"
        else if contains -- (string replace -r '^.*\.' '' -- "$file") $argv
            echo "$file"
        end
    end
end

# The first word that is no option is the verb.
function __qrxdeck_verb
    set -l words (commandline -opc)
    set -e words[1]
    while set -q words[1]
)";

std::string FishOption(const OptionInfo& option, const std::string& condition) {
    std::string text = "complete -c qrxdeck" + condition;
    for (const std::string& name : option.names)
        text += name.size() > 2 ? " -l " + name.substr(2) : " -s " + name.substr(1);
    if (!option.IsFlag()) {
        const std::string values = FishValues(option.values);
        text += values == " -F" ? " -r -F" : " -x" + values;
    }
    return text + " -d " + ForFishQuoted(option.about) + "\n";
}

std::string ForFish(const ProgramInfo& program) {
    std::string text = kFishHead;
    std::string withValues;
    for (const OptionInfo& option : program.options) {
        if (!option.IsFlag()) withValues += " " + WithBlanks(option.names);
    }
    text += "        switch $words[1]\n            case" + withValues +
            "\n                set -e words[1]\n            case '-*'\n            case '*'\n"
            "                echo $words[1]\n                return\n        end\n        set -e words[1]\n  "
            "  end\n"
            "end\n\ncomplete -c qrxdeck -f\n";
    for (const VerbInfo& verb : program.verbs) {
        text += "complete -c qrxdeck -n 'test -z (__qrxdeck_verb)' -a " + verb.name + " -d " +
                ForFishQuoted(verb.about) + "\n";
    }
    for (const OptionInfo& option : program.options) text += FishOption(option, "");
    for (const VerbInfo& verb : program.verbs) {
        const std::string condition = " -n 'contains -- " + verb.name + " (__qrxdeck_verb)'";
        for (const OptionInfo& option : verb.options) {
            const bool isOfProgram = std::ranges::any_of(
                program.options, [&option](const OptionInfo& other) { return other.names == option.names; });
            if (!option.names.empty() && !isOfProgram) text += FishOption(option, condition);
        }
        for (const OptionInfo* option : PlacedOf(verb)) {
            const std::string values = FishValues(option->values);
            if (!values.empty()) text += "complete -c qrxdeck" + condition + values + "\n";
        }
    }
    return text;
}

} // namespace

std::string CompletionFor(const std::string& shell, const ProgramInfo& program) {
    if (shell == "bash") return ForBash(program);
    if (shell == "zsh") return ForZsh(program);
    if (shell == "fish") return ForFish(program);
    return {};
}
