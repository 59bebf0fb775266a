#include "store_interface/model/odiK_IgnoreList.h"

odiK_IgnoreList::odiK_IgnoreList(const odb_Odb& store) {
    for (const auto& [name, model] : store.Models()) {
        std::string pointer = "/models";
        fnd_AppendPointer(pointer, name.View());
        for (const odiK_IgnoredFinding& entry : model->ignore) {
            entries_.push_back(entry);
            models_.push_back(pointer);
        }
    }
}

int odiK_IgnoreList::EntryFor(const fnd_Finding& finding) const {
    if (finding.IsError()) return -1;
    for (std::size_t i = 0; i < entries_.size(); ++i) {
        if (finding.code->name == entries_[i].code.View() && fnd_IsBelow(finding.place, models_[i]) &&
            fnd_IsBelow(finding.place, entries_[i].place.View()))
            return static_cast<int>(i);
    }
    return -1;
}

void odiK_IgnoreList::TakeFrom(std::vector<fnd_Finding>& findings) const {
    if (entries_.empty()) return;
    std::erase_if(findings, [this](const fnd_Finding& finding) { return EntryFor(finding) >= 0; });
}
