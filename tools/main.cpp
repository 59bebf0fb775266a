#include "foundation/nex_Exception.h"
#include "tools/Commands.h"
#include "tools/DeckCommands.h"
#include "tools/SignalCleanUp.h"

#include <CLI/CLI.hpp>

#include <algorithm>
#include <cstdio>
#include <iostream>
#include <new>
#include <string_view>

namespace {

constexpr char kAbout[] =
    "Writes finite-element models, held in JSON model files, as keyword decks; checks and compares decks.";
constexpr char kExitCodes[] =
    "Exit codes:\n"
    "  0  done (there may be warnings)\n"
    "  1  the model is wrong, or not in canonical form (format --check)\n"
    "  2  wrong usage\n"
    "  3  a file can't be read or written, or there is not enough memory\n"
    "  4  a deck can't express the model: the reason on a line, object and step on the next\n"
    "  5  an internal failure\n"
    "\n"
    "A run that fails leaves an older deck as it was.\n";

struct CommandLine {
    CLI::App app{kAbout, "qrxdeck"};
    WriteRequest write;
    FormatRequest format;
    DeckRequest deck;
    DiffRequest diff;
    FlattenRequest flatten;
    bool textOfDeck = false;
    std::string model;
    std::string schemaOutput;
    std::string stepType;
    bool json = false;
    bool history = false;
    CLI::App* writeCommand = app.add_subcommand("write", "Write the deck of a model");
    CLI::App* checkCommand = app.add_subcommand(
        "check", "Look for errors in a model and what its deck can't say, or in a deck; write nothing");
    CLI::App* diffCommand = app.add_subcommand("diff", "Compare two decks, or models, by what they mean");
    CLI::App* flattenCommand =
        app.add_subcommand("flatten", "Write a deck without parts, instances and assembly");
    CLI::App* infoCommand = app.add_subcommand("info", "Tell what is in a model");
    CLI::App* formatCommand = app.add_subcommand("format", "Write a model file anew in its canonical form");
    CLI::App* variablesCommand =
        app.add_subcommand("variables", "List the variables that output requests can ask for");
    CLI::App* schemaCommand =
        app.add_subcommand("schema", "Print the JSON Schema of model files, for editors and generators");

    CommandLine() {
        app.set_version_flag("--version", "qrxdeck " QRX_VERSION);
        app.require_subcommand(1);
        app.footer(kExitCodes);
        app.get_formatter()->column_width(30);

        AddModel(writeCommand, write.model);
        writeCommand
            ->add_option(
                "--job", write.job,
                "Name of the deck without \".inp\"; may hold a folder, relative to the output folder "
                "(default: the model file's name without extension)")
            ->type_name("NAME");
        writeCommand
            ->add_option("--output-dir", write.outputDir, "Folder of the deck (default: the current one)")
            ->type_name("DIR");
        AddModel(checkCommand, model, "Model file, JSON; or a deck, .inp");
        checkCommand->add_flag("--no-includes", deck.keepIncludesShut,
                               "Of a deck: don't read the files that it includes");
        AddDiff();
        AddFlatten();
        AddModel(infoCommand, model);
        infoCommand->add_flag(
            "--history", history,
            "Also what conditions, loads, interactions and output requests are in each step, "
            "and what the step writes of them");
        AddModel(formatCommand, format.model);
        auto* output =
            formatCommand
                ->add_option("-o,--output", format.output,
                             "File to write, which may be MODEL itself (default: the standard output); "
                             "comments are left out, and on failure the old file stays as it was")
                ->type_name("FILE");
        formatCommand
            ->add_flag("--check", format.check,
                       "Write nothing; exit with 1 and name the file when it isn't in that form")
            ->excludes(output);
        variablesCommand
            ->add_option("--step-type", stepType,
                         "Only those of one procedure, by the class of its step, such as StaticStep")
            ->type_name("TYPE");
        AddJson(variablesCommand);
        schemaCommand->add_option("--output", schemaOutput, "File to write (default: the standard output)")
            ->type_name("FILE");
    }

    /// What is wrong, in the words of the command line's reader but for a command that isn't known.
    std::string Complaint(const CLI::ParseError& error, int argc, char** argv) const {
        const bool named = argc > 1 && argv[1][0] != '-';
        if (!named || !app.get_subcommands().empty()) return error.what();
        return std::string("there is no command '") + argv[1] +
               "'; the commands are write, check, diff, flatten, info, format, variables and schema";
    }

