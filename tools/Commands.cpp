#include "tools/Commands.h"

#include "deck/oif_Writer.h"
#include "deck_checks/dck_Check.h"
#include "deck_checks/dck_DeckCounts.h"
#include "deck_checks/dck_LeftOut.h"
#include "foundation/nex_Exception.h"
#include "foundation/qio_Device.h"
#include "model_file/mdf_Locate.h"
#include "model_file/mdf_ModelFile.h"
#include "model_file/mdf_Parser.h"
#include "model_file/mdf_Token.h"
#include "platform/plt_Files.h"
#include "store_interface/findings/fnd_Text.h"
#include "tools/CommandParts.h"
#include "tools/DeckCommands.h"
#include "tools/MeshDescription.h"
#include "tools/ModelDescription.h"
#include "tools/ModelHistory.h"
#include "tools/OutOfMemory.h"
#include "tools/StandardStreams.h"
#include "tools/VariableList.h"
#include "whole_file/whf_File.h"

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <limits>
#include <sstream>
#include <system_error>
#include <utility>

using nlohmann::ordered_json;

namespace {

std::string ReasonText(int error) {
    return std::generic_category().message(error == 0 ? EIO : error);
}

std::string Grouped(long long count) {
    std::string text = std::to_string(count);
    for (auto place = static_cast<int>(text.size()) - 3; place > 0; place -= 3) {
        text.insert(static_cast<std::size_t>(place), 1, ' ');
    }
    return text;
}

std::string CountLine(const std::string& count, const std::string& text, std::size_t width) {
    std::string line(width + 2 - std::min(width, count.size()), ' ');
    line.append(count).append("  ").append(text).append("\n");
    return line;
}

std::string NameList(const std::vector<std::string>& names) {
    constexpr std::size_t kShown = 5;
    std::string text;
    for (std::size_t i = 0; i < names.size() && i < kShown; ++i) {
        if (i > 0) text.append(", ");
        text.append(names[i]);
    }
    if (names.size() > kShown) text.append(", ...");
    return text;
}

ordered_json JsonOf(const std::vector<dck_LeftOut>& leftOut) {
    ordered_json entries = ordered_json::array();
    for (const dck_LeftOut& entry : leftOut) {
        entries.push_back(
            {{"what", entry.what}, {"why", entry.why}, {"count", entry.count}, {"names", entry.names}});
    }
    return entries;
}

void PrintLeftOut(const std::vector<dck_LeftOut>& leftOut, std::size_t width, RunReport& report) {
    if (leftOut.empty()) return;
    report.Print("left out, since a deck can't carry it:\n");
    for (const dck_LeftOut& entry : leftOut) {
        std::string text = std::string(entry.what) + " (" + entry.why + ")";
        if (!entry.names.empty()) text += ": " + NameList(entry.names);
        report.Print(CountLine(Grouped(entry.count), text, width));
    }
}

std::size_t WidthOf(const std::vector<dck_LeftOut>& leftOut) {
    std::size_t width = 0;
    for (const dck_LeftOut& entry : leftOut) width = std::max(width, Grouped(entry.count).size());
    return width;
}

/// "0.57 s: reading 0.31, checking 0.05, writing 0.12, syncing 0.09".
std::string TextOf(const RunTimes& times) {
    char text[64];
    std::snprintf(text, sizeof text, "%.2f s", times.Whole());
    std::string line = text;
    const char* separator = ": ";
    for (const auto& [part, seconds] : times.Parts()) {
        std::snprintf(text, sizeof text, " %.2f", seconds);
        line.append(std::exchange(separator, ", ")).append(part).append(text);
    }
    return line;
}

void Summarise(const std::string& target, long long bytes, const std::vector<dck_KindCount>& counts,
               const std::vector<dck_LeftOut>& leftOut, RunReport& report) {
    if (report.AsJson()) {
        ordered_json& written = report.Member("written");
        written = {{"target", target}, {"bytes", bytes}, {"seconds", report.Times().Whole()}};
        ordered_json& times = written["times"] = ordered_json::object();
        for (const auto& [part, seconds] : report.Times().Parts()) times[part] = seconds;
        ordered_json& byKind = written["counts"] = ordered_json::object();
        for (const dck_KindCount& kind : counts) byKind[kind.key] = kind.count;
        written["leftOut"] = JsonOf(leftOut);
        return;
    }
    std::size_t width = WidthOf(leftOut);
    for (const dck_KindCount& kind : counts) width = std::max(width, Grouped(kind.count).size());
    report.Print(fnd_Visible(target) + ": " + Grouped(bytes) + " bytes in " + TextOf(report.Times()) + "\n");
    if (!counts.empty()) report.Print("written:\n");
    for (const dck_KindCount& kind : counts) report.Print(CountLine(Grouped(kind.count), kind.name, width));
    PrintLeftOut(leftOut, width, report);
}

/// The standard output takes nothing; the reason has been told.
class OutputIsLost {};

/// Hands bytes on and counts them.
class WatchedDevice final : public qio_ostream {
public:
    WatchedDevice(qio_ostream& to, thr_Progress& work) : to_(to), work_(work) {}
    void Write(const char* text, std::size_t bytes) override {
        to_.Write(text, bytes);
        work_.Add(static_cast<long long>(bytes));
    }

private:
    qio_ostream& to_;
    thr_Progress& work_;
};

/// Keeps the first failure.
class StandardOutputDevice final : public qio_ostream {
public:
    void Write(const char* text, std::size_t bytes) override {
        if (error == 0) error = WriteToStandardOutput({text, bytes});
    }
    int error = 0;
};

class NullDevice final : public qio_ostream {
public:
    void Write(const char*, std::size_t) override {}
};

/// Everything that is to be said of a model before its deck is written; false when it is not to be written.
bool IsFitToWrite(const odb_Odb& odb, const std::string& modelFile, fnd_List& list, RunReport& report) {
    report.Watched().Begin("checking", modelFile);
    dck_CheckDeck(odb, odb.DeckModelName(), list);
    dck_CheckMeshes(odb, odb.DeckModelName(), list);
    // Takes a look into the file again, which is to count.
    report.Locate(modelFile, list.findings);
    report.Times().End("checking");
    if (!report.IsStrict()) return true;
    report.AddAll(modelFile, std::exchange(list.findings, {}));
    return !report.HasStrictErrors();
}

/// Writes the deck where nothing else is printed. All of it or, when a deck can't express the model, nothing:
/// a first writing goes nowhere.
ExitCode WriteDeckToOutput(const odb_Odb& odb, const std::string& modelFile, RunReport& report) {
    report.LeaveOutput();
    fnd_List list;
    StandardOutputDevice output;
    try {
        if (!IsFitToWrite(odb, modelFile, list, report)) return ExitCode::MODEL_IS_WRONG;
        report.AddAll(modelFile, list.findings);
        NullDevice nowhere;
        oif_Writer(odb).WriteInput(nowhere);
        report.Watched().End();
        oif_Writer(odb).WriteInput(output);
    } catch (const QRXBasException& failure) {
        report.WriterError(failure.what(), failure.Context());
        return ExitCode::CANNOT_BE_EXPRESSED;
    }
    if (output.error == 0) return ExitCode::DONE;
    report.Error("standard output", ReasonText(output.error));
    return ExitCode::FILE_SYSTEM_REFUSED;
}

/// Why the request can't be met; empty when it can.
std::string ProblemOf(const WriteRequest& request, const std::string& target, bool asJson) {
    if (target.empty() && request.job.empty())
        return "a model from the standard input has no name: --job NAME or -o FILE says where its deck goes";
    if (target.empty()) return "the job " + fnd_Quoted(request.job) + " names no file";
    if (!request.outputDir.empty() && plt_Path(request.job).is_absolute()) {
        return "the job " + fnd_Quoted(request.job) +
               " is an absolute path, so it can't stand in the folder " + fnd_Quoted(request.outputDir);
    }
    if (target != kStandardStream) return {};
    if (asJson) return "with a deck on the standard output there is no place for --json";
    if (request.verify) return "a deck on the standard output can't be read back: --verify needs a file";
    return {};
}

} // namespace

