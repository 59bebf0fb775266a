#include "keyword_layer/qkw_BuilderComponent.h"

namespace {

qkw_KeywordList ListOf(const qkw_ByName<qkw_KeywordList>& lists, const cow_String& key) {
    const qkw_KeywordList* list = lists.Find(key);
    return list == nullptr ? qkw_KeywordList() : *list;
}

qkw_KeywordList ListOf(const qkw_ByName<std::vector<qkw_KeywordHandle>>& lists, const cow_String& key) {
    qkw_KeywordList list;
    if (const auto* keywords = lists.Find(key)) {
        for (const qkw_KeywordHandle& keyword : *keywords) list.Append(keyword);
    }
    return list;
}

} // namespace

qkw_KeywordList qkw_BuilderComponent::ModelDefinition() {
    return modelDefinitions_;
}

qkw_KeywordList qkw_BuilderComponent::PartDefinition(const cow_String& partName) {
    return ListOf(partDefinitions_, partName);
}

qkw_KeywordList qkw_BuilderComponent::InstanceDefinition(const cow_String& instanceName) {
    return ListOf(instanceDefinitions_, instanceName);
}

qkw_KeywordList qkw_BuilderComponent::AssemblyDefinition() {
    return assemblyDefinitions_;
}

qkw_KeywordList qkw_BuilderComponent::StepDefinition(const cow_String& stepName,
                                                     const cow_String& secondKey) {
    if (secondKey.IsEmpty()) return ListOf(stepDefinitions_, stepName);
    const StepsByName* lists = loadCaseDefinitions_.Find(stepName);
    return lists == nullptr ? qkw_KeywordList() : ListOf(*lists, secondKey);
}

qkw_KeywordList qkw_BuilderComponent::AtomOptionDefinition() {
    return atomOptionDefinitions_;
}

qkw_KeywordList qkw_BuilderComponent::SingleTermDefinition() {
    return singleTermDefinitions_;
}

qkw_KeywordList qkw_BuilderComponent::CombinedTermDefinition() {
    return combinedTermDefinitions_;
}

qkw_KeywordList qkw_BuilderComponent::DesignAreaDefinition() {
    return designAreaDefinitions_;
}
