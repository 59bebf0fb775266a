#ifndef QRX_KEYWORD_QKW_BUILDERCOMPONENT_H
#define QRX_KEYWORD_QKW_BUILDERCOMPONENT_H

#include "foundation/nex_Exception.h"
#include "keyword_layer/qkw_ByName.h"
#include "keyword_layer/qkw_Keyword.h"
#include "keyword_layer/qkw_ModelInfo.h"

#include <vector>

/// A keyword, the object that it was made of, and where in the deck it was filed.
struct qkw_Filed {
    /// What contexts call the object's kind, such as "load"; it outlives the run.
    const char* kind;
    cow_String name;
    /// Empty for a keyword of the model or the assembly.
    cow_String step;
    cow_String loadCase;
    qkw_KeywordHandle keyword;
};
using qkw_FilingLog = std::vector<qkw_Filed>;

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
    /// From now on tells the log, which must outlive the building, whose keywords it files.
    void LogTo(qkw_FilingLog& log) { log_ = &log; }

    qkw_KeywordList StepDefinition(const cow_String& stepName) {
        return StepDefinition(stepName, cow_String());
    }

protected:
    explicit qkw_BuilderComponent(qkw_ModelInfo& modelInfo)
        : model_(&modelInfo.Model()), modelInfo_(&modelInfo) {}
    qkw_BuilderComponent(const qkw_BuilderComponent&) = default;
    qkw_BuilderComponent& operator=(const qkw_BuilderComponent&) = default;

    /// While it lives, an object's keywords are being made: failures name it, and what is filed for the
    /// model, the assembly or a step is logged as its own.
    class Making {
    public:
        Making(qkw_BuilderComponent& component, const char* kind, const cow_String& name)
            : context_(kind, name), kind_(kind), name_(&name), component_(component),
              outer_(component.making_) {
            component_.making_ = this;
        }
        Making(const Making&) = delete;
        Making& operator=(const Making&) = delete;
        ~Making() { component_.making_ = outer_; }

    private:
        friend class qkw_BuilderComponent;
        nex_Context context_;
        const char* kind_;
        const cow_String* name_;
        qkw_BuilderComponent& component_;
        const Making* outer_;
    };
    /// Logs a keyword that several objects share as one of this object's.
    void LogAs(const char* kind, const cow_String& name, const cow_String& step,
               const qkw_KeywordHandle& keyword, const cow_String& loadCase = {}) {
        if (log_ != nullptr) log_->push_back({kind, name, step, loadCase, keyword});
    }

    void AddModelDefinition(const qkw_KeywordHandle& keyword) {
        modelDefinitions_.Append(keyword);
        Log({}, keyword);
    }
    void AddModelDefinition(const qkw_Keyword& keyword) { AddModelDefinition(qkw_KeywordHandle(keyword)); }
    void AddAssemblyDefinition(const qkw_KeywordHandle& keyword) {
        assemblyDefinitions_.Append(keyword);
        Log({}, keyword);
    }
    void AddAssemblyDefinition(const qkw_Keyword& keyword) {
        AddAssemblyDefinition(qkw_KeywordHandle(keyword));
    }
    void AddPartDefinition(const cow_String& partName, const qkw_Keyword& keyword) {
        partDefinitions_.GetOrInsert(partName).Append(keyword);
    }
    void AddInstanceDefinition(const cow_String& instanceName, const qkw_Keyword& keyword) {
        instanceDefinitions_.GetOrInsert(instanceName).Append(keyword);
    }
    /// For a keyword that stands in many places: the lists share it.
    void AddStepDefinition(const cow_String& stepName, const qkw_KeywordHandle& keyword,
                           const cow_String& secondKey = {}) {
        FileInStep(stepName, secondKey, keyword);
        Log(stepName, keyword, secondKey);
    }
    void AddStepDefinition(const cow_String& stepName, const qkw_Keyword& keyword,
                           const cow_String& secondKey = {}) {
        AddStepDefinition(stepName, qkw_KeywordHandle(keyword), secondKey);
    }
    /// The banner ahead of a step's keywords of one kind, which is no object's own.
    void AddStepBanner(const cow_String& stepName, const qkw_KeywordHandle& banner) {
        if (!banner.ConstGet().IsEmpty()) FileInStep(stepName, {}, banner);
    }
    void AddAtomOptionDefinition(const qkw_Keyword& keyword) { atomOptionDefinitions_.Append(keyword); }
    void AddSingleTermDefinition(const qkw_Keyword& keyword) { singleTermDefinitions_.Append(keyword); }
    void AddCombinedTermDefinition(const qkw_Keyword& keyword) { combinedTermDefinitions_.Append(keyword); }
    void AddDesignAreaDefinition(const qkw_Keyword& keyword) { designAreaDefinitions_.Append(keyword); }

    const qkw_Model& Model() const { return *model_; }
    qkw_ModelInfo& ModelInfo() const { return *modelInfo_; }

private:
    using ListsByName = qkw_ByName<qkw_KeywordList>;
    // Of thousands of steps, most have a few keywords, for which a list takes twenty times their room.
    using StepsByName = qkw_ByName<std::vector<qkw_KeywordHandle>>;

    void FileInStep(const cow_String& stepName, const cow_String& secondKey,
                    const qkw_KeywordHandle& keyword) {
        StepsByName& lists =
            secondKey.IsEmpty() ? stepDefinitions_ : loadCaseDefinitions_.GetOrInsert(stepName);
        lists.GetOrInsert(secondKey.IsEmpty() ? stepName : secondKey).push_back(keyword);
    }
    void Log(const cow_String& step, const qkw_KeywordHandle& keyword, const cow_String& loadCase = {}) {
        if (making_ != nullptr) LogAs(making_->kind_, *making_->name_, step, keyword, loadCase);
    }

    const qkw_Model* model_;
    qkw_ModelInfo* modelInfo_;
    qkw_KeywordList modelDefinitions_;
    ListsByName partDefinitions_;
    ListsByName instanceDefinitions_;
    qkw_KeywordList assemblyDefinitions_;
    StepsByName stepDefinitions_;
    qkw_ByName<StepsByName> loadCaseDefinitions_; // step by step, then by load case
    qkw_KeywordList atomOptionDefinitions_;
    qkw_KeywordList singleTermDefinitions_;
    qkw_KeywordList combinedTermDefinitions_;
    qkw_KeywordList designAreaDefinitions_;
    qkw_FilingLog* log_ = nullptr;
    const Making* making_ = nullptr;
};

#endif
