#include "deck_checks/dck_Checks.h"
#include "deck_checks/dck_Text.h"
#include "store_interface/model/ddb_ElementTypes.h"
#include "store_interface/model/odiK_Model.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/conditions/kloC_Loads.h"
#include "store_interface/records/sections/kseC_BeamSection.h"
#include "store_interface/records/sections/kseC_ShellSections.h"
#include "store_interface/records/sections/kseC_SolidSections.h"
#include "store_interface/records/steps/kprC_DynamicSteps.h"
#include "store_interface/records/steps/kprC_ModalSteps.h"
#include "store_interface/records/steps/kprC_Predicates.h"
#include "store_interface/records/steps/kprC_ThermalSteps.h"

#include <algorithm>
#include <set>
#include <vector>

namespace {

enum Needs : unsigned {
    kDensity = 1U << 0,
    kConductivity = 1U << 1,
    kHeatCapacity = 1U << 2, // and the density, where the response is transient
    kTemperatures = 1U << 3, // as degrees of freedom
    kDisplacements = 1U << 4,
};

struct Procedure {
    unsigned id;
    unsigned needs;
};

/// What procedures need; those that aren't here need displacements alone.
constexpr Procedure kProcedures[] = {
    {kprC_FrequencyStep::Class.Id(), kDensity | kDisplacements},
    {kprC_ImplicitDynamicsStep::Class.Id(), kDensity | kDisplacements},
    {kprC_ExplicitDynamicsStep::Class.Id(), kDensity | kDisplacements},
    {kprC_TempDisplacementDynamicsStep::Class.Id(),
     kDensity | kConductivity | kHeatCapacity | kDisplacements},
    {kprC_SteadyStateDirectStep::Class.Id(), kDensity | kDisplacements},
    {kprC_HeatTransferStep::Class.Id(), kConductivity | kHeatCapacity | kTemperatures},
    {kprC_CoupledTempDisplacementStep::Class.Id(), kConductivity | kHeatCapacity},
    {kprC_CoupledThermalElectricStep::Class.Id(), kConductivity | kHeatCapacity | kTemperatures},
    {kprC_MassDiffusionStep::Class.Id(), kTemperatures},
};

unsigned NeedsOf(const kprC_AnalysisStep& step) {
    unsigned needs = kDisplacements;
    for (const Procedure& procedure : kProcedures) {
        if (procedure.id == step.DynTypeId()) needs = procedure.needs;
    }
    const bool isTransient = step.Response() == kprC_Step::ResponseEnm::TRANSIENT;
    if ((needs & kHeatCapacity) == 0) return needs;
    return isTransient ? needs | kDensity : needs & ~kHeatCapacity;
}

/// Adds the names of the materials whose density or conductivity counts where elements have the section.
void AppendMaterials(const cls_Record& section, std::set<cow_String>& materials) {
    const auto add = [&](const cow_String& name) {
        if (!name.IsEmpty()) materials.insert(name);
    };
    if (const auto* shell = dynamic_cast<const kseC_CompositeShellSection*>(&section)) {
        for (const kseC_CompositeShellLayer& layer : shell->layers) add(layer.materialName);
    } else if (const auto* solid = dynamic_cast<const kseC_CompositeSolidSection*>(&section)) {
        for (const kseC_CompositeSolidLayer& layer : solid->layers) add(layer.materialName);
    } else if (const auto* beam = dynamic_cast<const kseC_BeamSection*>(&section)) {
        if (beam->integration == kseC_BeamSection::IntegrationEnm::DURING_ANALYSIS) add(beam->materialName);
    } else if (dynamic_cast<const kseC_GasketSection*>(&section) == nullptr) {
        if (const auto* plain = dynamic_cast<const kseC_Section*>(&section)) add(plain->MaterialName());
    }
}

std::set<cow_String> MaterialsInUse(const odiK_Model& model) {
    std::set<cow_String> sections;
    const auto addAll = [&](const std::vector<odiK_AttributeInput>& assignments) {
        for (const odiK_AttributeInput& input : assignments) {
            sections.insert(static_cast<const ptoC_SectionAssignment&>(input.record.ConstGet()).sectionName);
        }
    };
    for (const auto& [name, instance] : model.Instances()) {
        if (instance->ownSectionAssignments) {
            addAll(*instance->ownSectionAssignments);
        } else if (!instance->part.IsNull()) {
            addAll(instance->part->attributes.sectionAssignments);
        }
    }
    std::set<cow_String> materials;
    for (const cow_String& name : sections) {
        const cls_Record* section = model.sections.FindRecord(name);
        if (section != nullptr) AppendMaterials(*section, materials);
    }
    return materials;
}

/// How many elements of the instances can't take part in what kind of procedure.
struct ElementCounts {
    explicit ElementCounts(const odiK_Model& model) {
        for (const auto& [name, instance] : model.Instances()) {
            const auto mesh = instance->Mesh();
            if (mesh.IsNull() || !instance->isPartInstance) continue;
            for (const odiK_ElementClass& elements : mesh->Classes()) Add(elements);
        }
    }
    void Add(const odiK_ElementClass& elements) {
        const ddb_ElementFamily* family = ddb_FamilyOf(elements.type.View());
        const auto type = ddb_FindElementType(elements.type.View());
        const bool isBody = family != nullptr && family->dimension > 0 &&
                            family->section != ddb_SectionNeedEnm::NOTHING &&
                            family->section != ddb_SectionNeedEnm::UNKNOWN;
        if (!isBody || !type || family->physics == ddb_PhysicsEnm::OTHER) return;
        if (!type->temperature && type->displacement) {
            structural += elements.NumElements();
            structuralType = elements.type;
        }
        if (type->temperature && !type->displacement) {
            thermal += elements.NumElements();
            thermalType = elements.type;
        }
    }
    long long structural = 0; // without temperatures
    long long thermal = 0;    // without displacements
    cow_String structuralType;
    cow_String thermalType;
};

std::vector<const kloC_Load*> GravityLoads(const odiK_Model& model) {
    std::vector<const kloC_Load*> loads;
    for (const auto& [name, load] : model.loads) {
        if (load.DynTypeId() == kloC_Gravity::TypeId() && !load.suppressed) loads.push_back(&load);
    }
    return loads;
}

class ProcedureCheck {
public:
    ProcedureCheck(const odiK_Model& model, fnd_Sink& sink)
        : model_(model), sink_(sink), materials_(MaterialsInUse(model)), elements_(model),
          gravity_(GravityLoads(model)) {}

