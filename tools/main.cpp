#include "foundation/nex_Exception.h"
#include "store_interface/findings/fnd_Text.h"
#include "tools/Commands.h"
#include "tools/OutOfMemory.h"
#include "tools/SignalCleanUp.h"
#include "tools/StandardStreams.h"

#include <CLI/CLI.hpp>

#include <algorithm>
#include <cstdio>
#include <new>
#include <sstream>
#include <string_view>

namespace {

constexpr char kAbout[] = "Writes finite-element models, held in JSON model files, as keyword decks.";
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
    MeshRequest mesh;
    NewRequest newModel;
    std::string model;
    std::string schemaOutput;
    std::string stepType;
    bool json = false;
    bool history = false;
    CLI::App* writeCommand = app.add_subcommand("write", "Write the deck of a model");
    CLI::App* checkCommand =
        app.add_subcommand("check", "Look for errors in a model and what its deck can't say, write nothing");
    CLI::App* infoCommand = app.add_subcommand("info", "Tell what is in a model");
    CLI::App* meshCommand = app.add_subcommand("mesh", "Tell of a mesher's file: cells, groups, quality");
    CLI::App* newCommand = app.add_subcommand("new", "Make a model file for a mesher's file, to go on from");
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
                "Name of the deck without \".inp\"; may hold a folder, relative to the output folder, "
                "out of which \"../\" leads; an absolute path excludes --output-dir "
                "(default: the model file's name without extension)")
            ->type_name("NAME");
        writeCommand
            ->add_option("--output-dir", write.outputDir, "Folder of the deck (default: the current one)")
            ->type_name("DIR");
        AddModel(checkCommand, model);
        AddModel(infoCommand, model);
        infoCommand->add_flag(
            "--history", history,
            "Also what conditions, loads, interactions and output requests are in each step, "
            "and what the step writes of them");
        AddMeshFile(meshCommand, mesh.mesh);
        meshCommand
            ->add_option("--group-arrays", mesh.groupArrays,
                         "Arrays of cells that are to become groups, of formats that have none (VTK, VTU)")
            ->type_name("NAME");
        meshCommand->add_option("--part", mesh.part, "The mesh to take of a file with several")
            ->type_name("NAME");
        AddMeshFile(newCommand, newModel.mesh);
        newCommand
            ->add_option("-o,--output", newModel.output,
                         "Model file to write (default: the mesh file's name with \".json\", in the "
                         "current folder)")
            ->type_name("FILE");
        newCommand->add_flag("--force", newModel.force, "Overwrite the file if it is there");
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
        return "there is no command " + fnd_Quoted(argv[1]) +
               "; the commands are write, check, info, mesh, new, format, variables and schema";
    }

    ExitCode Run(RunReport& report) const {
        if (*writeCommand) return RunWrite(write, report);
        if (*checkCommand) return RunCheck(model, report);
        if (*infoCommand) return RunInfo(model, history, report);
        if (*meshCommand) return RunMesh(mesh, report);
        if (*newCommand) return RunNew(newModel, report);
        if (*formatCommand) return RunFormat(format, report);
        if (*variablesCommand) return RunVariables(stepType, report);
        return RunSchema(schemaOutput, report);
    }

private:
    void AddModel(CLI::App* command, std::string& file) {
        command->add_option("MODEL", file, "Model file, JSON")->required()->type_name("");
        AddJson(command);
    }
    void AddMeshFile(CLI::App* command, std::string& file) {
        command->add_option("MESH", file, "Mesh file: MSH, UNV, MED, VTU, VTK or STL")
            ->required()
            ->type_name("");
        AddJson(command);
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

int main(int argc, char** argv) {
    SecureStandardStreams();
    SignalCleanUp::Install();
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
