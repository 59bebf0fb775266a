#include "python/pyx_Classes.h"
#include "python/pyx_Hooks.h"
#include "python/pyx_Mesh.h"
#include "python/pyx_Store.h"
#include "python/pyx_Study.h"
#include "store_interface/findings/fnd_Nearest.h"
#include "tools/Program.h"

#include <sstream>

#include <pybind11/stl.h>

pyx_Hooks& pyx_Hooks::Get() {
    static auto* const hooks = new pyx_Hooks();
    return *hooks;
}

namespace {

int Run(std::vector<std::string> words) {
    std::vector<char*> arguments;
    for (std::string& word : words) arguments.push_back(word.data());
    arguments.push_back(nullptr);
    const py::gil_scoped_release released;
    return RunProgram(static_cast<int>(words.size()), arguments.data());
}

void SetHooks(const py::object& record, const py::object& member, const py::object& polar,
              const py::object& region, const py::object& modelError, const py::object& deckError) {
    pyx_Hooks::Get() = {record, member, polar, region, modelError, deckError};
}

std::string SchemaText() {
    std::ostringstream text;
    mdf_WriteSchema(text);
    return std::move(text).str();
}

} // namespace

PYBIND11_MODULE(_qrx, module) {
    module.attr("__version__") = QRX_VERSION;
    pyx_TranslateErrors();
    pyx_AddClasses(module);
    pyx_Mesh::Add(module);
    pyx_Store::Add(module);
    pyx_Study::Add(module);
    module.def("set_hooks", &SetHooks, py::arg("record"), py::arg("member"), py::arg("polar"),
               py::arg("region"), py::arg("model_error"), py::arg("deck_error"));
    module.def("nearest", [](const std::string& name, const std::vector<std::string>& known) {
        return fnd_DidYouMean(name, known);
    });
    module.def("schema", &SchemaText);
    module.def("run_program", &Run);
}
