#include "decks/DeckFromCopies.h"

#include "base/oif_Comment.h"
#include "deck/oif_Builder.h"
#include "store_interface/model/odb_Odb.h"

#include <memory>
#include <tuple>
#include <utility>
#include <vector>

namespace {

using Components = std::vector<std::unique_ptr<qkw_BuilderComponent>>;
using Keywords = std::vector<std::unique_ptr<qkw_Keyword>>;

// Builds in the order of the types and gives copies of the components in this order.
template <class... Types>
Components BuiltCopies(oif_ModelInfo& modelInfo) {
    std::tuple<std::unique_ptr<Types>...> originals(std::make_unique<Types>(modelInfo)...);
    Components copies;
    const auto build = [&](auto&... components) { (components->Build(), ...); };
    const auto copy = [&](auto&... components) { (copies.emplace_back(components->Copy()), ...); };
    std::apply(build, originals);
    std::apply(copy, originals);
    return copies;
}

void AppendCopies(Keywords& deck, const qkw_KeywordList& keywords) {
    for (int i = 0; i < keywords.Length(); ++i) deck.emplace_back(keywords[i].ConstGet().Copy());
}

template <class Section>
void AppendSection(Keywords& deck, const Components& components, const Section& section) {
    for (const auto& component : components) AppendCopies(deck, section(*component));
}

Keywords KeywordCopies(oif_ModelInfo& modelInfo) {
    Components components =
        BuiltCopies<oif_JobKeywordsBuilder, oif_PartBuilder, oif_MaterialBuilder, oif_InstanceBuilder,
                    oif_StepBuilder, oif_RegionBuilder, oif_PartAttributesBuilder, oif_AmplitudeBuilder,
                    oif_TransformBuilder, oif_ConstraintBuilder, oif_BoundaryConditionBuilder,
                    oif_LoadBuilder, oif_FieldBuilder, oif_InteractionBuilder, oif_OutputRequestBuilder,
                    oif_FinalBuilder>(modelInfo);
    Keywords deck;
    AppendCopies(deck, components.front()->ModelDefinition());
    // In the sections the opening text is left out, and materials stand behind amplitudes.
    components.erase(components.begin());
    auto material = std::move(components[1]);
    components.erase(components.begin() + 1);
    components.insert(components.begin() + 6, std::move(material));

    const oif_Model& model = modelInfo.Model();
    deck.push_back(std::make_unique<oif_RawKeyword>("**\n** PARTS\n**\n"));
    for (auto it = model.Parts().createIterator(); !it.isDone(); it.next()) {
        AppendSection(deck, components, [&](auto& from) { return from.PartDefinition(it.currentKey()); });
    }
    deck.push_back(std::make_unique<oif_RawKeyword>(cow_String("**\n** ASSEMBLY\n**\n*Assembly, name=") +
                                                    model.Model().rootAssembly().name()));
    for (auto it = model.Instances().createIterator(); !it.isDone(); it.next()) {
        AppendSection(deck, components, [&](auto& from) { return from.InstanceDefinition(it.currentKey()); });
    }
    AppendSection(deck, components, [](auto& from) { return from.AssemblyDefinition(); });
    AppendSection(deck, components, [](auto& from) { return from.ModelDefinition(); });
    bool isInitial = true;
    for (kprC_StepContainerIT it(model.Steps()); !it.IsDone(); it.Next()) {
        const cow_String step = it.CurrentKey();
        AppendSection(deck, components, [&](auto& from) { return from.StepDefinition(step); });
        if (std::exchange(isInitial, false)) continue;
        const auto& analysisStep = nex_canDynamicCastRef<kprC_AnalysisStep>(it.CurrentValue(), NEX_HERE);
        const cow_List<cow_String> loadCases = analysisStep.loadCases.Keys();
        for (int i = 0; i < loadCases.Length(); ++i) {
            if (loadCases[i].IsEmpty()) continue;
            AppendSection(deck, components,
                          [&](auto& from) { return from.StepDefinition(step, loadCases[i]); });
        }
    }
    return deck;
}

} // namespace

std::string DeckFromCopies(const odb_Odb& odb) {
    oif_ModelInfo modelInfo(odb.ddb().model(odb_Odb::DefaultModelName()));
    const Keywords deck = KeywordCopies(modelInfo);
    qio_StringDevice device;
    utl_Stream stream(device, 131, 6, 6);
    for (const auto& keyword : deck) keyword->Write(stream);
    stream.Flush();
    return device.Text();
}
