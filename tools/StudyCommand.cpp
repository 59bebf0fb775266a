#include "tools/StudyCommand.h"

#include "platform/plt_Files.h"
#include "platform/plt_Process.h"
#include "store_interface/findings/fnd_Text.h"
#include "tools/OutOfMemory.h"
#include "tools/StandardStreams.h"

#include <charconv>
#include <chrono>
#include <cstdio>
#include <filesystem>

namespace {

constexpr int kMostShards = 1'000'000;
constexpr int kMostJobs = 1024;

std::string TimeText(double seconds) {
    char text[32];
    if (seconds < 60.0) {
        std::snprintf(text, sizeof text, "%.1f s", seconds);
    } else if (seconds < 3600.0) {
        std::snprintf(text, sizeof text, "%d min %02d s", static_cast<int>(seconds) / 60,
                      static_cast<int>(seconds) % 60);
    } else {
        std::snprintf(text, sizeof text, "%lld h %02d min", static_cast<long long>(seconds) / 3600,
                      static_cast<int>(static_cast<long long>(seconds) / 60 % 60));
    }
    return text;
}

std::string RateText(double rate) {
    char text[32];
    std::snprintf(text, sizeof text, rate < 10.0 ? "%.1f" : "%.0f", rate);
    return text;
}

/// Tells how far a study has come: on a terminal in one line that changes, else in a line every ten seconds.
class Progress final : public sty_Observer {
public:
    explicit Progress(RunReport& report) : report_(report) {}

    void Tell(const std::string& file, const fnd_Finding& finding) override { report_.Add(file, finding); }
    void Warn(const std::string& text) override { report_.Warning("qrxdeck", text); }
    bool Pause(const sty_Counts& counts) override {
        if (!report_.AsJson()) Show(counts);
        return plt_PoliteSignals::Came() != 0;
    }
    void End() {
        if (shown_) WriteToStandardError("\r\033[K");
        shown_ = false;
    }

private:
    void Show(const sty_Counts& counts) {
        constexpr double interval = 10.0;
        if (!isTerminal_ && counts.seconds < next_) return;
        if (!isTerminal_) next_ = counts.seconds + interval;
        const long long ended = counts.done + counts.failed;
        std::string line = std::to_string(counts.earlier + ended) + " of " + std::to_string(counts.rows) +
                           " rows, " + std::to_string(counts.failed) + " failed";
        if (ended > 0) {
            line += ", " + RateText(counts.Rate()) + " rows/s, " +
                    TimeText(static_cast<double>(counts.Left()) / counts.Rate()) + " left";
        }
        WriteToStandardError(isTerminal_ ? "\r" + line + "\033[K" : line + "\n");
        shown_ = isTerminal_;
    }

