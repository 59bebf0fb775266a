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

void kprC_StepContainer::Append(const cow_String& name, const kprC_Step& step) {
    if (IsMember(name)) {
        const std::string text =
            "kprC_StepContainer: a step named '" + std::string(name.View()) + "' is there already";
        nex_Raise(atr_String(std::string_view(text)));
    }
    Data& data = Writable();
    data.steps.push_back({name, mdl_ObjCow<kprC_Step>(step)});
    data.index.emplace(data.steps.back().name.View(), Size() - 1);
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

int kprC_StepContainer::IndexOf(const cow_String& name) const {
    for (int guess = data_->lastFound; guess < std::min(data_->lastFound + 2, Size()); ++guess) {
        if (data_->steps[static_cast<std::size_t>(guess)].name == name) return data_->lastFound = guess;
    }
    const auto place = data_->index.find(name.View());
    return place == data_->index.end() ? -1 : data_->lastFound = place->second;
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
