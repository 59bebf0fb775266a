#include "store_interface/records/steps/kprC_StepContainer.h"

#include "foundation/nex_Exception.h"

#include <algorithm>
#include <string>

const omu_EnumTable& omu_EnumTableOf(kprC_AnalysisProductEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "IMPLICIT", "IMPLICIT", "STANDARD"}, {1, "EXPLICIT", "EXPLICIT"}, {2, "OTHER", "OTHER"}};
    static constexpr omu_EnumTable table{"kprC_AnalysisProductEnm", rows};
    return table;
}

void kprC_StepIndex::Append(const cow_String& name) {
    names_.push_back(name);
    places_.emplace(names_.back().View(), static_cast<int>(names_.size()) - 1);
}

int kprC_StepIndex::Find(const cow_String& name) const {
    // Who asks mostly has a copy of the name from here, with the same characters.
    const std::size_t last = last_;
    for (std::size_t guess = last; guess < std::min(last + 2, names_.size()); ++guess) {
        if (names_[guess].CStr() != name.CStr()) continue;
        if (guess != last) last_ = guess;
        return static_cast<int>(guess);
    }
    const auto place = places_.find(name.View());
    if (place == places_.end()) return -1;
    last_ = static_cast<std::size_t>(place->second);
    return place->second;
}

void kprC_StepContainer::Append(const cow_String& name, const kprC_Step& step) {
    if (IsMember(name)) {
        const std::string text =
            "kprC_StepContainer: a step named '" + std::string(name.View()) + "' is there already";
        nex_Raise(atr_String(std::string_view(text)));
    }
    Data& data = Writable();
    data.steps.push_back({name, mdl_ObjCow<kprC_Step>(step)});
    data.index.Append(name);
}

kprC_StepContainer::Data& kprC_StepContainer::Writable() {
    if (data_.use_count() > 1) data_ = std::make_shared<Data>(*data_);
    return *data_;
}

cow_List<cow_String> kprC_StepContainer::Keys() const {
    cow_List<cow_String> keys;
    for (const Entry& entry : data_->steps) keys.Append(entry.name);
    return keys;
}

const kprC_Step& kprC_StepContainer::ConstGet(const cow_String& name) const {
    const int index = IndexOf(name);
    if (index < 0) cow_RaiseNoSuchKey("kprC_StepContainer", name);
    return StepAt(index);
}

kprC_Step& kprC_StepContainer::Get(const cow_String& name) {
    const int index = IndexOf(name);
    if (index < 0) cow_RaiseNoSuchKey("kprC_StepContainer", name);
    return Writable().steps[static_cast<std::size_t>(index)].record.Get();
}
