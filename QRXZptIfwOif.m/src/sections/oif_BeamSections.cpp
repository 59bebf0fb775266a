#include "sections/oif_BeamSections.h"

#include "base/oif_ClassRows.h"
#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "materials/oif_MaterialTable.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <initializer_list>

namespace {

using Integration = kseC_BeamSection::IntegrationEnm;

bool IsGiven(double value) {
    return value != cls_UnsetDouble && value != 0.0;
}

void WriteValues(utl_Stream& stream, std::initializer_list<double> values) {
    const char* separator = "";
    for (const double value : values) {
        stream << separator << value;
        separator = ", ";
    }
}

void WriteSimple(utl_Stream& stream, const char* parameter, std::initializer_list<double> values) {
    stream.OptionalLineBreak();
    stream << parameter;
    stream.LineBreak();
    WriteValues(stream, values);
    stream.LineBreak();
}

void WriteProfileOf(utl_Stream& stream, const kbpC_CircularProfile& p) {
    WriteSimple(stream, "section=CIRC", {p.r});
}

void WriteProfileOf(utl_Stream& stream, const kbpC_HexagonalProfile& p) {
    WriteSimple(stream, "section=HEX", {p.r, p.t});
}

void WriteProfileOf(utl_Stream& stream, const kbpC_PipeProfile& p) {
    WriteSimple(stream, "section=PIPE", {p.r, p.t});
}

void WriteProfileOf(utl_Stream& stream, const kbpC_IbeamProfile& p) {
    WriteSimple(stream, "section=I", {p.l, p.h, p.b1, p.b2, p.t1, p.t2, p.t3});
}

void WriteProfileOf(utl_Stream& stream, const kbpC_BoxProfile& p) {
    if (p.uniformThickness) {
        WriteSimple(stream, "section=BOX", {p.a, p.b, p.t1, p.t1, p.t1, p.t1});
    } else {
        WriteSimple(stream, "section=BOX", {p.a, p.b, p.t1, p.t2, p.t3, p.t4});
    }
}

void WriteProfileOf(utl_Stream& stream, const kbpC_ArbitraryProfile& p) {
    const auto at = [&p](int row, int column) { return p.table.ConstGet(row, column); };
    stream.OptionalLineBreak();
    stream << "section=ARBITRARY";
    stream.LineBreak();
    const int segments = p.table.NumRows() - 1;
    stream << segments << ", ";
    WriteValues(stream, {at(0, 0), at(0, 1), at(1, 0), at(1, 1), at(1, 2)});
    stream.LineBreak();
    for (int i = 2; i <= segments; ++i) {
        WriteValues(stream, {at(i, 0), at(i, 1), at(i, 2)});
        stream.LineBreak();
    }
    // Behind a single segment stands an empty line.
    if (segments == 1) stream.LineBreak();
}

void WriteProfileOf(utl_Stream& stream, const kbpC_RectangularProfile& p) {
    WriteSimple(stream, "section=RECT", {p.a, p.b});
}

void WriteProfileOf(utl_Stream& stream, const kbpC_LbeamProfile& p) {
    WriteSimple(stream, "section=L", {p.a, p.b, p.t1, p.t2});
}

// Solvers have no T: an I without its bottom flange.
void WriteProfileOf(utl_Stream& stream, const kbpC_TbeamProfile& p) {
    WriteSimple(stream, "section=I", {p.l, p.h, 0.0, p.b, 0.0, p.tf, p.tw});
}

void WriteProfileOf(utl_Stream& stream, const kbpC_TrapezoidalProfile& p) {
    WriteSimple(stream, "section=TRAPEZOID", {p.a, p.b, p.c, p.d});
}

struct ProfileRow {
    unsigned typeId;
    void (*write)(utl_Stream& stream, const kbpC_BeamProfile& profile);

