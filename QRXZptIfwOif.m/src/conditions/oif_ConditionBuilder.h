#ifndef QRX_OIF_CONDITIONBUILDER_H
#define QRX_OIF_CONDITIONBUILDER_H

#include "base/oif_BlockHeader.h"
#include "base/oif_Component.h"
#include "conditions/oif_Card.h"
#include "conditions/oif_WrittenSteps.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <deque>

/// The objects for which a test holds, step by step in the order of their names. One walk over the objects
/// asks for all steps, so that a step costs nothing for what it only carries on.
template <class T>
class oif_ObjectsOfSteps {
public:
    struct Entry {
        const cow_String& name;
        const T& object;
        // What is the same in all steps, made for the first card; the cards share it.
        mdl_ObjCow<T> shared = {};
        cow_String setName = {};
        cow_String label = {};
        qkw_KeywordHandle comment = {};
    };

    /// `kind` is what messages call the objects; `test(object, stepName, inLoadCase)`, of which the last
    /// tells whether the step has load cases, is asked of objects that `counts` lets in.
    template <class Test, class Counts>
    oif_ObjectsOfSteps(const char* kind, const kprC_PropagatingContainer<T>& objects,
                       const kprC_StepContainer& steps, const oif_OpStatus& status, const Test& test,
                       const Counts& counts)
        : kind_(kind), ofStep_(static_cast<std::size_t>(steps.Size())) {
        oif_WrittenSteps written(steps, status);
        for (const auto& [name, object] : objects) {
            if (!counts(object)) continue;
            const std::vector<int> found = written.Of(kind, name, object, test);
            if (found.empty()) continue;
            Entry* entry = &entries_.emplace_back(Entry{name, object});
            for (const int step : found) ofStep_[static_cast<std::size_t>(step)].push_back(entry);
        }
    }
    template <class Test>
    oif_ObjectsOfSteps(const char* kind, const kprC_PropagatingContainer<T>& objects,
                       const kprC_StepContainer& steps, const oif_OpStatus& status, const Test& test)
        : oif_ObjectsOfSteps(kind, objects, steps, status, test, [](const T&) { return true; }) {}
    const char* Kind() const { return kind_; }
    const std::vector<Entry*>& In(int step) const { return ofStep_.at(static_cast<std::size_t>(step)); }

private:
    const char* kind_;
    std::deque<Entry> entries_;
    std::vector<std::vector<Entry*>> ofStep_;
};

/// Base of the builder B of objects that steps say anew. All go one way: the banner of the step, which stands
/// also where nothing follows it, then the card in each place of the object, most of them under a comment.
template <class B>
class oif_ConditionBuilder : public oif_ComponentOf<B> {
protected:
    oif_ConditionBuilder(oif_ModelInfo& modelInfo, const char* banner)
        : oif_ComponentOf<B>(modelInfo), banner_(cow_String(banner)) {}

    /// Makes the cards of a step: `placesOf(step, name, status)`, `opOf(object, stepName, inLoadCase)`,
    /// `labelOf(name, object)` is the comment's text, `make(card, entry)`.
    template <class T, class PlacesOf, class OpOf, class LabelOf, class Make>
    void MakeCards(const oif_ObjectsOfSteps<T>& written, int step, const PlacesOf& placesOf, const OpOf& opOf,
                   const LabelOf& labelOf, const Make& make) {
        const kprC_StepContainer& steps = this->Model().Steps();
        const cow_String& stepName = steps.NameAt(step);
        const nex_Context stepContext("step", stepName);
        for (auto* entry : written.In(step)) {
            const typename oif_ConditionBuilder::Making making(*this, written.Kind(), entry->name);
            if (entry->shared.IsNull()) {
                entry->shared = mdl_ObjCow<T>(entry->object);
                if constexpr (requires { entry->object.region; }) {
                    entry->setName = oif_RegionName(entry->object.region, this->ModelInfo());
                }
                entry->label = labelOf(entry->name, entry->object);
                entry->comment = oif_Comment(entry->label);
            }
            for (const auto& [loadCase, scale] :
                 placesOf(steps.StepAt(step), entry->name, entry->object.Status(stepName))) {
                const bool inLoadCase = !loadCase.IsEmpty();
                if (!inLoadCase) this->AddStepBanner(stepName, banner_.StepHeader(stepName));
                make(oif_CardOf<T>{entry->name, entry->shared, entry->setName, stepName,
                                   opOf(entry->object, stepName, inLoadCase), loadCase, scale},
                     *entry);
            }
        }
    }
    /// The same where the status tells places and op.
    template <class T, class OpStatus, class LabelOf, class Make>
    void MakeCards(const oif_ObjectsOfSteps<T>& written, int step, const OpStatus& opStatus,
                   const LabelOf& labelOf, const Make& make) {
        MakeCards(
            written, step, OpStatus::Places,
            [&](const T& object, const cow_String& stepName, bool inLoadCase) {
                return opStatus.Op(object, stepName, inLoadCase);
            },
            labelOf, make);
    }

    template <class T>
    void AddComment(const oif_CardOf<T>& card, const typename oif_ObjectsOfSteps<T>::Entry& entry) {
        if (!card.InLoadCase()) return this->AddStepDefinition(card.step, entry.comment);
        Add(card, oif_Comment(entry.label + ScaleText(card.scale)));
    }
    template <class T, class Keyword>
    void Add(const oif_CardOf<T>& card, const Keyword& keyword) {
        this->AddStepDefinition(card.step, keyword, card.loadCase);
    }
    /// The end of a comment in a load case.
    static cow_String ScaleText(float scale) { return cow_String("   Scale factor: ") + cow_String(scale); }

private:
    oif_BlockHeader banner_;
};

#endif
