#ifndef QRX_STORE_DDB_DATUM_H
#define QRX_STORE_DDB_DATUM_H

#include "store_interface/model/odiK_Datum.h"
#include "store_interface/regions/ddr_Shortcut.h"

/// View on a coordinate system.
class ddb_DatumCsys {
public:
    explicit ddb_DatumCsys(const odiK_Datum& datum) : datum_(datum) {}
    dtu_DatumCsysType GetCsysType() const { return datum_.csysType; }
    const gsl_Point& GetOrigin() const { return datum_.origin; }
    const gsl_Vector& GetXaxis() const { return datum_.xAxis; }
    const gsl_Vector& GetYaxis() const { return datum_.yAxis; }
    const gsl_Vector& GetZaxis() const { return datum_.zAxis; }

private:
    odiK_Datum datum_;
};

/// View on a datum, with data of its own that can be moved.
class ddb_Datum {
public:
    ddb_Datum(int id, const odiK_Datum& datum) : id_(id), datum_(datum) {}
    dtu_DatumType GetDatumType() const { return datum_.type; }
    /// Moves the view's own data; the store's stay.
    void TransformData(const gsl_Matrix& placement);
    /// The datum as a coordinate system; another kind raises.
    ddb_DatumCsys CvtDatumCsys() const;
    ddr_Shortcut Shortcut() const;

private:
    int id_;
    odiK_Datum datum_;
};

#endif
