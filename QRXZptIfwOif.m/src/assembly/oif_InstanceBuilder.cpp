#include "assembly/oif_InstanceBuilder.h"

#include "base/oif_DataLines.h"
#include "base/oif_KeywordLine.h"
#include "connectors/oif_ConnectorBehaviorRow.h"
#include "connectors/oif_ConnectorSection.h"
#include "mesh/oif_Element.h"
#include "mesh/oif_Node.h"
#include "mesh/oif_SetName.h"
#include "store_interface/model/odiK_Assembly.h"

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
    oif_KeywordLine(stream, "*Instance")
        .Fixed(", name=", qkw_QuorixName(name_, false))
        .Fixed(", part=", qkw_QuorixName(partName_, false))
        .End();
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
        for (const ptoC_PartAttribute& orientation : orientations) {
            if (!(orientation.RegionRef() == region)) continue;
            return nex_canDynamicCastRef<ptoC_ConnectorOrientation>(orientation, NEX_HERE);
        }
        return ptoC_ConnectorOrientation();
    };
    std::set<cow_String> sectionsDone;
    for (const ptoC_PartAttribute& attribute : assembly.ConstGetSectionAssignment()) {
        const auto& assignment = nex_canDynamicCastRef<ptoC_SectionAssignment>(attribute, NEX_HERE);
        const cow_String& name = assignment.SectionName();
        const nex_Context context("section assignment of the assembly", name);
        const rgnC_Region& region = assignment.RegionRef();
        const oif_SetName setName(region, ModelInfo());
        const cow_String printed = setName.UniqueSetName(oif_SetName::regionContext::ASSEMBLY);
        if (!Model().Sections().IsMember(name)) continue;
        const auto* section =
            nex_canDynamicCastPtr<kseC_ConnectorSection>(&Model().Sections().ConstGet(name));
        // Sections of other kinds belong to the instances.
        if (section == nullptr) continue;
        if (setName.InstanceName().IsEmpty()) {
            AddAssemblyDefinition(oif_AssemblyElement(region, printed, ModelInfo()));
        }
        AddAssemblyDefinition(
            oif_NewConnectorSection(name, printed, *section, orientationOf(region), ModelInfo()));
        if (!sectionsDone.insert(name).second) continue;
        for (const qkw_KeywordHandle& keyword : oif_ConnectorBehaviorKeywords(name, *section, ModelInfo())) {
            AddModelDefinition(keyword.ConstGet());
        }
    }
}
