#ifndef QRX_STORE_KPRC_TIMELINE_H
#define QRX_STORE_KPRC_TIMELINE_H

#include "store_interface/records/steps/kprC_StepContainer.h"

/// The steps as what lives across them sees them: general ones, each going on from the last, and linear
/// perturbations of the general one before them. Copies share everything; steps that change later don't show.
class kprC_Timeline {
public:
    kprC_Timeline();
    // NOLINTNEXTLINE(google-explicit-constructor): steps are what it is made of
    kprC_Timeline(const kprC_StepContainer& steps);

    const kprC_StepContainer& Steps() const { return data_->steps; }
    int Size() const { return static_cast<int>(data_->isPerturbation.size()); }
    bool IsPerturbation(int step) const { return data_->isPerturbation[static_cast<std::size_t>(step)]; }
    /// The first step from `from` on that is a perturbation, or is none; Size() when there is none.
    int Next(bool perturbation, int from) const {
        return data_->next[perturbation ? 1 : 0][static_cast<std::size_t>(from)];
    }

private:
    struct Data {
        kprC_StepContainer steps;
        std::vector<bool> isPerturbation;
        std::vector<int> next[2];
    };
    std::shared_ptr<const Data> data_;
};

/// Steps in which an object is the same: those of one kind from `first` on, before `end`.
struct kprC_StepRun {
    int first = 0;
    int end = 0;
    bool perturbation = false;
};

#endif
