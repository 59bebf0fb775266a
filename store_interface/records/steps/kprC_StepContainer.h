#ifndef QRX_STORE_KPRC_STEPCONTAINER_H
#define QRX_STORE_KPRC_STEPCONTAINER_H

#include "store_interface/records/steps/kprC_Step.h"

#include <memory>
#include <unordered_map>
#include <vector>

/// Whether a job is for the implicit or the explicit solver.
enum class kprC_AnalysisProductEnm : int { IMPLICIT = 0, EXPLICIT = 1, OTHER = 2 };
const omu_EnumTable& omu_EnumTableOf(kprC_AnalysisProductEnm);

/// The places of steps by their names. Questions mostly come step by step, so the place of the last answer
/// and the one behind it are tried first.
class kprC_StepIndex {
public:
    void Append(const cow_String& name);
    /// The place from 0, or -1.
    int Find(const cow_String& name) const;

private:
    std::vector<cow_String> names_;
    // The views lie in the names' shared storage, which copies of the index keep alive too.
    std::unordered_map<std::string_view, int> places_;
    mutable thr_Relaxed<std::size_t> last_ = 0;
};

/// The steps in the order of the analysis, the initial step first; not in name order. Copies share the steps
/// until one of them is written to.
class kprC_StepContainer {
public:
    /// Appends a copy of the step. A name that is there already raises.
    void Append(const cow_String& name, const kprC_Step& step);

    cow_List<cow_String> Keys() const;
    bool IsMember(const cow_String& name) const { return IndexOf(name) >= 0; }
    /// An unknown name raises.
    const kprC_Step& ConstGet(const cow_String& name) const;
    kprC_Step& Get(const cow_String& name);
    int Size() const { return static_cast<int>(data_->steps.size()); }
    /// The place of the step from 0, or -1.
    int IndexOf(const cow_String& name) const { return data_->index.Find(name); }
    /// A place outside the steps raises.
    const cow_String& NameAt(int index) const { return EntryAt(index).name; }
    const kprC_Step& StepAt(int index) const { return EntryAt(index).record.ConstGet(); }

    static cow_Entry<cow_String, const kprC_Step&> ItemAt(const kprC_StepContainer& steps, int index) {
        return {steps.NameAt(index), steps.StepAt(index)};
    }
    using ConstIterator = cow_IndexIterator<kprC_StepContainer, &ItemAt>;
    /// Names and steps in order, for loops that leave the steps as they are.
    ConstIterator begin() const { return {*this, 0}; }
    ConstIterator end() const { return {*this, Size()}; }

private:
    struct Entry {
        cow_String name;
        mdl_ObjCow<kprC_Step> record;
    };

    const Entry& EntryAt(int index) const {
        if (index < 0 || index >= Size()) cow_RaiseOutOfRange(index, Size());
        return data_->steps[static_cast<std::size_t>(index)];
    }

    struct Data {
        std::vector<Entry> steps;
        kprC_StepIndex index;
    };
    Data& Writable();

    std::shared_ptr<Data> data_ = std::make_shared<Data>();
};

class kprC_StepContainerIT {
public:
    explicit kprC_StepContainerIT(const kprC_StepContainer& steps) : steps_(steps) {}
    void First() { index_ = 0; }
    void Next() { ++index_; }
    bool IsDone() const { return index_ >= steps_.Size(); }
    const cow_String& CurrentKey() const { return steps_.NameAt(index_); }
    const kprC_Step& CurrentValue() const { return steps_.StepAt(index_); }

private:
    const kprC_StepContainer& steps_;
    int index_ = 0;
};

#endif
