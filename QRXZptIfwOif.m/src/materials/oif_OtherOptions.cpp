#include "materials/oif_SpecialOptions.h"

namespace {

/// "dependencies=" of gasket options: any number but zero.
void GasketDependencies(oif_OptionLine& line, int dependencies) {
    line.BreakingUnless("dependencies=", dependencies, 0);
}

void WriteConstants(utl_Stream& stream, const kmaC_UserMaterial& option, const cow_List<double>& constants,
                    const char* type) {
    oif_OptionLine line(stream, "*User Material");
    line.Breaking("constants=", constants.Length());
    if (type != nullptr) line.Breaking(type);
    line.BreakingIf(option.unsymm, "unsymm").End();
    stream << oif_TableOfOneRow([&](int i) { return constants[i]; }, constants.Length());
}

} // namespace

void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_AcousticMedium& option) {
    // The break, if any, comes ahead of the comma.
    const auto start = [&](const char* text, int dependencies) {
        stream << text;
        if (dependencies > 0) stream << ", dependencies=" << dependencies;
        stream.LineBreak();
    };
    stream << keyword;
    stream.OptionalLineBreak();
    start("", option.dependencies);
    stream << oif_DependentTable(option);
    if (!option.volumetricDrag) return;
    start("*Acoustic Medium, Volumetric Drag", option.volumetricDragDependencies);
    stream << oif_DependentTable(option.volumetricDragTable, option.volumetricDragDependencies,
                                 option.volumetricDragTemperatureDependency);
}

void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_Sorption& option) {
    oif_OptionLine(stream, keyword)
        .BreakingUnless("law=", option.lawAbsorption, option.lawAbsorptionDef())
        .End();
    stream << oif_PlainTable(option.absorptionTable);
    if (!option.exsorption) return;
    oif_OptionLine(stream, "*Sorption, type=Exsorption")
        .BreakingUnless("law=", option.lawExsorption, option.lawExsorptionDef())
        .End();
    stream << oif_PlainTable(option.exsorptionTable);
    if (option.scanning == option.scanningDef()) return;
    stream << "*Sorption, type=Scanning";
    stream.LineBreak();
    stream << option.scanning;
    stream.LineBreak();
}

void oif_WriteSpecial(utl_Stream& stream, const char*, const kmaC_UserMaterial& option) {
    using Type = kmaC_UserMaterial::TypeEnm;
    if (option.type != Type::THERMAL) {
        WriteConstants(stream, option, option.mechanicalConstants,
                       option.type == Type::MECHANICAL ? nullptr : "type=MECHANICAL");
    }
    if (option.type != Type::MECHANICAL) {
        WriteConstants(stream, option, option.thermalConstants, "type=THERMAL");
    }
}

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
