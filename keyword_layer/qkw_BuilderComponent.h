#ifndef QRX_KEYWORD_QKW_BUILDERCOMPONENT_H
#define QRX_KEYWORD_QKW_BUILDERCOMPONENT_H

#include "foundation/cow_Map.h"
#include "keyword_layer/qkw_Keyword.h"
#include "keyword_layer/qkw_ModelInfo.h"

/// One maker of keywords. Build() reads the model and stores finished keywords in the lists below, filed by
/// the section of the deck that they belong to; the driver reads the lists when all components have built.
/// Adding a keyword stores a copy of it. Lists are returned as shared copies; a key that has no list gives an
/// empty one.
class qkw_BuilderComponent : public mem_AllocationOperators {
public:
    virtual ~qkw_BuilderComponent() = default;
    virtual qkw_KeywordList ModelDefinition();
    virtual qkw_KeywordList PartDefinition(const cow_String& partName);
    virtual qkw_KeywordList InstanceDefinition(const cow_String& instanceName);
    virtual qkw_KeywordList AssemblyDefinition();
    /// The step's own body under the empty second key, else the list of a load case.
    virtual qkw_KeywordList StepDefinition(const cow_String& stepName, const cow_String& secondKey);
    // These four sections are kept for later kinds of decks; nothing fills or reads them.
    virtual qkw_KeywordList AtomOptionDefinition();
    virtual qkw_KeywordList SingleTermDefinition();
    virtual qkw_KeywordList CombinedTermDefinition();
    virtual qkw_KeywordList DesignAreaDefinition();
    virtual void Build() = 0;
    virtual qkw_BuilderComponent* Copy() const = 0;

    qkw_KeywordList StepDefinition(const cow_String& stepName) {
        return StepDefinition(stepName, cow_String());
    }

protected:
    explicit qkw_BuilderComponent(qkw_ModelInfo& modelInfo)
        : model_(&modelInfo.Model()), modelInfo_(&modelInfo) {}
    qkw_BuilderComponent(const qkw_BuilderComponent&) = default;
    qkw_BuilderComponent& operator=(const qkw_BuilderComponent&) = default;

    void AddModelDefinition(const qkw_Keyword& keyword) { modelDefinitions_.Append(keyword); }
    void AddAssemblyDefinition(const qkw_Keyword& keyword) { assemblyDefinitions_.Append(keyword); }
    void AddPartDefinition(const cow_String& partName, const qkw_Keyword& keyword) {
        partDefinitions_.GetOrInsert(partName).Append(keyword);
    }
    void AddInstanceDefinition(const cow_String& instanceName, const qkw_Keyword& keyword) {
        instanceDefinitions_.GetOrInsert(instanceName).Append(keyword);
    }
    void AddStepDefinition(const cow_String& stepName, const qkw_Keyword& keyword,
                           const cow_String& secondKey) {
        stepDefinitions_.GetOrInsert(stepName).GetOrInsert(secondKey).Append(keyword);
    }
    void AddStepDefinition(const cow_String& stepName, const qkw_Keyword& keyword) {
        AddStepDefinition(stepName, keyword, cow_String());
    }
    /// For a keyword that stands in many places: the lists share it.
    void AddStepDefinition(const cow_String& stepName, const qkw_KeywordHandle& keyword,
                           const cow_String& secondKey = {}) {
        stepDefinitions_.GetOrInsert(stepName).GetOrInsert(secondKey).Append(keyword);
    }
    void AddAtomOptionDefinition(const qkw_Keyword& keyword) { atomOptionDefinitions_.Append(keyword); }
    void AddSingleTermDefinition(const qkw_Keyword& keyword) { singleTermDefinitions_.Append(keyword); }
    void AddCombinedTermDefinition(const qkw_Keyword& keyword) { combinedTermDefinitions_.Append(keyword); }
    void AddDesignAreaDefinition(const qkw_Keyword& keyword) { designAreaDefinitions_.Append(keyword); }

    const qkw_Model& Model() const { return *model_; }
    qkw_ModelInfo& ModelInfo() const { return *modelInfo_; }

private:
    using ListsByName = cow_Map<cow_String, qkw_KeywordList>;

    const qkw_Model* model_;
    qkw_ModelInfo* modelInfo_;
    qkw_KeywordList modelDefinitions_;
    ListsByName partDefinitions_;
    ListsByName instanceDefinitions_;
    qkw_KeywordList assemblyDefinitions_;
    cow_Map<cow_String, ListsByName> stepDefinitions_;
    qkw_KeywordList atomOptionDefinitions_;
    qkw_KeywordList singleTermDefinitions_;
    qkw_KeywordList combinedTermDefinitions_;
    qkw_KeywordList designAreaDefinitions_;
};

/// Made from a component, it holds a copy of it.
using qkw_ComponentHandle = cow_ArrayCOW<qkw_BuilderComponent, cow_Virtual<qkw_BuilderComponent>>;
using qkw_ComponentList = cow_List<qkw_ComponentHandle>;

#endif