    template <class Profile>
    static constexpr ProfileRow Of() {
        return {Profile::Class.Id(), [](utl_Stream& stream, const kbpC_BeamProfile& profile) {
                    WriteProfileOf(stream, static_cast<const Profile&>(profile));
                }};
    }
};

/// The profiles whose line is the same in both kinds of beam sections.
constexpr ProfileRow kProfiles[] = {
    ProfileRow::Of<kbpC_CircularProfile>(),    ProfileRow::Of<kbpC_HexagonalProfile>(),
    ProfileRow::Of<kbpC_PipeProfile>(),        ProfileRow::Of<kbpC_IbeamProfile>(),
    ProfileRow::Of<kbpC_BoxProfile>(),         ProfileRow::Of<kbpC_ArbitraryProfile>(),
    ProfileRow::Of<kbpC_RectangularProfile>(), ProfileRow::Of<kbpC_LbeamProfile>(),
    ProfileRow::Of<kbpC_TbeamProfile>(),       ProfileRow::Of<kbpC_TrapezoidalProfile>(),
};

void WriteFluidInertia(utl_Stream& stream, const kseC_BeamSection& section) {
    stream << "*Beam Fluid Inertia";
    if (section.fluidInertiaHalf == kseC_BeamSection::FluidInertiaEnm::HALF) stream << ", half";
    stream.LineBreak();
    stream << section.fluidValue1 << ", ";
    if (section.fluidValue5 != 0.0) stream << section.fluidValue5;
    stream << ", ";
    if (section.fluidValue6 != 0.0) stream << section.fluidValue6;
    stream << ", " << section.fluidValue2;
    if (section.fluidValue3 != 1.0 || section.fluidValue4 != 0.0) {
        stream << ", ";
        if (section.fluidValue3 != 1.0) stream << section.fluidValue3;
        if (section.fluidValue4 != 0.0) stream << ", " << section.fluidValue4;
    }
    stream.LineBreak();
}

void WritePoint(utl_Stream& stream, const char* keyword, const cow_List<double>& point) {
    const double x = point.Length() > 0 ? point[0] : 0.0;
    const double y = point.Length() > 1 ? point[1] : 0.0;
    if (x == 0.0 && y == 0.0) return;
    stream << keyword;
    stream.LineBreak();
    stream << x << ", " << y << endl;
}

void WriteDamping(utl_Stream& stream, const kseC_BeamSection& section) {
    if (section.alphaDamping == 0.0 && section.betaDamping == 0.0 && section.compositeDamping == 0.0) return;
    oif_KeywordLine line(stream, "*Damping");
    if (section.alphaDamping != 0.0) line.Fixed(", alpha=", section.alphaDamping).MayBreak();
    if (section.betaDamping != 0.0) line.Fixed(", beta=", section.betaDamping).MayBreak();
    line.FixedUnless(", composite=", section.compositeDamping, 0.0).End();
}

void WriteSectionPoints(utl_Stream& stream, const cow_2DArray<double>& points) {
    constexpr int kPointsOfLine = 4;
    if (points.NumRows() == 0) return;
    stream << "*Section Points";
    for (int i = 0; i < points.NumRows(); ++i) {
        if (i % kPointsOfLine == 0) {
            stream.LineBreak();
        } else {
            stream << ", ";
        }
        WriteValues(stream, {points.ConstGet(i, 0), points.ConstGet(i, 1)});
    }
    stream.LineBreak();
}

} // namespace

