#ifndef QRX_STORE_PTOC_PARTATTRIBUTE_H
#define QRX_STORE_PTOC_PARTATTRIBUTE_H

#include "store_interface/regions/rgnC_Region.h"

class cls_ClassRegistrar;

/// What is assigned to a region of an instance or of the assembly.
class ptoC_PartAttribute : public cls_AbstractRecordOf<ptoC_PartAttribute> {
public:
    static constexpr cls_ClassInfo Class{"ptoC_PartAttribute", "something assigned to a region"};

    rgnC_Region region;
    const rgnC_Region& RegionRef() const { return region; }

    static const cls_FieldTable& Fields();
};

/// Gives a section to the elements of a region.
class ptoC_SectionAssignment final : public cls_RecordOf<ptoC_SectionAssignment, ptoC_PartAttribute> {
public:
    static constexpr cls_ClassInfo Class{"ptoC_SectionAssignment",
                                         "gives a section to the elements of a region"};

    cow_String sectionName;
    /// Distance of a shell's reference surface from its mid-surface, as a fraction of the thickness.
    double offset = 0.0;
    const cow_String& SectionName() const { return sectionName; }
    double Offset() const { return offset; }

    static const cls_FieldTable& Fields();
};

/// Gives a material orientation to the elements of a region.
class ptoC_MaterialOrientation final : public cls_RecordOf<ptoC_MaterialOrientation, ptoC_PartAttribute> {
public:
    static constexpr cls_ClassInfo Class{"ptoC_MaterialOrientation",
                                         "gives a material orientation to the elements of a region"};

    /// Axis of an additional rotation.
    enum class axisEnm : int { AXIS_1 = 0, AXIS_2 = 1, AXIS_3 = 2 };

    dtmC_DatumRef datum;
    axisEnm axis = axisEnm::AXIS_1;
    /// Degrees.
    double angle = 0.0;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(ptoC_MaterialOrientation::axisEnm);

/// Gives the beam elements of a region the direction of their first cross-section axis.
class ptoC_BeamOrientation final : public cls_RecordOf<ptoC_BeamOrientation, ptoC_PartAttribute> {
public:
    static constexpr cls_ClassInfo Class{
        "ptoC_BeamOrientation",
        "gives the beams of a region the direction of their first cross-section axis"};

    gsl_Vector vector{0.0, 0.0, -1.0};

    static const cls_FieldTable& Fields();
};

/// Gives the two ends of the connectors of a region their orientations. A default one gives none.
class ptoC_ConnectorOrientation final : public cls_RecordOf<ptoC_ConnectorOrientation, ptoC_PartAttribute> {
public:
    static constexpr cls_ClassInfo Class{
        "ptoC_ConnectorOrientation", "gives the two ends of the connectors of a region their orientations"};

    /// By which connector sections name the orientation. The store gives one without a name "ConnOri-" and
    /// the place in the assembly's list, from 0; only under that name orientations are defined.
    cow_String name;
    dtmC_DatumRef csys1;
    ptoC_MaterialOrientation::axisEnm axis1 = ptoC_MaterialOrientation::axisEnm::AXIS_1;
    double angle1 = 0.0;
    bool orient2sameAs1 = false;
    dtmC_DatumRef csys2;
    ptoC_MaterialOrientation::axisEnm axis2 = ptoC_MaterialOrientation::axisEnm::AXIS_1;
    double angle2 = 0.0;

    const cow_String& Name() const { return name; }
    const dtmC_DatumRef& ConstGetCsys1() const { return csys1; }
    ptoC_MaterialOrientation::axisEnm ConstGetAxis1() const { return axis1; }
    double ConstGetAngle1() const { return angle1; }
    const dtmC_DatumRef& ConstGetCsys2() const { return csys2; }
    ptoC_MaterialOrientation::axisEnm ConstGetAxis2() const { return axis2; }
    double ConstGetAngle2() const { return angle2; }

    static const cls_FieldTable& Fields();
};

/// Part attributes in order, reached by index from 0.
class ptoC_PartAttributeList {
public:
    int Size() const { return items_.Length(); }
    /// An index outside the list raises.
    const ptoC_PartAttribute& ConstGet(int index) const { return items_[index].ConstGet(); }
    void Append(const ptoC_PartAttribute& attribute) {
        items_.Append(mdl_ObjCow<ptoC_PartAttribute>(attribute));
    }

    static const ptoC_PartAttribute& ItemAt(const ptoC_PartAttributeList& list, int index) {
        return list.items_.UncheckedConstGet(index).ConstGet();
    }
    using ConstIterator = cow_IndexIterator<ptoC_PartAttributeList, &ItemAt>;
    ConstIterator begin() const { return {*this, 0}; }
    ConstIterator end() const { return {*this, Size()}; }

private:
    cow_List<mdl_ObjCow<ptoC_PartAttribute>> items_;
};

void cls_RegisterPartAttributeRecords(cls_ClassRegistrar& registrar);

#endif
