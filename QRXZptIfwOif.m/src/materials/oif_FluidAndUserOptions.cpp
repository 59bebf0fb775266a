#include "materials/oif_SpecialOptions.h"

namespace {

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
    const auto end = [](oif_KeywordLine& line, int dependencies) {
        line.FixedIf(dependencies > 0, ", dependencies=", dependencies).End();
    };
    // The break, if any, comes ahead of the comma.
    oif_OptionLine medium(stream, keyword);
    end(medium.MayBreak(), option.dependencies);
    stream << oif_DependentTable(option);
    if (!option.volumetricDrag) return;
    oif_OptionLine drag(stream, "*Acoustic Medium, Volumetric Drag");
    end(drag, option.volumetricDragDependencies);
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
