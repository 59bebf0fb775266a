#include "sections/oif_ShellSections.h"

#include "keyword_layer/qkw_QuorixName.h"
#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

constexpr char kGeneral[] = "*Shell General Section, elset=";

qkw_QuorixName Printed(const cow_String& name) {
    return {name, false};
}

[[noreturn]] void RaiseUnimplemented() {
    nex_Raise(oif_kShellError);
}

void WriteLayer(utl_Stream& stream, const kseC_CompositeShellLayer& layer, bool isGeneral) {
    stream << layer.thickness << ", ";
    if (!isGeneral) stream << layer.integrationPoints;
    stream << ", " << Printed(layer.materialName) << ", ";
    if (layer.orientationName.IsEmpty()) {
        stream << layer.orientationAngle;
    } else {
        stream << Printed(layer.orientationName);
    }
    stream << endl;
}

} // namespace

bool oif_HasShellLines(const kseC_Section& section) {
    return section.DynTypeId() == kseC_HomogenousShellSection::TypeId() ||
           section.DynTypeId() == kseC_CompositeShellSection::TypeId();
}

void oif_ShellSection::Write(utl_Stream& stream) const {
    using Form = oif_SectionForm<oif_ShellSection>;
    static constexpr Form forms[] = {
        Form::Of<kseC_HomogenousShellSection, &oif_ShellSection::WriteHomogeneous>(),
        Form::Of<kseC_CompositeShellSection, &oif_ShellSection::WriteComposite>(),
        Form::Of<kseC_UserShellSection, &oif_ShellSection::WriteUser>(),
    };
    const auto& shell = nex_canDynamicCastRef<kseC_ShellSection>(Section(), NEX_HERE);
    const Form* form = oif_FindRow(forms, shell.DynTypeId());
    if (form != nullptr) form->write(*this, stream, shell);
    if (!oif_HasShellLines(shell)) RaiseUnimplemented();
}

void oif_ShellSection::WriteHomogeneous(utl_Stream& stream, const kseC_HomogenousShellSection& shell) const {
    oif_KeywordLine line = KeywordLine(stream, shell);
    WriteNames(line);
    WriteTemperature(line, shell);
    line.Breaking("material=", Printed(shell.materialName));
    WriteOptions(line, shell);
    line.End();
    stream << shell.thickness << ", ";
    if (!shell.useGeneralKeyword) stream << shell.integrationPoints;
    stream << endl;
    WriteRebars(stream, shell);
}

void oif_ShellSection::WriteComposite(utl_Stream& stream, const kseC_CompositeShellSection& shell) const {
    oif_KeywordLine line = KeywordLine(stream, shell);
    line.Breaking("composite");
    WriteNames(line);
    WriteTemperature(line, shell);
    WriteOptions(line, shell);
    line.End();
    for (int i = 0; i < shell.layers.Length(); ++i) {
        WriteLayer(stream, shell.layers[i], shell.useGeneralKeyword);
    }
    WriteRebars(stream, shell);
}

// Has no orientation.
void oif_ShellSection::WriteUser(utl_Stream& stream, const kseC_UserShellSection& shell) const {
    oif_KeywordLine line(stream, kGeneral);
    line.Text(SetName());
    WriteControls(line);
    line.BreakingIf(!shell.symmetric, "unsymm");
}

oif_KeywordLine oif_ShellSection::KeywordLine(utl_Stream& stream,
                                              const kseC_GeometryShellSection& shell) const {
    oif_KeywordLine line(stream, shell.useGeneralKeyword ? kGeneral : "*Shell Section, elset=");
    line.Text(SetName());
    return line;
}

void oif_ShellSection::WriteTemperature(oif_KeywordLine& line, const kseC_GeometryShellSection& shell) {
    line.BreakingIf(shell.temperatureMode == kseC_GeometryShellSection::TemperatureModeEnm::POINTWISE,
                    "temperature=", shell.temperaturePoints);
}