    ExitCode Run(RunReport& report) const {
        if (*writeCommand) return RunWrite(write, report);
        if (*checkCommand) return IsDeck(model) ? RunCheckDeck(model, deck, report) : RunCheck(model, report);
        if (*diffCommand) {
            return static_cast<ExitCode>(textOfDeck ? RunTextOfDeck(diff.first, diff.deck, report)
                                                    : RunDiff(diff, report));
        }
        if (*flattenCommand) return RunFlatten(flatten, report);
        if (*infoCommand) return RunInfo(model, history, report);
        if (*formatCommand) return RunFormat(format, report);
        if (*variablesCommand) return RunVariables(stepType, report);
        return RunSchema(schemaOutput, report);
    }

private:
    void AddModel(CLI::App* command, std::string& file, const char* about = "Model file, JSON") {
        command->add_option("MODEL", file, about)->required()->type_name("");
        AddJson(command);
    }
    void AddDiff() {
        diffCommand->add_option("A", diff.first, "Deck, .inp, or model file")->required()->type_name("");
        auto* second = diffCommand->add_option("B", diff.second, "Deck, .inp, or model file")->type_name("");
        diffCommand
            ->add_flag("--textconv", textOfDeck,
                       "Compare nothing: print A in one form, for programs that compare lines")
            ->excludes(second);
        diffCommand
            ->add_option("--tolerance", diff.tolerance,
                         "Numbers are equal that differ by no more than this part of the greater")
            ->type_name("R");
        diffCommand
            ->add_option(
                "--ignore", diff.ignore,
                "What makes no difference: comments, names, order, titles, output, with commas between")
            ->delimiter(',')
            ->type_name("WORDS");
        diffCommand->add_flag("--no-includes", diff.deck.keepIncludesShut,
                              "Don't read the files that the decks include");
        AddJson(diffCommand);
        diffCommand->callback([this, second] {
            if (!textOfDeck && second->empty()) throw CLI::RequiredError("B");
        });
        diffCommand->footer("Exit codes: 0 equal, 1 different, 2 an error.\n");
    }
    void AddFlatten() {
        flattenCommand->add_option("FILE", flatten.input, "Deck, .inp, or model file")
            ->required()
            ->type_name("");
        flattenCommand
            ->add_option("-o,--output", flatten.output, "Deck to write (default: the standard output)")
            ->type_name("FILE");
        flattenCommand->add_flag("--no-includes", flatten.deck.keepIncludesShut,
                                 "Don't read the files that the deck includes");
        AddJson(flattenCommand);
    }
    void AddJson(CLI::App* command) {
        command->add_flag(
            "--json", json,
            "Everything as one JSON object on the standard output: exitCode, messages, results");
    }
};

ExitCode RunGuarded(const CommandLine& commandLine, RunReport& report) {
    try {
        return commandLine.Run(report);
    } catch (const std::bad_alloc&) {
        report.Error("qrxdeck", "not enough memory");
        return ExitCode::FILE_SYSTEM_REFUSED;
    } catch (const std::exception& failure) {
        report.Error("qrxdeck", std::string("internal failure: ") + failure.what());
        return ExitCode::INTERNAL_FAILURE;
    }
}

ExitCode Main(int argc, char** argv) {
    CommandLine commandLine;
    try {
        commandLine.app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        const bool wrong = error.get_exit_code() != static_cast<int>(CLI::ExitCodes::Success);
        const bool json = std::any_of(argv, argv + argc,
                                      [](const char* word) { return std::string_view(word) == "--json"; });
        RunReport report(wrong && json);
        if (!wrong) {
            commandLine.app.exit(error, std::cout, std::cerr);
            std::cout.flush();
            return report.Finish(ExitCode::DONE);
        }
        report.Error("qrxdeck", commandLine.Complaint(error, argc, argv));
        if (!json) std::fputs("Run with --help for more information.\n", stderr);
        return report.Finish(ExitCode::WRONG_USAGE);
    }
    RunReport report(commandLine.json);
    return report.Finish(RunGuarded(commandLine, report));
}

} // namespace

int main(int argc, char** argv) {
    SignalCleanUp::Install();
    try {
        return static_cast<int>(Main(argc, argv));
    } catch (const std::bad_alloc&) {
        std::fputs("qrxdeck: error: not enough memory\n", stderr);
        return static_cast<int>(ExitCode::FILE_SYSTEM_REFUSED);
    } catch (const std::exception& failure) {
        std::fprintf(stderr, "qrxdeck: error: internal failure: %s\n", failure.what());
        return static_cast<int>(ExitCode::INTERNAL_FAILURE);
    }
}
