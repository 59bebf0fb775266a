#include "model_file/checks/mdf_RecordChecks.h"

#include "store_interface/records/interactions/kinC_ActuatorSensor.h"
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

void CheckBeam(const kseC_BeamSection& section, mdf_RecordCheck& check) {
    check.NotNegative("dependencies", section.dependencies);
    check.Columns("sectionPoints", section.sectionPoints, "x, y");
    if (section.integration != kseC_BeamSection::IntegrationEnm::BEFORE_ANALYSIS) {
        if (section.materialName.IsEmpty()) {
            check.Error("materialName",
                        "found nothing, expected the material of a section integrated during the analysis");
        }
        return;
    }
    check.Columns("materialTable", section.materialTable, MaterialColumns(section).c_str(),
                  section.dependencies);
}

void CheckShell(const kseC_GeometryShellSection& shell, mdf_RecordCheck& check) {
    check.NotNegative("temperaturePoints", shell.temperaturePoints);
}

template <class Record>
void CheckIntegrationPoints(const Record& record, mdf_RecordCheck& check) {
    check.NotNegative("integrationPoints", record.integrationPoints);
}

template <class Shell>
void CheckGeneralShell(const Shell&, mdf_RecordCheck& check) {
    check.Warning("class", "found a shell of which no deck can be written: where elements have it, writing "
                           "fails with \"Shell general section unimplemented\"");
}

void CheckArbitraryProfile(const kbpC_ArbitraryProfile& profile, mdf_RecordCheck& check) {
    check.Columns("table", profile.table, "x, y, thickness");
    const int rows = profile.table.NumRows();
    if (rows < 2) {
        check.Error("table", "found " + std::to_string(rows) + (rows == 1 ? " row" : " rows") +
                                 ", expected at least 2, the ends of a segment");
    }
}

void CheckActuatorSensor(const kinC_ActuatorSensor& sensor, mdf_RecordCheck& check) {
    check.NotNegative("coordinates", sensor.coordinates);
    check.NotNegative("variables", sensor.variables);
}

} // namespace

void mdf_AddSectionChecks(mdf_RecordChecks& checks) {
    checks.Add<kseC_BeamSection>(CheckBeam);
    checks.Add<kseC_GeometryShellSection>(CheckShell);
    checks.Add<kseC_HomogenousShellSection>(CheckIntegrationPoints<kseC_HomogenousShellSection>);
    checks.Add<kseC_CompositeShellLayer>(CheckIntegrationPoints<kseC_CompositeShellLayer>);
    checks.Add<kseC_CompositeSolidLayer>(CheckIntegrationPoints<kseC_CompositeSolidLayer>);
    checks.Add<kseC_GeneralShellSection>(CheckGeneralShell<kseC_GeneralShellSection>);
    checks.Add<kseC_UserShellSection>(CheckGeneralShell<kseC_UserShellSection>);
    checks.Add<kbpC_ArbitraryProfile>(CheckArbitraryProfile);
    checks.Add<kinC_ActuatorSensor>(CheckActuatorSensor);
}