void oif_ShellSection::WriteOptions(oif_KeywordLine& line, const kseC_GeometryShellSection& shell) const {
    const bool hasModulus = shell.thicknessModulus != shell.thicknessModulusDef();
    line.BreakingUnless("section integration=", shell.integrationRule, shell.integrationRuleDef())
        .BreakingIf(shell.poissonDefinition != shell.poissonDefinitionDef(), "poisson=", shell.poisson)
        .BreakingIf(hasModulus && shell.thicknessModulus > 0.0, "thickness modulus=", shell.thicknessModulus)
        .BreakingIf(offset_ != 0.0, "offset=", offset_)
        // Also for a modulus that isn't positive and so isn't written.
        .BreakingIf(hasModulus && !OrientationName().IsEmpty(), "stack direction=ORIENTATION");
}

void oif_ShellSection::WriteRebars(utl_Stream& stream, const kseC_GeometryShellSection& shell) {
    if (!shell.rebars.IsNull()) oif_RebarLayer(shell.rebars.ConstGet(), {}, false).Write(stream);
}

void oif_ShellGeneralSection::Write(utl_Stream& stream) const {
    if (Section().DynTypeId() != kseC_UserShellSection::TypeId()) return;
    const auto& shell = nex_canDynamicCastRef<kseC_UserShellSection>(Section(), NEX_HERE);
    oif_KeywordLine line(stream, kGeneral);
    line.Text(SetName());
    WriteNames(line);
    line.BreakingIf(!shell.symmetric, "unsymm")
        // Wanted this way round: only an offset of zero is written.
        .BreakingIf(offset_ == 0.0, "offset=", offset_);
    RaiseUnimplemented();
}

bool oif_RebarLayer::IsAngular() const {
    return rebars_.spacingType == kseC_RebarLayers::SpacingTypeEnm::ANGULAR;
}

void oif_RebarLayer::Write(utl_Stream& stream) const {
    bool hasCommon = false;
    for (int i = 0; i < rebars_.layers.Length(); ++i) {
        hasCommon = hasCommon || rebars_.layers[i].orientationName.IsEmpty();
    }
    if (hasCommon) {
        oif_KeywordLine(stream, "*Rebar Layer")
            .BreakingIf(IsAngular(), "angular spacing")
            .BreakingIf(!orientationName_.IsEmpty(), "orientation=", Printed(orientationName_))
            .End();
        for (int i = 0; i < rebars_.layers.Length(); ++i) {
            if (rebars_.layers[i].orientationName.IsEmpty()) WriteLayer(stream, rebars_.layers[i]);
        }
    }
    for (int i = 0; i < rebars_.layers.Length(); ++i) {
        const kseC_RebarLayer& layer = rebars_.layers[i];
        if (layer.orientationName.IsEmpty()) continue;
        oif_KeywordLine(stream, "*Rebar Layer")
            .BreakingIf(IsAngular(), "angular spacing")
            .Text(", orientation=")
            .Text(Printed(layer.orientationName))
            .End();
        WriteLayer(stream, layer);
    }
}

void oif_RebarLayer::WriteLayer(utl_Stream& stream, const kseC_RebarLayer& layer) const {
    const bool isConstant = rebars_.spacingType == kseC_RebarLayers::SpacingTypeEnm::CONSTANT;
    stream << Printed(layer.name) << ", " << layer.area << ", "
           << (isConstant ? layer.spacing : layer.angularSpacing) << ", ";
    if (!omitPosition_) stream << layer.position;
    stream << ", " << Printed(layer.materialName) << ", ";
    // An orientation of its own stands in for the angle.
    if (layer.orientationName.IsEmpty()) stream << layer.orientationAngle;
    stream << ", 1" << endl;
}

void oif_TransverseShear::Write(utl_Stream& stream) const {
    stream << "*Transverse Shear" << endl << k11_ << ", " << k22_;
    if (isShell_) stream << ", " << k12_;
    stream << endl;
}
