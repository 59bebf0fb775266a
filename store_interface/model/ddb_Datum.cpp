#include "store_interface/model/ddb_Datum.h"

#include "foundation/nex_Exception.h"

void ddb_Datum::TransformData(const gsl_Matrix& placement) {
    datum_.origin = placement.Apply(datum_.origin);
    datum_.xAxis = placement.Apply(datum_.xAxis);
    datum_.yAxis = placement.Apply(datum_.yAxis);
    datum_.zAxis = placement.Apply(datum_.zAxis);
}

ddb_DatumCsys ddb_Datum::CvtDatumCsys() const {
    if (datum_.type != dtu_DatumType::CSYS) {
        const std::string text = "datum '" + std::string(datum_.name.View()) + "' is no coordinate system";
        nex_Raise(atr_String(std::string_view(text)));
    }
    return ddb_DatumCsys(datum_);
}

ddr_Shortcut ddb_Datum::Shortcut() const {
    return {cow_String("datum[") + cow_String(id_) + "]", datum_.name};
}
