#include "python/pyx_Study.h"

#include "foundation/nex_Exception.h"
#include "model_file/mdf_Parser.h"
#include "model_file/mdf_Pointer.h"
#include "python/pyx_Document.h"

#include <chrono>

namespace {

/// The row that the values make, and its columns.
sty_Row RowOf(long long number, const mdf_Value& values, std::vector<std::string>& names) {
    sty_Row row;
    row.number = number;
    for (const mdf_Member& member : values.Members()) {
        if (member.name != sty_Table::kNameColumn) {
            row.cells.push_back({static_cast<int>(names.size()), member.value, mdf_JsonText(member.value)});
            names.push_back(member.name);
        } else if (member.value.IsString()) {
            row.name = member.value.String();
        } else {
            row.problem = std::string("found ") + member.value.KindText() + ", expected a name";
            row.problemColumn = member.name;
        }
    }
    return row;
}

} // namespace

pyx_Study::pyx_Study(py::handle value) {
    const pyx_Document document(value);
    mdf_Report report;
    std::unique_ptr<mdf_Template> base;
    {
        const py::gil_scoped_release released;
        const auto none = [](const std::vector<mdf_Parameter>&) { return std::vector<std::string>(); };
        base = mdf_Template::OfText(document.Text(), "", none, report, document.Meshes());
    }
    if (base == nullptr) throw pyx_Wrong{report.findings};
    first_ = std::make_unique<sty_Variants>(std::move(base), meshes_);
    baseline_ = report.findings;
    try {
        for (fnd_Finding& finding : first_->Baseline()) baseline_.push_back(std::move(finding));
    } catch (const QRXBasException&) {
        // Rows may mend what can't be written.
    }
}

std::unique_ptr<sty_Variants> pyx_Study::Take() {
    const std::lock_guard<std::mutex> lock(mutex_);
    if (!free_.empty()) {
        std::unique_ptr<sty_Variants> taken = std::move(free_.back());
        free_.pop_back();
        return taken;
    }
    std::unique_ptr<sty_Variants> twin = first_->Twin();
    twin->LeaveOut(baseline_);
    return twin;
}

const sty_Columns& pyx_Study::ColumnsOf(const std::vector<std::string>& names) {
    const std::lock_guard<std::mutex> lock(mutex_);
    std::unique_ptr<sty_Columns>& known = columns_[names];
    if (known == nullptr) known = std::make_unique<sty_Columns>(names, false, first_->Base().Parameters());
    return *known;
}

py::tuple pyx_Study::Make(long long number, py::handle given) {
    const pyx_Document document(given);
    sty_Result result;
    std::string deck;
    {
        const py::gil_scoped_release released;
        const auto start = std::chrono::steady_clock::now();
        mdf_Value values;
        std::vector<fnd_Finding> errors;
        mdf_Parse(document.Text(), values, errors);
        std::vector<std::string> names;
        const sty_Row row = RowOf(number, values, names);
        const sty_Columns& columns = ColumnsOf(names);
        std::unique_ptr<sty_Variants> variants = Take();
        result = variants->Make(row, columns);
        if (result.IsDone()) {
            deck = variants->Text().Whole();
            result.sha256 = variants->Text().Sha256();
        }
        result.seconds = std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
        const std::lock_guard<std::mutex> lock(mutex_);
        free_.push_back(std::move(variants));
    }
    const py::object made = result.IsDone() ? py::object(py::bytes(deck)) : py::object(py::none());
    return py::make_tuple(made, sty_LineOf(result));
}

void pyx_Study::Add(py::module_& module) {
    py::class_<pyx_Study>(module, "Study")
        .def(py::init<py::handle>(), py::arg("document"))
        .def("make", &pyx_Study::Make, py::arg("row"), py::arg("values"));
}
