#include "materials/oif_SpecialOptions.h"

namespace {

/// "dependencies=" of gasket options: any number but zero.
void GasketDependencies(oif_OptionLine& line, int dependencies) {
    line.BreakingUnless("dependencies=", dependencies, 0);
}

} // namespace

void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_MembraneElastic& option) {
    oif_OptionLine line(stream, keyword);
    GasketDependencies(line, option.dependencies);
    line.Breaking("component=MEMBRANE").End();
    stream << oif_PlainTable(option.table);
}

void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_TransShearElastic& option) {
    oif_OptionLine line(stream, keyword);
    GasketDependencies(line, option.dependencies);
    line.BreakingIf(option.variableUnits == kmaC_TransShearElastic::VariableUnitsEnm::FORCE, "variable=FORCE")
        .End();
    stream << oif_PlainTable(option.table);
}

void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_ThicknessBehavior& option) {
    oif_OptionLine line(stream, keyword);
    GasketDependencies(line, option.dependencies);
    line.BreakingUnless("tensile stiffness factor=", option.tensileStiffnessFactor,
                        option.tensileStiffnessFactorDef())
        .BreakingIf(option.type != option.typeDef(), "type=DAMAGE")
        .BreakingUnless("variable=", option.variableUnits, option.variableUnitsDef());
    // One number, named after what it says of the onset.
    if (option.yieldOnsetMethod != option.yieldOnsetMethodDef()) {
        line.Breaking("yield onset=", option.yieldOnset);
    } else {
        line.BreakingUnless("slope drop=", option.yieldOnset, option.yieldOnsetDef());
    }
    line.End();
    stream << oif_PlainTable(option.table);
    if (option.unloadingTable.NumRows() > 0) {
        oif_OptionLine unloading(stream, "*Gasket Thickness Behavior, direction=UNLOADING");
        GasketDependencies(unloading, option.unloadingDependencies);
        // Unloading is told as damage whatever the loading block says.
        unloading.Breaking("type=DAMAGE")
            .BreakingUnless("variable=", option.variableUnits, option.variableUnitsDef())
            .End();
        stream << oif_PlainTable(option.unloadingTable);
    }
    if (option.variableUnits == kmaC_ThicknessBehavior::VariableUnitsEnm::FORCE) {
        oif_WriteOptions(stream, option.contactArea);
    }
}

void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_ContactArea& option) {
    oif_OptionLine line(stream, keyword);
    line.End();
    // The parameter stands below the keyword, at the head of the line of the first row.
    GasketDependencies(line, option.dependencies);
    stream << oif_PlainTable(option.table);
}
