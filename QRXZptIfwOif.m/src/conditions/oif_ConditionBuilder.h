#ifndef QRX_OIF_CONDITIONBUILDER_H
#define QRX_OIF_CONDITIONBUILDER_H

#include "base/oif_BlockHeader.h"
#include "base/oif_Component.h"
#include "conditions/oif_Card.h"
#include "conditions/oif_WrittenSteps.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <deque>
#include <numeric>
#include <optional>
#include <span>

/// What the keyword of a card rests on besides its object: cards of one object that agree in it say the same.
template <class T>
struct oif_SaidOf {
    mdl_PropagationStatusEnm status;
    mdl_ObjCow<typename T::StateRecord> state;
    unsigned procedureType;
    oif_Op op;
    bool isInitial;

    friend bool operator==(const oif_SaidOf&, const oif_SaidOf&) = default;
};

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
        // The keyword that was made last, for the steps that say the same again.
        std::optional<oif_SaidOf<T>> said = {};
        qkw_KeywordHandle keyword = {};
    };

    /// `kind` is what messages call the objects; `test(object, stepName, inLoadCase)`, of which the last
    /// tells whether the step has load cases, is asked of objects that `counts` lets in.
    template <class Test, class Counts>
    oif_ObjectsOfSteps(const char* kind, const kprC_PropagatingContainer<T>& objects,
                       const kprC_StepContainer& steps, const oif_OpStatus& status, const Test& test,
                       const Counts& counts)
        : kind_(kind), ends_(static_cast<std::size_t>(steps.Size()) + 1, 0) {
        oif_WrittenSteps written(steps, status);
        std::vector<int> stepsOfAll; // object by object
        std::vector<std::size_t> endOf;
        for (const auto& [name, object] : objects) {
            if (!counts(object)) continue;
            const std::vector<int> found = written.Of(kind, name, object, test);
            if (found.empty()) continue;
            entries_.emplace_back(Entry{name, object});
            stepsOfAll.insert(stepsOfAll.end(), found.begin(), found.end());
            endOf.push_back(stepsOfAll.size());
        }
        SortBySteps(stepsOfAll, endOf);
    }
    template <class Test>
    oif_ObjectsOfSteps(const char* kind, const kprC_PropagatingContainer<T>& objects,
                       const kprC_StepContainer& steps, const oif_OpStatus& status, const Test& test)
        : oif_ObjectsOfSteps(kind, objects, steps, status, test, [](const T&) { return true; }) {}
    const char* Kind() const { return kind_; }
    std::span<Entry* const> In(int step) const {
        const auto place = static_cast<std::size_t>(step);
        const std::size_t begin = place == 0 ? 0 : ends_.at(place - 1);
        return {places_.data() + begin, ends_.at(place) - begin};
    }

private:
    void SortBySteps(const std::vector<int>& stepsOfAll, const std::vector<std::size_t>& endOf) {
        // Each step's end begins as its first place and moves on with every entry.
        for (const int step : stepsOfAll) ++ends_[static_cast<std::size_t>(step) + 1];
        std::partial_sum(ends_.begin(), ends_.end(), ends_.begin());
        places_.resize(stepsOfAll.size());
        std::size_t next = 0;
        for (std::size_t i = 0; i < endOf.size(); ++i) {
            for (; next < endOf[i]; ++next) {
                places_[ends_[static_cast<std::size_t>(stepsOfAll[next])]++] = &entries_[i];
            }
        }
    }

    const char* kind_;
    std::deque<Entry> entries_;
    // The entries of all steps, one step behind the other.
    std::vector<Entry*> places_;
    std::vector<std::size_t> ends_;
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
        bool hasBanner = false;
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
                if (!inLoadCase && !hasBanner) this->AddStepBanner(stepName, banner_.StepHeader(stepName));
                hasBanner = hasBanner || !inLoadCase;
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
    /// Files what `makeKeyword` gives, or the entry's last keyword where that rests on the same. In a load
    /// case each has its own factor.
    template <class T, class MakeKeyword>
    void AddShared(const oif_CardOf<T>& card, typename oif_ObjectsOfSteps<T>::Entry& entry,
                   const MakeKeyword& makeKeyword) {
        if (card.InLoadCase()) return Add(card, makeKeyword());
        const auto quad = card.Quad();
        const oif_SaidOf<T> said{quad.status, quad.state, quad.procedureType, card.op,
                                 card.step == this->Model().InitialStepName()};
        if (entry.said != said) {
            entry.keyword = makeKeyword();
            entry.said = said;
        }
        Add(card, entry.keyword);
    }
    /// The end of a comment in a load case.
    static cow_String ScaleText(float scale) { return cow_String("   Scale factor: ") + cow_String(scale); }

private:
    oif_BlockHeader banner_;
};

#endif
