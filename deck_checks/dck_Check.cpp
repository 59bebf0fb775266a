#include "deck_checks/dck_Check.h"

#include "base/oif_ModelInfo.h"
#include "deck/oif_Writer.h"
#include "deck_checks/dck_Checks.h"
#include "foundation/nex_Exception.h"
#include "foundation/qio_Device.h"
#include "foundation/thr_Poll.h"
#include "foundation/thr_Progress.h"
#include "store_interface/model/odiK_IgnoreList.h"

#include <algorithm>

namespace {

class Counter final : public qio_ostream {
public:
    explicit Counter(thr_Progress* progress) : progress_(progress) {}
    void Write(const char*, std::size_t length) override {
        thr_Poll::Now();
        bytes += static_cast<long long>(length);
        if (progress_ != nullptr) progress_->Set(bytes);
    }
    long long bytes = 0;

private:
    thr_Progress* progress_;
};

} // namespace

void dck_CheckDeck(const odb_Odb& store, const cow_String& modelName, fnd_Sink& sink) {
    const odiK_Model& model = *store.FindModel(modelName);
    const fnd_Path root;
    const fnd_Path models(root, "models");
    const fnd_Path place(models, modelName.View());
    fnd_Below below(sink, place);
    dck_CheckElements(model, below);
    dck_CheckSections(model, below);
    dck_CheckConditions(model, below);
    dck_CheckInteractions(model, below);
    dck_CheckConstraints(model, below);
    dck_CheckRequests(model, below);
    dck_CheckProcedures(model, below);
    dck_CheckConflicts(model, below);
    dck_CheckStates(model, below);
    const oif_ModelInfo info(store.ddb().model(modelName));
    dck_CheckLoads(info, below);
    dck_CheckLoss(model, below);
}

void dck_Rehearse(const odb_Odb& store, const std::vector<fnd_Finding>& told, fnd_Sink& sink,
                  thr_Progress* progress) {
    constexpr long long kHuge = 1'000'000'000;
    const fnd_Path root;
    const fnd_Path models(root, "models");
    const fnd_Path place(models, store.DeckModelName().View());
    Counter counter(progress);
    try {
        oif_Writer(store).WriteInput(counter);
    } catch (const QRXBasException& failure) {
        const std::string text = failure.what();
        const bool isTold = std::ranges::any_of(told, [&](const fnd_Finding& finding) {
            return finding.code->name == "cannot-be-written" &&
                   (finding.found.find(text) != std::string::npos ||
                    finding.expected.find(text) != std::string::npos);
        });
        if (isTold) return;
        sink.Add("cannot-be-written", place, "writing fails with \"" + text + "\": " + failure.Context());
        return;
    }
    if (counter.bytes < kHuge) return;
    sink.Add("huge-deck", place, "the deck will have " + std::to_string(counter.bytes / 1'000'000) + " MB");
}

std::vector<fnd_Finding> dck_Check(const odb_Odb& store) {
    const cow_String& name = store.DeckModelName();
    // Completes the model, or raises.
    static_cast<void>(store.ddb().model(name));
    fnd_List list;
    dck_CheckStore(store, name, list);
    const bool wrong = std::ranges::any_of(list.findings, [](const fnd_Finding& f) { return f.IsError(); });
    if (!wrong) {
        dck_CheckDeck(store, name, list);
        dck_CheckMeshes(store, name, list);
        dck_Rehearse(store, std::vector<fnd_Finding>(list.findings), list);
    }
    odiK_IgnoreList(store).TakeFrom(list.findings);
    return std::move(list.findings);
}
