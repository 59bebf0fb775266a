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
    check.Columns("materialTable", section.materialTable, MaterialColumns(section).c_str(),
                  section.dependencies);
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
}
