#include "store_interface/model/odiK_ModelRules.h"

#include "store_interface/findings/fnd_Nearest.h"
#include "store_interface/findings/fnd_Text.h"
#include "store_interface/model/odiK_Model.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/constraints/kcoC_Constraints.h"
#include "store_interface/records/interactions/kinC_ContactExp.h"

#include <algorithm>
#include <iterator>

namespace {

/// A list in the states of general contact and the list of pairs that its entries belong to, by their
/// lengths.
struct PairList {
    const char* states;
    const char* pairs;
    int (*numStates)(const kinC_ContactExpState& state);
    int (*numPairs)(const kinC_ContactExp& contact);
};

template <auto States, auto Pairs>
constexpr PairList Lists(const char* states, const char* pairs) {
    return {states, pairs, [](const kinC_ContactExpState& state) { return (state.*States).Length(); },
            [](const kinC_ContactExp& contact) { return (contact.*Pairs).Length(); }};
}

using State = kinC_ContactExpState;
using Contact = kinC_ContactExp;
constexpr PairList kPairLists[] = {
    Lists<&State::inclusions, &Contact::inclusionPairs>("inclusions", "inclusionPairs"),
    Lists<&State::exclusions, &Contact::exclusionPairs>("exclusions", "exclusionPairs"),
    Lists<&State::propertyAssignments, &Contact::propertyAssignmentPairs>("propertyAssignments",
                                                                          "propertyAssignmentPairs"),
    Lists<&State::surfacePropertyAssignments, &Contact::surfacePropertyAssignmentPairs>(
        "surfacePropertyAssignments", "surfacePropertyAssignmentPairs"),
    Lists<&State::formulationAssignments, &Contact::formulationAssignmentPairs>("formulationAssignments",
                                                                                "formulationAssignmentPairs"),
};

void CheckGeneralContact(const odiK_Model& model, const fnd_Path& root, fnd_Sink& sink) {
    const fnd_Path interactions(root, "interactions");
    for (const auto& [name, interaction] : model.interactions) {
        const auto* contact = nex_canDynamicCastPtr<kinC_ContactExp>(&interaction);
        if (contact == nullptr) continue;
        const fnd_Path place(interactions, name.View());
        const fnd_Path states(place, "states");
        for (const mdl_GivenState& given : contact->GivenStates()) {
            const fnd_Path step(states, given.stepName.View());
            const auto& state = static_cast<const kinC_ContactExpState&>(given.record.ConstGet());
            for (const PairList& list : kPairLists) {
                const int found = list.numStates(state);
                const int most = list.numPairs(*contact);
                if (found <= most) continue;
                sink.Add("list-too-long", fnd_Path(step, std::string_view(list.states)),
                         "found " + fnd_Counted(found, "item"),
                         "no more than the " + std::to_string(most) + " of " + list.pairs);
            }
        }
    }
}

bool IsNodeSet(const odiK_Model& model, const cow_String& name) {
    const int set = model.FindAssemblySet(name);
    return set >= 0 && model.AssemblySets()[static_cast<std::size_t>(set)]->type == res_SetTypeEnm::NODES;
}

void CheckEquations(const odiK_Model& model, const fnd_Path& root, fnd_Sink& sink) {
    const fnd_Path constraints(root, "constraints");
    for (const auto& [name, constraint] : model.constraints) {
        const auto* equation = nex_canDynamicCastPtr<kcoC_Equation>(&constraint);
        if (equation == nullptr) continue;
        const fnd_Path place(constraints, name.View());
        const fnd_Path terms(place, "terms");
        for (int i = 0; i < equation->terms.Length(); ++i) {
            const kcoC_EquationTerm& term = equation->terms[i];
            if (term.csys.IsNullRef() || IsNodeSet(model, term.setName)) continue;
            const fnd_Path each(terms, static_cast<std::size_t>(i));
            sink.Add("term-without-nodes", fnd_Path(each, "setName"),
                     "found " + fnd_Quoted(term.setName.View()),
                     "a node set of the assembly, since the term has a csys");
        }
    }
}

void CheckSector(const odiK_Model& model, const fnd_Path& root, fnd_Sink& sink) {
    if (model.cyclicSymmetry.IsNull() ||
        model.cyclicSymmetry.ConstGet().symmetryType != calC_SymmetryTypeEnm::NONE) {
        return;
    }
    sink.Add("idle-sector", fnd_Path(root, "cyclicSymmetry"),
             "the sector definition is idle, since symmetryType is NONE");
}

void CheckIgnored(const odiK_Model& model, const fnd_Path& root, fnd_Sink& sink) {
    const fnd_Path list(root, "ignore");
    for (int i = 0; i < model.ignore.Length(); ++i) {
        const fnd_Path entry(list, static_cast<std::size_t>(i));
        const fnd_Path place(entry, "code");
        const std::string_view name = model.ignore[i].code.View();
        const auto* const code = std::ranges::find(fnd_Codes, name, &fnd_Code::name);
        if (code == std::end(fnd_Codes)) {
            sink.Add("no-such-name", place, "found " + fnd_Quoted(name), "the code of a warning or a note",
                     fnd_DidYouMean(sink, name, [](fnd_Nearest& nearest) {
                         for (const fnd_Code& known : fnd_Codes) nearest.Try(known.name);
                     }));
        } else if (code->severity == fnd_Severity::ERROR) {
            sink.Add("wrong-value", place, "found the error " + fnd_Quoted(name),
                     "a warning or a note: errors can't be passed over");
        }
    }
}

} // namespace

void odiK_CheckModelRules(const odiK_Model& model, fnd_Sink& sink) {
    const fnd_Path root;
    CheckIgnored(model, root, sink);
    CheckSector(model, root, sink);
    CheckEquations(model, root, sink);
    CheckGeneralContact(model, root, sink);
}
