#include "tools/Program.h"

#include "foundation/nex_Exception.h"
#include "foundation/thr_InOrder.h"
#include "store_interface/findings/fnd_Text.h"
#include "tools/Commands.h"
#include "tools/DeckCommands.h"
#include "tools/OutOfMemory.h"
#include "tools/StandardStreams.h"
#include "tools/StudyCommand.h"
#include "tools/ViewCommand.h"
#include "whole_file/whf_SignalCleanUp.h"

#include <CLI/CLI.hpp>

#include <algorithm>
#include <cstdio>
#include <new>
#include <sstream>
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
    "  6  the file was written, but the report on it is lost\n"
    "\n"
    "A run that fails with 1 to 5 leaves an older deck as it was. A deck takes over the access rights of "
    "the\n"
    "one that it replaces, which must be writable; a link is followed, other hard links keep the old deck.\n";

struct CommandLine {
    CLI::App app{kAbout, "qrxdeck"};
    WriteRequest write;
    FormatRequest format;
    ViewRequest view;
    MeshRequest mesh;
    NewRequest newModel;
    DeckRequest deck;
    DiffRequest diff;
    FlattenRequest flatten;
    StudyCommand study;
    bool textOfDeck = false;
    std::string model;
    std::string modelName;
    std::string schemaOutput;
    std::string schemaClass;
    std::string classFamily;
    std::string stepType;
    bool json = false;
    int threads = 0;
    bool history = false;
    CLI::App* writeCommand = app.add_subcommand("write", "Write the deck of a model");
    CLI::App* checkCommand = app.add_subcommand(
        "check", "Look for errors in a model and what its deck can't say, or in a deck; write nothing");
    CLI::App* diffCommand = app.add_subcommand("diff", "Compare two decks, or models, by what they mean");
    CLI::App* flattenCommand =
        app.add_subcommand("flatten", "Write a deck without parts, instances and assembly");
    CLI::App* infoCommand = app.add_subcommand("info", "Tell what is in a model");
    CLI::App* meshCommand = app.add_subcommand("mesh", "Tell of a mesher's file: cells, groups, quality");
    CLI::App* newCommand = app.add_subcommand("new", "Make a model file for a mesher's file, to go on from");
    CLI::App* formatCommand = app.add_subcommand("format", "Write a model file anew in its canonical form");
    CLI::App* studyCommand =
        app.add_subcommand("study", "Write a deck for each row of a table of parameters");
    CLI::App* viewCommand = app.add_subcommand("view", "Write a page that shows a model, step by step");
    CLI::App* variablesCommand =
        app.add_subcommand("variables", "List the variables that output requests can ask for");
    CLI::App* classesCommand =
        app.add_subcommand("classes", "List the classes of objects that model files know");
    CLI::App* schemaCommand = app.add_subcommand(
        "schema",
        "Print the JSON Schema of model files, for editors and generators, or one class as a table");

    CommandLine() {
        app.set_version_flag("--version", "qrxdeck " QRX_VERSION);
        app.require_subcommand(1);
        app.footer(kExitCodes);
        app.get_formatter()->column_width(30);

        AddWrite();
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
        AddMesh();
        AddNew();
        AddFormat();
        AddView();
        AddStudy();
        variablesCommand
            ->add_option("--step-type", stepType,
                         "Only those of one procedure, by the class of its step, such as StaticStep")
            ->type_name("TYPE");
        AddJson(variablesCommand);
        schemaCommand
            ->add_option("CLASS", schemaClass,
                         "One class alone, as a table to read: StaticStep, Pressure, Part, ...")
            ->type_name("");
        schemaCommand->add_option("--output", schemaOutput, "File to write (default: the standard output)")
            ->type_name("FILE");
        AddJson(schemaCommand);
        classesCommand
            ->add_option("FAMILY", classFamily, "One family alone: steps, loads, sections, materials, ...")
            ->type_name("");
        AddJson(classesCommand);
        AddModelName(writeCommand, write.modelName);
        AddModelName(checkCommand, modelName);
        AddModelName(viewCommand, view.modelName);
    }

    /// What is wrong, in the words of the command line's reader but for a command that isn't known.
    std::string Complaint(const CLI::ParseError& error, int argc, char** argv) const {
        const bool named = argc > 1 && argv[1][0] != '-';
        if (!named || !app.get_subcommands().empty()) return error.what();
        std::string commands;
        for (const CLI::App* command : app.get_subcommands({})) {
            commands += (commands.empty() ? "" : ", ") + command->get_name();
        }
        return "there is no command " + fnd_Quoted(argv[1]) + "; the commands are " + commands;
    }

