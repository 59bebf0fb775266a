#ifndef QRX_STORE_ODIK_DATUM_H
#define QRX_STORE_ODIK_DATUM_H

#include "foundation/cow_String.h"
#include "foundation/gsl_Geometry.h"
#include "store_interface/records/cls_Record.h"

struct omu_EnumTable;

enum class dtu_DatumType : int { POINT = 1, AXIS = 2, PLANE = 3, CSYS = 4 };
enum class dtu_DatumCsysType : int { RECTANGULAR = 1, CYLINDRICAL = 2, SPHERICAL = 3 };
const omu_EnumTable& omu_EnumTableOf(dtu_DatumType);
const omu_EnumTable& omu_EnumTableOf(dtu_DatumCsysType);

/// A datum. Axes are unit vectors. A point has an origin; an axis has its direction in xAxis; a plane its
/// normal in zAxis.
struct odiK_Datum : cls_RecordOf<odiK_Datum> {
    static constexpr cls_ClassInfo Class{
        "odiK_Datum", "A coordinate system, point, axis or plane. A csys takes origin and axes, a point its "
                      "origin, an axis "
                      "origin and xAxis (its direction), a plane origin and zAxis (its normal)."};

    cow_String name;
    dtu_DatumType type = dtu_DatumType::CSYS;
    dtu_DatumCsysType csysType = dtu_DatumCsysType::RECTANGULAR;
    gsl_Point origin;
    gsl_Vector xAxis{1.0, 0.0, 0.0};
    gsl_Vector yAxis{0.0, 1.0, 0.0};
    gsl_Vector zAxis{0.0, 0.0, 1.0};
    /// The axes as they were given, kept by AddDatum: normalising twice may change the last bit.
    gsl_Vector givenAxes[3];

    static const cls_FieldTable& Fields();
};

#endif