std::string DeckTargetOf(const WriteRequest& request) {
    if (!request.output.empty()) return request.output;
    if (request.job == kStandardStream) return kStandardStream;
    if (request.job.empty() && request.model == kStandardStream) return {};
    const std::filesystem::path job =
        request.job.empty() ? plt_Path(request.model).stem() : plt_Path(request.job);
    if (!job.has_filename() || job.filename() == "." || job.filename() == "..") return {};
    std::filesystem::path target = plt_Path(request.outputDir) / job;
    if (request.job.empty() || job.extension() != ".inp") target += ".inp";
    return target.string();
}

std::string InputName(const std::string& path) {
    return path == kStandardStream ? "<stdin>" : path;
}

bool ReadInput(const std::string& path, std::string& text, fnd_Finding& error) {
    if (path != kStandardStream) return mdf_ReadFile(path, text, error);
    const int number = ReadStandardInput(text);
    if (number != 0) error = fnd_Make("unreadable-file", {}, "it can't be read: " + ReasonText(number));
    return number == 0;
}

std::unique_ptr<odb_Odb> ReadModelInput(const std::string& path, mdf_Report& found,
                                        const mdf_ModelChoice& choice) {
    if (path != kStandardStream) return mdf_ReadModelFile(path, found, choice);
    found.fileName = InputName(path);
    std::string text;
    fnd_Finding error;
    if (!ReadInput(path, text, error)) {
        found.unreadable = true;
        found.findings.push_back(std::move(error));
        return nullptr;
    }
    std::unique_ptr<odb_Odb> odb = mdf_ReadModelText(text, found.fileName, found, {}, choice);
    const auto kept = std::make_shared<mdf_FileText>("");
    kept->Keep(std::move(text));
    found.text = kept;
    return odb;
}

