#include "tools/Program.h"

#include "tools/CommandLine.h"
#include "tools/OutOfMemory.h"
#include "tools/ProgressLine.h"
#include "tools/StandardStreams.h"
#include "whole_file/whf_SignalCleanUp.h"

#include <algorithm>
#include <cstdio>
#include <new>
#include <string_view>

namespace {

ExitCode RunGuarded(CommandLine& commandLine, RunReport& report) {
    try {
        return commandLine.Run(report);
    } catch (const std::bad_alloc&) {
        OutOfMemory::End();
    } catch (const std::exception& failure) {
        report.Error("qrxdeck", std::string("internal failure: ") + failure.what());
        return ExitCode::INTERNAL_FAILURE;
    }
}

/// Tells of a command line that can't be understood.
ExitCode Refuse(const CommandLine& commandLine, const CLI::ParseError& error,
                const std::vector<std::string>& words) {
    const bool json = std::ranges::find(words, "--json") != words.end();
    RunReport report(json);
    report.Error("qrxdeck", commandLine.Complaint(error, words));
    if (!json && words.empty())
        WriteToStandardError("\n" + ListOfVerbs(commandLine.Info(), TextWidth()));
    else if (!json)
        WriteToStandardError("Run with --help for more information.\n");
    return report.Finish(ExitCode::WRONG_USAGE);
}

ExitCode Main(int argc, char** argv) {
    CommandLine commandLine;
    try {
        commandLine.App().parse(argc, argv);
    } catch (const CLI::CallForHelp&) {
        RunReport report(false);
        report.Print(commandLine.Help());
        return report.Finish(ExitCode::DONE);
    } catch (const CLI::CallForVersion& version) {
        RunReport report(false);
        report.Print(std::string(version.what()) + "\n");
        return report.Finish(ExitCode::DONE);
    } catch (const CLI::ParseError& error) {
        return Refuse(commandLine, error, {argv + std::min(argc, 1), argv + argc});
    }
    OutOfMemory::Install(commandLine.AsJson());
    RunReport report(commandLine.Options());
    return report.Finish(RunGuarded(commandLine, report));
}

} // namespace

int RunProgram(int argc, char** argv) {
    SecureStandardStreams();
    whf_SignalCleanUp::Install();
    whf_SignalCleanUp::AlsoCall(&ProgressLine::Erase);
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
