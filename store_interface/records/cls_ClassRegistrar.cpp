#include "store_interface/records/cls_ClassRegistrar.h"

#include <cstdio>
#include <memory>
#include <string>

void cls_ClassRegistrar::AddEntry(const cls_ClassEntry& entry) {
    const unsigned id = entry.info.Id();
    if (id == entry.baseId || byId_.count(id) != 0 || FindByName(entry.info.name) != nullptr) {
        const std::string text = std::string("class registered twice: ") + entry.info.name;
        nex_Raise(atr_String(std::string_view(text)));
    }
    byId_.emplace(id, entries_.size());
    entries_.push_back(entry);
}

bool cls_ClassRegistrar::InheritanceCheck(const unsigned& derived, const unsigned& base) const {
    unsigned id = derived;
    for (;;) {
        if (id == base) return true;
        const cls_ClassEntry* entry = Find(id);
        if (entry == nullptr || entry->baseId == 0) return false;
        id = entry->baseId;
    }
}

const cls_ClassEntry* cls_ClassRegistrar::Find(unsigned id) const {
    const auto place = byId_.find(id);
    return place == byId_.end() ? nullptr : &entries_[place->second];
}

const cls_ClassEntry* cls_ClassRegistrar::FindByName(std::string_view name) const {
    for (const cls_ClassEntry& entry : entries_) {
        if (name == entry.info.name) return &entry;
    }
    return nullptr;
}

std::vector<const cls_ClassEntry*> cls_ClassRegistrar::ConcreteClasses(unsigned base) const {
    std::vector<const cls_ClassEntry*> classes;
    for (const cls_ClassEntry& entry : entries_) {
        if (entry.create != nullptr && InheritanceCheck(entry.info.Id(), base)) classes.push_back(&entry);
    }
    return classes;
}

cow_String cls_ClassRegistrar::NameOf(unsigned id) const {
    const cls_ClassEntry* entry = Find(id);
    if (entry != nullptr) return entry->info.name;
    char text[32];
    std::snprintf(text, sizeof text, "class 0x%X", id);
    return text;
}

cow_String cls_ClassRegistrar::ShortNameOf(unsigned id) const {
    const cls_ClassEntry* entry = Find(id);
    if (entry == nullptr) return NameOf(id);
    const cls_ClassEntry* base = Find(entry->baseId);
    if (base == nullptr || base->create == nullptr || base->info.Word() != entry->info.Word())
        return entry->info.Word();
    // Records of the base may answer with the derived class.
    const std::unique_ptr<cls_Record> record(base->create());
    return record->DynTypeId() == id ? cow_String(entry->info.Word()) : NameOf(id);
}

void nex_CheckCast(unsigned found, unsigned expected, nex_Position position) {
    if (found == expected || cls_Classes().InheritanceCheck(found, expected)) return;
    nex_RaiseCastFailure(cls_Classes().NameOf(found).CStr(), cls_Classes().NameOf(expected).CStr(), position);
}
