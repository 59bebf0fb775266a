#include "store_interface/propagation/kprC_Timeline.h"

kprC_Timeline::kprC_Timeline() {
    static const kprC_Timeline empty{kprC_StepContainer()};
    data_ = empty.data_;
}

kprC_Timeline::kprC_Timeline(const kprC_StepContainer& steps) {
    auto data = std::make_shared<Data>();
    data->steps = steps;
    const int size = steps.Size();
    for (int i = 0; i < size; ++i) data->isPerturbation.push_back(steps.StepAt(i).Perturbation());
    for (std::vector<int>& next : data->next) next.assign(static_cast<std::size_t>(size) + 1, size);
    for (int i = size - 1; i >= 0; --i) {
        const auto place = static_cast<std::size_t>(i);
        for (std::vector<int>& next : data->next) next[place] = next[place + 1];
        data->next[data->isPerturbation[place] ? 1 : 0][place] = i;
    }
    data_ = std::move(data);
}
