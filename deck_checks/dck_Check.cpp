#include "deck_checks/dck_Check.h"

#include "base/oif_ModelInfo.h"
#include "deck/oif_Writer.h"
#include "deck_checks/dck_Checks.h"
#include "deck_checks/dck_Kept.h"
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

struct Check {
    const char* name;
    /// `view` is that on the subject's model.
    void (*run)(const dck_Subject& subject, const ddb_Model& view, fnd_Sink& sink);
};
template <auto Run>
constexpr Check OfModel(const char* name) {
    return {name, [](const dck_Subject& subject, const ddb_Model&, fnd_Sink& sink) {
                if constexpr (std::is_invocable_v<decltype(Run), const dck_Subject&, fnd_Sink&>) {
                    Run(subject, sink);
                } else {
                    Run(subject.Model(), sink);
                }
            }};
}

/// In the order in which they tell.
constexpr Check kChecks[] = {
    OfModel<dck_CheckElements>("elements"),
    OfModel<dck_CheckSections>("sections"),
    OfModel<dck_CheckConditions>("conditions"),
    OfModel<dck_CheckInteractions>("interactions"),
    OfModel<dck_CheckConstraints>("constraints"),
    OfModel<dck_CheckRequests>("requests"),
    OfModel<dck_CheckProcedures>("procedures"),
    OfModel<dck_CheckMeetings>("meetings"),
    OfModel<dck_CheckTies>("ties"),
    OfModel<dck_CheckContactPairs>("contact pairs"),
    OfModel<dck_CheckStates>("states"),
    {"loads", [](const dck_Subject&, const ddb_Model& view,
                 fnd_Sink& sink) { dck_CheckLoads(oif_ModelInfo(view), sink); }},
    OfModel<dck_CheckLoss>("loss"),
};

/// Hands a model's findings on with their places in the store.
template <class Work>
void BelowModel(const cow_String& modelName, fnd_Sink& sink, const Work& work) {
    const fnd_Path root;
    const fnd_Path models(root, "models");
    const fnd_Path place(models, modelName.View());
    fnd_Below below(sink, place);
    work(below);
}

std::vector<fnd_Finding> FindingsOf(const Check& check, const dck_Subject& subject, const ddb_Model& view) {
    fnd_List list;
    check.run(subject, view, list);
    return std::move(list.findings);
}

} // namespace

void dck_CheckDeck(const odb_Odb& store, const cow_String& modelName, fnd_Sink& sink) {
    const ddb_Model view = store.ddb().model(modelName);
    BelowModel(modelName, sink, [&](fnd_Sink& below) {
        for (const Check& check : kChecks) check.run(*store.FindModel(modelName), view, below);
    });
}

void dck_CheckDeck(const odb_Odb& store, const cow_String& modelName, const dck_Kept& kept, fnd_Sink& sink) {
    const ddb_Model view = store.ddb().model(modelName);
    const dck_Subject subject(*store.FindModel(modelName), kept);
    BelowModel(modelName, sink, [&](fnd_Sink& below) {
        for (const Check& check : kChecks) {
            const auto findings = subject.Of(check.name, [&] { return FindingsOf(check, subject, view); });
            for (const fnd_Finding& finding : *findings) below.Take(finding);
        }
    });
}

std::unique_ptr<const dck_Kept> dck_KeepChecks(const odb_Odb& store, const cow_String& modelName) {
    const ddb_Model view = store.ddb().model(modelName);
    const odiK_Model& model = *store.FindModel(modelName);
    auto kept = std::make_unique<dck_Kept>(model);
    const dck_Subject subject(model, kept.get());
    for (const Check& check : kChecks)
        subject.Of(check.name, [&] { return FindingsOf(check, subject, view); });
    return kept;
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
