#ifndef QRX_OIF_ORIENTATION_H
#define QRX_OIF_ORIENTATION_H

#include "keyword_layer/qkw_Keyword.h"
#include "sections/oif_DatumCsys.h"
#include "store_interface/records/part_attributes/ptoC_PartAttribute.h"

/// A local system for the degrees of freedom of a node set:
///     *Transform, nset=NAME, type=C
///     six values
/// Without a system it writes nothing.
class oif_Transform final : public qkw_KeywordOf<oif_Transform> {
public:
    oif_Transform(const ddb_Model& model, const dtmC_DatumRef& datum, const cow_String& nset)
        : nset_(nset), csys_(model, datum, gsl_Matrix()) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String nset_;
    oif_DatumCsys csys_;
};

/// A named orientation:
///     *Orientation, name=NAME, system=CYLINDRICAL
///     six values
///     3, angle                 axis and angle (degrees) of an additional rotation, if asked for
/// The name goes out as it stands. Without a system it writes nothing.
class oif_Orientation final : public qkw_KeywordOf<oif_Orientation> {
public:
    /// One that a user subroutine defines: *Orientation, name=NAME, system=user
    explicit oif_Orientation(const cow_String& name) : name_(name) {}
    oif_Orientation(const ddb_Model& model, const dtmC_DatumRef& datum, const cow_String& name,
                    bool withRotation, double angle, ptoC_MaterialOrientation::axisEnm axis)
        : csys_(new oif_DatumCsys(model, datum, gsl_Matrix())), name_(name), axis_(axis), angle_(angle),
          withRotation_(withRotation) {}
    /// `placement` is that of the instance which the record belongs to.
    oif_Orientation(const ddb_Model& model, const ptoC_MaterialOrientation& orientation,
                    const cow_String& name, const gsl_Matrix& placement)
        : csys_(new oif_DatumCsys(model, orientation.datum, placement)), name_(name), axis_(orientation.axis),
          angle_(orientation.angle), withRotation_(true) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_COW<oif_DatumCsys, cow_Direct<oif_DatumCsys>> csys_;
    cow_String name_;
    ptoC_MaterialOrientation::axisEnm axis_ = ptoC_MaterialOrientation::axisEnm::AXIS_1;
    double angle_ = 0.0;
    bool withRotation_ = false;
};

#endif
