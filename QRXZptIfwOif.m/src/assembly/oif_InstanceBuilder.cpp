#include "assembly/oif_InstanceBuilder.h"

#include "base/oif_DataLines.h"
#include "connectors/oif_ConnectorOptions.h"
#include "connectors/oif_ConnectorSection.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "mesh/oif_Element.h"
#include "mesh/oif_Node.h"
#include "mesh/oif_SetName.h"

#include <set>

namespace {

constexpr double kPi = 3.141592653589793;

} // namespace

oif_Instance::oif_Instance(const ddb_PartInstance& instance)
    : name_(instance.name()), partName_(instance.partName()) {
    const cow_List<float> t = instance.transform();
    const gsl_Vector translation(t[0], t[1], t[2]);
    const gsl_Vector rotation(t[3], t[4], t[5]);
    const double angle = rotation.ComputeMagnitude();
    if (translation.ComputeMagnitude() == 0.0 && angle == 0.0) return;
    placement_.FillIdentity();
    gsl_Vector axis(rotation);
    axis.Normalize();
    placement_.AxisRotation(gsl_Point(), axis, angle);
    placement_.SetTranslation(translation);
}

void oif_Instance::Write(utl_Stream& stream) const {
    stream << "*Instance, name=" << qkw_QuorixName(name_, false)
           << ", part=" << qkw_QuorixName(partName_, false) << endl;
    const gsl_Vector translation = placement_.GetTranslation();
    gsl_Point point;
    gsl_Vector axis;
    double angle = 0.0;
    placement_.GetAxisRotation(point, axis, angle);
    const bool turned = angle > gsl_Util::Instance().AngleTolerance();
    // A turn alone still has its line of zeros.
    if (turned || translation.ComputeMagnitude() > gsl_Util::Instance().LengthTolerance()) {
        oif_PrintGeometry(stream, {translation.X(), translation.Y(), translation.Z()});
        stream << endl;
    }
    if (!turned) return;
    const gsl_Point second = point + axis;
    oif_PrintGeometry(
        stream, {point.X(), point.Y(), point.Z(), second.X(), second.Y(), second.Z(), angle * 180.0 / kPi});
    stream << endl;
}

void oif_InstanceBuilder::Build() {
    CreateInstances();
    CreateMesh();
}

void oif_InstanceBuilder::CreateInstances() {
    if (!ModelInfo().V6Format()) return;
    ForEachPartInstance([&](const cow_String& key, const ddb_PartInstance& instance) {
        AddInstanceDefinition(key, oif_Instance(instance));
    });
}

void oif_InstanceBuilder::CreateMesh() {
    ForEachPartInstance([&](const cow_String& key, const ddb_PartInstance& instance) {
        AddInstanceDefinition(key, oif_Node(instance, ModelInfo()));
        AddInstanceDefinition(key, oif_ElementFromMesh(instance, ModelInfo()));
    });
    CreateConnectors();
}

void oif_InstanceBuilder::CreateConnectors() {
    const odiK_Assembly& assembly = Model().Assembly();
    const ptoC_PartAttributeList& orientations = assembly.ConstGetConnectorOrientation();
    const auto orientationOf = [&](const rgnC_Region& region) {
        for (int i = 0; i < orientations.Size(); ++i) {
            if (!(orientations.ConstGet(i).RegionRef() == region)) continue;
            return nex_canDynamicCastRef<ptoC_ConnectorOrientation>(orientations.ConstGet(i), NEX_HERE);
        }
        return ptoC_ConnectorOrientation();
    };
    std::set<cow_String> sectionsDone;
    const ptoC_PartAttributeList& assignments = assembly.ConstGetSectionAssignment();
    for (int i = 0; i < assignments.Size(); ++i) {
        const auto& assignment =
            nex_canDynamicCastRef<ptoC_SectionAssignment>(assignments.ConstGet(i), NEX_HERE);
        const cow_String& name = assignment.SectionName();
        const nex_Context context("section assignment of the assembly", name);
        const rgnC_Region& region = assignment.RegionRef();
        const oif_SetName setName(region, ModelInfo());
        const cow_String printed = setName.UniqueSetName(oif_SetName::regionContext::ASSEMBLY);
        if (!Model().Sections().IsMember(name)) continue;
        const kseC_Section& anySection = Model().Sections().ConstGet(name);
        // Sections of other kinds belong to the instances.
        if (anySection.DynTypeId() != kseC_ConnectorSection::TypeId()) continue;
        if (setName.InstanceName().IsEmpty()) {
            AddAssemblyDefinition(oif_AssemblyElement(region, printed, ModelInfo()));
        }
        const auto& section = nex_canDynamicCastRef<kseC_ConnectorSection>(anySection, NEX_HERE);
        AddAssemblyDefinition(
            oif_NewConnectorSection(name, printed, section, orientationOf(region), ModelInfo()));
        if (sectionsDone.insert(name).second) CreateConnectorBehaviors(name, section);
    }
}

void oif_InstanceBuilder::CreateConnectorBehaviors(const cow_String& name,
                                                   const kseC_ConnectorSection& section) {
    if (kseC_Utils::IsConnectorSectionEmpty(section)) return;
    AddModelDefinition(oif_ConnectorBehavior(name, section.regularize, section.useBehaviorRegularization,
                                             section.regularization, section.extrapolationLinear,
                                             section.integrationExplicit));
    AddModelDefinition(oif_ConnectorConstitutiveReference(section));
    oif_DerivedComponents derived;
    const auto addWithDerived = [&](const auto& keyword) {
        keyword.GetDerivedComponents(derived);
        AddModelDefinition(keyword);
    };
    for (int i = 0; i < section.options.Length(); ++i) {
        const kbeC_ConnectorBehaviorOption& option = section.options[i].ConstGet();
        const unsigned type = option.DynTypeId();
        if (type == kbeC_ConnectorElasticity::TypeId()) {
            AddModelDefinition(oif_ConnectorElasticity(static_cast<const kbeC_ConnectorElasticity&>(option)));
        } else if (type == kbeC_ConnectorDamping::TypeId()) {
            AddModelDefinition(oif_ConnectorDamping(static_cast<const kbeC_ConnectorDamping&>(option)));
        } else if (type == kbeC_ConnectorStop::TypeId()) {
            AddModelDefinition(oif_ConnectorStop(static_cast<const kbeC_ConnectorStop&>(option)));
        } else if (type == kbeC_ConnectorLock::TypeId()) {
            AddModelDefinition(oif_ConnectorLock(static_cast<const kbeC_ConnectorLock&>(option)));
        } else if (type == kbeC_ConnectorFailure::TypeId()) {
            AddModelDefinition(oif_ConnectorFailure(static_cast<const kbeC_ConnectorFailure&>(option)));
        } else if (type == kbeC_ConnectorFriction::TypeId()) {
            addWithDerived(
                oif_ConnectorFriction(static_cast<const kbeC_ConnectorFriction&>(option), ModelInfo(), i));
        } else if (type == kbeC_ConnectorPlasticity::TypeId()) {
            addWithDerived(oif_ConnectorPlasticity(static_cast<const kbeC_ConnectorPlasticity&>(option), i));
        } else if (type == kbeC_ConnectorDamage::TypeId()) {
            addWithDerived(oif_ConnectorDamage(static_cast<const kbeC_ConnectorDamage&>(option), i));
        }
    }
    for (mdl_MapString2ObjCowIT<kbeC_DerivedComponent> it(derived); !it.IsDone(); it.Next()) {
        AddModelDefinition(oif_DerivedComponent(it.CurrentKey(), it.CurrentValue()));
    }
}