    ExitCode Run(RunReport& report) const {
        thr_SetUsualThreads(threads);
        if (*writeCommand) return RunWrite(write, report);
        if (*checkCommand)
            return IsDeck(model) ? RunCheckDeck(model, deck, report) : RunCheck(model, modelName, report);
        if (*diffCommand) {
            return static_cast<ExitCode>(textOfDeck ? RunTextOfDeck(diff.first, diff.deck, report)
                                                    : RunDiff(diff, report));
        }
        if (*flattenCommand) return RunFlatten(flatten, report);
        if (*infoCommand) return RunInfo(model, history, report);
        if (*meshCommand) return RunMesh(mesh, report);
        if (*newCommand) return RunNew(newModel, report);
        if (*formatCommand) return RunFormat(format, report);
        if (*viewCommand) return RunView(view, report);
        if (*studyCommand) return RunStudy(study, report);
        if (*variablesCommand) return RunVariables(stepType, report);
        if (*classesCommand) return RunClasses(classFamily, report);
        return schemaClass.empty() ? RunSchema(schemaOutput, report) : RunSchemaOf(schemaClass, report);
    }

private:
    void AddModel(CLI::App* command, std::string& file, const char* about = "Model file, JSON") {
        command->add_option("MODEL", file, about)->required()->type_name("");
        command
            ->add_option(
                "--threads", threads,
                "Threads for what is large; the result is the same with any number (default: one a core)")
            ->check(CLI::Range(1, 64))
            ->type_name("N");
        AddJson(command);
    }
    static void AddModelName(CLI::App* command, std::string& name) {
        command
            ->add_option("--model", name,
                         "Which model of the file (default: the only one, or \"Default Model\")")
            ->type_name("NAME");
    }
    void AddMeshFile(CLI::App* command, std::string& file) {
        command->add_option("MESH", file, "Mesh file: MSH, UNV, MED, VTU, VTK or STL")
            ->required()
            ->type_name("");
        AddJson(command);
    }
    void AddView() {
        AddModel(viewCommand, view.model, "Model file, JSON; a mesher's file; or a deck, .inp");
        viewCommand
            ->add_option("-o,--output", view.output,
                         "The page (default: the model file's name with .html, in the current folder)")
            ->type_name("FILE");
        viewCommand
            ->add_option("--vtu", view.vtu,
                         "Also write the mesh with sections, materials and sets as a VTU file")
            ->type_name("FILE");
        viewCommand->add_flag("--open", view.open, "Show the page in the browser");
    }
    void AddWrite() {
        AddModel(writeCommand, write.model);
        writeCommand
            ->add_option(
                "--job", write.job,
                "Name of the deck without \".inp\"; may hold a folder, relative to the output folder, "
                "out of which \"../\" leads; an absolute path excludes --output-dir "
                "(default: the model file's name without extension)")
            ->type_name("NAME");
        writeCommand
            ->add_option("--output-dir", write.outputDir, "Folder of the deck (default: the current one)")
            ->type_name("DIR");
        writeCommand->add_flag(
            "--verify", write.verify,
            "Read the deck back and hold it against the model: nodes, elements, sets, surfaces, "
            "materials, amplitudes, steps");
    }

    void AddMesh() {
        AddMeshFile(meshCommand, mesh.mesh);
        meshCommand
            ->add_option("--group-arrays", mesh.groupArrays,
                         "Arrays of cells that are to become groups, of formats that have none (VTK, VTU)")
            ->type_name("NAME");
        meshCommand->add_option("--part", mesh.part, "The mesh to take of a file with several")
            ->type_name("NAME");
    }

    void AddNew() {
        AddMeshFile(newCommand, newModel.mesh);
        newCommand
            ->add_option("-o,--output", newModel.output,
                         "Model file to write (default: the mesh file's name with \".json\", in the "
                         "current folder)")
            ->type_name("FILE");
        newCommand->add_flag("--force", newModel.force, "Overwrite the file if it is there");
    }

    void AddFormat() {
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
    }

    void AddStudy() {
        studyCommand->add_option("TEMPLATE", study.request.model, "Model file, JSON")->type_name("");
        studyCommand
            ->add_option("TABLE", study.request.table,
                         "Table: .csv, .tsv, or .jsonl; columns are JSON pointers into the template, its "
                         "parameters, or \"name\"")
            ->type_name("");
        studyCommand
            ->add_option("--out", study.request.out,
                         "Folder of the decks and the ledger (default: the table's name without extension)")
            ->type_name("DIR");
        studyCommand
            ->add_option("--jobs", study.request.jobs, "Decks at a time (default: as many as processors)")
            ->type_name("N");
        studyCommand->add_option("--shard", study.shard, "Only the K-th of N parts of the rows")
            ->type_name("K/N");
        studyCommand->add_flag("--resume", study.request.resume, "Do what is missing or failed");
        studyCommand->add_flag("--dry-run", study.request.dryRun, "Make all decks and write nothing");
        studyCommand->add_option("--merge", study.merge, "Join the ledgers of a study's shards")
            ->type_name("DIR");
        studyCommand
            ->add_option("--emit", study.emit, "Print a script that runs shards: for slurm or snakemake")
            ->type_name("WORD");
        studyCommand->add_option("--shards", study.shards, "Shards of the script")->type_name("N");
        AddJson(studyCommand);
        studyCommand->footer("Exit codes: 0 all rows have their decks, 1 some failed, 2 template, table or "
                             "folder can't be used,\n"
                             "3 a file can't be read or written. A run that a signal interrupts ends by that "
                             "signal, when the\n"
                             "rows in hand are done.\n");
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
            ->type_name("WORDS");
        diffCommand->add_flag("--no-includes", diff.deck.keepIncludesShut,
                              "Don't read the files that the decks include");
        AddJson(diffCommand);
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
        OutOfMemory::End();
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
            std::ostringstream text;
            commandLine.app.exit(error, text, text);
            report.Print(text.str());
            return report.Finish(ExitCode::DONE);
        }
        report.Error("qrxdeck", commandLine.Complaint(error, argc, argv));
        if (!json) std::fputs("Run with --help for more information.\n", stderr);
        return report.Finish(ExitCode::WRONG_USAGE);
    }
    OutOfMemory::Install(commandLine.json);
    RunReport report(commandLine.json);
    return report.Finish(RunGuarded(commandLine, report));
}

} // namespace

int RunProgram(int argc, char** argv) {
    SecureStandardStreams();
    whf_SignalCleanUp::Install();
    OutOfMemory::Install(false);
    try {
        return static_cast<int>(Main(argc, argv));
    } catch (const std::bad_alloc&) {
        OutOfMemory::End();
    } catch (const std::exception& failure) {
        std::fprintf(stderr, "qrxdeck: error: internal failure: %s\n", failure.what());
        return static_cast<int>(ExitCode::INTERNAL_FAILURE);
    }
}