void oif_BeamSectionCommon::WriteData(utl_Stream& stream) const {
    if (section_->DynTypeId() != kseC_BeamSection::TypeId()) return;
    const auto& section = nex_canDynamicCastRef<kseC_BeamSection>(section_.ConstGet(), NEX_HERE);
    const bool isGeneral = section.integration == Integration::BEFORE_ANALYSIS;
    oif_KeywordLine line(stream, keyword_);
    // Each parameter brings the comma behind it.
    line.Fixed(", elset=", setName_).Separator();
    if (section.integration == Integration::DURING_ANALYSIS) {
        WriteMaterialBehavior(stream, section);
        stream.OptionalLineBreak();
    }
    if (isGeneral) {
        // This one has a comma ahead too, so that two stand side by side.
        line.FixedIf(section.dependencies > 0, ", dependencies=", section.dependencies)
            .FixedIf(section.dependencies > 0, ", ")
            .MayBreak();
    }
    if (IsGiven(section.poisson)) stream << "poisson = " << section.poisson << ", ";
    stream.OptionalLineBreak();
    WriteTempData(stream, section);
    stream.OptionalLineBreak();
    if (isGeneral) {
        WriteDensity(stream, section);
        stream.OptionalLineBreak();
    }
    WriteProfile(stream);
    stream << direction_.X() << "," << direction_.Y() << "," << direction_.Z();
    stream.LineBreak();
    if (isGeneral) WriteMaterialBehavior(stream, section);
    if (section.useFluidInertia) WriteFluidInertia(stream, section);
    WriteOptions(stream, section);
}

void oif_BeamSectionCommon::WriteProfile(utl_Stream& stream) const {
    stream.OptionalLineBreak();
    const kbpC_BeamProfile& profile = profile_.ConstGet();
    if (profile.DynTypeId() == kbpC_GeneralizedProfile::TypeId()) {
        WriteGeneralizedProfile(stream, nex_canDynamicCastRef<kbpC_GeneralizedProfile>(profile, NEX_HERE));
    } else if (const ProfileRow* row = oif_FindRow(kProfiles, profile.DynTypeId())) {
        row->write(stream, profile);
    } else {
        stream.LineBreak();
    }
}

void oif_BeamSectionCommon::WriteGeneralizedProfile(utl_Stream& stream,
                                                    const kbpC_GeneralizedProfile&) const {
    stream.LineBreak();
}

void oif_BeamSection::WriteTempData(utl_Stream& stream, const kseC_BeamSection& section) const {
    using TemperatureVar = kseC_BeamSection::TemperatureVarEnm;
    if (section.temperatureVar == TemperatureVar::GRADIENTS) stream << "temperature=GRADIENTS, ";
    if (section.temperatureVar == TemperatureVar::VALUES) stream << "temperature=VALUES, ";
}

void oif_BeamSection::WriteMaterialBehavior(utl_Stream& stream, const kseC_BeamSection& section) const {
    stream << "material=" << qkw_QuorixName(section.materialName, false) << ", ";
}

void oif_BeamGeneralSection::WriteDensity(utl_Stream& stream, const kseC_BeamSection& section) const {
    if (IsGiven(section.density)) stream << "density=" << section.density << ", ";
}

void oif_BeamGeneralSection::WriteTempData(utl_Stream& stream, const kseC_BeamSection& section) const {
    if (IsGiven(section.referenceTemperature)) stream << "zero=" << section.referenceTemperature << ", ";
}

void oif_BeamGeneralSection::WriteMaterialBehavior(utl_Stream& stream,
                                                   const kseC_BeamSection& section) const {
    oif_MaterialTable table(section.materialTable, 0, false);
    if (!section.temperatureDependency) table.InsertEmptyColumn(2);
    if (!section.useFieldColumn) table.InsertEmptyColumn(3);
    table.Print(stream);
}

void oif_BeamGeneralSection::WriteGeneralizedProfile(utl_Stream& stream,
                                                     const kbpC_GeneralizedProfile& p) const {
    stream.OptionalLineBreak();
    stream << "section=GENERAL";
    stream.LineBreak();
    WriteValues(stream, {p.area, p.i11, p.i12, p.i22, p.j});
    if (p.gammaO != 0.0 || p.gammaW != 0.0) stream << ", " << p.gammaO << ", " << p.gammaW;
    stream.LineBreak();
}

void oif_BeamGeneralSection::WriteOptions(utl_Stream& stream, const kseC_BeamSection& section) const {
    WriteDamping(stream, section);
    WritePoint(stream, "*Shear Center", section.shearCenter);
    WritePoint(stream, "*Centroid", section.centroid);
    WriteSectionPoints(stream, section.sectionPoints);
}
