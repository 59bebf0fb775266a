#include "tools/ViewCommand.h"

#include "foundation/nex_Exception.h"
#include "foundation/qio_Device.h"
#include "platform/plt_Files.h"
#include "platform/plt_Process.h"
#include "store_interface/findings/fnd_Text.h"
#include "tools/CommandParts.h"
#include "tools/DeckCommands.h"
#include "tools/DeckView.h"
#include "view_page/vpg_Html.h"
#include "view_page/vpg_Vtu.h"

#include <filesystem>
#include <fstream>

using nlohmann::ordered_json;

namespace {

constexpr char kNoPage[] = "this qrxdeck was built without the page that shows models: run "
                           "scripts/install-dependencies.sh viewer in its sources and build it again";

std::string TargetOf(const ViewRequest& request) {
    if (!request.output.empty()) return request.output;
    return plt_Path(request.model).stem().string() + ".html";
}

/// Whether the file begins as JSON does, a comment ahead of it or not.
bool IsModelFile(const std::string& path) {
    std::ifstream file(plt_Path(path), std::ios::binary);
    char first = '\0';
    return !(file >> first) || first == '{' || first == '/' || first == '\xEF';
}

/// The store of a model whose one part has the mesh of a mesher's file.
std::unique_ptr<odb_Odb> ReadMesh(const std::string& path, RunReport& report, ExitCode& code) {
    const nlohmann::json mesh = {{"file", std::filesystem::absolute(plt_Path(path)).string()}};
    const std::string part = plt_Path(path).stem().string();
    const nlohmann::json model = {
        {"format", mdf_kFormat},
        {"models", {{odb_Odb::DefaultModelName(), {{"parts", {{part, {{"mesh", mesh}}}}}}}}}};
    mdf_Report found;
    auto odb =
        mdf_ReadModelText(model.dump(-1, ' ', false, nlohmann::json::error_handler_t::replace), path, found);
    for (const fnd_Finding& finding : found.findings)
        report.Add(path, {finding.code, {}, finding.found, finding.expected, finding.hint});
    code = odb != nullptr     ? ExitCode::DONE
           : found.unreadable ? ExitCode::FILE_SYSTEM_REFUSED
                              : ExitCode::MODEL_IS_WRONG;
    return odb;
}

/// Writes the file as a whole, and tells of it as a member of the report.
bool Write(const std::string& target, const char* thing, const char* member, const whf_File::Write& write,
           RunReport& report) {
    whf_File file(target, whf_System::Standard(), thing);
    const auto tell = [&](long long bytes) {
        report.Print(fnd_Visible(target) + ": " + std::to_string(bytes) + " bytes\n");
        report.Member(member) = {{"target", target}, {"bytes", bytes}};
    };
    return ReplaceFile(file, write, tell, report);
}

bool WriteVtu(const odb_Odb& odb, const std::string& target, RunReport& report) {
    const auto write = [&odb](qio_ostream& device) {
        vpg_WriteVtu(odb, [&device](std::string_view bytes) { device.Write(bytes.data(), bytes.size()); });
    };
    return Write(target, "mesh file", "mesh", write, report);
}

/// A deck, and the store that its meshes are shown from.
class ShownDeck {
public:
    explicit ShownDeck(const std::string& path) : deck_(ReadDeck(path, {}, findings_)), names_(deck_) {}

    std::unique_ptr<odb_Odb> Store(RunReport& report, ExitCode& code) const {
        code = ExitCode::DONE;
        if (findings_.HasErrors()) {
            AddFindings(deck_, findings_, report);
            const bool unreadable = findings_.Counts().contains("deck-unreadable");
            code = unreadable ? ExitCode::FILE_SYSTEM_REFUSED : ExitCode::MODEL_IS_WRONG;
            return nullptr;
        }
        std::unique_ptr<odb_Odb> odb = StoreOfDeck(deck_, names_, report);
        if (odb == nullptr) code = ExitCode::MODEL_IS_WRONG;
        return odb;
    }
    /// The header with the deck's steps.
    std::string Header(const std::string& ofMeshes) const {
        ordered_json header = ordered_json::parse(ofMeshes);
        DescribeDeck(deck_, header);
        return header.dump(-1, ' ', false, ordered_json::error_handler_t::replace);
    }

private:
    drd_Findings findings_;
    drd_Deck deck_;
    drd_Names names_;
};

ExitCode WritePage(const odb_Odb& odb, const ShownDeck* deck, const ViewRequest& request, RunReport& report) {
    const std::string target = TargetOf(request);
    const std::string title = plt_Path(request.model).stem().string();
    vpg_PageData data = vpg_DataOf(odb, title);
    if (deck != nullptr) data.header = deck->Header(data.header);
    const std::string html = vpg_Html(data, title);
    const auto write = [&html](qio_ostream& device) { device.Write(html.data(), html.size()); };
    if (!Write(target, "page", "page", write, report)) return ExitCode::FILE_SYSTEM_REFUSED;
    if (request.open && !plt_OpenOnDesktop(std::filesystem::absolute(plt_Path(target)).string())) {
        report.Warning(target, "there is no program that opens it; any browser shows it");
    }
    return ExitCode::DONE;
}

} // namespace

ExitCode RunView(const ViewRequest& request, RunReport& report) {
    if (request.model == kStandardStream && request.output.empty()) {
        report.Error("qrxdeck",
                     "a model from the standard input has no name: -o FILE says where its page goes");
        return ExitCode::WRONG_USAGE;
    }
    ExitCode code;
    std::unique_ptr<ShownDeck> deck;
    std::unique_ptr<odb_Odb> odb;
    if (IsDeck(request.model)) {
        deck = std::make_unique<ShownDeck>(request.model);
        odb = deck->Store(report, code);
    } else {
        odb = IsModelFile(request.model)
                  ? ReadModel(request.model, report, code, nullptr, {request.modelName})
                  : ReadMesh(request.model, report, code);
    }
    report.Watched().End();
    if (odb == nullptr) return code;
    if (odb->DeckModel() == nullptr) {
        report.Error(request.model,
                     "there is no model named " + fnd_Quoted(odb->DeckModelName().View()) + " to show");
        return ExitCode::MODEL_IS_WRONG;
    }
    try {
        if (!request.vtu.empty() && !WriteVtu(*odb, request.vtu, report))
            return ExitCode::FILE_SYSTEM_REFUSED;
        if (!vpg_PageText().empty()) return WritePage(*odb, deck.get(), request, report);
    } catch (const QRXBasException& failure) {
        report.WriterError(failure.what(), failure.Context());
        return ExitCode::CANNOT_BE_EXPRESSED;
    }
    report.Error("qrxdeck", kNoPage);
    return ExitCode::WRONG_USAGE;
}
