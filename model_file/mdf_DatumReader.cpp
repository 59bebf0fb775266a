#include "model_file/mdf_DatumReader.h"

#include <cmath>

void mdf_DatumReader::ReadDatums(const mdf_Value& json, const fnd_Path& path) {
    if (!json.IsArray()) {
        diagnostics_.Expected(path, json, "an array of datums");
        return;
    }
    mdf_CapitalsCheck capitals;
    for (std::size_t i = 0; i < json.Size(); ++i) ReadDatum(json.Item(i), fnd_Path(path, i), capitals);
}

void mdf_DatumReader::ReadDatum(const mdf_Value& json, const fnd_Path& path, mdf_CapitalsCheck& capitals) {
    const int errorsBefore = diagnostics_.NumErrors();
    odiK_Datum datum;
    records_.ReadRecord(datum, json, path);
    if (datum.name.IsEmpty()) return;
    const std::string name(datum.name.View());
    const fnd_Path namePath(path, "name");
    capitals.Enter(name, namePath, "datum", diagnostics_);
    if (!model_.FindDatum(datum.name).IsNullRef()) {
        diagnostics_.Add("duplicate-name", namePath, "found a second datum named " + fnd_Quoted(name),
                         "names that are unique");
    }
    // The third axis of a coordinate system follows from the others unless it is given.
    const bool zGiven = json.Find("zAxis") != nullptr;
    if (!zGiven && datum.type == dtu_DatumType::CSYS) datum.zAxis = gsl_Vector();
    if (diagnostics_.NumErrors() == errorsBefore && CheckAxes(datum, zGiven, path)) {
        model_.AddDatum(datum);
    } else {
        records_.References().NoteWrong(name);
    }
}

bool mdf_DatumReader::CheckAxes(const odiK_Datum& datum, bool zGiven, const fnd_Path& path) {
    const bool csys = datum.type == dtu_DatumType::CSYS;
    const auto check = [&](bool used, const char* member, gsl_Vector& axis) {
        const double length = axis.ComputeMagnitude();
        const bool good = length > 0.0 && std::isfinite(length);
        if (used && !good) {
            diagnostics_.Add("no-direction-csys", fnd_Path(path, std::string_view(member)),
                             std::string("found a direction ") +
                                 (length > 0.0 ? "whose length is beyond double precision" : "of no length"),
                             "one with a length");
        }
        axis.Normalize();
        return good || !used;
    };
    gsl_Vector x = datum.xAxis;
    gsl_Vector y = datum.yAxis;
    gsl_Vector z = datum.zAxis;
    bool good = check(csys || datum.type == dtu_DatumType::AXIS, "xAxis", x);
    good = check(csys, "yAxis", y) && good;
    good = check(zGiven && (csys || datum.type == dtu_DatumType::PLANE), "zAxis", z) && good;
    if (good && csys && !(gsl_Cross(x, y).ComputeMagnitude() > gsl_Util::Instance().AngleTolerance())) {
        diagnostics_.Add("no-direction-csys", fnd_Path(path, "yAxis"), "found a direction parallel to xAxis",
                         "one that is not");
        good = false;
    }
    return good;
}