std::unique_ptr<odb_Odb> ReadModel(const std::string& path, RunReport& report, ExitCode& code,
                                   std::list<mdf_MeshOrigin>* origins, const mdf_ModelChoice& choice) {
    mdf_Report found;
    report.Watched().Begin("reading", InputName(path));
    found.progress = &report.Watched().Work();
    if (report.ShowsAll()) found.most = std::numeric_limits<int>::max();
    std::unique_ptr<odb_Odb> odb = ReadModelInput(path, found, choice);
    if (odb != nullptr) report.Ignore(odiK_IgnoreList(*odb));
    report.AddAll(found);
    report.Times().End("reading");
    code = ExitCode::DONE;
    if (found.unreadable) {
        code = ExitCode::FILE_SYSTEM_REFUSED;
    } else if (found.HasErrors() || odb == nullptr) {
        code = ExitCode::MODEL_IS_WRONG;
    }
    if (code != ExitCode::DONE) odb.reset();
    if (origins != nullptr) *origins = std::move(found.meshOrigins);
    return odb;
}

bool ReplaceFile(whf_File& file, const whf_File::Write& write, const whf_File::Ready& tell,
                 RunReport& report) {
    whf_File::Result result;
    const auto ready = [&](long long bytes) {
        tell(bytes);
        if (!report.PrepareForSuccess()) throw OutputIsLost();
    };
    try {
        result = file.Replace(write, ready);
    } catch (const whf_Error& failure) {
        report.Error(file.Target(), failure.what());
        return false;
    } catch (const OutputIsLost&) {
        return false;
    }
    report.MarkWritten();
    OutOfMemory::MarkWritten();
    if (result.removeError != 0) {
        report.Warning(file.Target(), "the temporary folder " + fnd_Quoted(file.TemporaryFolder()) +
                                          " can't be removed: " + ReasonText(result.removeError));
    }
    if (result.folderSyncError != 0) {
        report.Warning(file.Target(), "the " + file.Thing() +
                                          " stands, but its folder can't be brought to the disk: " +
                                          ReasonText(result.folderSyncError));
    }
    return true;
}

