#include "tools/HelpCommands.h"

#include "store_interface/findings/fnd_Nearest.h"
#include "store_interface/findings/fnd_Text.h"
#include "tools/CommandParts.h"

namespace {

/// The verb of the name; null, with the reason told, when there is none.
const VerbInfo* FindVerb(const ProgramInfo& program, const std::string& name, RunReport& report) {
    const VerbInfo* verb = program.Find(name);
    if (verb == nullptr) {
        report.Error(program.name,
                     "there is no command " + fnd_Quoted(name) + "; " + HintOfVerb(program, name));
    }
    return verb;
}

} // namespace

std::string HintOfVerb(const ProgramInfo& program, const std::string& verb) {
    std::vector<std::string> names;
    std::string all;
    for (const VerbInfo& each : program.verbs) {
        names.push_back(each.name);
        all += (all.empty() ? "" : ", ") + each.name;
    }
    const std::string nearest = fnd_DidYouMean(verb, names);
    return nearest.empty() ? "the commands are " + all : nearest;
}

ExitCode RunHelp(const ProgramInfo& program, const std::string& verb, RunReport& report) {
    if (verb.empty()) {
        report.Print(HelpOf(program, TextWidth()));
        return ExitCode::DONE;
    }
    const VerbInfo* info = FindVerb(program, verb, report);
    if (info == nullptr) return ExitCode::WRONG_USAGE;
    report.Print(HelpOf(program, *info, TextWidth()));
    return ExitCode::DONE;
}

ExitCode RunManual(const ProgramInfo& program, const std::string& verb, RunReport& report) {
    if (verb.empty()) {
        report.Print(ManualOf(program));
        return ExitCode::DONE;
    }
    const VerbInfo* info = FindVerb(program, verb, report);
    if (info == nullptr) return ExitCode::WRONG_USAGE;
    report.Print(ManualOf(program, *info));
    return ExitCode::DONE;
}

ExitCode WriteManuals(const ProgramInfo& program, const std::string& folder, RunReport& report) {
    const auto write = [&](const std::string& page, const std::string& text) {
        return WriteWholeFile(folder + "/" + page + ".1", "manual page", text, report);
    };
    ExitCode code = write(program.name, ManualOf(program));
    for (const VerbInfo& verb : program.verbs) {
        if (code == ExitCode::DONE) code = write(program.name + "-" + verb.name, ManualOf(program, verb));
    }
    return code;
}

ExitCode RunCompletion(const ProgramInfo& program, const std::string& shell, RunReport& report) {
    const std::string script = CompletionFor(shell, program);
    if (script.empty()) {
        report.Error(program.name, "there is no completion for the shell " + fnd_Quoted(shell) +
                                       ", but for bash, zsh and fish");
        return ExitCode::WRONG_USAGE;
    }
    report.Print(script);
    return ExitCode::DONE;
}
