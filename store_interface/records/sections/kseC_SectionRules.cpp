#include "store_interface/findings/fnd_RecordRules.h"
#include "store_interface/findings/fnd_Text.h"

#include "store_interface/records/sections/kbpC_BeamProfile.h"
#include "store_interface/records/sections/kseC_BeamSection.h"
#include "store_interface/records/sections/kseC_ShellSections.h"
#include "store_interface/records/sections/kseC_SolidSections.h"

namespace {

std::string MaterialColumns(const kseC_BeamSection& section) {
    std::string names = "Young's modulus, torsional shear modulus";
    if (section.temperatureDependency) names += ", the cell of temperatureDependency";
    if (section.useFieldColumn) names += ", the cell of useFieldColumn";
    return names;
}

void CheckBeam(const kseC_BeamSection& section, fnd_RecordCheck& check) {
    check.NotNegative("dependencies", section.dependencies);
    check.Columns("sectionPoints", section.sectionPoints, "x, y");
    if (section.integration != kseC_BeamSection::IntegrationEnm::BEFORE_ANALYSIS) {
        if (section.materialName.IsEmpty()) {
            check.Add("missing-field", "materialName", "found nothing",
                      "the material of a section integrated during the analysis");
        }
        return;
    }
    if (section.materialTable.IsEmpty()) {
        check.Add("beam-without-moduli", "materialTable", "found no row",
                  MaterialColumns(section) + ": a section integrated before the analysis takes no others");
    }
    check.Columns("materialTable", section.materialTable, MaterialColumns(section).c_str(),
                  section.dependencies);
}

template <class Record>
void CheckThickness(const Record& record, fnd_RecordCheck& check) {
    check.Positive("thickness", record.thickness);
}

void CheckArea(const kseC_TrussSection& section, fnd_RecordCheck& check) {
    check.Positive("area", section.area);
}

void CheckRebar(const kseC_RebarLayer& layer, fnd_RecordCheck& check) {
    check.Positive("area", layer.area);
}

/// What may be zero: the distance of an I's origin from its lower edge, and of a trapezoid's from its base;
/// the wall of a hexagon or box that is given by its first; integrals of a profile but for its area.
bool MayBeZero(const kbpC_BeamProfile& profile, std::string_view field) {
    if (profile.DynTypeId() == kbpC_GeneralizedProfile::TypeId()) return field != "area";
    const auto* box = dynamic_cast<const kbpC_BoxProfile*>(&profile);
    if (box != nullptr && box->uniformThickness) return field == "t2" || field == "t3" || field == "t4";
    const bool isTrapezoid = profile.DynTypeId() == kbpC_TrapezoidalProfile::TypeId();
    return field == "l" || (isTrapezoid && field == "d");
}

void CheckProfile(const kbpC_BeamProfile& profile, fnd_RecordCheck& check) {
    for (const cls_Field& field : profile.DynFields().All()) {
        if (field.type->Kind() != cls_FieldKind::Double || MayBeZero(profile, field.name)) continue;
        check.Positive(field.name, *static_cast<const double*>(field.In(profile)));
    }
}

void CheckShell(const kseC_GeometryShellSection& shell, fnd_RecordCheck& check) {
    check.NotNegative("temperaturePoints", shell.temperaturePoints);
}

template <class Record>
void CheckIntegrationPoints(const Record& record, fnd_RecordCheck& check) {
    check.NotNegative("integrationPoints", record.integrationPoints);
}

template <class Shell>
void CheckGeneralShell(const Shell&, fnd_RecordCheck& check) {
    check.Add("cannot-be-written", "class",
              "found a shell of which no deck can be written: where elements have it, writing "
              "fails with \"Shell general section unimplemented\"");
}

void CheckArbitraryProfile(const kbpC_ArbitraryProfile& profile, fnd_RecordCheck& check) {
    check.Columns("table", profile.table, "x, y, thickness");
    const int rows = profile.table.NumRows();
    if (rows < 2) {
        check.Add("table-rows", "table", "found " + fnd_Counted(rows, "row"),
                  "at least 2, the ends of a segment");
    }
}

} // namespace

void fnd_AddSectionRules(fnd_RecordRules& rules) {
    rules.Add<CheckBeam>();
    rules.Add<CheckShell>();
    rules.Add<CheckIntegrationPoints<kseC_HomogenousShellSection>>();
    rules.Add<CheckIntegrationPoints<kseC_CompositeShellLayer>>();
    rules.Add<CheckIntegrationPoints<kseC_CompositeSolidLayer>>();
    rules.Add<CheckGeneralShell<kseC_GeneralShellSection>>();
    rules.Add<CheckGeneralShell<kseC_UserShellSection>>();
    rules.Add<CheckArbitraryProfile>();
    rules.Add<CheckThickness<kseC_HomogenousShellSection>>();
    rules.Add<CheckThickness<kseC_CompositeShellLayer>>();
    rules.Add<CheckThickness<kseC_HomogenousSolidSection>>();
    rules.Add<CheckThickness<kseC_CompositeSolidLayer>>();
    rules.Add<CheckThickness<kseC_MembraneSection>>();
    rules.Add<CheckArea>();
    rules.Add<CheckRebar>();
    rules.Add<CheckProfile>();
}
