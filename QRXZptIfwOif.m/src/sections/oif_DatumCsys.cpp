#include "sections/oif_DatumCsys.h"

#include "base/oif_DataLines.h"
#include "foundation/nex_Exception.h"

oif_DatumCsys::oif_DatumCsys(const ddb_Model& model, const dtmC_DatumRef& reference, gsl_Matrix placement) {
    if (reference.Id() == 0) return;
    ddb_Datum datum = model.datum(reference.Id());
    if (datum.GetDatumType() != dtu_DatumType::CSYS) nex_Raise(oif_kDatumError);
    if (!placement.IsIdentity()) datum.TransformData(placement);
    const ddb_DatumCsys csys = datum.CvtDatumCsys();
    origin_ = csys.GetOrigin();
    xAxis_ = csys.GetXaxis();
    yAxis_ = csys.GetYaxis();
    zAxis_ = csys.GetZaxis();
    type_ = csys.GetCsysType();
    defined_ = true;
}

bool oif_DatumCsys::Write(utl_Stream& stream, const cow_String& head, bool forTransform) const {
    if (!defined_) return false;
    stream << head;
    const auto parameter = [&](const char* ofTransform, const char* ofOrientation) {
        stream << ", ";
        stream.OptionalLineBreak();
        stream << (forTransform ? ofTransform : ofOrientation);
    };
    switch (type_) {
    case dtu_DatumCsysType::RECTANGULAR: break;
    case dtu_DatumCsysType::CYLINDRICAL: parameter("type=C", "system=CYLINDRICAL"); break;
    case dtu_DatumCsysType::SPHERICAL: parameter("type=S", "system=SPHERICAL"); break;
    default: return false;
    }
    stream << endl;
    const utl_StreamSmallReal guard(stream, smallReal_);
    if (type_ == dtu_DatumCsysType::RECTANGULAR) {
        // Axes as they are, not points: the origin of a rectangular system never reaches the deck.
        oif_PrintGeometry(stream, {xAxis_.X(), xAxis_.Y(), xAxis_.Z(), yAxis_.X(), yAxis_.Y(), yAxis_.Z()});
    } else {
        const gsl_Point second = origin_ + zAxis_;
        oif_PrintGeometry(stream,
                          {origin_.X(), origin_.Y(), origin_.Z(), second.X(), second.Y(), second.Z()});
    }
    stream << endl;
    return true;
}
