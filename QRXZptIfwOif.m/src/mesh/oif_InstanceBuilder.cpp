#include "mesh/oif_InstanceBuilder.h"

#include "deck/oif_DataLines.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "mesh/oif_Element.h"
#include "mesh/oif_Node.h"
#include "mesh/oif_SetName.h"

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
    if (!Info().V6Format()) return;
    ForEachPartInstance([&](const cow_String& key, const ddb_PartInstance& instance) {
        AddInstanceDefinition(key, oif_Instance(instance));
    });
}

void oif_InstanceBuilder::CreateMesh() {
    ForEachPartInstance([&](const cow_String& key, const ddb_PartInstance& instance) {
        AddInstanceDefinition(key, oif_Node(instance, ModelInfo()));
        AddInstanceDefinition(key, oif_ElementFromMesh(instance, ModelInfo()));
    });

    const ptoC_PartAttributeList& assignments = Info().View().Assembly().ConstGetSectionAssignment();
    for (int i = 0; i < assignments.Size(); ++i) {
        const auto& assignment =
            nex_canDynamicCastRef<ptoC_SectionAssignment>(assignments.ConstGet(i), NEX_HERE);
        const nex_Context context("section assignment of the assembly", assignment.SectionName());
        oif_SetName setName(assignment.RegionRef(), ModelInfo());
        const cow_String printed = setName.UniqueSetName(oif_SetName::regionContext::ASSEMBLY);
        if (!Model().Sections().IsMember(assignment.SectionName())) continue;
        // Sections of other kinds belong to the instances.
        if (Model().Sections().ConstGet(assignment.SectionName()).DynTypeId() !=
            kseC_ConnectorSection::TypeId()) {
            continue;
        }
        if (setName.InstanceName().IsEmpty()) {
            AddAssemblyDefinition(oif_AssemblyElement(assignment.RegionRef(), printed, Info()));
        }
    }
}
