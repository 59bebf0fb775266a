#include "python/pyx_Store.h"

#include "deck/oif_DeckLines.h"
#include "deck/oif_Writer.h"
#include "deck_checks/dck_Check.h"
#include "foundation/qio_Device.h"
#include "python/pyx_Document.h"
#include "python/pyx_Run.h"
#include "python/pyx_Tree.h"
#include "store_interface/model/odiK_IgnoreList.h"
#include "tools/ModelDescription.h"
#include "tools/ModelHistory.h"
#include "view_page/vpg_Html.h"
#include "whole_file/whf_File.h"

#include <pybind11/stl.h>

#include <sstream>

namespace {

/// Hands on, and lets the run be broken off between two blocks.
class PolledDevice final : public qio_ostream {
public:
    explicit PolledDevice(qio_ostream& device) : device_(device) {}
    void Write(const char* text, std::size_t bytes) override {
        thr_Poll::Now();
        device_.Write(text, bytes);
    }

private:
    qio_ostream& device_;
};

/// Gives a function of Python blocks of bytes. What it raises ends the run.
class FunctionDevice final : public qio_ostream {
public:
    explicit FunctionDevice(const py::object& write) : write_(write) { block_.reserve(kBlock); }
    void Write(const char* text, std::size_t bytes) override {
        thr_Poll::Now();
        block_.append(text, bytes);
        if (block_.size() >= kBlock) Flush();
    }
    void Flush() {
        const py::gil_scoped_acquire held;
        std::size_t begin = 0;
        while (begin < block_.size()) {
            const py::object taken = write_(py::bytes(block_.data() + begin, block_.size() - begin));
            // Files without a buffer may take a part.
            const std::size_t left = block_.size() - begin;
            begin += PyLong_Check(taken.ptr()) ? std::min(left, taken.cast<std::size_t>()) : left;
        }
        block_.clear();
    }

private:
    static constexpr std::size_t kBlock = 1U << 20U;
    const py::object& write_;
    std::string block_;
};

long long Replace(const std::string& path, const char* thing, const whf_File::Write& write) {
    whf_File file(path, whf_System::Standard(), thing);
    whf_File::Result result;
    try {
        pyx_Released([&] { result = file.Replace(write); });
    } catch (const whf_Error& refused) {
        throw pyx_FileRefused{refused.Error(), refused.what(), path};
    }
    return result.bytes;
}

/// Places stand in the text that the values made; its lines are nobody's.
void DropLines(std::vector<fnd_Finding>& findings) {
    for (fnd_Finding& finding : findings) finding.line = finding.column = 0;
}

std::unique_ptr<odb_Odb> Read(const pyx_Document& document, mdf_Report& report) {
    std::unique_ptr<odb_Odb> odb;
    pyx_Released([&] { odb = mdf_ReadModelText(document.Text(), "", report, document.Meshes()); });
    DropLines(report.findings);
    report.meshOrigins = document.Origins();
    if (odb != nullptr) odiK_IgnoreList(*odb).TakeFrom(report.findings);
    return odb;
}

void AddDeckChecks(const odb_Odb& odb, fnd_List& list) {
    const cow_String& name = odb.DeckModelName();
    dck_CheckDeck(odb, name, list);
    dck_CheckMeshes(odb, name, list);
    dck_Rehearse(odb, std::vector<fnd_Finding>(list.findings), list);
    odiK_IgnoreList(odb).TakeFrom(list.findings);
}

} // namespace

std::unique_ptr<pyx_Store> pyx_Store::Of(py::handle value) {
    const pyx_Document document(value);
    auto store = std::make_unique<pyx_Store>();
    store->odb_ = Read(document, store->report_);
    if (store->odb_ == nullptr) throw pyx_Wrong{store->report_.findings};
    return store;
}

std::unique_ptr<pyx_Store> pyx_Store::Load(const std::string& path) {
    auto store = std::make_unique<pyx_Store>();
    mdf_Report& report = store->report_;
    pyx_Released([&] { store->odb_ = mdf_ReadModelFile(path, report, {{}, false}); });
    if (report.unreadable) pyx_RaiseUnreadable(report.findings);
    if (store->odb_ == nullptr) throw pyx_Wrong{report.findings};
    return store;
}

py::list pyx_Store::Check(py::handle value) {
    const pyx_Document document(value);
    mdf_Report report;
    const std::unique_ptr<odb_Odb> odb = Read(document, report);
    fnd_List list;
    list.findings = report.findings;
    if (odb != nullptr) pyx_Released([&] { AddDeckChecks(*odb, list); });
    return pyx_TuplesOf(list.findings);
}

