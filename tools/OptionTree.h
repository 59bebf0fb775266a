#ifndef QRX_TOOLS_OPTIONTREE_H
#define QRX_TOOLS_OPTIONTREE_H

#include <string>
#include <vector>

// What the command line takes, as data: help, manual pages and completions are made of it.

/// What the values of an option are.
struct OptionValues {
    enum class KindEnm { ANY, FILES, FOLDERS, WORDS };

    KindEnm kind = KindEnm::ANY;
    /// Of files the extensions without their dot, none for all files; of words the words.
    std::vector<std::string> words;
};

struct OptionInfo {
    /// "-o", "--output"; none for what is given by its place.
    std::vector<std::string> names;
    /// "MODEL", of what is given by its place.
    std::string place;
    /// "FILE"; empty for a flag.
    std::string type;
    std::string about;
    bool required = false;
    bool many = false;
    OptionValues values;

    bool IsFlag() const { return place.empty() && type.empty(); }
};

struct VerbInfo {
    std::string name;
    std::string about;
    /// Paragraphs that tell more; may be empty.
    std::vector<std::string> more;
    std::vector<OptionInfo> options;
    /// Codes with what they mean, where they aren't the program's.
    std::vector<std::pair<int, std::string>> exitCodes;
    /// Commands with what they do.
    std::vector<std::pair<std::string, std::string>> examples;
};

struct ProgramInfo {
    std::string name;
    std::string version;
    std::string about;
    std::vector<std::string> more;
    std::vector<OptionInfo> options;
    std::vector<std::pair<int, std::string>> exitCodes;
    std::vector<VerbInfo> verbs;

    const VerbInfo* Find(const std::string& verb) const {
        for (const VerbInfo& each : verbs) {
            if (each.name == verb) return &each;
        }
        return nullptr;
    }
};

/// "qrxdeck write [OPTIONS] MODEL...".
std::string UsageOf(const ProgramInfo& program, const VerbInfo& verb);
/// The help of the program, or of a verb, in lines no longer than the width.
std::string HelpOf(const ProgramInfo& program, std::size_t width);
std::string HelpOf(const ProgramInfo& program, const VerbInfo& verb, std::size_t width);
/// The verbs, a line each.
std::string ListOfVerbs(const ProgramInfo& program, std::size_t width);
/// A manual page as roff source, of the program or of a verb.
std::string ManualOf(const ProgramInfo& program);
std::string ManualOf(const ProgramInfo& program, const VerbInfo& verb);
/// A completion script for "bash", "zsh" or "fish"; empty for any other shell.
std::string CompletionFor(const std::string& shell, const ProgramInfo& program);

/// The words of the text in lines no longer than the width, each but the first behind the indent.
std::string Wrapped(const std::string& text, std::size_t width, const std::string& indent = {});

#endif