ExitCode RunWrite(const WriteRequest& request, RunReport& report) {
    const std::string target = DeckTargetOf(request);
    if (const std::string problem = ProblemOf(request, target, report.AsJson()); !problem.empty()) {
        report.Error("qrxdeck", problem);
        return ExitCode::WRONG_USAGE;
    }
    if (!CanWriteToStandardOutput()) {
        report.Error("standard output", "it is closed");
        return ExitCode::FILE_SYSTEM_REFUSED;
    }
    ExitCode code;
    const std::unique_ptr<odb_Odb> odb = ReadModel(request.model, report, code, nullptr, {request.modelName});
    if (odb == nullptr) return code;
    if (target == kStandardStream) return WriteDeckToOutput(*odb, InputName(request.model), report);
    code = WriteDeck(*odb, InputName(request.model), target, report);
    return code == ExitCode::DONE && request.verify ? VerifyDeck(*odb, target, report) : code;
}

ExitCode WriteDeck(const odb_Odb& odb, const std::string& modelFile, const std::string& target,
                   RunReport& report) {
    const odiK_Model* model = odb.DeckModel();
    if (model == nullptr) {
        report.Error(modelFile, "there is no model named " + fnd_Quoted(odb.DeckModelName().View()) +
                                    " to write a deck from");
        return ExitCode::MODEL_IS_WRONG;
    }
    const std::vector<dck_KindCount> counts = dck_CountsOfDeck(*model);
    const std::vector<dck_LeftOut> leftOut = dck_LeftOutOf(odb, *model);

    whf_File deck(target);
    fnd_List list;
    try {
        if (!IsFitToWrite(odb, modelFile, list, report)) return ExitCode::MODEL_IS_WRONG;
        const auto write = [&](qio_ostream& device) {
            report.Watched().Begin("writing", target);
            WatchedDevice watched(device, report.Watched().Work());
            oif_Writer(odb).WriteInput(watched);
            report.Times().End("writing");
        };
        const auto tell = [&](long long bytes) {
            report.Times().End("syncing");
            report.Watched().End();
            report.AddAll(modelFile, list.findings);
            Summarise(target, bytes, counts, leftOut, report);
        };
        return ReplaceFile(deck, write, tell, report) ? ExitCode::DONE : ExitCode::FILE_SYSTEM_REFUSED;
    } catch (const QRXBasException& failure) {
        report.WriterError(failure.what(), failure.Context());
        return ExitCode::CANNOT_BE_EXPRESSED;
    }
}

ExitCode RunCheck(const std::string& model, const std::string& modelName, RunReport& report) {
    ExitCode code;
    const std::unique_ptr<odb_Odb> odb = ReadModel(model, report, code, nullptr, {modelName});
    if (odb == nullptr) return code;
    const std::string file = InputName(model);
    report.Watched().Begin("checking", file);
    fnd_List list;
    dck_CheckDeck(*odb, odb->DeckModelName(), list);
    dck_CheckMeshes(*odb, odb->DeckModelName(), list);
    report.AddAll(file, list.findings);
    report.Watched().Begin("rehearsing the deck of", file);
    fnd_List raised;
    dck_Rehearse(*odb, report.Foretold(), raised, &report.Watched().Work());
    report.AddAll(file, raised.findings);
    if (report.HasStrictErrors())
        code = ExitCode::MODEL_IS_WRONG;
    else
        report.Print(fnd_Visible(file) + ": no errors\n");
    const std::vector<dck_LeftOut> leftOut = dck_LeftOutOf(*odb, *odb->DeckModel());
    if (report.AsJson()) report.Member("leftOut") = JsonOf(leftOut);
    PrintLeftOut(leftOut, WidthOf(leftOut), report);
    return code;
}