    RunReport& report_;
    const bool isTerminal_ = plt_IsTerminal(plt_kStandardError);
    double next_ = 10.0;
    bool shown_ = false;
};

nlohmann::ordered_json JsonOf(const std::vector<sty_Failure>& failures) {
    nlohmann::ordered_json list = nlohmann::ordered_json::array();
    for (const sty_Failure& failure : failures) {
        nlohmann::ordered_json entry = {{"row", failure.row}, {"reason", failure.reason}};
        if (!failure.name.empty()) entry["name"] = failure.name;
        list.push_back(std::move(entry));
    }
    return list;
}

void PrintFailures(const std::vector<sty_Failure>& failures, long long count, RunReport& report) {
    for (const sty_Failure& failure : failures) {
        const std::string name = failure.name.empty() ? "" : " (" + failure.name + ")";
        report.Print("  row " + std::to_string(failure.row) + name + ": " + fnd_Visible(failure.reason) +
                     "\n");
    }
    const long long more = count - static_cast<long long>(failures.size());
    if (more > 0) report.Print("  and " + std::to_string(more) + " more, which the ledger tells of\n");
}

void Summarise(const sty_Outcome& outcome, const sty_Request& request, RunReport& report) {
    const sty_Counts& counts = outcome.counts;
    if (report.AsJson()) {
        report.Member("study") = {
            {"folder", request.out},     {"rows", counts.rows},       {"done", counts.done},
            {"earlier", counts.earlier}, {"failed", counts.failed},   {"left", counts.Left()},
            {"bytes", counts.bytes},     {"seconds", counts.seconds}, {"failures", JsonOf(outcome.failures)}};
        return;
    }
    std::string line = fnd_Visible(request.dryRun ? request.table : request.out) + ": " +
                       std::to_string(counts.done) + (request.dryRun ? " rows are right" : " decks written") +
                       ", " + std::to_string(counts.failed) + " rows failed";
    if (counts.earlier > 0) line += ", " + std::to_string(counts.earlier) + " done before";
    if (counts.Left() > 0) line += ", " + std::to_string(counts.Left()) + " left";
    line += "; " + TimeText(counts.seconds);
    if (counts.done > 0)
        line += ", " + RateText(static_cast<double>(counts.done) / counts.seconds) + " decks/s";
    report.Print(line + "\n");
    PrintFailures(outcome.failures, counts.failed, report);
}

bool ReadShard(const std::string& text, sty_Request& request) {
    const char* const end = text.data() + text.size();
    const auto shard = std::from_chars(text.data(), end, request.shard);
    if (shard.ec != std::errc() || shard.ptr == end || *shard.ptr != '/') return false;
    const auto shards = std::from_chars(shard.ptr + 1, end, request.shards);
    return shards.ec == std::errc() && shards.ptr == end && request.shard >= 1 &&
           request.shard <= request.shards && request.shards <= kMostShards;
}

ExitCode Wrong(const std::string& text, RunReport& report) {
    report.Error("qrxdeck", text);
    return ExitCode::WRONG_USAGE;
}

std::string AbsolutePath(const std::string& path) {
    return std::filesystem::absolute(plt_Path(path)).lexically_normal().string();
}

ExitCode Emit(const StudyCommand& command, RunReport& report) {
    if (command.emit != "slurm" && command.emit != "snakemake") {
        return Wrong("found the scheduler " + fnd_Quoted(command.emit) + ", expected slurm or snakemake",
                     report);
    }
    sty_Request request = command.request;
    request.shards = command.shards;
    if (request.shards < 1 || request.shards > kMostShards)
        return Wrong("--emit needs --shards, a number from 1 to " + std::to_string(kMostShards), report);
    request.model = AbsolutePath(request.model);
    request.table = AbsolutePath(request.table);
    request.out = AbsolutePath(request.out);
    std::string program = plt_ProgramPath();
    if (program.empty()) program = "qrxdeck";
    const std::string script =
        command.emit == "slurm" ? sty_SlurmScript(request, program) : sty_Snakefile(request, program);
    if (report.AsJson()) report.Member("script") = script;
    report.Print(script);
    return ExitCode::DONE;
}

ExitCode Merge(const std::string& folder, RunReport& report) {
    sty_Merged merged;
    try {
        merged = sty_Merge(folder);
    } catch (const sty_NoStudy& failure) {
        report.Error(folder, failure.what());
        return ExitCode::WRONG_USAGE;
    } catch (const sty_Refused& failure) {
        report.Error(folder, failure.what());
        return ExitCode::FILE_SYSTEM_REFUSED;
    }
    if (report.AsJson()) {
        report.Member("study") = {{"folder", folder},
                                  {"rows", merged.rows},
                                  {"done", merged.done},
                                  {"failed", merged.failed},
                                  {"missing", merged.missing},
                                  {"missingRows", merged.missingRows},
                                  {"failures", JsonOf(merged.failures)},
                                  {"contradictions", JsonOf(merged.contradictions)}};
    }
    report.Print(fnd_Visible(folder) + ": " + std::to_string(merged.done) + " of " +
                 std::to_string(merged.rows) + " decks, " + std::to_string(merged.failed) + " rows failed, " +
                 std::to_string(merged.missing) + " missing\n");
    PrintFailures(merged.failures, merged.failed, report);
    if (merged.missing > 0) report.Print("  missing: rows " + merged.missingRows + "\n");
    for (const sty_Failure& each : merged.contradictions)
        report.Error(folder, "row " + std::to_string(each.row) + ": " + each.reason);
    const bool isWhole = merged.failed + merged.missing == 0 && merged.contradictions.empty();
    return isWhole ? ExitCode::DONE : ExitCode::MODEL_IS_WRONG;
}

/// The end that the signal would have been, now that all is told.
[[noreturn]] void EndBySignal(RunReport& report) {
    report.Finish(ExitCode::MODEL_IS_WRONG);
    plt_EndBySignal(plt_PoliteSignals::Came());
}

} // namespace

ExitCode RunStudy(const StudyCommand& command, RunReport& report) {
    if (!command.merge.empty()) {
        if (!command.request.model.empty()) return Wrong("--merge takes no template and no table", report);
        return Merge(command.merge, report);
    }
    sty_Request request = command.request;
    if (request.model.empty() || request.table.empty())
        return Wrong("study needs a template and a table", report);
    if (request.out.empty()) request.out = plt_Path(request.table).stem().string();
    if (request.out.empty())
        return Wrong("the table " + fnd_Quoted(request.table) + " names no file", report);
    if (request.jobs < 0 || request.jobs > kMostJobs)
        return Wrong("found " + std::to_string(request.jobs) + " jobs, expected 1 to " +
                         std::to_string(kMostJobs),
                     report);
    if (!command.emit.empty()) {
        StudyCommand emit = command;
        emit.request = request;
        return Emit(emit, report);
    }
    if (!command.shard.empty() && !ReadShard(command.shard, request)) {
        return Wrong("found the shard " + fnd_Quoted(command.shard) + ", expected K/N with K from 1 to N",
                     report);
    }
    Progress progress(report);
    sty_Outcome outcome;
    {
        const plt_PoliteSignals signals;
        outcome = sty_Run(request, progress);
        progress.End();
    }
    using Kind = sty_Outcome::Kind;
    if (outcome.kind == Kind::WRONG) {
        report.Error(outcome.file, outcome.problem);
        return ExitCode::WRONG_USAGE;
    }
    Summarise(outcome, request, report);
    if (outcome.kind == Kind::REFUSED) report.Error(outcome.file, outcome.problem);
    if (outcome.counts.Left() > 0 && !request.dryRun)
        report.Print("The same command with --resume goes on.\n");
    if (outcome.kind == Kind::INTERRUPTED) EndBySignal(report);
    if (outcome.kind == Kind::REFUSED) return ExitCode::FILE_SYSTEM_REFUSED;
    return outcome.counts.failed > 0 ? ExitCode::MODEL_IS_WRONG : ExitCode::DONE;
}
