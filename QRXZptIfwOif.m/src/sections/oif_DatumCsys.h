#ifndef QRX_OIF_DATUMCSYS_H
#define QRX_OIF_DATUMCSYS_H

#include "foundation/utl_Stream.h"
#include "store_interface/model/ddb_Model.h"

/// What a datum that is no coordinate system raises where a deck needs one.
inline constexpr char oif_kDatumError[] = "Wrong datum type during input generation";

/// A coordinate system of the model as the deck states it. A rectangular one is given by its x and y axis as
/// vectors, a cylindrical or spherical one by two points of its z axis.
class oif_DatumCsys {
public:
    /// `placement` moves a system that lies in an instance. The null reference leaves the system undefined; a
    /// datum of another kind raises.
    oif_DatumCsys(const ddb_Model& model, const dtmC_DatumRef& reference, gsl_Matrix placement);

    /// Writes the keyword line, which begins with `head`, and the data line. False when there is no data
    /// line: nothing is written of an undefined system, and only the head, its line left open, of an unknown
    /// type.
    bool Write(utl_Stream& stream, const cow_String& head, bool forTransform) const;

private:
    bool defined_ = false;
    gsl_Point origin_;
    gsl_Vector xAxis_{1.0, 0.0, 0.0};
    gsl_Vector yAxis_{0.0, 1.0, 0.0};
    gsl_Vector zAxis_{0.0, 0.0, 1.0};
    dtu_DatumCsysType type_ = dtu_DatumCsysType::RECTANGULAR;
    double smallReal_ = 1e-15;
};

#endif
