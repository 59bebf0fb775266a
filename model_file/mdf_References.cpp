#include "model_file/mdf_References.h"

#include "store_interface/model/odiK_References.h"

std::vector<std::string> mdf_Names(const cow_List<cow_String>& names) {
    std::vector<std::string> copies;
    copies.reserve(static_cast<std::size_t>(names.Length()));
    for (const cow_String& name : names) copies.emplace_back(name.View());
    return copies;
}

void mdf_References::Note(const cls_Field& field, const std::string& name, const fnd_Path& path) {
    if (field.refersTo != nullptr && !name.empty()) references_.push_back({&field, name, path.Text()});
}

void mdf_References::Check() {
    odiK_References known(model_);
    for (const Reference& reference : references_) {
        if (!IsWrong(reference.name))
            known.Check(*reference.field, reference.name, reference.pointer, diagnostics_);
    }
}