ExitCode RunInfo(const std::string& model, bool history, RunReport& report) {
    ExitCode code;
    std::list<mdf_MeshOrigin> origins;
    const std::unique_ptr<odb_Odb> odb = ReadModel(model, report, code, &origins, {{}, false});
    if (odb == nullptr) return code;
    ordered_json& models = report.Member("models") = ordered_json::object();
    for (const auto& [name, entry] : odb->Models()) {
        const std::string key(name.View());
        models[key] = DescribeModel(*entry);
        report.Print(TextOfDescription(key, models[key]));
        if (!history) continue;
        const ModelHistory told(*odb, name);
        if (report.AsJson()) models[key]["history"] = told.Json();
        report.Print(told.Text());
    }
    if (!origins.empty()) {
        ordered_json& files = report.Member("meshFiles") = DescribeOrigins(origins);
        report.Print(TextOfOrigins(files));
    }
    return code;
}

ExitCode RunFormat(const FormatRequest& request, RunReport& report) {
    const std::string file = InputName(request.model);
    std::string text;
    fnd_Finding unreadable;
    if (!ReadInput(request.model, text, unreadable)) {
        report.Add(file, unreadable);
        return ExitCode::FILE_SYSTEM_REFUSED;
    }
    mdf_Report found;
    const std::unique_ptr<odb_Odb> odb = mdf_ReadModelText(text, file, found, {}, {{}, false});
    report.AddAll(found);
    if (odb == nullptr) return found.unreadable ? ExitCode::FILE_SYSTEM_REFUSED : ExitCode::MODEL_IS_WRONG;
    std::ostringstream stream;
    const bool toOutput = request.output.empty() || request.output == kStandardStream;
    const std::string place = toOutput ? file : request.output;
    mdf_WriteModelFile(*odb, stream, found.meshOrigins, plt_Path(place).parent_path().string(),
                       found.parameters, found.schema);
    const std::string formatted = std::move(stream).str();
    const bool isCanonical = formatted == text;
    report.Member("formatted") = {{"file", file}, {"wasCanonical", isCanonical}};
    if (request.check) {
        if (!isCanonical) report.Print(fnd_Visible(file) + "\n");
        return isCanonical ? ExitCode::DONE : ExitCode::MODEL_IS_WRONG;
    }
    if (mdf_HasComments(text)) report.Warning(file, "its comments are left out");
    if (toOutput) {
        if (report.AsJson()) report.Member("formatted")["text"] = formatted;
        report.Print(formatted);
        return ExitCode::DONE;
    }
    return WriteWholeFile(request.output, "model file", formatted, report);
}

bool ReplaceFile(const std::string& target, const char* thing, const std::function<void(qio_ostream&)>& write,
                 RunReport& report) {
    whf_File file(target, whf_System::Standard(), thing);
    return ReplaceFile(
        file, write, [](long long) {}, report);
}

ExitCode WriteWholeFile(const std::string& path, const char* thing, const std::string& text,
                        RunReport& report) {
    const auto write = [&text](qio_ostream& device) { device.Write(text.data(), text.size()); };
    return ReplaceFile(path, thing, write, report) ? ExitCode::DONE : ExitCode::FILE_SYSTEM_REFUSED;
}

ExitCode RunVariables(const std::string& stepType, RunReport& report) {
    const std::optional<unsigned> type = FindStepType(stepType);
    if (!stepType.empty() && !type) {
        report.Error("qrxdeck", "there is no step type " + fnd_Quoted(stepType) + "; the step types are " +
                                    StepTypeNames());
        return ExitCode::WRONG_USAGE;
    }
    ordered_json& variables = report.Member("variables") = DescribeVariables(type);
    report.Print(TextOfVariables(variables, type));
    return ExitCode::DONE;
}

ExitCode RunSchema(const std::string& output, RunReport& report) {
    std::ostringstream schema;
    mdf_WriteSchema(schema);
    if (output.empty() || output == kStandardStream) {
        if (report.AsJson()) report.Member("schema") = ordered_json::parse(schema.str());
        report.Print(schema.str());
        return ExitCode::DONE;
    }
    return WriteWholeFile(output, "schema", schema.str(), report);
}