    void Run() {
        bool isExplicit = false;
        bool isImplicit = false;
        for (int i = 1; i < model_.steps.Size(); ++i) {
            const auto& step = static_cast<const kprC_AnalysisStep&>(model_.steps.StepAt(i));
            (kprC_IsExplicit(step.DynTypeId()) ? isExplicit : isImplicit) = true;
            if (isExplicit && isImplicit && !told_) {
                told_ = true;
                sink_.Add("mixed-solvers", "/steps/" + std::to_string(i),
                          "found steps of the explicit and of the implicit solver in one job", {},
                          "make two models, the second with an initial state from the first");
            }
            const std::string name = "step " + Quoted(model_.steps.NameAt(i));
            CheckMaterials(NeedsOf(step), name);
            if (!Lacks(kDensity).told && HasGravity(model_.steps.NameAt(i))) {
                CheckMaterials(kDensity, "gravity in " + name);
            }
            CheckElements(NeedsOf(step), "/steps/" + std::to_string(i), name);
        }
    }

private:
    struct Property {
        unsigned need;
        const char* name;
        bool (*isThere)(const kmaC_Material& material);
        bool told = false;
    };

    bool HasGravity(const cow_String& step) const {
        return std::ranges::any_of(
            gravity_, [&](const kloC_Load* load) { return kloC_Load::IsActive(load->Status(step)); });
    }

    Property& Lacks(unsigned need) {
        for (Property& property : properties_) {
            if (property.need == need) return property;
        }
        return properties_[0];
    }

    void CheckMaterials(unsigned needs, const std::string& what) {
        for (Property& property : properties_) {
            if ((needs & property.need) == 0 || property.told) continue;
            property.told = true;
            for (const cow_String& name : materials_) {
                if (!model_.materials.IsMember(name)) continue;
                const kmaC_Material& material = model_.materials.ConstGet(name);
                // What user code brings isn't known.
                if (property.isThere(material) || !material.userMaterial.IsNull()) continue;
                sink_.Add("material-lacks", Place("materials", name),
                          "found no " + std::string(property.name) + ", which " + what + " needs");
            }
        }
    }

    void CheckElements(unsigned needs, const std::string& place, const std::string& step) {
        if ((needs & kTemperatures) != 0 && elements_.structural > 0) {
            Tell(place, step, elements_.structural, elements_.structuralType, "temperatures",
                 "take elements for heat transfer, such as DC3D8 for C3D8");
        }
        if ((needs & kDisplacements) != 0 && elements_.thermal > 0) {
            Tell(place, step, elements_.thermal, elements_.thermalType, "displacements",
                 "take structural elements, such as C3D8 for DC3D8");
        }
    }

    void Tell(const std::string& place, const std::string& step, long long count, const cow_String& type,
              const char* quantity, const char* hint) {
        if (!toldOfElements_.insert(quantity).second) return;
        sink_.Add("element-without-physics", place,
                  step + " solves for " + quantity + ", which " + fnd_Counted(count, "element") +
                      (count == 1 ? " doesn't have (" : " don't have (") + Text(type) + ")",
                  {}, hint);
    }

    const odiK_Model& model_;
    fnd_Sink& sink_;
    std::set<cow_String> materials_;
    ElementCounts elements_;
    std::vector<const kloC_Load*> gravity_;
    bool told_ = false;
    std::set<std::string> toldOfElements_;
    // Each is told of the first step that needs it.
    Property properties_[3] = {
        {kDensity, "density", [](const kmaC_Material& m) { return !m.density.IsNull(); }},
        {kConductivity, "conductivity", [](const kmaC_Material& m) { return !m.conductivity.IsNull(); }},
        {kHeatCapacity, "specific heat", [](const kmaC_Material& m) { return !m.specificHeat.IsNull(); }},
    };
};

} // namespace

void dck_CheckProcedures(const odiK_Model& model, fnd_Sink& sink) {
    ProcedureCheck(model, sink).Run();
}