const odiK_Model& pyx_Store::Model() const {
    return *odb_->DeckModel();
}

py::dict pyx_Store::Trees() const {
    py::dict trees;
    for (const auto& [name, model] : odb_->Models())
        trees[py::str(std::string(name.View()))] = pyx_TreeOf(*model, report_.meshOrigins);
    return trees;
}

long long pyx_Store::WriteDeck(const std::string& path, int threads) const {
    return Replace(path, "deck", [this, threads](qio_ostream& device) {
        PolledDevice polled(device);
        oif_Writer(*odb_, threads).WriteInput(polled);
    });
}

void pyx_Store::WriteDeckTo(const py::object& write, int threads) const {
    pyx_Released([&] {
        FunctionDevice device(write);
        oif_Writer(*odb_, threads).WriteInput(device);
        device.Flush();
    });
}

py::bytes pyx_Store::Deck(int threads) const {
    qio_StringDevice text;
    pyx_Released([&] {
        PolledDevice polled(text);
        oif_Writer(*odb_, threads).WriteInput(polled);
    });
    return text.Text();
}

py::bytes pyx_Store::ModelFile(const std::string& folder) const {
    std::ostringstream text;
    pyx_Released([&] { mdf_WriteModelFile(*odb_, text, report_.meshOrigins, folder, report_.parameters); });
    return std::move(text).str();
}

py::list pyx_Store::Parameters() const {
    py::list all;
    for (const mdf_Parameter& parameter : report_.parameters) {
        all.append(py::make_tuple(parameter.name, py::tuple(py::cast(parameter.pointers)), parameter.unit,
                                  parameter.limits, parameter.description));
    }
    return all;
}

void pyx_Store::SetParameters(const py::list& parameters) {
    report_.parameters.clear();
    for (const py::handle each : parameters) {
        const auto told = py::reinterpret_borrow<py::tuple>(each);
        mdf_Parameter& parameter = report_.parameters.emplace_back();
        parameter.name = told[0].cast<std::string>();
        parameter.pointers = told[1].cast<std::vector<std::string>>();
        parameter.unit = told[2].cast<std::string>();
        parameter.limits = told[3].cast<std::string>();
        parameter.description = told[4].cast<std::string>();
    }
}

std::pair<std::string, std::map<std::string, std::string>> pyx_Store::History() const {
    std::pair<std::string, std::map<std::string, std::string>> told;
    pyx_Released([&] {
        const ModelHistory history(*odb_, odb_->DeckModelName());
        told = {history.Json().dump(), history.TextsByKind()};
    });
    return told;
}

std::string pyx_Store::Description() const {
    std::string text;
    pyx_Released([&] { text = DescribeModel(Model()).dump(); });
    return text;
}

py::list pyx_Store::DeckLines(const std::string& repository, const std::string& name,
                              const std::string& step) const {
    std::vector<oif_ObjectLines> lines;
    pyx_Released([&] { lines = oif_DeckLines(*odb_).Of(repository, cow_String(name), cow_String(step)); });
    py::list all;
    for (const oif_ObjectLines& each : lines)
        all.append(py::make_tuple(std::string(each.loadCase.View()), each.text));
    return all;
}

std::string pyx_Store::Page(const std::string& title) const {
    if (vpg_PageText().empty()) return {};
    std::string page;
    pyx_Released([&] { page = vpg_Html(vpg_DataOf(*odb_, title), title); });
    return page;
}

void pyx_Store::Add(py::module_& module) {
    py::class_<pyx_Store>(module, "Store")
        .def("trees", &pyx_Store::Trees)
        .def("write_deck", &pyx_Store::WriteDeck, py::arg("path"), py::arg("threads") = 0)
        .def("write_deck_to", &pyx_Store::WriteDeckTo, py::arg("write"), py::arg("threads") = 0)
        .def("deck", &pyx_Store::Deck, py::arg("threads") = 0)
        .def("model_file", &pyx_Store::ModelFile)
        .def_property_readonly("parameters", &pyx_Store::Parameters)
        .def("set_parameters", &pyx_Store::SetParameters)
        .def("history", &pyx_Store::History)
        .def("description", &pyx_Store::Description)
        .def("deck_lines", &pyx_Store::DeckLines)
        .def("page", &pyx_Store::Page);
    module.def("store_of", &pyx_Store::Of);
    module.def("load", &pyx_Store::Load);
    module.def("check", &pyx_Store::Check);
    module.def("replace_file", [](const std::string& path, const std::string& thing, const py::bytes& text) {
        const std::string_view bytes = text;
        return Replace(path, thing.c_str(),
                       [bytes](qio_ostream& device) { device.Write(bytes.data(), bytes.size()); });
    });
}
